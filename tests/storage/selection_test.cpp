// Criteria with each operator, orders, the live cursor and counts.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>

#include "storage_fixture.h"

namespace storage_test {
namespace {

class SelectionTest : public ::testing::Test {
 protected:
  void SetUp() override {
    struct Row {
      const char* ident;
      const char* cofor;
      const char* datdb;
      const char* nbstag;
      const char* prix;
    };
    const Row rows[] = {
        {"1", "ANG-01", "2024-01-08", "12", "950.5"},  {"2", "ANG-02", "2024-02-05", "9", "99.5"},
        {"3", "A_G-03", "2024-02-19", "15", "1200"},   {"4", "100%", "2024-03-04", "0", "0"},
        {"5", "1000", "", "1", "99.75"},               {"6", "Été-2024", "2024-07-01", "120", "12.5"},
        {"7", "Étape", "2023-12-31", "-3", "-4"},      {"8", "ang-08", "2024-01-15", "12", "950.5"},
    };
    for (const Row& row : rows) {
      ASSERT_TRUE(sessions.insert(make_record(sessions, {{"IDENT", row.ident},
                                                         {"COFOR", row.cofor},
                                                         {"DATDB", row.datdb},
                                                         {"NBSTAG", row.nbstag},
                                                         {"PRIX", row.prix}}))
                      .ok());
    }
  }

