// Named variables: Donnee and its four kinds.
#include <algorithm>
#include <ctime>

#include "frame/host_runtime.h"
#include "host/runtime/program_state.h"
#include "host/runtime/registry.h"
#include "host/runtime/text/utf8.h"
#include "host/runtime/value_text.h"

namespace {

// The date and time variables every program may declare get today's values.
void fill_system_variable(const std::string& name, Valeur& v) {
  static const char* const kMonths[] = {"janvier", "février", "mars",      "avril",   "mai",      "juin",
                                        "juillet", "août",    "septembre", "octobre", "novembre", "décembre"};
  static const char* const kDays[] = {"dimanche", "lundi", "mardi", "mercredi", "jeudi", "vendredi", "samedi"};
  if (name.empty() || name[0] != '$') return;
  std::time_t now = std::time(nullptr);
  std::tm tm{};
  localtime_r(&now, &tm);
  long long ymd = (tm.tm_year + 1900) * 10000LL + (tm.tm_mon + 1) * 100 + tm.tm_mday;
  char buf[64];
  std::string text;
  if (name == "$DATE") {
    v = host::convert(host::date_value(ymd), v.type);
    return;
  } else if (name == "$LDATE") {
    std::snprintf(buf, sizeof buf, "%s %d %s %d", kDays[tm.tm_wday], tm.tm_mday, kMonths[tm.tm_mon], tm.tm_year + 1900);
    text = buf;
  } else if (name == "$JOUR") {
    std::snprintf(buf, sizeof buf, "%02d", tm.tm_mday);
    text = buf;
  } else if (name == "$MOIS") {
    text = kMonths[tm.tm_mon];
  } else if (name == "$ANNEE") {
    text = std::to_string(tm.tm_year + 1900);
  } else if (name == "$HEURE") {
    std::snprintf(buf, sizeof buf, "%02d:%02d", tm.tm_hour, tm.tm_min);
    text = buf;
  } else {
    return;
  }
  v = host::convert(host::text_value(text), v.type);
}

}  // namespace

// --- Donnee ----------------------------------------------------------------

Donnee::Donnee(TypeDonnee type) : type_(type) { v_.type = type; }

Donnee::Donnee(TypeDonnee type, std::string_view nom, Automate* proprio, int acces, std::string_view libelle,
               std::string_view format)
    : type_(type),
      nom_(host::upper_name(nom)),
      libelle_(host::text::to_valid_utf8(libelle)),
      format_(format),
      acces_(acces),
      proprio_(proprio) {
  v_.type = type;
  fill_system_variable(nom_, v_);
  enregistrer();
}

Donnee::Donnee(const Donnee& autre) : type_(autre.type_) { v_ = host::convert(autre.valeur(), type_); }

Donnee& Donnee::operator=(const Donnee& autre) {
  if (this != &autre) affecter(autre.valeur());
  return *this;
}

Donnee::~Donnee() {
  rendre();
  desenregistrer();
}

void Donnee::enregistrer() {
  if (nom_.empty() || proprio_ == nullptr) return;
  proprio_->etat().variables.push_back(this);
}

void Donnee::desenregistrer() noexcept {
  if (nom_.empty()) return;
  if (proprio_ != nullptr) {
    auto& vars = proprio_->etat().variables;
    auto it = std::find(vars.rbegin(), vars.rend(), this);
    if (it != vars.rend()) vars.erase(std::next(it).base());
  } else if (acces_ == ACCES_GLOBAL) {
    host::Registry::instance().forget_global(this);
  }
}

void Donnee::lier(Evt* evt, int indice, bool sortie) {
  if (!sortie) return;
  lienEvt_ = evt;
  lienIndice_ = indice;
}

void Donnee::rendre() noexcept {
  if (lienEvt_ == nullptr) return;
  Evt* evt = lienEvt_;
  lienEvt_ = nullptr;
  try {
    evt->ecrireParam(lienIndice_, valeur());
  } catch (...) {
    // A caller's field that refuses the value: nothing to report to from a destructor.
  }
}

Valeur Donnee::valeur() const { return v_; }

void Donnee::affecter(const Valeur& v) { v_ = host::convert(v, type_); }

std::string Donnee::texte() const { return host::to_text(valeur()); }
long long Donnee::entier() const { return host::to_integer(valeur()); }
double Donnee::decimal() const { return host::to_decimal(valeur()); }

