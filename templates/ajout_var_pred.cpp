#include "ajout_var_pred.h"

VNTEMAILAjout_var_pred::VNTEMAILAjout_var_pred(Evt* evt)
    : ProgrammeNonConstruit<Traitecr>(evt, {
                                          "DEBUT",
                                          "ABANDON",
                                          "VALID",
                                          "VALIDER",
                                          "SUITE",
                                          "RETOUR",
                                          "RETOURN",
                                          "P1",
                                          "P2",
                                          "P3",
                                          "CHOIX_CHAMP",
                                          "CTRL_CHOISIR"}) {
  nomBase("GESCOM");
  nomEcran("ADDVARPR");
}
