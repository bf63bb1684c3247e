#include "cli/call_args.h"

#include <fmt/format.h>

namespace cli {
namespace {
bool starts_with(const std::string& s, const char* prefix) { return s.rfind(prefix, 0) == 0; }

std::string json_escape(const std::string& s) {
  std::string out;
  for (unsigned char c : s) {
    switch (c) {
      case '"': out += "\\\""; break;
      case '\\': out += "\\\\"; break;
      case '\n': out += "\\n"; break;
      case '\r': out += "\\r"; break;
      case '\t': out += "\\t"; break;
      default:
        if (c < 0x20) out += fmt::format("\\u{:04x}", c);
        else out.push_back(static_cast<char>(c));
    }
  }
  return out;
}
}  // namespace

std::vector<std::unique_ptr<Donnee>> make_arguments(const std::vector<std::string>& args) {
  std::vector<std::unique_ptr<Donnee>> out;
  for (const std::string& a : args) {
    if (starts_with(a, "int:")) {
      out.push_back(std::make_unique<Entier>(std::stoll(a.substr(4))));
    } else if (starts_with(a, "dec:")) {
      out.push_back(std::make_unique<Double>(std::stod(a.substr(4))));
    } else if (starts_with(a, "text:")) {
      out.push_back(std::make_unique<Chaine>(a.substr(5)));
    } else {
      out.push_back(std::make_unique<Chaine>(a));
    }
  }
  return out;
}

std::string format_outcome(int code, const std::vector<std::unique_ptr<Donnee>>& params, bool json) {
  std::string out;
  if (json) {
    out = fmt::format("{{\"code\": {}, \"params\": [", code);
    for (std::size_t i = 0; i < params.size(); ++i)
      out += fmt::format("{}\"{}\"", i ? ", " : "", json_escape(params[i]->texte()));
    out += "]}\n";
    return out;
  }
  out = fmt::format("code : {}\n", code);
  for (std::size_t i = 0; i < params.size(); ++i) out += fmt::format("[{}] {}\n", i, params[i]->texte());
  return out;
}

}  // namespace cli
