// File paths as the module writes them: folder + "\" + file.
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace host {

/// The path with "\" turned into "/" on this platform (a "C:" drive prefix is kept as it is).
std::string native_path(std::string_view path);

/// The desktop opener: $VNTEMAIL_OPENER when set, otherwise "xdg-open".
std::string desktop_opener();

/// Runs `program` with `args` (no shell) and waits; its exit status, or -1 when it cannot start.
int run_program_and_wait(const std::string& program, const std::vector<std::string>& args);

}  // namespace host
