#include "envoi_mail.h"

VNTEMAILEnvoi_mail::VNTEMAILEnvoi_mail(Evt* evt)
    : ProgrammeNonConstruit<Traitmnt>(evt, {
                                          "INIT",
                                          "DEBUT",
                                          "FAIRE",
                                          "FIN_ENVOI_MAIL"}) {
  nomBase("GESCOM");
}
