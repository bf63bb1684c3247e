#include "host/runtime/dialogs.h"

#include "host/runtime/screen.h"

namespace host {

std::vector<Choice> parse_choices(const std::vector<std::string_view>& texts) {
  std::vector<Choice> out;
  for (std::string_view t : texts) {
    if (t.empty()) break;  // the list ends with an empty text
    Choice c;
    if (t.front() == '$') {
      c.is_default = true;
      t.remove_prefix(1);
    }
    auto tilde = t.find('~');
    c.value = std::string(t.substr(0, tilde));
    c.label = tilde == std::string_view::npos ? c.value : std::string(t.substr(tilde + 1));
    out.push_back(std::move(c));
  }
  return out;
}

std::string default_value(const std::vector<Choice>& choices) {
  for (const Choice& c : choices)
    if (c.is_default) return c.value;
  return choices.empty() ? std::string() : choices.front().value;
}

std::string with_line_breaks(std::string_view text) {
  std::string out(text);
  for (char& c : out)
    if (c == '@') c = '\n';
  return out;
}

ControlState& ScreenModel::control(const std::string& name) { return controls[name]; }

ControlState ScreenModel::state(const std::string& name) const {
  auto it = controls.find(name);
  return it == controls.end() ? ControlState{} : it->second;
}

}  // namespace host
