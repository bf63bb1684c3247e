#include "smail_for.h"

VNTEMAILSmail_for::VNTEMAILSmail_for(Evt* evt)
    : ProgrammeNonConstruit<Fenetre_simple>(evt, {
                                          "INIT",
                                          "DEBUT",
                                          "DEFAUT_VALEURS",
                                          "VVIA",
                                          "BCONSULT",
                                          "VERIF_PAR",
                                          "VALIDER",
                                          "ABANDON",
                                          "CLIENT(1,3)",
                                          "CONT(1,3)",
                                          "ANIM(1,3)",
                                          "AJOUTER_EMAIL",
                                          "BADD_JOINT",
                                          "BINIT_JOINT",
                                          "REMPLIR_DEFAUT_ADR",
                                          "DOCUMENT_FORM",
                                          "LECTURE_PRINC",
                                          "LECTURE_EN_LIEN",
                                          "DESTINATAIRE_DEFAUT",
                                          "OBJET_DEFAUT",
                                          "MESSAGE_DEFAUT",
                                          "MAJ_FLAG"}) {
  nomBase("GESCOM");
  nomEcran("MAIL_FOR");
}
