// Canonical texts of field values and their checks before a write.
// Every value travels as text; numbers and dates have one spelling each
// so that what is read back compares equal to what a program expects.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <variant>

#include "host/runtime/storage/status.h"
#include "host/runtime/storage/table_def.h"

namespace host::storage {

/// A value in the form SQLite stores for its kind: INTEGER, REAL or TEXT.
using SqlValue = std::variant<std::int64_t, double, std::string>;

/// "42", "-7"; "" for 0.
std::string canonical_integer(std::int64_t value);
/// Shortest decimal text with a point that reads back the same double ("12.5"); "" for 0.
std::string canonical_decimal(double value);

/// The integer written as optional "-" and digits; "" reads as 0. Empty optional otherwise.
std::optional<std::int64_t> parse_integer(std::string_view text);
/// The finite decimal written as optional "-", digits and an optional point; "" reads as 0.
std::optional<double> parse_decimal(std::string_view text);
/// True for a real calendar date written "YYYY-MM-DD".
bool is_date(std::string_view text);

/// Checks entry `entry` of `field` and converts it for SQLite. Fails with TooLong (a text longer
/// than the width, counted in characters), InvalidValue (bad UTF-8, NUL, a bad number or date).
Result<SqlValue> to_sql_value(const TableDef& table, const FieldDef& field, int entry, std::string_view value);

}  // namespace host::storage
