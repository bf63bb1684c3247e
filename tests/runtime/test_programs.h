// Programs of a small test library "TEST", written as the module writes its own.
#pragma once

#include "branche.h"
#include "host_runtime.h"

/// Procedures with parameters, failures and error codes.
class TestAppel : public Traitmnt {
 public:
  explicit TestAppel(Evt* evt);
  void echo(Evt* evt);        // ECHO(VIN, VOUT in-out): VOUT = VIN + "!"
  void echec(Evt* evt);       // ECHEC: a host failure
  void acheteur__1__3(Evt* evt);  // ACHETEUR(1,3)(VTRACE in-out): appends the index; fails on 2
  void code(Evt* evt);        // CODE: error code 7
  void sans_param(Evt* evt);  // SANS_PARAM(A, B, C): VTRACE-like report in the log
  void appel_interne(Evt* evt);  // APPEL_INTERNE(VOUT in-out): calls its own ECHO
};

/// Records the hooks of a processing program in its first parameter (in-out).
class TestFlux : public Traitmnt {
 public:
  explicit TestFlux(Evt* evt);
  void init(Evt* evt) override;
  void debut(Evt* evt) override;
  void faire(Evt* evt) override;
  Chaine TRACE;
};

/// A screen program: VALIDER asks a question, ends on "1", stays open otherwise.
class TestEcran : public Fenetre_simple {
 public:
  explicit TestEcran(Evt* evt);
  void debut(Evt* evt) override;
  void valider(Evt* evt);
  void abandon(Evt* evt) override;
  void lancer(Evt* evt);  // LANCER: launches TEST-FLUX, which runs after this call chain
  Chaine TRACE;
  Chaine V_OBJET;
};

bool TestChargement();
void TestDechargement();
