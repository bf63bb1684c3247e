#include "host/runtime/terminal_dialogs.h"

#include <termios.h>
#include <unistd.h>

#include <cstdlib>

#include "host/runtime/screen.h"

namespace host {

TerminalDialogs::TerminalDialogs(Options options, std::FILE* out, std::FILE* in)
    : options_(options), out_(out), in_(in) {}

std::string TerminalDialogs::bold(std::string_view s) const {
  return options_.colour ? "\033[1m" + std::string(s) + "\033[0m" : std::string(s);
}
std::string TerminalDialogs::dim(std::string_view s) const {
  return options_.colour ? "\033[2m" + std::string(s) + "\033[0m" : std::string(s);
}

std::optional<std::string> TerminalDialogs::read_line(bool secret) {
  if (!options_.interactive || in_ == nullptr) return std::nullopt;
  termios saved{};
  bool hide = secret && isatty(fileno(in_)) && tcgetattr(fileno(in_), &saved) == 0;
  if (hide) {
    termios quiet = saved;
    quiet.c_lflag &= ~static_cast<tcflag_t>(ECHO);
    tcsetattr(fileno(in_), TCSANOW, &quiet);
  }
  std::string line;
  int c;
  bool got = false;
  while ((c = std::fgetc(in_)) != EOF) {
    got = true;
    if (c == '\n') break;
    if (c != '\r') line.push_back(static_cast<char>(c));
  }
  if (hide) {
    tcsetattr(fileno(in_), TCSANOW, &saved);
    std::fputs("\n", out_);
  }
  if (!got) return std::nullopt;  // closed input: never block, never loop
  return line;
}

void TerminalDialogs::message(std::string_view title, std::string_view text, int) {
  if (!title.empty()) std::fprintf(out_, "%s\n", bold(title).c_str());
  std::fprintf(out_, "%s\n", with_line_breaks(text).c_str());
  std::fflush(out_);
}

std::string TerminalDialogs::question(std::string_view title, std::string_view text, int,
                                      const std::vector<Choice>& choices) {
  message(title, text, 0);
  std::string fallback = default_value(choices);
  if (options_.assume_yes) {
    for (const Choice& c : choices)
      if (c.value == "1") {
        std::fprintf(out_, "%s\n", dim("(réponse automatique : " + c.label + ")").c_str());
        return c.value;
      }
  }
  for (;;) {
    for (const Choice& c : choices)
      std::fprintf(out_, "  [%s] %s%s\n", c.value.c_str(), c.label.c_str(), c.is_default ? " (par défaut)" : "");
    std::fprintf(out_, "Votre choix : ");
    std::fflush(out_);
    auto line = read_line();
    if (!line) {
      std::string label = fallback;
      for (const Choice& c : choices)
        if (c.value == fallback) label = c.label;
      std::fprintf(out_, "\n%s\n", dim("(pas de réponse possible : choix par défaut « " + label + " »)").c_str());
      return fallback;
    }
    if (line->empty()) return fallback;
    for (const Choice& c : choices)
      if (*line == c.value || *line == c.label) return c.value;
    std::fprintf(out_, "Réponse non comprise.\n");
  }
}

std::optional<std::string> TerminalDialogs::open_file(std::string_view title, std::string_view, const FileFilters&) {
  std::fprintf(out_, "%s\nChemin du fichier (vide pour annuler) : ", bold(title).c_str());
  std::fflush(out_);
  auto line = read_line();
  if (!line || line->empty()) return std::nullopt;
  return line;
}

std::optional<std::string> TerminalDialogs::save_file(std::string_view title, std::string_view suggested,
                                                      const FileFilters& filters) {
  std::fprintf(out_, "%s %s\n", bold(title).c_str(), dim(std::string(suggested)).c_str());
  return open_file("", "", filters);
}

std::optional<std::size_t> TerminalDialogs::choose(std::string_view title, const std::vector<std::string>& items) {
  std::fprintf(out_, "%s\n", bold(title).c_str());
  for (std::size_t i = 0; i < items.size(); ++i) std::fprintf(out_, "  %zu. %s\n", i + 1, items[i].c_str());
  if (items.empty()) std::fprintf(out_, "  (aucun choix possible)\n");
  std::fprintf(out_, "Numéro (vide pour annuler) : ");
  std::fflush(out_);
  auto line = read_line();
  if (!line || line->empty()) return std::nullopt;
  long n = std::strtol(line->c_str(), nullptr, 10);
  if (n < 1 || static_cast<std::size_t>(n) > items.size()) return std::nullopt;
  return static_cast<std::size_t>(n - 1);
}

std::optional<std::string> TerminalDialogs::ask_text(std::string_view prompt, std::string_view current, bool secret) {
  if (secret || current.empty()) {
    std::fprintf(out_, "%s : ", std::string(prompt).c_str());
  } else {
    std::fprintf(out_, "%s [%s] : ", std::string(prompt).c_str(), std::string(current).c_str());
  }
  std::fflush(out_);
  auto line = read_line(secret);
  if (!line) return std::nullopt;
  if (line->empty() && !secret) return std::string(current);
  return line;
}

ScreenAction TerminalDialogs::next_action(const ScreenModel& screen) {
  std::fprintf(out_, "\n%s\n", bold("── " + screen.screen + " ──").c_str());
  for (const auto& [name, state] : screen.controls) {
    if (!state.visible || state.shown.empty()) continue;
    std::fprintf(out_, "  %-16s %s\n", name.c_str(), with_line_breaks(state.shown).c_str());
  }
  std::fprintf(out_, "%s\n", dim("Action (nom d'un bouton, CHAMP=valeur, ou vide pour fermer) :").c_str());
  std::fprintf(out_, "> ");
  std::fflush(out_);
  auto line = read_line();
  ScreenAction a;
  if (!line || line->empty()) return a;
  auto eq = line->find('=');
  if (eq != std::string::npos) {
    a.kind = ScreenAction::Set;
    a.name = line->substr(0, eq);
    a.value = line->substr(eq + 1);
  } else {
    a.kind = ScreenAction::Branch;
    a.name = *line;
  }
  return a;
}

}  // namespace host
