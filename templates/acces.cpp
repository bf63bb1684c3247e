#include "acces.h"

VNTEMAILAcces::VNTEMAILAcces(Evt* evt)
    : ProgrammeNonConstruit<Bseacc>(evt, {
                                          "DEBUT_ACTIVATION",
                                          "FIN_ACTIVATION",
                                          "GERER",
                                          "LST_CHOIX",
                                          "MODIFIER",
                                          "CREER",
                                          "LST_LISTE_VIDE",
                                          "LST_LISTE_PLEINE"}) {
  nomBase("GESCOM");
  nomTable("VNTEMAIL");
  nomEcran("ACCES");
}
