// Host-side state of a program object (Automate::Etat).
#pragma once

#include <functional>
#include <map>
#include <string>
#include <vector>

#include "frame/host_runtime.h"

namespace host {
class Host;
}

struct Automate::Etat {
  struct Branche {
    std::string name;                  // as registered, "CLIENT(1,3)"
    std::string key;                   // "CLIENT"
    int from = 0, to = 0;              // element range, 0 for a plain branch
    std::function<void(Evt*)> handler; // the program's handler
  };

  host::Host* host = nullptr;          // host that runs the program
  std::string program;                 // "VNTEMAIL-SENDMAIL"
  std::string base, table, screen;     // nomBase, nomTable, nomEcran
  std::vector<Branche> branches;       // registration order
  std::map<std::string, std::size_t> by_key;  // key -> branches index
  std::vector<Donnee*> variables;      // program and local variables, creation order
  std::vector<Table*> tables;          // open tables, creation order
  int element = 0;                     // index of the array-branch call in progress
  int last_code = 0;                   // method error code of the last call made
  bool ended = false;                  // sortir / abandon
  bool rejected = false;               // rejeter on the current event
  Evt* creation = nullptr;             // event the program was built from

  /// The branch serving `name` ("CLIENT2", "CLIENT(2)", "VALIDER"), with its element index.
  const Branche* find(const std::string& name, int* element) const;
  /// Variable by upper-case name: the newest first (locals hide program variables).
  Donnee* variable(const std::string& name) const;
  Table* open_table(const std::string& name) const;
};

namespace host {
/// Runs a branch of `program` by name; a host failure when it has none.
void run_branch(Automate& program, const std::string& name, Evt* evt);
/// Runs a whole program object: its kind's flow to the end.
void run_program(Automate& program, Evt* evt);
/// Creates a program object of a registered program ("VNTEMAIL-X"); a host failure when unknown or refused.
Automate* create_program(const std::string& full_name, Evt* evt);
void destroy_program(Automate* program) noexcept;
/// Walks the records of a table program (selection, then pour_tout unless rejected).
void walk_records(Parcours& program, Evt* evt);
/// Upper case of an ASCII/Latin name.
std::string upper_name(std::string_view name);
}  // namespace host
