#include "host/runtime/host.h"

#include <pwd.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>

#include "host/runtime/registry.h"
#include "host/runtime/terminal_dialogs.h"

namespace host {
namespace {

std::string login_name() {
  if (const char* u = std::getenv("USER"); u && *u) return u;
  if (passwd* pw = getpwuid(getuid()); pw && pw->pw_name) return pw->pw_name;
  return "utilisateur";
}

}  // namespace

Host::Host(HostOptions options, Dialogs* dialogs) : options_(std::move(options)), dialogs_(dialogs) {
  user_ = options_.user.empty() ? login_name() : options_.user;
  std::string log_path = options_.log_file;
  if (log_path.empty() && !options_.data_dir.empty()) {
    std::error_code ec;
    std::filesystem::create_directories(options_.data_dir, ec);
    log_path = options_.data_dir + "/vntemail.log";
  }
  if (!log_path.empty()) log_file_ = std::fopen(log_path.c_str(), "a");
  Registry& r = Registry::instance();
  previous_ = r.active;
  r.active = this;
}

Host::~Host() {
  Registry& r = Registry::instance();
  if (r.active == this) r.active = previous_;
  if (log_file_) std::fclose(log_file_);
}

Host& Host::active() {
  Host* h = Registry::instance().active;
  if (h == nullptr) leverException("hote", "Aucun hôte actif", "no active host");
  return *h;
}

Host* Host::active_or_null() { return Registry::instance().active; }

Dialogs& Host::dialogs() {
  if (dialogs_ != nullptr) return *dialogs_;
  if (!default_dialogs_) default_dialogs_ = std::make_unique<TerminalDialogs>(TerminalDialogs::Options{false, false, false});
  return *default_dialogs_;
}

ScreenModel& Host::screen(const std::string& program) {
  ScreenModel& s = screens_[program];
  if (s.program.empty()) s.program = program;
  return s;
}

void Host::log(std::string level, std::string text, std::string detail) {
  std::string line = "[vntemail] " + level + " : " + text;
  if (!detail.empty()) line += " (" + detail + ")";
  if (options_.log_to_stderr) std::fprintf(stderr, "%s\n", line.c_str());
  if (log_file_) {
    std::fprintf(log_file_, "%s\n", line.c_str());
    std::fflush(log_file_);
  }
  log_.push_back({std::move(level), std::move(text), std::move(detail)});
}

int Host::pop_frame() {
  if (frames_.empty()) return 0;
  int code = frames_.back();
  frames_.pop_back();
  return code;
}

void Host::set_frame_code(int code) {
  if (!frames_.empty()) frames_.back() = code;
}

void Host::run_launched() {
  if (in_call()) return;
  while (!launched_.empty()) {
    auto job = std::move(launched_.front());
    launched_.pop_front();
    job();
  }
}

bool Host::allocation_allowed() {
  if (fail_allocation_after_ <= 0) return true;
  if (--fail_allocation_after_ == 0) return false;
  return true;
}

}  // namespace host
