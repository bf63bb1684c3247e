#include "host/runtime/scripted_dialogs.h"

namespace host {

std::vector<std::string> ScriptedDialogs::texts_of(std::string_view kind) const {
  std::vector<std::string> out;
  for (const Shown& s : shown)
    if (s.kind == kind) out.push_back(s.text);
  return out;
}

void ScriptedDialogs::message(std::string_view title, std::string_view text, int) {
  shown.push_back({"message", std::string(title), std::string(text), ""});
}

std::string ScriptedDialogs::question(std::string_view title, std::string_view text, int,
                                      const std::vector<Choice>& choices) {
  std::string answer;
  if (!answers.empty()) {
    answer = answers.front();
    answers.pop_front();
  } else {
    answer = default_value(choices);
  }
  shown.push_back({"question", std::string(title), std::string(text), answer});
  return answer;
}

std::optional<std::string> ScriptedDialogs::open_file(std::string_view title, std::string_view, const FileFilters&) {
  std::optional<std::string> r;
  if (!files.empty()) {
    r = files.front();
    files.pop_front();
  }
  shown.push_back({"open_file", std::string(title), "", r.value_or("")});
  return r;
}

std::optional<std::string> ScriptedDialogs::save_file(std::string_view title, std::string_view, const FileFilters&) {
  std::optional<std::string> r;
  if (!files.empty()) {
    r = files.front();
    files.pop_front();
  }
  shown.push_back({"save_file", std::string(title), "", r.value_or("")});
  return r;
}

std::optional<std::size_t> ScriptedDialogs::choose(std::string_view title, const std::vector<std::string>& items) {
  std::optional<std::size_t> r;
  if (!choices.empty()) {
    r = choices.front();
    choices.pop_front();
  }
  if (r && *r >= items.size()) r.reset();
  std::string list;
  for (const auto& i : items) list += i + "\n";
  shown.push_back({"choose", std::string(title), list, r ? items[*r] : ""});
  return r;
}

std::optional<std::string> ScriptedDialogs::ask_text(std::string_view prompt, std::string_view, bool) {
  std::optional<std::string> r;
  if (!texts.empty()) {
    r = texts.front();
    texts.pop_front();
  }
  shown.push_back({"ask_text", "", std::string(prompt), r.value_or("")});
  return r;
}

ScreenAction ScriptedDialogs::next_action(const ScreenModel&) {
  if (actions.empty()) return {};
  ScreenAction a = actions.front();
  actions.pop_front();
  return a;
}

}  // namespace host
