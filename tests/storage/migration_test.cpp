// Opening files of older and later releases, and files that are not ours.
#include <gtest/gtest.h>
#include <sqlite3.h>

#include <fstream>
#include <iterator>

#include "storage_fixture.h"

namespace storage_test {
namespace {

// Runs SQL on the file with SQLite directly, as an older release would have written it.
void raw_sql(const std::filesystem::path& file, const std::string& sql) {
  sqlite3* db = nullptr;
  ASSERT_EQ(sqlite3_open(file.string().c_str(), &db), SQLITE_OK);
  char* message = nullptr;
  int rc = sqlite3_exec(db, sql.c_str(), nullptr, nullptr, &message);
  EXPECT_EQ(rc, SQLITE_OK) << (message != nullptr ? message : "") << "\n" << sql;
  sqlite3_free(message);
  sqlite3_close(db);
}

long long raw_integer(const std::filesystem::path& file, const std::string& sql) {
  sqlite3* db = nullptr;
  sqlite3_open(file.string().c_str(), &db);
  sqlite3_stmt* statement = nullptr;
  sqlite3_prepare_v2(db, sql.c_str(), -1, &statement, nullptr);
  long long value = sqlite3_step(statement) == SQLITE_ROW ? sqlite3_column_int64(statement, 0) : -1;
  sqlite3_finalize(statement);
  sqlite3_close(db);
  return value;
}

TEST(Migration, OlderFileGainsItsMissingColumnsAndTablesWithoutDataLoss) {
  TempFolder folder;
  // An older release: five tags, no TYPE, no settings table, no version recorded.
  raw_sql(folder.file(),
          "CREATE TABLE \"GESCOM.VNTEMAIL\" (\"CODE\" TEXT NOT NULL PRIMARY KEY, \"DESIG\" TEXT, "
          "\"OBJET_EMAIL\" TEXT, \"MESSAGE_EMAIL\" TEXT, \"DATE_CREATION\" TEXT, "
          "\"NOMTAG#1\" TEXT, \"NOMTAG#2\" TEXT, \"NOMTAG#3\" TEXT, \"NOMTAG#4\" TEXT, \"NOMTAG#5\" TEXT);"
          "INSERT INTO \"GESCOM.VNTEMAIL\" VALUES ('VNTEFAC', 'Les factures clients', "
          "'Votre facture n° [NUMERODOC]', 'Ci-joint ; « la » facture', '2019-05-02', 'NUMERODOC', 'DATEDOC', '', '', "
          "'CINQUIEME');"
          "INSERT INTO \"GESCOM.VNTEMAIL\" (\"CODE\", \"DESIG\") VALUES ('GENERAL', 'GENERAL');");
  ASSERT_EQ(raw_integer(folder.file(), "PRAGMA user_version"), 0);

  {
    Database db = open_or_fail(folder.path());
    EXPECT_EQ(db.schema_version(), 1);
    EXPECT_TRUE(db.check_integrity().ok());
    StoredTable templates = table_or_fail(db, "GESCOM", "VNTEMAIL");
    auto old = templates.read("VNTEFAC");
    ASSERT_TRUE(old.ok());
    EXPECT_EQ(old->get("DESIG"), "Les factures clients");
    EXPECT_EQ(old->get("MESSAGE_EMAIL"), "Ci-joint ; « la » facture");
    EXPECT_EQ(old->get("DATE_CREATION"), "2019-05-02");
    EXPECT_EQ(old->get("NOMTAG", 5), "CINQUIEME");
    EXPECT_EQ(old->get("NOMTAG", 6), "");
    EXPECT_EQ(old->get("TYPE"), "");
    EXPECT_EQ(old->get("MESSAGE_EMAIL2"), "");
    // A value the older release left NULL reads as empty.
    EXPECT_EQ(templates.read("GENERAL")->get("OBJET_EMAIL"), "");
    Record changed = *old;
    ASSERT_TRUE(changed.set("NOMTAG", 10, "DIXIEME").ok());
    ASSERT_TRUE(changed.set("TYPE", "A").ok());
    ASSERT_TRUE(templates.update(changed).ok());
    ASSERT_TRUE(table_or_fail(db, "$$", "PREF").insert(make_record(table_or_fail(db, "$$", "PREF"),
                                                                   {{"CODE", "DUPONT|EMAIL"}, {"INF1", "2"}}))
                    .ok());
  }
  Database db = open_or_fail(folder.path());
  EXPECT_EQ(*table_or_fail(db, "GESCOM", "VNTEMAIL").count(), 2);
  EXPECT_EQ(table_or_fail(db, "GESCOM", "VNTEMAIL").read("VNTEFAC")->get("NOMTAG", 10), "DIXIEME");
  EXPECT_EQ(table_or_fail(db, "$$", "PREF").read("DUPONT|EMAIL")->get("INF1"), "2");
  EXPECT_EQ(raw_integer(folder.file(), "PRAGMA user_version"), 1);
}

TEST(Migration, StepsRunOnceInVersionOrderAndAFailedStepChangesNothing) {
  TempFolder folder;
  {
    Database db = open_or_fail(folder.path());
    StoredTable templates = table_or_fail(db, "GESCOM", "VNTEMAIL");
    ASSERT_TRUE(templates.insert(make_record(templates, {{"CODE", "GENERAL"}, {"DESIG", "GENERAL"}})).ok());
  }
  std::vector<int> ran;
  auto steps = [&ran](bool third_fails) {
    return std::vector<Migration>{
        {3, "third", [&ran, third_fails](const MigrationContext& context) -> Status {
           ran.push_back(3);
           if (third_fails) return Error{ErrorKind::Failure, "échec voulu", "test"};
           return context.execute("UPDATE \"GESCOM.VNTEMAIL\" SET \"DESIG\" = \"DESIG\" || ' v3'");
         }},
        {1, "first", [&ran](const MigrationContext&) -> Status {
           ran.push_back(1);
           return {};
         }},
        {2, "second", [&ran](const MigrationContext& context) -> Status {
           ran.push_back(2);
           auto has = context.has_column(mail_template_table(), "DESIG");
           if (!has || !*has) return Error{ErrorKind::Failure, "DESIG missing", ""};
           return context.execute("UPDATE \"GESCOM.VNTEMAIL\" SET \"DESIG\" = \"DESIG\" || ' v2'");
         }},
    };
  };

  auto failed = Database::open(folder.path(), test_catalog(), OpenOptions{steps(true)});
  ASSERT_FALSE(failed.ok());
  EXPECT_EQ(failed.error().message,
            "La mise à jour de la base de données " + folder.file().string() + " vers la version 3 a échoué.");
  EXPECT_EQ(ran, (std::vector<int>{2, 3}));
  EXPECT_EQ(raw_integer(folder.file(), "PRAGMA user_version"), 1);
  EXPECT_EQ(raw_integer(folder.file(), "SELECT count(*) FROM \"GESCOM.VNTEMAIL\" WHERE \"DESIG\" = 'GENERAL'"), 1);

  ran.clear();
  {
    Database db = open_or_fail(folder.path(), test_catalog(), OpenOptions{steps(false)});
    EXPECT_EQ(db.schema_version(), 3);
    EXPECT_EQ(table_or_fail(db, "GESCOM", "VNTEMAIL").read("GENERAL")->get("DESIG"), "GENERAL v2 v3");
  }
  EXPECT_EQ(ran, (std::vector<int>{2, 3}));
  ran.clear();
  Database again = open_or_fail(folder.path(), test_catalog(), OpenOptions{steps(false)});
  EXPECT_TRUE(ran.empty());
  EXPECT_EQ(table_or_fail(again, "GESCOM", "VNTEMAIL").read("GENERAL")->get("DESIG"), "GENERAL v2 v3");

  // A new file is made at the latest layout without running the steps.
  TempFolder fresh;
  Database made = open_or_fail(fresh.path(), test_catalog(), OpenOptions{steps(true)});
  EXPECT_TRUE(ran.empty());
  EXPECT_EQ(made.schema_version(), 3);
}

TEST(Migration, FilesThatCannotBeOpenedAreLeftAsTheyWere) {
  TempFolder later;
  {
    Database db = open_or_fail(later.path());
    StoredTable templates = table_or_fail(db, "GESCOM", "VNTEMAIL");
    ASSERT_TRUE(templates.insert(make_record(templates, {{"CODE", "GENERAL"}})).ok());
  }
  raw_sql(later.file(), "PRAGMA user_version = 7");
  auto newer = Database::open(later.path(), test_catalog());
  ASSERT_FALSE(newer.ok());
  EXPECT_EQ(newer.error().kind, ErrorKind::NewerFile);
  EXPECT_EQ(newer.error().message, "La base de données " + later.file().string() +
                                       " a été écrite par une version plus récente du logiciel.");
  EXPECT_EQ(raw_integer(later.file(), "PRAGMA user_version"), 7);
  EXPECT_EQ(raw_integer(later.file(), "SELECT count(*) FROM \"GESCOM.VNTEMAIL\""), 1);

  TempFolder garbage;
  const std::string junk = "Ceci n'est pas une base de données, mais un fichier texte assez long pour SQLite.\n";
  { std::ofstream(garbage.file(), std::ios::binary) << junk << junk << junk; }
  auto broken = Database::open(garbage.path(), test_catalog());
  ASSERT_FALSE(broken.ok());
  EXPECT_EQ(broken.error().message, "La base de données " + garbage.file().string() + " est endommagée.");
  std::ifstream in(garbage.file(), std::ios::binary);
  EXPECT_EQ(std::string(std::istreambuf_iterator<char>(in), {}), junk + junk + junk);

  auto nowhere = Database::open(garbage.path() / "absent", test_catalog());
  ASSERT_FALSE(nowhere.ok());
  EXPECT_EQ(nowhere.error().message,
            "Le dossier de données " + (garbage.path() / "absent").string() + " n'existe pas.");

  Catalog twice = test_catalog();
  twice.add(session_table());
  auto doubled = Database::open(later.path(), std::move(twice));
  ASSERT_FALSE(doubled.ok());
  EXPECT_EQ(doubled.error().message, "La table BP.FORMA est définie deux fois.");
  Catalog keyless;
  keyless.add(TableDef{"BP", "SANS_CLE", {text_field("NOM", 10)}, "CODE"});
  EXPECT_EQ(Database::open(later.path(), std::move(keyless)).error().message,
            "La définition de la table BP.SANS_CLE est incorrecte.");
}

}  // namespace
}  // namespace storage_test
