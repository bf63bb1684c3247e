#include "test_programs.h"

TestAppel::TestAppel(Evt* evt) : Traitmnt(evt) {
  addBranch("ECHO", &TestAppel::echo);
  addBranch("ECHEC", &TestAppel::echec);
  addBranch("ACHETEUR(1,3)", &TestAppel::acheteur__1__3);
  addBranch("CODE", &TestAppel::code);
  addBranch("SANS_PARAM", &TestAppel::sans_param);
  addBranch("APPEL_INTERNE", &TestAppel::appel_interne);
}

void TestAppel::echo(Evt* evt) {
  executerBranche(*this, "ECHO", evt, [&] {
    Chaine VIN("VIN", this);
    Chaine VOUT("VOUT", this);
    if (evt && evt->nbParams() != 0) {
      evt->param(0, VIN, PARAM_ENTREE);
      evt->param(1, VOUT, PARAM_ENTREE_SORTIE);
    }
    VOUT = VIN + "!";
    VIN = "changé";  // an input parameter never reaches the caller
  });
}

void TestAppel::echec(Evt* evt) {
  executerBranche(*this, "ECHEC", evt, [&] { leverException("variable", "Variable inconnue : VXYZ"); });
}

void TestAppel::acheteur__1__3(Evt* evt) {
  executerBranche(*this, "ACHETEUR__1__3", evt, [&] {
    Chaine VTRACE("VTRACE", this);
    if (evt && evt->nbParams() != 0) evt->param(0, VTRACE, PARAM_ENTREE_SORTIE);
    VTRACE += std::to_string(indice());
    if (indice() == 2) leverException("table", "Table inconnue : I_XYZ");
  });
}

void TestAppel::code(Evt* evt) {
  executerBranche(*this, "CODE", evt, [&] { erreurMethode(7, evt); });
}

void TestAppel::sans_param(Evt* evt) {
  executerBranche(*this, "SANS_PARAM", evt, [&] {
    Chaine A("A", this);
    Entier B("B", this, ACCES_LOCAL, 5);
    Chaine C("C", this, ACCES_LOCAL, "initial");
    if (evt && evt->nbParams() != 0) {
      evt->param(0, A);
      evt->param(1, B);
      evt->param(2, C);
    }
    // Tell the test what the parameters hold through the error code.
    int code = 0;
    if (!A.estVide()) code += 1;
    if (B != 5) code += 2;
    if (!(C == "initial")) code += 4;
    erreurMethode(100 + code, evt);
  });
}

void TestAppel::appel_interne(Evt* evt) {
  executerBranche(*this, "APPEL_INTERNE", evt, [&] {
    Chaine VOUT("VOUT", this);
    if (evt && evt->nbParams() != 0) evt->param(0, VOUT, PARAM_ENTREE_SORTIE);
    Chaine VIN("VIN2", this, ACCES_LOCAL, "interne");
    EvtParamRef e{&VIN, &VOUT};
    appelerProcedure("", "", "", "ECHO", &e, 0);
  });
}

TestFlux::TestFlux(Evt* evt) : Traitmnt(evt), TRACE("TRACE", this, ACCES_PROGRAMME) {
  addBranch("INIT", &TestFlux::init);
  addBranch("DEBUT", &TestFlux::debut);
  addBranch("FAIRE", &TestFlux::faire);
  if (evt && evt->nbParams() != 0) evt->param(0, TRACE, PARAM_ENTREE_SORTIE);
}
void TestFlux::init(Evt* evt) {
  executerBranche(*this, "INIT", evt, [&] { TRACE += "init,"; });
}
void TestFlux::debut(Evt* evt) {
  executerBranche(*this, "DEBUT", evt, [&] { TRACE += "debut,"; });
}
void TestFlux::faire(Evt* evt) {
  executerBranche(*this, "FAIRE", evt, [&] {
    TRACE += "faire";
    erreurMethode(3, evt);
  });
}

TestEcran::TestEcran(Evt* evt)
    : Fenetre_simple(evt), TRACE("TRACE", this, ACCES_PROGRAMME), V_OBJET("V_OBJET", this, ACCES_PROGRAMME) {
  nomEcran("ECRAN_TEST");
  addBranch("DEBUT", &TestEcran::debut);
  addBranch("VALIDER", &TestEcran::valider);
  addBranch("ABANDON", &TestEcran::abandon);
  addBranch("LANCER", &TestEcran::lancer);
  if (evt && evt->nbParams() != 0) evt->param(0, TRACE, PARAM_ENTREE_SORTIE);
}
void TestEcran::debut(Evt* evt) {
  executerBranche(*this, "DEBUT", evt, [&] {
    ecran().interdit("BINIT_JOINT");
    Automate::debut(evt);
    V_OBJET = "Votre document";
    ecran().affiche("V_OBJET");
  });
}
void TestEcran::valider(Evt* evt) {
  executerBranche(*this, "VALIDER", evt, [&] {
    TRACE += "valider(" + V_OBJET.str() + "),";
    if (BoiteDialogue("Attention", "Confirmez-vous l'opération ?", 2, {"1~Oui", "$0~Non"}) == 1) {
      sortir(nullptr, 0);
    } else {
      rejeter(evt);
    }
  });
}
void TestEcran::abandon(Evt* evt) {
  executerBranche(*this, "ABANDON", evt, [&] {
    TRACE += "abandon,";
    Automate::abandon(evt);
  });
}
void TestEcran::lancer(Evt* evt) {
  executerBranche(*this, "LANCER", evt, [&] {
    Chaine valeur("lancé:");
    lancerModule("", "TEST", "FLUX", hoteCreer<EvtParamVal>(std::initializer_list<const Donnee*>{&valeur}));
    TRACE += "lancer,";
  });
}

namespace {
template <class P>
Automate* fabriquer(Evt* evt) {
  return hoteCreer<P>(evt);
}
}  // namespace

bool TestChargement() {
  Registre::enregistrer(Global{"TEST", "TEST"});
  bool ok = Registre::enregistrer(Module{"", "TEST-APPEL", fabriquer<TestAppel>, false, ""});
  ok &= Registre::enregistrer(Module{"", "TEST-FLUX", fabriquer<TestFlux>, false, ""});
  ok &= Registre::enregistrer(Module{"", "TEST-ECRAN", fabriquer<TestEcran>, false, ""});
  Registre::enregistrer(Source{"TEST", 0});
  return ok;
}
void TestDechargement() {}
