// Program objects: branches, hooks, dispatch, method error codes, dialogs.
#include <cstdlib>
#include <filesystem>

#include "frame/host_runtime.h"
#include "host/runtime/host.h"
#include "host/runtime/program_state.h"
#include "host/runtime/registry.h"
#include "host/runtime/text/utf8.h"

namespace host {

std::string upper_name(std::string_view name) { return text::upper(name); }

}  // namespace host

using host::upper_name;

// --- Etat --------------------------------------------------------------------

const Automate::Etat::Branche* Automate::Etat::find(const std::string& name, int* element) const {
  std::string key = upper_name(name);
  *element = 0;
  if (auto it = by_key.find(key); it != by_key.end() && branches[it->second].from == 0) return &branches[it->second];
  // "CLIENT(2)" or "CLIENT2" reach the array branch "CLIENT(1,3)".
  std::string base;
  std::string digits;
  if (!key.empty() && key.back() == ')') {
    auto open = key.rfind('(');
    if (open == std::string::npos) return nullptr;
    base = key.substr(0, open);
    digits = key.substr(open + 1, key.size() - open - 2);
  } else {
    std::size_t end = key.size();
    while (end > 0 && key[end - 1] >= '0' && key[end - 1] <= '9') --end;
    base = key.substr(0, end);
    digits = key.substr(end);
  }
  if (digits.empty() || digits.size() > 6 || digits.find_first_not_of("0123456789") != std::string::npos)
    return nullptr;
  auto it = by_key.find(base);
  if (it == by_key.end()) return nullptr;
  const Branche& b = branches[it->second];
  int n = std::atoi(digits.c_str());
  if (b.from == 0) return nullptr;
  *element = n;  // out-of-range indexes still reach the handler, which decides
  return &b;
}

Donnee* Automate::Etat::variable(const std::string& name) const {
  for (auto it = variables.rbegin(); it != variables.rend(); ++it)
    if ((*it)->nom() == name) return *it;
  return nullptr;
}

Table* Automate::Etat::open_table(const std::string& name) const {
  for (auto it = tables.rbegin(); it != tables.rend(); ++it)
    if (upper_name((*it)->nom()) == name) return *it;
  return nullptr;
}

// --- Automate ----------------------------------------------------------------

Automate::Automate(Evt* evt) : etat_(std::make_unique<Etat>()), ecran_(*this) {
  etat_->host = host::Host::active_or_null();
  etat_->creation = evt;
}

Automate::~Automate() = default;

void Automate::init(Evt*) {}
void Automate::debut(Evt*) {
  if (etat_->screen.empty() || etat_->host == nullptr) return;
  host::ScreenModel& s = etat_->host->screen(etat_->program);
  s.screen = etat_->screen;
  s.opened = true;
  s.branches = branches();
}
void Automate::faire(Evt*) {}
void Automate::selection(Evt*) {}
void Automate::pour_tout(Evt*) {}
void Automate::sortie(Evt*) {}
void Automate::abandon(Evt*) { etat_->ended = true; }
void Automate::validation(Evt*) {}

void Bsegestion::avant_debut(Evt*) {}
void Bsegestion::debut_fiche(Evt*) {}
void Bsegestion::debut_modification(Evt*) {}
void Bsegestion::debut_visualisation(Evt*) {}
void Bsegestion::debut_creation(Evt*) {}
void Bseacc::debut_activation(Evt*) {}
void Bseacc::gerer(Evt*) {}
void Bseacc::modifier(Evt*) {}
void Bseacc::creer(Evt*) {}

void Automate::addBranch(std::string_view nom, std::function<void(Evt*)> handler) {
  Etat::Branche b;
  b.name = upper_name(nom);
  b.key = b.name;
  if (auto open = b.name.find('('); open != std::string::npos && b.name.back() == ')') {
    b.key = b.name.substr(0, open);
    std::string range = b.name.substr(open + 1, b.name.size() - open - 2);
    auto comma = range.find(',');
    b.from = std::atoi(range.substr(0, comma).c_str());
    b.to = comma == std::string::npos ? b.from : std::atoi(range.substr(comma + 1).c_str());
    if (b.from <= 0) b.from = 1;
  }
  b.handler = std::move(handler);
  if (etat_->by_key.count(b.key)) {  // a programming error: keep the first one
    if (etat_->host) etat_->host->log("erreur", "Branche déjà enregistrée : " + b.name, etat_->program);
    return;
  }
  etat_->by_key[b.key] = etat_->branches.size();
  etat_->branches.push_back(std::move(b));
}

std::vector<std::string> Automate::branches() const {
  std::vector<std::string> names;
  for (const auto& b : etat_->branches) names.push_back(b.name);
  return names;
}

int Automate::indice() const { return etat_->element; }

void Automate::nomBase(std::string_view base) { etat_->base = upper_name(base); }
void Automate::nomTable(std::string_view table) { etat_->table = upper_name(table); }
void Automate::nomEcran(std::string_view ecran) { etat_->screen = upper_name(ecran); }
const std::string& Automate::nomBase() const { return etat_->base; }
const std::string& Automate::nomTable() const { return etat_->table; }
const std::string& Automate::nomEcran() const { return etat_->screen; }
const std::string& Automate::nomProgramme() const { return etat_->program; }

