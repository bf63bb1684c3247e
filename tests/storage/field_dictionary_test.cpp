// The field dictionary "@@"."$CHP$" kept in step with the catalog.
#include <gtest/gtest.h>

#include "storage_fixture.h"

namespace storage_test {
namespace {

// "CODE CODEC LIEN NUMAL" of the dictionary records of one table, in NUMAL order, one per line.
std::string dictionary_of(const Database& db, const std::string& base_and_table) {
  StoredTable dictionary = table_or_fail(db, "@@", "$CHP$");
  auto cursor = dictionary.select({{{"CODE", 1, Operator::BeginsWith, base_and_table + "."}}, Order{"NUMAL"}});
  if (!cursor) return cursor.error().message;
  std::string lines;
  while (*cursor->next()) {
    const Record& r = cursor->record();
    lines += r.get("CODE") + " " + r.get("CODEC") + " [" + r.get("LIEN") + "] " + r.get("NUMAL") + "\n";
  }
  return lines;
}

TEST(FieldDictionary, HoldsEveryFieldOfEveryTableInItsRank) {
  TempFolder folder;
  Database db = open_or_fail(folder.path());
  EXPECT_EQ(dictionary_of(db, "BP.FORMA"),
            "BP.FORMA.IDENT IDENT [] 1\n"
            "BP.FORMA.COFOR COFOR [] 2\n"
            "BP.FORMA.DATDB DATDB [] 3\n"
            "BP.FORMA.NBSTAG NBSTAG [] 4\n"
            "BP.FORMA.PRIX PRIX [] 5\n"
            "BP.FORMA.VNTCLI_IDENT VNTCLI_IDENT [C VNTCLI] 6\n");
  EXPECT_EQ(dictionary_of(db, "@@.$CHP$"),
            "@@.$CHP$.CODE CODE [] 1\n"
            "@@.$CHP$.CODEC CODEC [] 2\n"
            "@@.$CHP$.LIEN LIEN [] 3\n"
            "@@.$CHP$.NUMAL NUMAL [] 4\n");

  StoredTable dictionary = table_or_fail(db, "@@", "$CHP$");
  EXPECT_EQ(*dictionary.count(), 18 + 11 + 4 + 6);  // VNTEMAIL, PREF, $CHP$, FORMA
  // What the token transformer asks: a table's first field, and its link fields.
  auto first = dictionary.select({{{"CODE", 1, Operator::BeginsWith, "GESCOM.VNTEMAIL."}}, Order{"NUMAL"}});
  ASSERT_TRUE(*first->first());
  EXPECT_EQ(first->record().get("CODEC"), "CODE");
  EXPECT_EQ(keys_of(dictionary, {{{"CODE", 1, Operator::BeginsWith, "BP.FORMA."}, {"LIEN", 1, Operator::Differs, ""}},
                                 Order{"NUMAL"}}),
            "BP.FORMA.VNTCLI_IDENT");
  // The mail templates' fields come in declaration order, a repeated field once.
  auto walk = dictionary.select({{{"CODE", 1, Operator::BeginsWith, "GESCOM.VNTEMAIL."}}, Order{"NUMAL"}});
  std::string names;
  while (*walk->next()) names += walk->record().get("CODEC") + " ";
  EXPECT_EQ(names,
            "CODE DESIG DEST DEST_COPIE DEST_COPIE_CACHEE EMAIL_DEST EMAIL_DEST_COPIE EMAIL_DEST_CACHEE OBJET_EMAIL "
            "MESSAGE_EMAIL MESSAGE_EMAIL2 MESSAGE_EMAIL3 DATE_CREATION HEURE_CREATION NOMTAG CODECHAMPTAG LIBELTAG "
            "TYPE ");
}

TEST(FieldDictionary, FollowsTheCatalogWhenDefinitionsChange) {
  TempFolder folder;
  {
    Database db = open_or_fail(folder.path());
    StoredTable sessions = table_or_fail(db, "BP", "FORMA");
    ASSERT_TRUE(sessions.insert(make_record(sessions, {{"IDENT", "7"}, {"COFOR", "ANG-07"}, {"PRIX", "950.5"}})).ok());
    // A record the catalog does not explain: the host removes it.
    StoredTable dictionary = table_or_fail(db, "@@", "$CHP$");
    ASSERT_TRUE(dictionary.insert(make_record(dictionary, {{"CODE", "BP.FORMA.ANCIEN"}, {"CODEC", "ANCIEN"}})).ok());
  }
  // A later definition: LIEU added after COFOR, PRIX dropped, the link gains a range and a context.
  Catalog grown = host_catalog();
  grown.add(TableDef{"BP",
                     "FORMA",
                     {integer_field("IDENT"), text_field("COFOR", 20), text_field("LIEU", 40), date_field("DATDB"),
                      integer_field("NBSTAG"), integer_field("VNTCLI_IDENT", "C VNTCLI(1,6)=I_CLI_OPCA")},
                     "IDENT"});
  {
    Database db = open_or_fail(folder.path(), grown);
    EXPECT_EQ(dictionary_of(db, "BP.FORMA"),
              "BP.FORMA.IDENT IDENT [] 1\n"
              "BP.FORMA.COFOR COFOR [] 2\n"
              "BP.FORMA.LIEU LIEU [] 3\n"
              "BP.FORMA.DATDB DATDB [] 4\n"
              "BP.FORMA.NBSTAG NBSTAG [] 5\n"
              "BP.FORMA.VNTCLI_IDENT VNTCLI_IDENT [C VNTCLI(1,6)=I_CLI_OPCA] 6\n");
    StoredTable sessions = table_or_fail(db, "BP", "FORMA");
    auto record = sessions.read("7");
    ASSERT_TRUE(record.ok());
    EXPECT_EQ(record->get("COFOR"), "ANG-07");
    EXPECT_EQ(record->get("LIEU"), "");
    ASSERT_TRUE(record->set("LIEU", "Lyon").ok());
    ASSERT_TRUE(sessions.update(*record).ok());
  }
  // Without the training table in the catalog, its dictionary records go; its data stay in the file.
  {
    Database db = open_or_fail(folder.path(), host_catalog());
    EXPECT_EQ(dictionary_of(db, "BP.FORMA"), "");
    EXPECT_EQ(*table_or_fail(db, "@@", "$CHP$").count(), 18 + 11 + 4);
  }
  // Back to the first definition: the dropped column kept its value.
  Database db = open_or_fail(folder.path());
  auto record = table_or_fail(db, "BP", "FORMA").read("7");
  EXPECT_EQ(record->get("PRIX"), "950.5");
  EXPECT_EQ(dictionary_of(db, "BP.FORMA").substr(0, 26), "BP.FORMA.IDENT IDENT [] 1\n");
}

}  // namespace
}  // namespace storage_test
