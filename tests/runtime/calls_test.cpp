// Procedure calls, parameter binding, failures, flows and launches.
#include "fixture.h"
#include "test_programs.h"

namespace {

class CallTest : public HostTest {
 protected:
  void SetUp() override {
    HostTest::SetUp();
    auto& r = host::Registry::instance();
    r.add_library("TEST", &TestChargement, &TestDechargement);
    ASSERT_TRUE(r.load("TEST"));
  }
  void TearDown() override {
    host::Registry::instance().unload("TEST");
    HostTest::TearDown();
  }
  int call(const std::string& procedure, Evt* evt) {
    return host::call_procedure(*host, nullptr, "*", "TEST", "APPEL", procedure, evt);
  }
};

TEST_F(CallTest, ParametersBindByRankInAndInOut) {
  Chaine in("Société");
  Chaine out("avant");
  EvtParamRef ref{&in, &out};
  EXPECT_EQ(call("ECHO", &ref), 0);
  EXPECT_EQ(out.str(), "Société!");  // in-out comes back
  EXPECT_EQ(in.str(), "Société");    // input does not

  // By value: the event keeps the written value, the caller's variable is untouched.
  Chaine val_in("x");
  Chaine val_out("y");
  EvtParamVal val{&val_in, &val_out};
  EXPECT_EQ(call("echo", &val), 0);  // names are case-insensitive
  EXPECT_EQ(val_out.str(), "y");
  EXPECT_EQ(val.valeurParam(1).texte, "x!");

  // A branch calling its own branch with empty names.
  Chaine r;
  EvtParamRef one{&r};
  EXPECT_EQ(call("APPEL_INTERNE", &one), 0);
  EXPECT_EQ(r.str(), "interne!");
}

TEST_F(CallTest, MissingParametersStayEmpty) {
  // No event at all, an event without parameters, and fewer parameters than declared.
  EXPECT_EQ(call("SANS_PARAM", nullptr), 100);
  EvtParamVal none{InfoCode{}};
  EXPECT_EQ(call("SANS_PARAM", &none), 100);
  Chaine a("rempli");
  EvtParamRef partial{&a};
  EXPECT_EQ(call("SANS_PARAM", &partial), 101);
}

TEST_F(CallTest, HostFailureStaysInTheBranchAndCarriesItsName) {
  // With no event: reported through a by-value event; the caller sees a non-zero code, no exception.
  int code = 0;
  EXPECT_NO_THROW(code = call("ECHEC", nullptr));
  EXPECT_NE(code, 0);
  ASSERT_FALSE(host->log_entries().empty());
  EXPECT_EQ(host->log_entries().back().text,
            "Échec dans la branche ECHEC de TEST-APPEL : Variable inconnue : VXYZ");

  // Array branch: dispatched with its index, failure named after the handler.
  Chaine trace;
  EvtParamRef t{&trace};
  EXPECT_EQ(call("ACHETEUR1", &t), 0);
  EXPECT_EQ(call("ACHETEUR(3)", &t), 0);
  EXPECT_NE(call("ACHETEUR2", &t), 0);
  EXPECT_EQ(trace.str(), "132");
  EXPECT_EQ(host->log_entries().back().text,
            "Échec dans la branche ACHETEUR__1__3 de TEST-APPEL : Table inconnue : I_XYZ");
  EXPECT_NE(t.adresseC(), nullptr);  // the failure was attached to the caller's event
  EXPECT_EQ(t.adresseC()->branche(), "ACHETEUR__1__3");
}

TEST_F(CallTest, ErrorCodesAndUnknownProcedures) {
  EXPECT_EQ(call("CODE", nullptr), 7);
  try {
    call("NEXISTE_PAS", nullptr);
    FAIL() << "an unknown procedure must be a host failure";
  } catch (Exception* e) {
    EXPECT_EQ(e->message(), "Procédure inconnue : NEXISTE_PAS du programme TEST-APPEL");
    hoteDetruire(e);
  }
  try {
    host::call_procedure(*host, nullptr, "*", "SYSRIEN", "INTERFACE", "LECTURE", nullptr);
    FAIL();
  } catch (Exception* e) {
    EXPECT_EQ(e->message(), "Procédure inconnue : SYSRIEN.INTERFACE.LECTURE");
    hoteDetruire(e);
  }
  // Components are procedures too.
  host->components().add("SYSTEST", "DOUBLE", [](host::ComponentCall& c) {
    c.set_integer(0, c.integer(0) * 2);
    return c.integer(0) > 10 ? 1 : 0;
  });
  Entier n(4);
  EvtParamRef e{&n};
  EXPECT_EQ(host::call_procedure(*host, nullptr, "*", "SYSTEST", "INTERFACE", "DOUBLE", &e), 0);
  EXPECT_EQ(n.entier(), 8);
  EXPECT_EQ(host::call_procedure(*host, nullptr, "*", "SYSTEST", "INTERFACE", "DOUBLE", &e), 1);
}

TEST_F(CallTest, ProcessingProgramRunsItsHooksInOrder) {
  Chaine trace;
  EvtParamRef e{&trace};
  EXPECT_EQ(host::run_module(*host, nullptr, "TEST", "FLUX", &e), 3);
  EXPECT_EQ(trace.str(), "init,debut,faire");
}

TEST_F(CallTest, ScreenProgramLoopsUntilItEnds) {
  Chaine trace;
  EvtParamRef e{&trace};
  dialogs.actions = {{host::ScreenAction::Set, "V_OBJET", "Relance"},
                     {host::ScreenAction::Branch, "VALIDER", ""},
                     {host::ScreenAction::Branch, "VALIDER", ""}};
  dialogs.answers = {"0", "1"};  // "Non" keeps the screen open, "Oui" ends it
  EXPECT_EQ(host::run_module(*host, nullptr, "TEST", "ECRAN", &e), 0);
  EXPECT_EQ(trace.str(), "valider(Relance),valider(Relance),");
  const host::ScreenModel& s = host->screens().at("TEST-ECRAN");
  EXPECT_TRUE(s.opened);
  EXPECT_EQ(s.screen, "ECRAN_TEST");
  EXPECT_FALSE(s.state("BINIT_JOINT").allowed);
  EXPECT_EQ(s.state("V_OBJET").shown, "Votre document");
  ASSERT_EQ(dialogs.shown.size(), 2u);
  EXPECT_EQ(dialogs.shown[0].text, "Confirmez-vous l'opération ?");

  // No more action: the host abandons the screen.
  trace = "";
  EXPECT_EQ(host::run_module(*host, nullptr, "TEST", "ECRAN", &e), 0);
  EXPECT_EQ(trace.str(), "abandon,");
}

TEST_F(CallTest, LaunchedProgramRunsAfterTheCallChain) {
  Chaine trace;
  EvtParamRef e{&trace};
  dialogs.actions = {{host::ScreenAction::Branch, "LANCER", ""}};
  host->run_launched();
  EXPECT_EQ(host::run_module(*host, nullptr, "TEST", "ECRAN", &e), 0);
  // The launch ran once the screen program had returned, with its own by-value event.
  EXPECT_EQ(trace.str(), "lancer,abandon,");
}

TEST_F(CallTest, RefusedAllocationIsAHostFailureNotACrash) {
  host->fail_allocation_after(1);  // the program object itself
  try {
    host::run_module(*host, nullptr, "TEST", "FLUX", nullptr);
    FAIL();
  } catch (Exception* e) {
    EXPECT_EQ(e->message(), "Impossible de créer le programme TEST-FLUX");
    hoteDetruire(e);
  }
}

}  // namespace
