// Host components: procedures reached by module name and procedure name.
#pragma once

#include <functional>
#include <map>
#include <string>
#include <string_view>

#include "frame/host_runtime.h"

namespace host {

class Host;

/// One call of a component procedure: parameter access by rank.
struct ComponentCall {
  Host& host;         // the host running the call
  Automate* caller;   // calling program (may be null from the command line)
  Evt* evt;           // parameters (may be null)
  std::string base;   // base designation passed ("*", "*1")

  int count() const { return evt ? evt->nbParams() : 0; }
  std::string text(int i) const;         ///< parameter i as text ("" when absent)
  long long integer(int i) const;        ///< parameter i as integer (0 when absent)
  double decimal(int i) const;           ///< parameter i as decimal
  void set_text(int i, std::string_view v) const;  ///< writes parameter i when present
  void set_integer(int i, long long v) const;
  void set_decimal(int i, double v) const;
};

/// A procedure returns its method error code.
using Procedure = std::function<int(ComponentCall&)>;

class Components {
 public:
  /// Adds (or replaces) a procedure; names are case-insensitive.
  void add(std::string_view component, std::string_view procedure, Procedure p);
  /// The procedure, or nullptr when unknown.
  const Procedure* find(std::string_view component, std::string_view procedure) const;
  bool has_component(std::string_view component) const;

 private:
  std::map<std::string, std::map<std::string, Procedure>> procedures_;  // upper-case keys
};

}  // namespace host
