#include "sendefac.h"

VNTEMAILSendefac::VNTEMAILSendefac(Evt* evt)
    : ProgrammeNonConstruit<Traitecr>(evt, {
                                          "INIT",
                                          "DEBUT",
                                          "DEFAUT_VALEURS",
                                          "FAIRE",
                                          "REMPLIR_DEFAUT",
                                          "CORR_ADMAIL",
                                          "LECTURE_EN_LIEN",
                                          "DESTINATAIRE_DEFAUT",
                                          "LECTURE_EN_LIEN_DOCUMENT"}) {
  nomBase("GESCOM");
  nomEcran("JAUEFAC");
}
