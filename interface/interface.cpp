#include "interface.h"

VNTEMAILInterface::VNTEMAILInterface(Evt* evt)
    : ProgrammeNonConstruit<Bseinter>(evt, {
                                          "GES_FORM",
                                          "INITIALISE_PARAMETRAGE",
                                          "INIT_PAR_1001",
                                          "INIT_PARAM_2806",
                                          "INIT_PARAM_1038",
                                          "ENVOYER_MAIL",
                                          "ENVOYER_MAIL_DIDACTIS",
                                          "INIT_PARAM_DIDACTIS",
                                          "INIT_PARAM_DIDACTIS_257",
                                          "INIT_PARAM_DIDACTIS_280",
                                          "INIT_PARAM_DIDACTIS_298",
                                          "ENVOI_MAIL",
                                          "RETOURNE_TEXTE_INTERPRETABLE"}) {
  nomBase("GESCOM");
}