bool Donnee::estVide() const {
  Valeur v = valeur();
  switch (v.type) {
    case TypeDonnee::Chaine: return v.texte.empty();
    case TypeDonnee::Double: return v.decimal == 0;
    default: return v.entier == 0;
  }
}

// --- Chaine ----------------------------------------------------------------

Chaine::Chaine() : Donnee(TypeDonnee::Chaine) {}
Chaine::Chaine(const char* texte) : Chaine(std::string_view(texte ? texte : "")) {}
Chaine::Chaine(std::string_view texte) : Donnee(TypeDonnee::Chaine) { v_.texte = host::text::to_valid_utf8(texte); }
Chaine::Chaine(const std::string& texte) : Chaine(std::string_view(texte)) {}
Chaine::Chaine(const Donnee& autre) : Donnee(TypeDonnee::Chaine) { v_.texte = autre.texte(); }
Chaine::Chaine(const Chaine& autre) : Donnee(TypeDonnee::Chaine) { v_.texte = autre.texte(); }
Chaine::Chaine(std::string_view nom, Automate* proprio, int acces, std::string_view initial, std::string_view libelle,
               std::string_view format)
    : Donnee(TypeDonnee::Chaine, nom, proprio, acces, libelle, format) {
  if (!initial.empty()) v_.texte = host::text::to_valid_utf8(initial);
}

Chaine& Chaine::operator=(const Chaine& autre) {
  if (this != &autre) affecter(autre.valeur());
  return *this;
}
Chaine& Chaine::operator=(const Donnee& autre) {
  if (this != &autre) affecter(autre.valeur());
  return *this;
}
Chaine& Chaine::operator=(std::string_view texte) {
  v_.texte = host::text::to_valid_utf8(texte);
  return *this;
}

long Chaine::longueur() const { return static_cast<long>(host::text::length(v_.texte)); }
Chaine Chaine::sousChaine(long debut, long fin) const { return Chaine(host::text::substring(v_.texte, debut, fin)); }
long Chaine::position(std::string_view motif, long depuis) const {
  return static_cast<long>(host::text::position(v_.texte, motif, depuis < 1 ? 1 : static_cast<std::size_t>(depuis)));
}
Chaine Chaine::droite(long n) const { return Chaine(host::text::right(v_.texte, n < 0 ? 0 : n)); }
Chaine Chaine::majuscules() const { return Chaine(host::text::upper(v_.texte)); }
Chaine Chaine::minuscules() const { return Chaine(host::text::lower(v_.texte)); }
Chaine& Chaine::operator+=(std::string_view texte) {
  v_.texte += host::text::to_valid_utf8(texte);
  return *this;
}

Chaine operator+(const Chaine& a, const Chaine& b) { return Chaine(a.str() + b.str()); }
Chaine operator+(const Chaine& a, const Donnee& b) { return Chaine(a.str() + b.texte()); }
Chaine operator+(const Donnee& a, const Chaine& b) { return Chaine(a.texte() + b.str()); }
Chaine operator+(const Chaine& a, const char* b) { return a + std::string_view(b ? b : ""); }
Chaine operator+(const char* a, const Chaine& b) { return std::string_view(a ? a : "") + b; }
Chaine operator+(const Chaine& a, std::string_view b) {
  Chaine r(a);
  r += b;
  return r;
}
Chaine operator+(std::string_view a, const Chaine& b) {
  Chaine r(a);
  r += b;
  return r;
}
Chaine operator+(const Donnee& a, std::string_view b) {
  Chaine r(a);
  r += b;
  return r;
}
Chaine operator+(std::string_view a, const Donnee& b) {
  Chaine r(a);
  r += b;
  return r;
}
Chaine operator+(const Donnee& a, const char* b) { return a + std::string_view(b ? b : ""); }
Chaine operator+(const char* a, const Donnee& b) { return std::string_view(a ? a : "") + b; }

namespace {
bool is_number(const Valeur& v) { return v.type == TypeDonnee::Entier || v.type == TypeDonnee::Double; }
}  // namespace

