// Files and the desktop: Maccess, Munlink, ShellExecuteA.
#include "host/runtime/files.h"

#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>

#include "frame/host_runtime.h"

extern char** environ;

namespace host {

std::string native_path(std::string_view path) {
  std::string p(path);
  for (char& c : p)
    if (c == '\\') c = '/';
  return p;
}

std::string desktop_opener() {
  if (const char* o = std::getenv("VNTEMAIL_OPENER"); o && *o) return o;
  return "xdg-open";
}

int run_program_and_wait(const std::string& program, const std::vector<std::string>& args) {
  std::vector<char*> argv;
  argv.push_back(const_cast<char*>(program.c_str()));
  for (const auto& a : args) argv.push_back(const_cast<char*>(a.c_str()));
  argv.push_back(nullptr);
  pid_t pid = 0;
  if (posix_spawnp(&pid, program.c_str(), nullptr, nullptr, argv.data(), environ) != 0) return -1;
  int status = 0;
  while (waitpid(pid, &status, 0) < 0) {
    if (errno != EINTR) return -1;
  }
  return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

}  // namespace host

int Maccess(std::string_view chemin, int mode) {
  if (chemin.empty()) return -1;
  int how = F_OK;
  if (mode & 2) how |= W_OK;
  if (mode & 4) how |= R_OK;
  return access(host::native_path(chemin).c_str(), how) == 0 ? 0 : -1;
}

int Munlink(std::string_view chemin) {
  if (chemin.empty()) return -1;
  return unlink(host::native_path(chemin).c_str()) == 0 ? 0 : -1;
}

long ShellExecuteA(void*, std::string_view verbe, std::string_view fichier, std::string_view, std::string_view, int) {
  if (verbe != "open" || fichier.empty()) return 31;
  std::string target(fichier);
  bool is_address = target.find("://") != std::string::npos || target.rfind("mailto:", 0) == 0;
  if (!is_address) {
    target = host::native_path(target);
    if (access(target.c_str(), F_OK) != 0) return 2;  // file not found
  }
  int status = host::run_program_and_wait(host::desktop_opener(), {target});
  return status == 0 ? 42 : 31;  // 31: no program associated with the file
}
