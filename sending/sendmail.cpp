#include "sendmail.h"

VNTEMAILSendmail::VNTEMAILSendmail(Evt* evt)
    : ProgrammeNonConstruit<Fenetre_simple>(evt, {
                                          "INIT",
                                          "DEBUT",
                                          "DEFAUT_VALEURS",
                                          "VERIF_PAR",
                                          "VVIA",
                                          "BCONSULT",
                                          "VALIDER",
                                          "ABANDON",
                                          "VALID_EFAC",
                                          "EFAC_BOUT",
                                          "CLIENT(1,3)",
                                          "CONT(1,3)",
                                          "CONTF(1,3)",
                                          "FOUR(1,3)",
                                          "REPR(1,3)",
                                          "APPOR(1,3)",
                                          "ACHETEUR(1,3)",
                                          "DEMANDEUR(1,3)",
                                          "AJOUTER_EMAIL",
                                          "BADD_JOINT",
                                          "BINIT_JOINT",
                                          "REMPLIR_DEFAUT",
                                          "CORR_ADMAIL",
                                          "LECTURE_EN_LIEN",
                                          "DOCUMENT_VENTE",
                                          "DOCUMENT_ACHAT",
                                          "DESTINATAIRE_DEFAUT",
                                          "LECTURE_ADRESSE_EN_LIEN",
                                          "LECTURE_EN_LIEN_DOCUMENT",
                                          "OBJET_DEFAUT",
                                          "MESSAGE_DEFAUT"}) {
  nomBase("GESCOM");
  nomEcran("SENDMAIL");
}
