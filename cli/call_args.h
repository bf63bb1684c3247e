// Parameters given on the command line: "int:N" an Entier, "dec:N" a Double,
// "text:..." or anything else a Chaine.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "frame/host_runtime.h"

namespace cli {

/// The variables built from the arguments, in order; they outlive the call.
std::vector<std::unique_ptr<Donnee>> make_arguments(const std::vector<std::string>& args);
/// Prints the method error code and the parameters after the call (text or JSON).
std::string format_outcome(int code, const std::vector<std::unique_ptr<Donnee>>& params, bool json);

}  // namespace cli
