// What a program asks of a table: criteria on fields and an order.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "host/runtime/storage/status.h"

namespace host::storage {

/// Comparison of a criterion, written by programs as "=", "/", "#", "<", "<=", ">", ">=".
enum class Operator {
  Equal,           ///< "="
  BeginsWith,      ///< "/": the value's bytes start the field's text; no wildcard, case kept
  Differs,         ///< "#"
  Less,            ///< "<"
  LessOrEqual,     ///< "<="
  Greater,         ///< ">"
  GreaterOrEqual,  ///< ">="
};

/// The operator written `symbol`; UnknownName for any other text.
Result<Operator> parse_operator(std::string_view symbol);

/// One condition: entry `entry` of `field` compared with `value` (canonical text of the field's kind).
struct Criterion {
  std::string field;            ///< field name
  int entry = 1;                ///< 1-based entry of a repeated field
  Operator op = Operator::Equal;  ///< comparison
  std::string value;            ///< compared value; numbers compare as numbers, dates in date order
};

/// Order of a selection; records with equal values come in key order.
struct Order {
  std::string field;        ///< field name
  int entry = 1;            ///< 1-based entry of a repeated field
  bool descending = false;  ///< largest first
};

/// Criteria (all must hold) and an order (the key when absent).
struct Selection {
  std::vector<Criterion> criteria;  ///< joined by AND; none: every record
  std::optional<Order> order;       ///< empty: key order
};

}  // namespace host::storage
