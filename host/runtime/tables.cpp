// Tables: placeholder until the storage engine is wired in.
#include "frame/host_runtime.h"
#include "host/runtime/program_state.h"

struct Table::Etat {
  std::string base, name, alias;
};

namespace {
[[noreturn]] void unavailable() { leverException("table", "Tables non disponibles dans cet hôte"); }
}  // namespace

Table::Table(Automate*, std::string_view base, std::string_view nom, std::string_view alias, int, int)
    : etat_(std::make_unique<Etat>()) {
  etat_->base = base;
  etat_->name = nom;
  etat_->alias = alias;
}
Table::~Table() = default;
const std::string& Table::nom() const { return etat_->alias.empty() ? etat_->name : etat_->alias; }
const std::string& Table::nomReel() const { return etat_->name; }
const std::string& Table::base() const { return etat_->base; }
void Table::base(std::string_view designation) { etat_->base = designation; }
int Table::lireCle(std::string_view, const Donnee&) { unavailable(); }
void Table::effacerCriteres() {}
void Table::critere(std::string_view, std::string_view, const Donnee&) { unavailable(); }
void Table::ordre(std::string_view) {}
int Table::premier() { unavailable(); }
int Table::suivant() { unavailable(); }
long Table::nombre() { unavailable(); }
void Table::vider() {}
void Table::preparer() {}
int Table::creer() { unavailable(); }
int Table::modifier() { unavailable(); }
int Table::supprimer() { unavailable(); }
Valeur Table::lire(std::string_view, int) const { unavailable(); }
void Table::ecrire(std::string_view, int, const Valeur&) { unavailable(); }

void Automate::lireInterface(std::string_view) { unavailable(); }
void Automate::creerContexteComposant(std::string_view, std::string_view, std::string_view) { unavailable(); }

bool Bseinter::procedureDeBase(std::string_view, Evt*) { return false; }
Table& Bseinter::interfaceTable() { unavailable(); }

namespace host {
void walk_records(Parcours&, Evt*) { unavailable(); }
}  // namespace host

bool Donnee::analyse(std::string_view) { return false; }
Donnee Execute::execute(Automate*, std::string_view) { leverException("expression", "Expressions non disponibles"); }
bool Execute::execute(Automate*, std::string_view, Donnee&, std::string& erreur) {
  erreur = "Expressions non disponibles";
  return false;
}