  TempFolder folder;
  Database db = open_or_fail(folder.path());
  StoredTable sessions = table_or_fail(db, "BP", "FORMA");
};

Criterion where(const char* field, const char* op, const char* value) {
  auto parsed = parse_operator(op);
  EXPECT_TRUE(parsed.ok()) << op;
  return Criterion{field, 1, parsed.ok() ? *parsed : Operator::Equal, value};
}

TEST_F(SelectionTest, EachOperatorOnTextIntegerDateAndDecimal) {
  struct Case {
    std::vector<Criterion> criteria;
    const char* keys;
  };
  const Case cases[] = {
      {{}, "1 2 3 4 5 6 7 8"},
      // Text, compared byte for byte: case kept, "_" (0x5F) after "N", "É" after ASCII.
      {{where("COFOR", "=", "ANG-01")}, "1"},
      {{where("COFOR", "/", "ANG")}, "1 2"},
      {{where("COFOR", "/", "A_G")}, "3"},     // "_" is no wildcard
      {{where("COFOR", "/", "100%")}, "4"},    // nor "%"
      {{where("COFOR", "/", "10")}, "4 5"},
      {{where("COFOR", "/", "Ét")}, "6 7"},
      {{where("COFOR", "/", "Été")}, "6"},
      {{where("COFOR", "/", "")}, "1 2 3 4 5 6 7 8"},
      {{where("COFOR", "#", "ANG-01")}, "2 3 4 5 6 7 8"},
      {{where("COFOR", "<", "ANG-02")}, "1 4 5"},
      {{where("COFOR", "<=", "ANG-02")}, "1 2 4 5"},
      {{where("COFOR", ">", "ANG-02")}, "3 6 7 8"},
      {{where("COFOR", ">=", "ang")}, "6 7 8"},
      // Integers, compared as numbers ("12" > "9"); "" is zero.
      {{where("NBSTAG", "=", "12")}, "1 8"},
      {{where("NBSTAG", "#", "12")}, "2 3 4 5 6 7"},
      {{where("NBSTAG", ">", "9")}, "1 3 6 8"},
      {{where("NBSTAG", ">=", "9")}, "1 2 3 6 8"},
      {{where("NBSTAG", "<", "1")}, "4 7"},
      {{where("NBSTAG", "<=", "")}, "4 7"},
      {{where("NBSTAG", "=", "")}, "4"},
      {{where("NBSTAG", "/", "1")}, "1 3 5 6 8"},  // on the canonical text, 0 being ""
      {{where("NBSTAG", "/", "-")}, "7"},
      // Dates, in date order; "" is an empty date, before every date.
      {{where("DATDB", "=", "2024-02-05")}, "2"},
      {{where("DATDB", "<", "2024-01-15")}, "1 5 7"},
      {{where("DATDB", ">=", "2024-02-19")}, "3 4 6"},
      {{where("DATDB", "/", "2024-0")}, "1 2 3 4 6 8"},
      {{where("DATDB", "/", "2024-02")}, "2 3"},
      {{where("DATDB", "#", "")}, "1 2 3 4 6 7 8"},
      {{where("DATDB", "<=", "")}, "5"},
      // Decimals.
      {{where("PRIX", ">", "99.5")}, "1 3 5 8"},
      {{where("PRIX", "=", "950.50")}, "1 8"},
      {{where("PRIX", "<", "")}, "7"},
      // Several criteria: all must hold.
      {{where("NBSTAG", ">=", "9"), where("DATDB", "<", "2024-02-10"), where("COFOR", "#", "ANG-01")}, "2 8"},
      {{where("COFOR", "/", "ANG"), where("COFOR", "/", "ANG-02")}, "2"},
  };
  for (const Case& c : cases) {
    std::string description;
    for (const Criterion& criterion : c.criteria) description += criterion.field + " " + criterion.value + "; ";
    EXPECT_EQ(keys_of(sessions, {c.criteria, {}}), c.keys) << description;
    auto count = sessions.count(c.criteria);
    ASSERT_TRUE(count.ok()) << description;
    EXPECT_EQ(*count, static_cast<std::int64_t>(std::count(c.keys, c.keys + std::strlen(c.keys), ' ') +
                                                (*c.keys != 0 ? 1 : 0)))
        << description;
  }
}

TEST_F(SelectionTest, BadCriteriaAreRefused) {
  struct Case {
    Criterion criterion;
    ErrorKind kind;
    const char* message;
  };
  const Case cases[] = {
      {{"NOM", 1, Operator::Equal, "x"}, ErrorKind::UnknownName, "Le champ NOM n'existe pas dans la table BP.FORMA."},
      {{"COFOR", 2, Operator::Equal, "x"}, ErrorKind::UnknownName,
       "Le champ COFOR de la table BP.FORMA n'a pas d'élément 2 (il en a 1)."},
      {{"NBSTAG", 1, Operator::Greater, "douze"}, ErrorKind::InvalidValue,
       "Le critère sur le champ NBSTAG de la table BP.FORMA attend un nombre entier, pas \"douze\"."},
      {{"PRIX", 1, Operator::Less, "9,5"}, ErrorKind::InvalidValue,
       "Le critère sur le champ PRIX de la table BP.FORMA attend un nombre décimal écrit avec un point, pas \"9,5\"."},
      {{"PRIX", 1, Operator::BeginsWith, "9"}, ErrorKind::InvalidValue,
       "L'opérateur / (commence par) ne s'applique pas au champ décimal PRIX de la table BP.FORMA."},
  };
  for (const Case& c : cases) {
    auto cursor = sessions.select({{c.criterion}, {}});
    ASSERT_FALSE(cursor.ok()) << c.message;
    EXPECT_EQ(cursor.error().kind, c.kind);
    EXPECT_EQ(cursor.error().message, c.message);
    EXPECT_EQ(sessions.count({c.criterion}).error().message, c.message);
  }
  auto order = sessions.select({{}, Order{"NOM"}});
  EXPECT_EQ(order.error().message, "Le champ NOM n'existe pas dans la table BP.FORMA.");
  for (const char* symbol : {"==", "<>", "", "LIKE", "!="}) {
    auto op = parse_operator(symbol);
    ASSERT_FALSE(op.ok()) << symbol;
    EXPECT_EQ(op.error().message,
              "L'opérateur \"" + std::string(symbol) + "\" est inconnu (opérateurs : =, /, #, <, <=, >, >=).");
  }
}

TEST_F(SelectionTest, OrdersAreNumericForNumbersAndKeepKeyOrderOnTies) {
  struct Case {
    std::optional<Order> order;
    const char* keys;
  };
  const Case cases[] = {
      {std::nullopt, "1 2 3 4 5 6 7 8"},
      {Order{"NBSTAG"}, "7 4 5 2 1 8 3 6"},
      {Order{"NBSTAG", 1, true}, "6 3 8 1 2 5 4 7"},
      {Order{"DATDB"}, "5 7 1 8 2 3 4 6"},
      {Order{"PRIX"}, "7 4 6 2 5 1 8 3"},
      {Order{"COFOR"}, "4 5 1 2 3 8 7 6"},
      {Order{"IDENT", 1, true}, "8 7 6 5 4 3 2 1"},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(keys_of(sessions, {{}, c.order}), c.keys) << (c.order ? c.order->field : "key");
  }
}

TEST_F(SelectionTest, CursorWalksRestartsAndStopsAtTheEnd) {
  auto cursor = sessions.select({{where("NBSTAG", "=", "12")}, Order{"IDENT", 1, true}});
  ASSERT_TRUE(cursor.ok());
  ASSERT_TRUE(*cursor->first());
  EXPECT_EQ(cursor->record().key(), "8");
  EXPECT_EQ(cursor->record().get("COFOR"), "ang-08");
  ASSERT_TRUE(*cursor->next());
  EXPECT_EQ(cursor->record().key(), "1");
  EXPECT_FALSE(*cursor->next());
  EXPECT_FALSE(*cursor->next());  // stays at the end, does not start over
  ASSERT_TRUE(*cursor->first());  // first() does
  EXPECT_EQ(cursor->record().key(), "8");
  cursor->close();
  EXPECT_FALSE(*cursor->next());

  // Two walks of the same selection at once do not share a position.
  auto a = sessions.select({{where("COFOR", "/", "ANG")}, {}});
  auto b = sessions.select({{where("COFOR", "/", "ANG")}, {}});
  ASSERT_TRUE(*a->next());
  ASSERT_TRUE(*b->next());
  ASSERT_TRUE(*b->next());
  EXPECT_EQ(a->record().key(), "1");
  EXPECT_EQ(b->record().key(), "2");

  auto none = sessions.select({{where("COFOR", "=", "ABSENT")}, {}});
  EXPECT_FALSE(*none->first());
  EXPECT_FALSE(*none->next());
}

TEST(Selection, RepeatedFieldEntriesAreSelectedAndOrderedOneByOne) {
  TempFolder folder;
  Database db = open_or_fail(folder.path());
  StoredTable templates = table_or_fail(db, "GESCOM", "VNTEMAIL");
  const std::pair<const char*, const char*> tags[] = {
      {"VNTEFAC", "DATEDOC"}, {"VNTECH", ""}, {"VNTEBL", "DATEDOC"}, {"M_ATTFIS", ""}, {"QPRECOM", "AUTRE"}};
  for (const auto& [code, second] : tags) {
    Record record = make_record(templates, {{"CODE", code}});
    ASSERT_TRUE(record.set("NOMTAG", 1, "NUMERODOC").ok());
    ASSERT_TRUE(record.set("NOMTAG", 2, second).ok());
    ASSERT_TRUE(templates.insert(record).ok());
  }
  EXPECT_EQ(keys_of(templates, {{{"NOMTAG", 2, Operator::Equal, "DATEDOC"}}, {}}), "VNTEBL VNTEFAC");
  EXPECT_EQ(keys_of(templates, {{{"NOMTAG", 2, Operator::Differs, ""}}, Order{"NOMTAG", 2, true}}),
            "VNTEFAC VNTEBL QPRECOM");
  EXPECT_EQ(*templates.count({{"NOMTAG", 1, Operator::Equal, "NUMERODOC"}}), 5);
}

}  // namespace
}  // namespace storage_test
