// Dialogs for tests: answers are queued beforehand and every shown text is recorded.
#pragma once

#include <deque>
#include <string>
#include <vector>

#include "host/runtime/dialogs.h"

namespace host {

class ScriptedDialogs : public Dialogs {
 public:
  /// One thing the program showed.
  struct Shown {
    std::string kind;   // "message", "question", "open_file", "save_file", "choose", "ask_text"
    std::string title;  // as given
    std::string text;   // as given ("@" kept)
    std::string answer; // what was answered ("" for a message)
  };

  // Queues; an empty queue gives the default (question), a cancel (files,
  // choices, text) or Close (actions).
  std::deque<std::string> answers;                     // question values
  std::deque<std::optional<std::string>> files;        // open/save results
  std::deque<std::optional<std::size_t>> choices;      // picker results
  std::deque<std::optional<std::string>> texts;        // text entries
  std::deque<ScreenAction> actions;                    // screen actions
  std::vector<Shown> shown;                            // everything shown, in order

  /// Texts of the shown items of one kind.
  std::vector<std::string> texts_of(std::string_view kind) const;

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
};

}  // namespace host
