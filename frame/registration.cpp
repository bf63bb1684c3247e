// Registration of the module's ten programs, in load order, unit by unit.
#include "../interface/interface.h"
#include "../sending/envoi_mail.h"
#include "../sending/sendefac.h"
#include "../sending/sendmail.h"
#include "../sending/smail_for.h"
#include "../templates/acces.h"
#include "../templates/ajout_var_pred.h"
#include "../templates/ges_form.h"
#include "../templates/gestion.h"
#include "../transform/transformer.h"
#include "host_runtime.h"

namespace {

template <class P>
Automate* fabriquer(Evt* evt) {
  return hoteCreer<P>(evt);  // null when the host refuses the memory
}

Module programme(const char* nom, Fabrique fabrique, const char* description = "") {
  return Module{description, std::string("VNTEMAIL-") + nom, fabrique, false, ""};
}

const Global kContexteModule{"VNTEMAIL", "VNTEMAIL"};
const Global kContexteGescom{"GESCOM", "VNTEMAIL"};
const Source kSource{"VNTEMAIL", 0};

}  // namespace

bool VNTEMAILChargement() {
  // Kept for the host; the module never reads it.
  Chaine* drapeau = hoteCreer<Chaine>("$$|VCODECRASHFLAG", nullptr, ACCES_GLOBAL, "CRASHFLAG");
  if (drapeau == nullptr) return false;
  Registre::enregistrerGlobale(drapeau);

  bool ok = true;
  // Template list.
  Registre::enregistrer(kContexteModule);
  ok &= Registre::enregistrer(programme("ACCES", fabriquer<VNTEMAILAcces>));
  Registre::enregistrer(kSource);
  // Add-variable dialog and template editor.
  ok &= Registre::enregistrer(programme("AJOUT_VAR_PRED", fabriquer<VNTEMAILAjout_var_pred>));
  ok &= Registre::enregistrer(programme("GESTION", fabriquer<VNTEMAILGestion>));
  Registre::enregistrer(kSource);
  // Training template editor.
  ok &= Registre::enregistrer(programme("GES_FORM", fabriquer<VNTEMAILGes_form>));
  Registre::enregistrer(kSource);
  // Mail interface.
  Registre::enregistrer(kContexteModule);
  ok &= Registre::enregistrer(programme("INTERFACE", fabriquer<VNTEMAILInterface>));
  Registre::enregistrer(kSource);
  // E-invoice dispatch.
  Registre::enregistrer(kContexteModule);
  Registre::enregistrer(kContexteGescom);
  ok &= Registre::enregistrer(programme("SENDEFAC", fabriquer<VNTEMAILSendefac>));
  Registre::enregistrer(kSource);
  // Dispatch, send dialog and token transformer.
  Registre::enregistrer(kContexteModule);
  Registre::enregistrer(kContexteGescom);
  ok &= Registre::enregistrer(programme("ENVOI_MAIL", fabriquer<VNTEMAILEnvoi_mail>));
  ok &= Registre::enregistrer(programme("SENDMAIL", fabriquer<VNTEMAILSendmail>));
  ok &= Registre::enregistrer(
      programme("TRANSFORMER", fabriquer<VNTEMAILTransformer>, "Transformation de jetons dans un document ASCII"));
  Registre::enregistrer(kSource);
  // Training send dialog.
  Registre::enregistrer(kContexteModule);
  ok &= Registre::enregistrer(programme("SMAIL_FOR", fabriquer<VNTEMAILSmail_for>));
  Registre::enregistrer(kSource);
  return ok;
}

void VNTEMAILDechargement() {
  // The host removes the records in reverse order; the module holds nothing else.
}
