// The host: one instance runs the module's programs. It holds the data folder,
// the current user, the dialogs, the screens, the components, the interface
// records, the call frames and the launch queue. The registry points at the
// active host; building a Host makes it active, destroying it deactivates it.
#pragma once

#include <cstdio>
#include <deque>
#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "frame/host_runtime.h"
#include "host/runtime/components.h"
#include "host/runtime/dialogs.h"
#include "host/runtime/screen.h"

namespace host {

struct HostOptions {
  std::string data_dir;   // data folder ("" = no storage)
  std::string user;       // current user ("" = login name)
  std::string mem_url;    // web base address
  std::string log_file;   // "" = data_dir/vntemail.log when data_dir is set
  bool log_to_stderr = true;
};

/// One logged host failure or notice.
struct LogEntry {
  std::string level;    // "erreur", "info"
  std::string text;     // French text
  std::string detail;   // technical detail
};

class Host {
 public:
  explicit Host(HostOptions options, Dialogs* dialogs = nullptr);
  ~Host();
  Host(const Host&) = delete;
  Host& operator=(const Host&) = delete;

  /// The active host; a host failure when there is none.
  static Host& active();
  static Host* active_or_null();

  const HostOptions& options() const { return options_; }
  const std::string& user() const { return user_; }
  void set_user(std::string user) { user_ = std::move(user); }

  Dialogs& dialogs();                 ///< the dialogs (a non-interactive terminal when none was given)
  void set_dialogs(Dialogs* d) { dialogs_ = d; }
  Components& components() { return components_; }

  /// Screen model of a program (kept after the program ends, for inspection).
  ScreenModel& screen(const std::string& program);
  const std::map<std::string, ScreenModel>& screens() const { return screens_; }

  // Log: failures are written to stderr and the log file, and kept here.
  void log(std::string level, std::string text, std::string detail = {});
  const std::vector<LogEntry>& log_entries() const { return log_; }

  // Call frames: the method error code of each call in progress.
  void push_frame() { frames_.push_back(0); }
  int pop_frame();
  void set_frame_code(int code);
  int frame_code() const { return frames_.empty() ? 0 : frames_.back(); }
  bool in_call() const { return !frames_.empty(); }

  /// Queues a launched program or procedure; run by run_launched().
  void queue_launch(std::function<void()> job) { launched_.push_back(std::move(job)); }
  /// Runs the queued launches (and those they queue) once no call is in progress.
  void run_launched();

  /// Busy cursor state (Ecran::curseur).
  int cursor() const { return cursor_; }
  void set_cursor(int c) { cursor_ = c; }
  /// Pending messages cleared (Message::nettoie) count, for tests.
  int messages_cleared() const { return messages_cleared_; }
  void clear_messages() { ++messages_cleared_; }

  /// Test hook: the Nth host allocation from now fails (0 = never).
  void fail_allocation_after(long n) { fail_allocation_after_ = n; }
  bool allocation_allowed();

 private:
  HostOptions options_;
  std::string user_;
  Dialogs* dialogs_ = nullptr;
  std::unique_ptr<Dialogs> default_dialogs_;
  Components components_;
  std::map<std::string, ScreenModel> screens_;
  std::vector<LogEntry> log_;
  std::FILE* log_file_ = nullptr;
  std::vector<int> frames_;
  std::deque<std::function<void()>> launched_;
  int cursor_ = 0;
  int messages_cleared_ = 0;
  long fail_allocation_after_ = 0;
  Host* previous_ = nullptr;
};

}  // namespace host
