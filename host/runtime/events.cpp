// Events: parameters by reference or by value, bound by rank.
#include "frame/host_runtime.h"
#include "host/runtime/value_text.h"

Evt::~Evt() = default;

void Evt::param(int indice, Donnee& variable, int type) {
  if (indice < 0 || indice >= nbParams()) return;  // nothing passed there: stays empty
  variable.affecter(valeurParam(indice));
  variable.lier(this, indice, type == PARAM_ENTREE_SORTIE);
}

void Evt::adresseC(Exception* e) { exception_.reset(e); }

Valeur Evt::valeurParam(int indice) const {
  if (indice < 0 || indice >= nbParams()) return host::text_value("");
  const Param& p = params_[static_cast<std::size_t>(indice)];
  return p.reference ? p.reference->valeur() : p.valeur;
}

void Evt::ecrireParam(int indice, const Valeur& v) {
  if (indice < 0 || indice >= nbParams()) return;
  Param& p = params_[static_cast<std::size_t>(indice)];
  if (p.reference) {
    p.reference->affecter(v);
  } else {
    p.valeur = v;
  }
}

EvtParamRef::EvtParamRef(std::initializer_list<Donnee*> variables)
    : EvtParamRef(std::vector<Donnee*>(variables)) {}

EvtParamRef::EvtParamRef(const std::vector<Donnee*>& variables) {
  params_.reserve(variables.size());
  for (Donnee* d : variables) {
    Param p;
    p.reference = d;
    params_.push_back(std::move(p));
  }
}

EvtParamVal::EvtParamVal(const InfoCode&) {}

EvtParamVal::EvtParamVal(std::initializer_list<const Donnee*> valeurs) {
  params_.reserve(valeurs.size());
  for (const Donnee* d : valeurs) {
    Param p;
    if (d) p.valeur = d->valeur();
    params_.push_back(std::move(p));
  }
}
