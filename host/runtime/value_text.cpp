#include "host/runtime/value_text.h"

#include <charconv>
#include <cmath>
#include <cstdio>

#include "host/runtime/text/utf8.h"

namespace host {
namespace {

bool valid_ymd(int y, int m, int d) {
  if (y < 1 || y > 9999 || m < 1 || m > 12 || d < 1) return false;
  static const int days[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
  int max = days[m - 1];
  if (m == 2 && ((y % 4 == 0 && y % 100 != 0) || y % 400 == 0)) max = 29;
  return d <= max;
}

std::string_view trim(std::string_view s) {
  while (!s.empty() && (s.front() == ' ' || s.front() == '\t')) s.remove_prefix(1);
  while (!s.empty() && (s.back() == ' ' || s.back() == '\t')) s.remove_suffix(1);
  return s;
}

bool parse_int(std::string_view s, int& out) {
  auto r = std::from_chars(s.data(), s.data() + s.size(), out);
  return r.ec == std::errc() && r.ptr == s.data() + s.size();
}

}  // namespace

std::string format_decimal(double d) {
  if (std::isnan(d) || std::isinf(d)) return "0";
  char buf[64];
  std::snprintf(buf, sizeof buf, "%.6f", d);
  std::string s = buf;
  auto dot = s.find('.');
  if (dot != std::string::npos) {
    while (!s.empty() && s.back() == '0') s.pop_back();
    if (s.back() == '.') s.pop_back();
    else s[dot] = ',';
  }
  if (s == "-0") s = "0";
  return s;
}

std::string format_date(long long v) {
  if (v <= 0) return {};
  char buf[16];
  std::snprintf(buf, sizeof buf, "%02d/%02d/%04d", static_cast<int>(v % 100), static_cast<int>((v / 100) % 100),
                static_cast<int>(v / 10000));
  return buf;
}

std::optional<long long> parse_date(std::string_view text) {
  text = trim(text);
  int y = 0, m = 0, d = 0;
  auto slash = text.find('/');
  if (slash != std::string_view::npos) {
    auto slash2 = text.find('/', slash + 1);
    if (slash2 == std::string_view::npos) return std::nullopt;
    if (!parse_int(text.substr(0, slash), d) || !parse_int(text.substr(slash + 1, slash2 - slash - 1), m) ||
        !parse_int(text.substr(slash2 + 1), y))
      return std::nullopt;
  } else if (text.size() == 10 && text[4] == '-' && text[7] == '-') {
    if (!parse_int(text.substr(0, 4), y) || !parse_int(text.substr(5, 2), m) || !parse_int(text.substr(8, 2), d))
      return std::nullopt;
  } else {
    return std::nullopt;
  }
  if (!valid_ymd(y, m, d)) return std::nullopt;
  return static_cast<long long>(y) * 10000 + m * 100 + d;
}

std::optional<double> parse_number(std::string_view text) {
  text = trim(text);
  if (text.empty()) return std::nullopt;
  std::string s(text);
  for (char& c : s)
    if (c == ',') c = '.';
  double d = 0;
  auto r = std::from_chars(s.data(), s.data() + s.size(), d);
  if (r.ec != std::errc() || r.ptr != s.data() + s.size()) return std::nullopt;
  return d;
}

std::string to_text(const Valeur& v) {
  switch (v.type) {
    case TypeDonnee::Chaine: return v.texte;
    case TypeDonnee::Entier: return std::to_string(v.entier);
    case TypeDonnee::Double: return format_decimal(v.decimal);
    case TypeDonnee::Date: return format_date(v.entier);
  }
  return {};
}

long long to_integer(const Valeur& v) {
  switch (v.type) {
    case TypeDonnee::Chaine: {
      auto n = parse_number(v.texte);
      return n ? static_cast<long long>(*n) : 0;
    }
    case TypeDonnee::Entier:
    case TypeDonnee::Date: return v.entier;
    case TypeDonnee::Double: return static_cast<long long>(v.decimal);
  }
  return 0;
}

double to_decimal(const Valeur& v) {
  switch (v.type) {
    case TypeDonnee::Chaine: return parse_number(v.texte).value_or(0);
    case TypeDonnee::Entier:
    case TypeDonnee::Date: return static_cast<double>(v.entier);
    case TypeDonnee::Double: return v.decimal;
  }
  return 0;
}

Valeur convert(const Valeur& v, TypeDonnee type) {
  if (v.type == type) return v;
  switch (type) {
    case TypeDonnee::Chaine: return text_value(to_text(v));
    case TypeDonnee::Entier: return integer_value(to_integer(v));
    case TypeDonnee::Double: return decimal_value(to_decimal(v));
    case TypeDonnee::Date:
      if (v.type == TypeDonnee::Chaine) return date_value(parse_date(v.texte).value_or(0));
      return date_value(to_integer(v));
  }
  return v;
}

Valeur text_value(std::string_view s) {
  Valeur v;
  v.type = TypeDonnee::Chaine;
  v.texte = text::to_valid_utf8(s);
  return v;
}
Valeur integer_value(long long i) {
  Valeur v;
  v.type = TypeDonnee::Entier;
  v.entier = i;
  return v;
}
Valeur decimal_value(double d) {
  Valeur v;
  v.type = TypeDonnee::Double;
  v.decimal = d;
  return v;
}
Valeur date_value(long long yyyymmdd) {
  Valeur v;
  v.type = TypeDonnee::Date;
  v.entier = yyyymmdd;
  return v;
}

}  // namespace host