void Automate::erreurMethode(int code, Evt*) {
  if (etat_->host) etat_->host->set_frame_code(code);
}

int Automate::erreurMethode() const { return etat_->last_code; }

void Automate::exception(Evt* evt) {
  Exception* e = evt ? evt->adresseC() : nullptr;
  host::Host* h = etat_->host;
  if (h == nullptr) return;
  std::string where = e && !e->branche().empty() ? e->branche() : std::string("?");
  std::string text = "Échec dans la branche " + where + " de " + etat_->program;
  if (e) text += " : " + e->message();
  h->log("erreur", text, e ? e->detail() : std::string());
  // A failed branch must not look like a success to its caller.
  if (h->frame_code() == 0) h->set_frame_code(-1);
}

void Automate::controler(std::string_view controle) {
  if (etat_->host && !controle.empty()) etat_->host->screen(etat_->program).control(upper_name(controle));
}
void Automate::rejeter(Evt*) { etat_->rejected = true; }
void Automate::sortir(Evt*, int) { etat_->ended = true; }
bool Automate::estTermine() const { return etat_->ended; }
bool Automate::estRejete() const { return etat_->rejected; }

int Automate::BoiteMessage(std::string_view texte, int type, std::string_view titre) {
  host::Host::active().dialogs().message(titre, texte, type);
  return 1;
}

long Automate::BoiteDialogue(std::string_view titre, std::string_view texte, int icone,
                             std::initializer_list<std::string_view> choix) {
  auto choices = host::parse_choices(std::vector<std::string_view>(choix));
  std::string answer = host::Host::active().dialogs().question(titre, texte, icone, choices);
  return std::atol(answer.c_str());
}

namespace {
host::FileFilters to_filters(std::initializer_list<std::pair<std::string_view, std::string_view>> filtres) {
  host::FileFilters f;
  for (auto& [name, pattern] : filtres) f.emplace_back(std::string(name), std::string(pattern));
  return f;
}
}  // namespace

int Automate::BoiteOuvrirFichier(std::string_view titre, Chaine& fichier, Chaine& repertoire,
                                 std::initializer_list<std::pair<std::string_view, std::string_view>> filtres) {
  auto chosen = host::Host::active().dialogs().open_file(titre, fichier.str(), to_filters(filtres));
  if (!chosen) return 0;
  fichier = *chosen;
  repertoire = std::filesystem::path(*chosen).parent_path().string();
  return 1;
}

int Automate::BoiteSauverFichier(std::string_view titre, Chaine& fichier, Chaine& dossier,
                                 std::initializer_list<std::pair<std::string_view, std::string_view>> filtres) {
  std::string start = fichier.str().empty() ? dossier.str() : fichier.str();
  auto chosen = host::Host::active().dialogs().save_file(titre, start, to_filters(filtres));
  if (!chosen) return 0;
  fichier = *chosen;
  return 1;
}

// --- Screens, messages, universe ---------------------------------------------

namespace {
host::ScreenModel* model_of(Automate& p) {
  host::Host* h = p.etat().host;
  return h ? &h->screen(p.etat().program) : nullptr;
}
}  // namespace

void Ecran::affiche(std::string_view controle) {
  host::ScreenModel* s = model_of(programme_);
  if (!s) return;
  auto show = [&](const std::string& name) {
    host::ControlState& c = s->control(name);
    ++c.redisplays;
    if (Donnee* d = programme_.etat().variable(name)) c.shown = d->texte();
  };
  if (!controle.empty()) {
    show(upper_name(controle));
  } else {
    for (auto& [name, state] : s->controls) show(name);
  }
}
void Ecran::autorise(std::string_view c) {
  if (auto* s = model_of(programme_)) s->control(upper_name(c)).allowed = true;
}
void Ecran::interdit(std::string_view c) {
  if (auto* s = model_of(programme_)) s->control(upper_name(c)).allowed = false;
}
void Ecran::cacher(std::string_view c) {
  if (auto* s = model_of(programme_)) s->control(upper_name(c)).visible = false;
}
void Ecran::rendreVisible(std::string_view c) {
  if (auto* s = model_of(programme_)) s->control(upper_name(c)).visible = true;
}
void Ecran::libelle(std::string_view c, std::string_view texte) {
  if (auto* s = model_of(programme_)) s->control(upper_name(c)).label = host::text::to_valid_utf8(texte);
}
void Ecran::attacheMenuC(std::string_view, std::string_view) {}
void Ecran::fonction(std::string_view, std::string_view) {}
void Ecran::curseur(int mode) {
  if (host::Host* h = host::Host::active_or_null()) h->set_cursor(mode);
}

void Message::nettoie() {
  if (host::Host* h = host::Host::active_or_null()) h->clear_messages();
}

Chaine Univers::utilisateur() { return Chaine(host::Host::active().user()); }
Chaine Univers::memUrl() { return Chaine(host::Host::active().options().mem_url); }
