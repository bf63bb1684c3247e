// Calls from outside any program (command line, tests): the same paths as
// Automate::appelerProcedure and Automate::appelerModule, with no caller.
#pragma once

#include <string>

#include "frame/host_runtime.h"

namespace host {

class Host;

/// Runs procedure `procedure` of `module`/`program` (a program of a loaded
/// library, or a component); returns the method error code. Host failures
/// thrown outside a branch (unknown procedure) are thrown as Exception*.
int call_procedure(Host& host, Automate* caller, const std::string& base, const std::string& module,
                   const std::string& program, const std::string& procedure, Evt* evt);
/// Runs program `module`-`program` to its end; returns its method error code.
int run_module(Host& host, Automate* caller, const std::string& module, const std::string& program, Evt* evt);

}  // namespace host
