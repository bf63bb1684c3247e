#include "ges_form.h"

VNTEMAILGes_form::VNTEMAILGes_form(Evt* evt)
    : ProgrammeNonConstruit<Bsegestion>(evt, {
                                          "INIT",
                                          "AVANT_DEBUT",
                                          "DEBUT_FICHE",
                                          "ADRESSES_PREDEFINIES",
                                          "CODE",
                                          "DESIG",
                                          "DEBUT_MODIFICATION",
                                          "DEBUT_VISUALISATION",
                                          "DEBUT_CREATION",
                                          "VPREDEFINIE_DEST",
                                          "VPREDEFINIE_COPIE",
                                          "VPREDEFINIE_CACHEE",
                                          "RECUPERE_DESTINATAIRES",
                                          "VALIDATION",
                                          "SAUVE_DESTINATAIRES",
                                          "SAUVE_MESS",
                                          "AUTORISE_CHAMP_TABLE",
                                          "REMPLIS_CHX_VARPRED",
                                          "VAR_PRED(1,10)",
                                          "SUPVAR_PRED(1,10)",
                                          "BTN_VARPRED",
                                          "AJOUT_VAR_PRED",
                                          "MODVAR_PRED(1,10)",
                                          "REMPLACE_UN_TAG"}) {
  nomBase("GESCOM");
  nomTable("VNTEMAIL");
  nomEcran("GES_FORM");
}
