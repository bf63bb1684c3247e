// Dialogs on a terminal. Without an interactive input (closed or redirected
// stdin, or `assume_yes`), questions take their default and say so.
#pragma once

#include <cstdio>

#include "host/runtime/dialogs.h"

namespace host {

class TerminalDialogs : public Dialogs {
 public:
  struct Options {
    bool interactive = true;  // false: never read stdin
    bool assume_yes = false;  // answer every question with its "1" choice
    bool colour = false;      // ANSI colours
  };
  explicit TerminalDialogs(Options options, std::FILE* out = stdout, std::FILE* in = stdin);

  void message(std::string_view title, std::string_view text, int type) override;
  std::string question(std::string_view title, std::string_view text, int icon,
                       const std::vector<Choice>& choices) override;
  std::optional<std::string> open_file(std::string_view title, std::string_view start,
                                       const FileFilters& filters) override;
  std::optional<std::string> save_file(std::string_view title, std::string_view suggested,
                                       const FileFilters& filters) override;
  std::optional<std::size_t> choose(std::string_view title, const std::vector<std::string>& items) override;
  std::optional<std::string> ask_text(std::string_view prompt, std::string_view current, bool secret) override;
  ScreenAction next_action(const ScreenModel& screen) override;

 private:
  std::optional<std::string> read_line(bool secret = false);
  std::string bold(std::string_view s) const;
  std::string dim(std::string_view s) const;

  Options options_;
  std::FILE* out_;
  std::FILE* in_;
};

}  // namespace host
