#include "branche.h"

#include <string>

namespace {
std::string nomDeBranche(std::string_view nom) {
  std::string s;
  for (char c : nom) s.push_back((c >= 'a' && c <= 'z') ? static_cast<char>(c - 32) : c);
  return s;
}
}  // namespace

void signalerEchec(Automate& programme, std::string_view nom, Evt* evt, Exception* e) noexcept {
  try {
    if (e != nullptr) e->nomBranche(nomDeBranche(nom));
    if (evt != nullptr) {
      evt->adresseC(e);
      programme.exception(evt);
    } else {
      EvtParamVal porteur{InfoCode{}};
      porteur.adresseC(e);
      programme.exception(&porteur);
    }
  } catch (...) {
    // Reporting itself failed (no memory): the failure stays contained.
  }
}

void brancheNonConstruite(Automate& programme, std::string_view nom, Evt* evt) {
  executerBranche(programme, nom, evt, [&] {
    programme.erreurMethode(CODE_BRANCHE_NON_CONSTRUITE, evt);
    leverException("programme", "Branche non construite : " + std::string(nom), programme.nomProgramme());
  });
}
