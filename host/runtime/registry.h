// The program registry: the one piece of process-wide state. It keeps the
// registration records of the loaded module libraries, their global
// variables, and a pointer to the active host.
#pragma once

#include <map>
#include <memory>
#include <string>
#include <variant>
#include <vector>

#include "frame/host_runtime.h"

namespace host {

class Host;

class Registry {
 public:
  static Registry& instance();

  using Record = std::variant<Global, Module, Source>;

  /// Declares a module library by its entry points (does not load it).
  void add_library(const std::string& name, bool (*load)(), void (*unload)());
  /// Loads a declared library: false when unknown or already loaded.
  bool load(const std::string& name);
  /// Unloads it: records and globals removed in reverse order.
  void unload(const std::string& name);
  bool loaded(const std::string& name) const;

  bool add(const Module& m);
  void add(const Global& g);
  void add(const Source& s);
  void add_global(Donnee* variable);  // owned (made with hoteCreer)

  /// The program's record, or nullptr ("VNTEMAIL-SENDMAIL", case-insensitive).
  const Module* find(const std::string& program) const;
  /// All records in load order.
  const std::vector<Record>& records() const { return records_; }
  /// Global variable by upper-case name, or nullptr.
  Donnee* global(const std::string& name) const;
  void forget_global(Donnee* variable);  // a global destroyed by its owner

  Host* active = nullptr;  // the active host

 private:
  struct Library {
    bool (*load)() = nullptr;
    void (*unload)() = nullptr;
    bool is_loaded = false;
    std::size_t first_record = 0;  // records_ index where it starts
    std::size_t first_global = 0;
  };
  std::map<std::string, Library> libraries_;
  std::string loading_;              // library being loaded
  std::vector<Record> records_;
  std::vector<Donnee*> globals_;
};

}  // namespace host
