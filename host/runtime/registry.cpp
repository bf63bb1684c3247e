#include "host/runtime/registry.h"

#include <algorithm>

#include "host/runtime/host.h"
#include "host/runtime/program_state.h"

namespace host {
namespace {
void log_notice(const std::string& text) {
  if (Host* h = Host::active_or_null()) h->log("erreur", text);
}
}  // namespace

Registry& Registry::instance() {
  static Registry registry;
  return registry;
}

void Registry::add_library(const std::string& name, bool (*load)(), void (*unload)()) {
  Library& lib = libraries_[upper_name(name)];
  lib.load = load;
  lib.unload = unload;
}

bool Registry::load(const std::string& name) {
  auto it = libraries_.find(upper_name(name));
  if (it == libraries_.end() || it->second.is_loaded) return false;
  Library& lib = it->second;
  lib.first_record = records_.size();
  lib.first_global = globals_.size();
  loading_ = it->first;
  bool ok = lib.load();
  loading_.clear();
  lib.is_loaded = ok;
  return ok;
}

void Registry::unload(const std::string& name) {
  auto it = libraries_.find(upper_name(name));
  if (it == libraries_.end() || !it->second.is_loaded) return;
  Library& lib = it->second;
  if (lib.unload) lib.unload();
  // Reverse order of creation.
  while (records_.size() > lib.first_record) records_.pop_back();
  while (globals_.size() > lib.first_global) {
    Donnee* d = globals_.back();
    globals_.pop_back();
    hoteDetruire(d);
  }
  lib.is_loaded = false;
}

bool Registry::loaded(const std::string& name) const {
  auto it = libraries_.find(upper_name(name));
  return it != libraries_.end() && it->second.is_loaded;
}

bool Registry::add(const Module& m) {
  if (find(m.nom) != nullptr) {
    log_notice("Programme déjà enregistré : " + m.nom);
    return false;
  }
  records_.emplace_back(m);
  return true;
}

void Registry::add(const Global& g) { records_.emplace_back(g); }
void Registry::add(const Source& s) { records_.emplace_back(s); }

void Registry::add_global(Donnee* variable) {
  if (variable != nullptr) globals_.push_back(variable);
}

const Module* Registry::find(const std::string& program) const {
  std::string key = upper_name(program);
  for (const Record& r : records_)
    if (const Module* m = std::get_if<Module>(&r); m && upper_name(m->nom) == key) return m;
  return nullptr;
}

Donnee* Registry::global(const std::string& name) const {
  for (auto it = globals_.rbegin(); it != globals_.rend(); ++it)
    if ((*it)->nom() == name) return *it;
  return nullptr;
}

void Registry::forget_global(Donnee* variable) {
  globals_.erase(std::remove(globals_.begin(), globals_.end(), variable), globals_.end());
}

}  // namespace host

bool Registre::enregistrer(const Module& m) { return host::Registry::instance().add(m); }
void Registre::enregistrer(const Global& g) { host::Registry::instance().add(g); }
void Registre::enregistrer(const Source& s) { host::Registry::instance().add(s); }
void Registre::enregistrerGlobale(Donnee* variable) { host::Registry::instance().add_global(variable); }
