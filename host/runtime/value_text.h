// Conversions between the four kinds of host values and their French text forms.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "frame/host_runtime.h"

namespace host {

/// "12,5", "3", "-0,25": comma as decimal separator, at most 6 decimals, no trailing zeros.
std::string format_decimal(double d);
/// dd/mm/yyyy of a yyyymmdd value; "" for 0.
std::string format_date(long long yyyymmdd);
/// Parses "dd/mm/yyyy", "d/m/yyyy" or "yyyy-mm-dd" into yyyymmdd; nullopt when not a valid date.
std::optional<long long> parse_date(std::string_view text);
/// Parses an integer or decimal written with "." or ","; nullopt when not a number.
std::optional<double> parse_number(std::string_view text);

/// Text form of any value.
std::string to_text(const Valeur& v);
long long to_integer(const Valeur& v);
double to_decimal(const Valeur& v);
/// `v` converted to `type`.
Valeur convert(const Valeur& v, TypeDonnee type);

Valeur text_value(std::string_view s);  // made valid UTF-8
Valeur integer_value(long long i);
Valeur decimal_value(double d);
Valeur date_value(long long yyyymmdd);

}  // namespace host
