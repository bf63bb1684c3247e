// Dialogs behind one interface: scripted for tests, terminal for the command line.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace host {

class ScreenModel;

/// One choice of a question, from "1~Oui" or "$0~Non" ("$" marks the default).
struct Choice {
  std::string value;        // what the question returns
  std::string label;        // what the user sees
  bool is_default = false;  // taken when nobody answers
};

/// Parses "value~label" texts; an empty text ends the list.
std::vector<Choice> parse_choices(const std::vector<std::string_view>& texts);
/// The default choice's value (the first choice when none is marked, "" when no choice).
std::string default_value(const std::vector<Choice>& choices);
/// "@" is the host's line break inside message texts.
std::string with_line_breaks(std::string_view text);

using FileFilters = std::vector<std::pair<std::string, std::string>>;  // name, pattern

/// What the user does next on a screen.
struct ScreenAction {
  enum Kind { Branch, Set, Close } kind = Close;  // press a button / type into a field / close
  std::string name;                               // branch or control name
  std::string value;                              // typed value for Set
};

/// The host's dialogs. Implementations must never block on a closed input.
class Dialogs {
 public:
  virtual ~Dialogs() = default;
  /// A message box.
  virtual void message(std::string_view title, std::string_view text, int type) = 0;
  /// A question; returns the chosen choice's value.
  virtual std::string question(std::string_view title, std::string_view text, int icon,
                               const std::vector<Choice>& choices) = 0;
  /// File-open dialog: the chosen full path, or nullopt when cancelled.
  virtual std::optional<std::string> open_file(std::string_view title, std::string_view start,
                                               const FileFilters& filters) = 0;
  /// File-save dialog: the chosen full path, or nullopt when cancelled.
  virtual std::optional<std::string> save_file(std::string_view title, std::string_view suggested,
                                               const FileFilters& filters) = 0;
  /// A choice list (pickers): index of the chosen item, or nullopt when cancelled.
  virtual std::optional<std::size_t> choose(std::string_view title, const std::vector<std::string>& items) = 0;
  /// Free text entry (settings editors): nullopt when cancelled.
  virtual std::optional<std::string> ask_text(std::string_view prompt, std::string_view current, bool secret) = 0;
  /// The user's next action on a screen; Close when there is none.
  virtual ScreenAction next_action(const ScreenModel& screen) = 0;
};

}  // namespace host
