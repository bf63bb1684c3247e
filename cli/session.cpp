#include "cli/session.h"

#include <cstdlib>

#include "host/runtime/registry.h"

namespace cli {

std::string default_data_dir() {
  if (const char* x = std::getenv("XDG_DATA_HOME"); x && *x) return std::string(x) + "/vntemail";
  if (const char* h = std::getenv("HOME"); h && *h) return std::string(h) + "/.local/share/vntemail";
  return ".vntemail";
}

std::unique_ptr<EvtParamRef> make_event(const std::vector<Donnee*>& vars) { return std::make_unique<EvtParamRef>(vars); }

Session::Session(const GlobalOptions& options, host::Dialogs* dialogs) : options_(options) {
  host::HostOptions ho;
  ho.data_dir = options.data_dir.empty() ? default_data_dir() : options.data_dir;
  ho.user = options.user;
  ho.log_to_stderr = options.verbose;
  if (const char* url = std::getenv("VNTEMAIL_WEB_URL")) ho.mem_url = url;
  host_ = std::make_unique<host::Host>(ho, dialogs);
  auto& registry = host::Registry::instance();
  registry.add_library("VNTEMAIL", &VNTEMAILChargement, &VNTEMAILDechargement);
  registry.load("VNTEMAIL");
}

Session::~Session() { host::Registry::instance().unload("VNTEMAIL"); }

int Session::guarded(const std::function<int()>& body) {
  try {
    return body();
  } catch (Exception* e) {
    std::fprintf(stderr, "Erreur : %s\n", e->message().c_str());
    if (options_.verbose && !e->detail().empty()) std::fprintf(stderr, "Détail : %s\n", e->detail().c_str());
    hoteDetruire(e);
    return 1;
  } catch (const std::exception& e) {
    std::fprintf(stderr, "Erreur interne : %s\n", e.what());
    return 1;
  }
}

}  // namespace cli
