// One run of the command: the host, the module library, the components.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "frame/host_runtime.h"
#include "host/runtime/host.h"

namespace cli {

struct GlobalOptions {
  std::string data_dir;  // --data / VNTEMAIL_DATA ("" = default under the user's data directory)
  std::string user;      // --user / VNTEMAIL_USER
  bool verbose = false;  // technical detail of errors
};

/// The default data folder: $XDG_DATA_HOME/vntemail, or ~/.local/share/vntemail.
std::string default_data_dir();

/// An event of variables by reference, from a list built at run time.
std::unique_ptr<EvtParamRef> make_event(const std::vector<Donnee*>& vars);

class Session {
 public:
  explicit Session(const GlobalOptions& options, host::Dialogs* dialogs = nullptr);
  ~Session();
  host::Host& host() { return *host_; }
  /// Runs `body`; a host failure becomes a French message on stderr (and its detail with --verbose) and exit code 1.
  int guarded(const std::function<int()>& body);

 private:
  GlobalOptions options_;
  std::unique_ptr<host::Host> host_;
};

}  // namespace cli
