#include "host/runtime/storage/values.h"

#include <charconv>
#include <cmath>
#include <system_error>

#include "host/runtime/text/utf8.h"

namespace host::storage {

namespace {

Error value_error(const TableDef& table, const FieldDef& field, int entry, const std::string& expected,
                  std::string_view value) {
  return Error{ErrorKind::InvalidValue,
               "Le champ " + field_label(field, entry) + " de la table " + qualified_name(table) + " attend " +
                   expected + ", pas \"" + std::string(value) + "\".",
               "invalid value for its kind"};
}

bool is_digit(char c) { return c >= '0' && c <= '9'; }

int days_in_month(int year, int month) {
  static constexpr int days[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
  bool leap = (year % 4 == 0 && year % 100 != 0) || year % 400 == 0;
  return month == 2 && leap ? 29 : days[month - 1];
}

}  // namespace

std::string canonical_integer(std::int64_t value) { return value == 0 ? std::string() : std::to_string(value); }

std::string canonical_decimal(double value) {
  if (value == 0.0) return {};
  char buffer[400];  // fixed notation of the largest double fits
  auto [end, ec] = std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::fixed);
  if (ec != std::errc()) return std::to_string(value);
  return std::string(buffer, end);
}

std::optional<std::int64_t> parse_integer(std::string_view text) {
  if (text.empty()) return 0;
  std::int64_t value = 0;
  auto [end, ec] = std::from_chars(text.data(), text.data() + text.size(), value);
  if (ec != std::errc() || end != text.data() + text.size()) return std::nullopt;
  return value;
}

std::optional<double> parse_decimal(std::string_view text) {
  if (text.empty()) return 0.0;
  // from_chars also takes "inf" and "nan": only digits, one point and a leading minus are ours.
  bool digit = false;
  for (std::size_t i = 0; i < text.size(); ++i) {
    char c = text[i];
    if (is_digit(c)) digit = true;
    else if (!(c == '.' || (c == '-' && i == 0))) return std::nullopt;
  }
  if (!digit) return std::nullopt;
  double value = 0;
  auto [end, ec] = std::from_chars(text.data(), text.data() + text.size(), value, std::chars_format::fixed);
  if (ec != std::errc() || end != text.data() + text.size() || !std::isfinite(value)) return std::nullopt;
  return value;
}

bool is_date(std::string_view text) {
  if (text.size() != 10 || text[4] != '-' || text[7] != '-') return false;
  for (std::size_t i : {0u, 1u, 2u, 3u, 5u, 6u, 8u, 9u}) {
    if (!is_digit(text[i])) return false;
  }
  auto number = [&](std::size_t from, std::size_t count) {
    int n = 0;
    for (std::size_t i = from; i < from + count; ++i) n = n * 10 + (text[i] - '0');
    return n;
  };
  int year = number(0, 4), month = number(5, 2), day = number(8, 2);
  return year >= 1 && month >= 1 && month <= 12 && day >= 1 && day <= days_in_month(year, month);
}

Result<SqlValue> to_sql_value(const TableDef& table, const FieldDef& field, int entry, std::string_view value) {
  switch (field.kind) {
    case FieldKind::Integer: {
      auto n = parse_integer(value);
      if (!n) return value_error(table, field, entry, "un nombre entier", value);
      return SqlValue(*n);
    }
    case FieldKind::Decimal: {
      auto d = parse_decimal(value);
      if (!d) return value_error(table, field, entry, "un nombre décimal écrit avec un point", value);
      return SqlValue(*d);
    }
    case FieldKind::Date:
      if (!value.empty() && !is_date(value)) return value_error(table, field, entry, "une date AAAA-MM-JJ", value);
      return SqlValue(std::string(value));
    case FieldKind::Text:
      break;
  }
  if (!host::text::is_valid_utf8(value)) {
    return Error{ErrorKind::InvalidValue,
                 "Le champ " + field_label(field, entry) + " de la table " + qualified_name(table) +
                     " contient un texte mal encodé.",
                 "text is not valid UTF-8"};
  }
  // SQLite's text functions stop at a NUL; the host's texts never hold one.
  if (value.find('\0') != std::string_view::npos) {
    return Error{ErrorKind::InvalidValue,
                 "Le champ " + field_label(field, entry) + " de la table " + qualified_name(table) +
                     " contient un caractère nul.",
                 "text holds a NUL byte"};
  }
  std::size_t length = host::text::length(value);
  if (length > static_cast<std::size_t>(field.width)) {
    return Error{ErrorKind::TooLong,
                 "Le champ " + field_label(field, entry) + " de la table " + qualified_name(table) +
                     " accepte au plus " + std::to_string(field.width) + " caractères ; la valeur en compte " +
                     std::to_string(length) + ".",
                 "value longer than the field's width"};
  }
  return SqlValue(std::string(value));
}

}  // namespace host::storage
