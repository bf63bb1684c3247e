// Widths, canonical texts of each kind, and texts that must come back byte for byte.
#include <gtest/gtest.h>

#include "storage_fixture.h"

namespace storage_test {
namespace {

std::string repeat(std::string_view piece, int times) {
  std::string text;
  for (int i = 0; i < times; ++i) text += piece;
  return text;
}

TEST(Values, TextOverItsWidthIsRefusedNeverCut) {
  TempFolder folder;
  Database db = open_or_fail(folder.path());
  StoredTable templates = table_or_fail(db, "GESCOM", "VNTEMAIL");
  Record original = make_record(templates, {{"CODE", "GENERAL"}, {"MESSAGE_EMAIL", "Veuillez trouver ci-joint"}});
  ASSERT_TRUE(templates.insert(original).ok());

  struct Case {
    const char* field;
    int entry;
    std::string value;
    const char* message;  // nullptr: accepted
  };
  const Case cases[] = {
      {"MESSAGE_EMAIL", 1, repeat("é", 255), nullptr},
      {"MESSAGE_EMAIL", 1, repeat("é", 256),
       "Le champ MESSAGE_EMAIL de la table GESCOM.VNTEMAIL accepte au plus 255 caractères ; la valeur en compte 256."},
      {"MESSAGE_EMAIL2", 1, repeat("a", 254) + "€", nullptr},
      {"MESSAGE_EMAIL3", 1, repeat("a", 255) + "😀",
       "Le champ MESSAGE_EMAIL3 de la table GESCOM.VNTEMAIL accepte au plus 255 caractères ; la valeur en compte 256."},
      {"NOMTAG", 3, repeat("N", 31),
       "Le champ NOMTAG(3) de la table GESCOM.VNTEMAIL accepte au plus 30 caractères ; la valeur en compte 31."},
      {"TYPE", 1, "ABCDEF",
       "Le champ TYPE de la table GESCOM.VNTEMAIL accepte au plus 5 caractères ; la valeur en compte 6."},
  };
  for (const Case& c : cases) {
    Record record = original;
    ASSERT_TRUE(record.set(c.field, c.entry, c.value).ok());
    Status updated = templates.update(record);
    if (c.message == nullptr) {
      ASSERT_TRUE(updated.ok()) << c.field << ": " << updated.error().message;
      EXPECT_EQ(templates.read("GENERAL")->get(c.field, c.entry), c.value) << c.field;
      ASSERT_TRUE(templates.update(original).ok());
      continue;
    }
    ASSERT_FALSE(updated.ok()) << c.field;
    EXPECT_EQ(updated.error().kind, ErrorKind::TooLong);
    EXPECT_EQ(updated.error().message, c.message);
    EXPECT_EQ(*templates.read("GENERAL"), original) << c.field;
    // A new record is refused the same way, and nothing is added.
    ASSERT_TRUE(record.set("CODE", "NOUVEAU").ok());
    EXPECT_EQ(templates.insert(record).error().message, c.message);
    EXPECT_EQ(*templates.count(), 1);
  }
  // The key itself is checked like any field.
  Record long_key = make_record(templates, {{"CODE", repeat("C", 31)}});
  EXPECT_EQ(templates.insert(long_key).error().message,
            "Le champ CODE de la table GESCOM.VNTEMAIL accepte au plus 30 caractères ; la valeur en compte 31.");
}

TEST(Values, TextComesBackByteForByte) {
  TempFolder folder;
  const std::string texts[] = {
      "Numéro de la facture",
      "l'attestation \"fiscale\" d'aujourd'hui",
      "C:\\m\\lettre.pdf|C:\\m\\annexe.pdf",
      "a@b.fr; c@d.fr;e@f.fr",
      "ligne 1\r\nligne 2\nligne 3\r",
      "\ttabulé  et espaces en fin   ",
      "🙂 émoji 🇫🇷 et Œuvre ŒÆ",
      "'); DROP TABLE \"GESCOM.VNTEMAIL\"; --",
      "100% _joker_ [NUMERODOC] [#ERREUR#]",
      "",
  };
  {
    Database db = open_or_fail(folder.path());
    StoredTable templates = table_or_fail(db, "GESCOM", "VNTEMAIL");
    int n = 0;
    for (const std::string& text : texts) {
      Record record = make_record(templates, {{"CODE", "T" + std::to_string(++n)}, {"OBJET_EMAIL", text}});
      ASSERT_TRUE(record.set("LIBELTAG", 10, text).ok());
      ASSERT_TRUE(templates.insert(record).ok()) << text;
    }
  }
  // Read back after reopening, by key and through a walk.
  Database db = open_or_fail(folder.path());
  StoredTable templates = table_or_fail(db, "GESCOM", "VNTEMAIL");
  int n = 0;
  for (const std::string& text : texts) {
    auto record = templates.read("T" + std::to_string(++n));
    ASSERT_TRUE(record.ok());
    EXPECT_EQ(record->get("OBJET_EMAIL"), text);
    EXPECT_EQ(record->get("LIBELTAG", 10), text);
    auto found = templates.count({{"OBJET_EMAIL", 1, Operator::Equal, text}});
    EXPECT_EQ(*found, 1) << text;
  }
  auto cursor = templates.select({{}, Order{"CODE"}});
  n = 0;
  while (*cursor->next()) {
    EXPECT_EQ(cursor->record().get("OBJET_EMAIL"), texts[std::stoi(cursor->record().key().substr(1)) - 1]);
    ++n;
  }
  EXPECT_EQ(n, 10);
}

TEST(Values, EachKindHasOneCanonicalText) {
  TempFolder folder;
  Database db = open_or_fail(folder.path());
  StoredTable sessions = table_or_fail(db, "BP", "FORMA");
  struct Case {
    const char* field;
    const char* written;
    const char* read;
  };
  const Case cases[] = {
      {"NBSTAG", "42", "42"},        {"NBSTAG", "-7", "-7"},           {"NBSTAG", "007", "7"},
      {"NBSTAG", "0", ""},           {"NBSTAG", "", ""},               {"PRIX", "12.5", "12.5"},
      {"PRIX", "12.50", "12.5"},     {"PRIX", "-0.25", "-0.25"},       {"PRIX", "3", "3"},
      {"PRIX", "0.0", ""},           {"PRIX", "1234567.89", "1234567.89"}, {"DATDB", "2024-02-29", "2024-02-29"},
      {"DATDB", "", ""},
  };
  int ident = 0;
  for (const Case& c : cases) {
    Record record = make_record(sessions, {{"IDENT", std::to_string(++ident)}, {c.field, c.written}});
    ASSERT_TRUE(sessions.insert(record).ok()) << c.field << " " << c.written;
    EXPECT_EQ(sessions.read(std::to_string(ident))->get(c.field), c.read) << c.field << " " << c.written;
  }

  struct Refused {
    const char* field;
    std::string value;
    const char* message;
  };
  const Refused refused[] = {
      {"NBSTAG", "12a", "Le champ NBSTAG de la table BP.FORMA attend un nombre entier, pas \"12a\"."},
      {"NBSTAG", "1.5", "Le champ NBSTAG de la table BP.FORMA attend un nombre entier, pas \"1.5\"."},
      {"NBSTAG", "99999999999999999999",
       "Le champ NBSTAG de la table BP.FORMA attend un nombre entier, pas \"99999999999999999999\"."},
      {"PRIX", "12,5",
       "Le champ PRIX de la table BP.FORMA attend un nombre décimal écrit avec un point, pas \"12,5\"."},
      {"PRIX", "inf", "Le champ PRIX de la table BP.FORMA attend un nombre décimal écrit avec un point, pas \"inf\"."},
      {"PRIX", "1e5", "Le champ PRIX de la table BP.FORMA attend un nombre décimal écrit avec un point, pas \"1e5\"."},
      {"DATDB", "2023-02-29", "Le champ DATDB de la table BP.FORMA attend une date AAAA-MM-JJ, pas \"2023-02-29\"."},
      {"DATDB", "15/03/2024", "Le champ DATDB de la table BP.FORMA attend une date AAAA-MM-JJ, pas \"15/03/2024\"."},
      {"DATDB", "2024-3-5", "Le champ DATDB de la table BP.FORMA attend une date AAAA-MM-JJ, pas \"2024-3-5\"."},
      {"COFOR", "caf\xC3", "Le champ COFOR de la table BP.FORMA contient un texte mal encodé."},
      {"COFOR", std::string("a\0b", 3), "Le champ COFOR de la table BP.FORMA contient un caractère nul."},
  };
  for (const Refused& r : refused) {
    Record record = make_record(sessions, {{"IDENT", "100"}});
    ASSERT_TRUE(record.set(r.field, r.value).ok());
    Status inserted = sessions.insert(record);
    ASSERT_FALSE(inserted.ok()) << r.value;
    EXPECT_EQ(inserted.error().kind, ErrorKind::InvalidValue);
    EXPECT_EQ(inserted.error().message, r.message);
  }
  EXPECT_EQ(sessions.read("100").error().kind, ErrorKind::NotFound);
}

}  // namespace
}  // namespace storage_test
