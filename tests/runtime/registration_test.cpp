// The module's registration records and program anatomy.
#include "fixture.h"
#include "host/runtime/program_state.h"

namespace {

class RegistrationTest : public HostTest {
 protected:
  void SetUp() override {
    HostTest::SetUp();
    auto& r = host::Registry::instance();
    r.add_library("VNTEMAIL", &VNTEMAILChargement, &VNTEMAILDechargement);
    ASSERT_TRUE(r.load("VNTEMAIL"));
  }
  void TearDown() override {
    host::Registry::instance().unload("VNTEMAIL");
    HostTest::TearDown();
  }
};

std::string describe(const host::Registry::Record& r) {
  if (auto* g = std::get_if<Global>(&r)) return "G " + g->contexte;
  if (auto* m = std::get_if<Module>(&r)) return "M " + m->nom;
  return "S";
}

TEST_F(RegistrationTest, RecordsInLoadOrderOnceOnly) {
  std::vector<std::string> got;
  for (const auto& r : host::Registry::instance().records()) got.push_back(describe(r));
  std::vector<std::string> want = {
      "G VNTEMAIL", "M VNTEMAIL-ACCES", "S", "M VNTEMAIL-AJOUT_VAR_PRED", "M VNTEMAIL-GESTION", "S",
      "M VNTEMAIL-GES_FORM", "S", "G VNTEMAIL", "M VNTEMAIL-INTERFACE", "S", "G VNTEMAIL", "G GESCOM",
      "M VNTEMAIL-SENDEFAC", "S", "G VNTEMAIL", "G GESCOM", "M VNTEMAIL-ENVOI_MAIL", "M VNTEMAIL-SENDMAIL",
      "M VNTEMAIL-TRANSFORMER", "S", "G VNTEMAIL", "M VNTEMAIL-SMAIL_FOR", "S"};
  EXPECT_EQ(got, want);
  EXPECT_EQ(host::Registry::instance().find("vntemail-transformer")->description,
            "Transformation de jetons dans un document ASCII");
  EXPECT_EQ(host::Registry::instance().find("VNTEMAIL-SENDMAIL")->description, "");
  Donnee* flag = host::Registry::instance().global("$$|VCODECRASHFLAG");
  ASSERT_NE(flag, nullptr);
  EXPECT_EQ(flag->texte(), "CRASHFLAG");
  EXPECT_EQ(flag->acces(), ACCES_GLOBAL);

  // A second load, or a second record of the same program, is refused.
  EXPECT_FALSE(host::Registry::instance().load("VNTEMAIL"));
  EXPECT_FALSE(Registre::enregistrer(Module{"", "VNTEMAIL-SENDMAIL", nullptr, false, ""}));

  // Unloading removes everything, and a new load registers again.
  host::Registry::instance().unload("VNTEMAIL");
  EXPECT_EQ(host::Registry::instance().find("VNTEMAIL-SENDMAIL"), nullptr);
  EXPECT_EQ(host::Registry::instance().global("$$|VCODECRASHFLAG"), nullptr);
  EXPECT_TRUE(host::Registry::instance().load("VNTEMAIL"));
}

TEST_F(RegistrationTest, ProgramsCarryTheirNamesAndBranches) {
  struct Case {
    const char* program;
    const char* base;
    const char* screen;
    std::size_t branches;
    const char* first;
    const char* last;
  };
  const Case cases[] = {
      {"VNTEMAIL-ACCES", "GESCOM", "ACCES", 8, "DEBUT_ACTIVATION", "LST_LISTE_PLEINE"},
      {"VNTEMAIL-AJOUT_VAR_PRED", "GESCOM", "ADDVARPR", 12, "DEBUT", "CTRL_CHOISIR"},
      {"VNTEMAIL-GESTION", "GESCOM", "GESTION", 23, "INIT", "REMPLACE_UN_TAG"},
      {"VNTEMAIL-GES_FORM", "GESCOM", "GES_FORM", 24, "INIT", "REMPLACE_UN_TAG"},
      {"VNTEMAIL-INTERFACE", "GESCOM", "", 13, "GES_FORM", "RETOURNE_TEXTE_INTERPRETABLE"},
      {"VNTEMAIL-SENDEFAC", "GESCOM", "JAUEFAC", 9, "INIT", "LECTURE_EN_LIEN_DOCUMENT"},
      {"VNTEMAIL-ENVOI_MAIL", "GESCOM", "", 4, "INIT", "FIN_ENVOI_MAIL"},
      {"VNTEMAIL-SENDMAIL", "GESCOM", "SENDMAIL", 31, "INIT", "MESSAGE_DEFAUT"},
      {"VNTEMAIL-TRANSFORMER", "", "", 8, "INIT", "SORTIE"},
      {"VNTEMAIL-SMAIL_FOR", "GESCOM", "MAIL_FOR", 22, "INIT", "MAJ_FLAG"},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.program);
    Automate* p = host::create_program(c.program, nullptr);
    EXPECT_EQ(p->nomProgramme(), c.program);
    EXPECT_EQ(p->nomBase(), c.base);
    EXPECT_EQ(p->nomEcran(), c.screen);
    auto names = p->branches();
    ASSERT_EQ(names.size(), c.branches);
    EXPECT_EQ(names.front(), c.first);
    EXPECT_EQ(names.back(), c.last);
    host::destroy_program(p);
  }
}

TEST_F(RegistrationTest, BranchesNotBuiltNeverPretendSuccess) {
  // A whole program and a single procedure both report a non-zero code.
  Entier err;
  EvtParamRef e{&err};
  EXPECT_NE(host::run_module(*host, nullptr, "VNTEMAIL", "ENVOI_MAIL", &e), 0);
  EXPECT_NE(host::call_procedure(*host, nullptr, "*", "VNTEMAIL", "INTERFACE", "INIT_PAR_1001", nullptr), 0);
}

}  // namespace
