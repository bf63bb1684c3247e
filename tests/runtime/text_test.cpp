// Character semantics of text over UTF-8, and the conversions of values.
#include <gtest/gtest.h>

#include "frame/host_runtime.h"
#include "host/runtime/text/utf8.h"
#include "host/runtime/value_text.h"

namespace {

TEST(Text, LengthSubstringPositionCountCharacters) {
  Chaine t("é€😀a");  // 2, 3, 4 and 1 bytes
  EXPECT_EQ(t.longueur(), 4);
  EXPECT_EQ(t.sousChaine(1, 1).str(), "é");
  EXPECT_EQ(t.sousChaine(2, 3).str(), "€😀");
  EXPECT_EQ(t.sousChaine(3).str(), "😀a");  // end 0 = the rest
  EXPECT_EQ(t.sousChaine(4, 10).str(), "a");
  EXPECT_EQ(t.sousChaine(5).str(), "");
  EXPECT_EQ(t.sousChaine(3, 2).str(), "");  // end before start
  EXPECT_EQ(t.position("😀"), 3);
  EXPECT_EQ(t.position("a"), 4);
  EXPECT_EQ(t.position("z"), 0);
  EXPECT_EQ(t.position("é", 2), 0);
  EXPECT_EQ(t.droite(2).str(), "😀a");
  EXPECT_EQ(Chaine("Votre facture n° ").longueur(), 17);

  // Slicing a 255-character text of two-byte letters never splits one.
  std::string s;
  for (int i = 0; i < 256; ++i) s += "é";
  Chaine big(s);
  EXPECT_EQ(big.sousChaine(1, 255).longueur(), 255);
  EXPECT_EQ(big.sousChaine(256).str(), "é");
  EXPECT_TRUE(host::text::is_valid_utf8(big.sousChaine(2, 254).str()));
}

TEST(Text, CaseOfFrenchLetters) {
  EXPECT_EQ(Chaine("élève à Noël, œuvre çà").majuscules().str(), "ÉLÈVE À NOËL, ŒUVRE ÇÀ");
  EXPECT_EQ(Chaine("ÉLÈVE ŸVES ŒIL").minuscules().str(), "élève ÿves œil");
  EXPECT_EQ(Chaine("formule=").majuscules().str(), "FORMULE=");
  EXPECT_TRUE(host::text::iequals("vnTEfac", "VNTEFAC"));
  EXPECT_TRUE(host::text::iequals("société", "SOCIÉTÉ"));
}

TEST(Text, InvalidUtf8IsReadAsWindows1252) {
  // A Windows-1252 "é" (0xE9), a lone continuation byte, a truncated sequence, an overlong "/".
  struct Case {
    std::string in;
    std::string out;
  } cases[] = {
      {"caf\xE9", "café"},
      {"a\x80z", "a€z"},
      {"\xE2\x82", "â‚"},
      {"\xC0\xAF", "À¯"},
      {"ok é", "ok é"},  // valid text stays as it is
  };
  for (const auto& c : cases) {
    Chaine t(c.in);
    EXPECT_EQ(t.str(), c.out);
    EXPECT_TRUE(host::text::is_valid_utf8(t.str()));
  }
  // Neighbours are untouched: concatenation of a bad and a good text.
  Chaine a(std::string("\xE9t\xE9"));
  Chaine b("été");
  EXPECT_EQ((a + b).str(), "étéété");
  EXPECT_EQ((a + b).longueur(), 6);
}

TEST(Values, ConversionsAndTextForms) {
  Entier n(42);
  Double d(12.5);
  Date dt(2026, 12, 6);
  Chaine c;
  c = n;
  EXPECT_EQ(c.str(), "42");
  EXPECT_EQ(d.texte(), "12,5");
  EXPECT_EQ(Double(3.0).texte(), "3");
  EXPECT_EQ(dt.texte(), "06/12/2026");
  EXPECT_EQ(Date().texte(), "");
  Date parsed;
  parsed = Chaine("06/12/2026");
  EXPECT_EQ(parsed.jour(), 6);
  Entier e;
  e = Chaine("17");
  EXPECT_EQ(e.entier(), 17);
  e = Chaine("pas un nombre");
  EXPECT_EQ(e.entier(), 0);
  EXPECT_TRUE(Chaine("1") == 1);
  EXPECT_TRUE(n == 42);
  EXPECT_EQ((Chaine("n° ") + n).str(), "n° 42");
  EXPECT_EQ(Entier(2) + 3, 5);  // numbers add as numbers
  EXPECT_EQ(host::format_decimal(-0.25), "-0,25");
  EXPECT_FALSE(host::parse_date("31/02/2026").has_value());
}

}  // namespace