bool operator==(const Donnee& a, const Donnee& b) {
  Valeur x = a.valeur(), y = b.valeur();
  if (is_number(x) && is_number(y)) return host::to_decimal(x) == host::to_decimal(y);
  if (x.type == TypeDonnee::Date && y.type == TypeDonnee::Date) return x.entier == y.entier;
  return host::to_text(x) == host::to_text(y);
}
bool operator==(const Donnee& a, std::string_view b) { return a.texte() == b; }
bool operator==(const Donnee& a, const char* b) { return a.texte() == std::string_view(b ? b : ""); }
bool operator==(const Donnee& a, long long b) {
  Valeur x = a.valeur();
  if (x.type == TypeDonnee::Chaine) {
    auto n = host::parse_number(x.texte);
    return n && *n == static_cast<double>(b);
  }
  return host::to_decimal(x) == static_cast<double>(b);
}
bool operator==(const Donnee& a, int b) { return a == static_cast<long long>(b); }
bool operator<(const Donnee& a, const Donnee& b) {
  Valeur x = a.valeur(), y = b.valeur();
  if (is_number(x) && is_number(y)) return host::to_decimal(x) < host::to_decimal(y);
  if (x.type == TypeDonnee::Date && y.type == TypeDonnee::Date) return x.entier < y.entier;
  return host::to_text(x) < host::to_text(y);
}

// --- Entier, Double, Date -------------------------------------------------

Entier::Entier(long long valeur) : Donnee(TypeDonnee::Entier) { v_.entier = valeur; }
Entier::Entier(const Entier& autre) : Donnee(TypeDonnee::Entier) { v_.entier = autre.entier(); }
Entier::Entier(std::string_view nom, Automate* proprio, int acces, long long initial, std::string_view libelle,
               std::string_view format)
    : Donnee(TypeDonnee::Entier, nom, proprio, acces, libelle, format) {
  if (initial != 0) v_.entier = initial;
}
Entier& Entier::operator=(long long valeur) {
  affecter(host::integer_value(valeur));
  return *this;
}
Entier& Entier::operator=(const Donnee& autre) {
  if (this != &autre) affecter(autre.valeur());
  return *this;
}
Entier& Entier::operator=(const Entier& autre) {
  if (this != &autre) affecter(autre.valeur());
  return *this;
}

Double::Double(double valeur) : Donnee(TypeDonnee::Double) { v_.decimal = valeur; }
Double::Double(const Double& autre) : Donnee(TypeDonnee::Double) { v_.decimal = autre.decimal(); }
Double::Double(std::string_view nom, Automate* proprio, int acces, double initial, std::string_view libelle,
               std::string_view format)
    : Donnee(TypeDonnee::Double, nom, proprio, acces, libelle, format) {
  if (initial != 0) v_.decimal = initial;
}
Double& Double::operator=(double valeur) {
  affecter(host::decimal_value(valeur));
  return *this;
}
Double& Double::operator=(const Donnee& autre) {
  if (this != &autre) affecter(autre.valeur());
  return *this;
}
Double& Double::operator=(const Double& autre) {
  if (this != &autre) affecter(autre.valeur());
  return *this;
}

Date::Date() : Donnee(TypeDonnee::Date) {}
Date::Date(int annee, int mois, int jour) : Donnee(TypeDonnee::Date) {
  v_.entier = static_cast<long long>(annee) * 10000 + mois * 100 + jour;
}
Date::Date(const Date& autre) : Donnee(TypeDonnee::Date) { v_.entier = autre.valeur().entier; }
Date::Date(std::string_view nom, Automate* proprio, int acces, std::string_view libelle, std::string_view format)
    : Donnee(TypeDonnee::Date, nom, proprio, acces, libelle, format) {}
Date& Date::operator=(const Donnee& autre) {
  if (this != &autre) affecter(autre.valeur());
  return *this;
}
Date& Date::operator=(const Date& autre) {
  if (this != &autre) affecter(autre.valeur());
  return *this;
}
int Date::annee() const { return static_cast<int>(valeur().entier / 10000); }
int Date::mois() const { return static_cast<int>((valeur().entier / 100) % 100); }
int Date::jour() const { return static_cast<int>(valeur().entier % 100); }

Date Date::dateCourante() {
  std::time_t now = std::time(nullptr);
  std::tm tm{};
  localtime_r(&now, &tm);
  return Date(tm.tm_year + 1900, tm.tm_mon + 1, tm.tm_mday);
}

Chaine Date::heureCourante() {
  std::time_t now = std::time(nullptr);
  std::tm tm{};
  localtime_r(&now, &tm);
  char buf[16];
  std::snprintf(buf, sizeof buf, "%02d:%02d:%02d", tm.tm_hour, tm.tm_min, tm.tm_sec);
  return Chaine(buf);
}
