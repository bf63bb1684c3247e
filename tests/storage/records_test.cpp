// Creating, reading, updating and deleting records, and what is refused.
#include <gtest/gtest.h>

#include "storage_fixture.h"

namespace storage_test {
namespace {

Record invoice_template(const StoredTable& templates) {
  Record record = make_record(templates, {{"CODE", "VNTEFAC"},
                                          {"DESIG", "Les factures clients"},
                                          {"DEST", "01000"},
                                          {"DEST_COPIE", "00000"},
                                          {"DEST_COPIE_CACHEE", "00000"},
                                          {"OBJET_EMAIL", "Votre facture n° [NUMERODOC] du [DATEDOC]"},
                                          {"MESSAGE_EMAIL", "Veuillez trouver ci-joint la facture n° [NUMERODOC]"},
                                          {"DATE_CREATION", "2024-03-15"},
                                          {"HEURE_CREATION", "14:05:09"}});
  EXPECT_TRUE(record.set("NOMTAG", 1, "NUMERODOC").ok());
  EXPECT_TRUE(record.set("CODECHAMPTAG", 1, "I_VNTEFAC.NUMERO_DOC").ok());
  EXPECT_TRUE(record.set("LIBELTAG", 1, "Numéro de la facture").ok());
  EXPECT_TRUE(record.set("NOMTAG", 2, "DATEDOC").ok());
  EXPECT_TRUE(record.set("CODECHAMPTAG", 2, "I_VNTEFAC.DATE_CREATION").ok());
  EXPECT_TRUE(record.set("LIBELTAG", 2, "Date de la facture").ok());
  return record;
}

TEST(Records, CreateReadUpdateDelete) {
  TempFolder folder;
  Database db = open_or_fail(folder.path());
  StoredTable templates = table_or_fail(db, "GESCOM", "VNTEMAIL");
  Record written = invoice_template(templates);
  ASSERT_TRUE(templates.insert(written).ok());

  auto read = templates.read("VNTEFAC");
  ASSERT_TRUE(read.ok()) << read.error().message;
  EXPECT_EQ(*read, written);
  EXPECT_EQ(read->get("NOMTAG", 2), "DATEDOC");
  EXPECT_EQ(read->get("NOMTAG", 3), "");

  Record changed = *read;
  ASSERT_TRUE(changed.set("DESIG", "Factures").ok());
  ASSERT_TRUE(changed.set("NOMTAG", 2, "").ok());
  ASSERT_TRUE(templates.update(changed).ok());
  EXPECT_EQ(*templates.read("VNTEFAC"), changed);

  // Renaming the key moves the record.
  ASSERT_TRUE(changed.set("CODE", "VNTEFAC2").ok());
  ASSERT_TRUE(templates.update("VNTEFAC", changed).ok());
  EXPECT_EQ(templates.read("VNTEFAC").error().kind, ErrorKind::NotFound);
  EXPECT_EQ(*templates.read("VNTEFAC2"), changed);

  ASSERT_TRUE(templates.remove("VNTEFAC2").ok());
  auto gone = templates.read("VNTEFAC2");
  ASSERT_FALSE(gone.ok());
  EXPECT_EQ(gone.error().kind, ErrorKind::NotFound);
  EXPECT_EQ(gone.error().message, "Aucun enregistrement de clé \"VNTEFAC2\" dans la table GESCOM.VNTEMAIL.");
  EXPECT_EQ(*templates.count(), 0);

  // Reading into a record of another table replaces it with one of this table.
  Record reused = table_or_fail(db, "$$", "PREF").new_record();
  ASSERT_TRUE(templates.insert(written).ok());
  ASSERT_TRUE(templates.read("VNTEFAC", reused).ok());
  EXPECT_EQ(reused, written);
}

TEST(Records, RefusedWritesLeaveTheTableAsItWas) {
  TempFolder folder;
  Database db = open_or_fail(folder.path());
  StoredTable templates = table_or_fail(db, "GESCOM", "VNTEMAIL");
  Record original = invoice_template(templates);
  ASSERT_TRUE(templates.insert(original).ok());
  Record other = make_record(templates, {{"CODE", "GENERAL"}, {"DESIG", "GENERAL"}});
  ASSERT_TRUE(templates.insert(other).ok());

  Record same_key = make_record(templates, {{"CODE", "VNTEFAC"}, {"DESIG", "Autre"}});
  Record no_key = make_record(templates, {{"DESIG", "Sans code"}});
  Record renamed_onto_general = original;
  ASSERT_TRUE(renamed_onto_general.set("CODE", "GENERAL").ok());
  Record missing = make_record(templates, {{"CODE", "ABSENT"}});
  Record foreign = table_or_fail(db, "$$", "PREF").new_record();
  ASSERT_TRUE(foreign.set("CODE", "X").ok());

  struct Case {
    const char* what;
    Status status;
    ErrorKind kind;
    const char* message;
  };
  Case cases[] = {
      {"duplicate key", templates.insert(same_key), ErrorKind::Duplicate,
       "Un enregistrement de clé \"VNTEFAC\" existe déjà dans la table GESCOM.VNTEMAIL."},
      {"empty key", templates.insert(no_key), ErrorKind::InvalidValue,
       "La clé CODE d'un enregistrement de la table GESCOM.VNTEMAIL ne peut pas être vide."},
      {"rename onto a taken key", templates.update("VNTEFAC", renamed_onto_general), ErrorKind::Duplicate,
       "Un enregistrement de clé \"GENERAL\" existe déjà dans la table GESCOM.VNTEMAIL."},
      {"update of a missing key", templates.update(missing), ErrorKind::NotFound,
       "Aucun enregistrement de clé \"ABSENT\" dans la table GESCOM.VNTEMAIL."},
      {"delete of a missing key", templates.remove("ABSENT"), ErrorKind::NotFound,
       "Aucun enregistrement de clé \"ABSENT\" dans la table GESCOM.VNTEMAIL."},
      {"record of another table", templates.insert(foreign), ErrorKind::UnknownName,
       "L'enregistrement n'appartient pas à la table GESCOM.VNTEMAIL."},
      {"unknown field", no_key.set("NOM", "x"), ErrorKind::UnknownName,
       "Le champ NOM n'existe pas dans la table GESCOM.VNTEMAIL."},
      {"entry past the last", no_key.set("NOMTAG", 11, "x"), ErrorKind::UnknownName,
       "Le champ NOMTAG de la table GESCOM.VNTEMAIL n'a pas d'élément 11 (il en a 10)."},
      {"unknown table", db.table("GESCOM", "VNTCLI").status(), ErrorKind::UnknownName,
       "La table GESCOM.VNTCLI est inconnue."},
      {"integer key that is not a number", table_or_fail(db, "BP", "FORMA").read("12a").status(),
       ErrorKind::InvalidValue, "La clé IDENT de la table BP.FORMA est un nombre entier, pas \"12a\"."},
  };
  for (const Case& c : cases) {
    ASSERT_FALSE(c.status.ok()) << c.what;
    EXPECT_EQ(c.status.error().kind, c.kind) << c.what;
    EXPECT_EQ(c.status.error().message, c.message) << c.what;
  }
  EXPECT_EQ(*templates.count(), 2);
  EXPECT_EQ(*templates.read("VNTEFAC"), original);
  EXPECT_EQ(*templates.read("GENERAL"), other);
}

TEST(Records, TablesAndFieldsAreFoundWhateverTheCase) {
  TempFolder folder;
  Database db = open_or_fail(folder.path());
  StoredTable templates = table_or_fail(db, "gescom", "vntemail");
  Record record = templates.new_record();
  ASSERT_TRUE(record.set("code", "X").ok());
  ASSERT_TRUE(record.set("nomtag", 10, "DERNIER").ok());
  ASSERT_TRUE(templates.insert(record).ok());
  EXPECT_EQ(templates.read("X")->get("NOMTAG", 10), "DERNIER");
}

TEST(Records, WritesDuringAWalkAreCommittedAtOnce) {
  TempFolder folder;
  Database db = open_or_fail(folder.path());
  StoredTable sessions = table_or_fail(db, "BP", "FORMA");
  for (int i = 1; i <= 5; ++i) {
    ASSERT_TRUE(sessions.insert(make_record(sessions, {{"IDENT", std::to_string(i)}})).ok());
  }
  auto cursor = sessions.select();
  ASSERT_TRUE(cursor.ok());
  int seen = 0;
  while (*cursor->next()) {
    Record record = cursor->record();
    ASSERT_TRUE(record.set("COFOR", "ENVOYE").ok());
    ASSERT_TRUE(sessions.update(record).ok());
    ++seen;
    // Another connection sees the write while the walk is still under way.
    Database other = open_or_fail(folder.path());
    EXPECT_EQ(table_or_fail(other, "BP", "FORMA").read(record.key())->get("COFOR"), "ENVOYE");
  }
  EXPECT_EQ(seen, 5);
}

TEST(Records, TransactionCommitsAllOrNothing) {
  TempFolder folder;
  Database db = open_or_fail(folder.path());
  StoredTable sessions = table_or_fail(db, "BP", "FORMA");
  {
    auto transaction = db.begin();
    ASSERT_TRUE(transaction.ok()) << transaction.error().detail;
    ASSERT_TRUE(sessions.insert(make_record(sessions, {{"IDENT", "1"}})).ok());
    ASSERT_TRUE(sessions.insert(make_record(sessions, {{"IDENT", "2"}})).ok());
    auto nested = db.begin();
    ASSERT_FALSE(nested.ok());
    EXPECT_EQ(nested.error().message,
              "Une transaction est déjà en cours sur la base de données " + folder.file().string() + ".");
  }  // not committed: rolled back
  EXPECT_EQ(*sessions.count(), 0);
  {
    auto transaction = db.begin();
    ASSERT_TRUE(sessions.insert(make_record(sessions, {{"IDENT", "1"}})).ok());
    ASSERT_TRUE(sessions.insert(make_record(sessions, {{"IDENT", "2"}})).ok());
    ASSERT_TRUE(transaction->commit().ok());
  }
  Database other = open_or_fail(folder.path());
  EXPECT_EQ(*table_or_fail(other, "BP", "FORMA").count(), 2);
}

}  // namespace
}  // namespace storage_test
