#include "host/runtime/storage/query_text.h"

namespace host::storage::detail {

namespace {

const char* comparison(Operator op) {
  switch (op) {
    case Operator::Equal: return " = ?";
    case Operator::Differs: return " <> ?";
    case Operator::Less: return " < ?";
    case Operator::LessOrEqual: return " <= ?";
    case Operator::Greater: return " > ?";
    case Operator::GreaterOrEqual: return " >= ?";
    case Operator::BeginsWith: break;
  }
  return " = ?";
}

// The smallest text above every text that starts with `prefix` (bytewise order, as SQLite's
// BINARY collation compares); empty when there is none (a prefix of 0xFF bytes only).
std::string upper_bound_of(std::string prefix) {
  while (!prefix.empty() && static_cast<unsigned char>(prefix.back()) == 0xFF) prefix.pop_back();
  if (!prefix.empty()) prefix.back() = static_cast<char>(static_cast<unsigned char>(prefix.back()) + 1);
  return prefix;
}

Error criterion_error(const TableDef& table, const FieldDef& field, int entry, const std::string& expected,
                      const std::string& value) {
  return Error{ErrorKind::InvalidValue,
               "Le critère sur le champ " + field_label(field, entry) + " de la table " + qualified_name(table) +
                   " attend " + expected + ", pas \"" + value + "\".",
               "criterion value does not fit the field's kind"};
}

}  // namespace

std::string quote_identifier(std::string_view name) {
  std::string quoted = "\"";
  for (char c : name) {
    if (c == '"') quoted += '"';
    quoted += c;
  }
  return quoted + "\"";
}

std::string quoted_table(const TableDef& table) { return quote_identifier(qualified_name(table)); }

std::string column_list(const TableDef& table) {
  std::string list;
  for (const FieldDef& field : table.fields) {
    for (int entry = 1; entry <= field.repeat; ++entry) {
      if (!list.empty()) list += ", ";
      list += quote_identifier(column_name(field, entry));
    }
  }
  return list;
}

Result<WhereClause> where_clause(const TableDef& table, const std::vector<Criterion>& criteria) {
  WhereClause clause;
  std::string conditions;
  for (const Criterion& criterion : criteria) {
    auto index = column_index(table, criterion.field, criterion.entry);
    if (!index) return index.error();
    const FieldDef& field = *find_field(table, criterion.field);
    std::string column = quote_identifier(column_name(field, criterion.entry));
    std::string condition;

    if (criterion.op == Operator::BeginsWith) {
      if (field.kind == FieldKind::Decimal) {
        return Error{ErrorKind::InvalidValue,
                     "L'opérateur / (commence par) ne s'applique pas au champ décimal " +
                         field_label(field, criterion.entry) + " de la table " + qualified_name(table) + ".",
                     "begins-with on a decimal field"};
      }
      if (criterion.value.empty()) continue;  // every text begins with ""
      // Integers are compared on their canonical text, where 0 is "".
      std::string subject =
          field.kind == FieldKind::Integer ? "CASE WHEN " + column + " = 0 THEN '' ELSE CAST(" + column + " AS TEXT) END"
                                           : column;
      // A range, not LIKE: LIKE treats "%" and "_" as wildcards and folds ASCII case.
      condition = subject + " >= ?";
      clause.parameters.emplace_back(criterion.value);
      std::string upper = upper_bound_of(criterion.value);
      if (!upper.empty()) {
        condition += " AND " + subject + " < ?";
        clause.parameters.emplace_back(std::move(upper));
      }
    } else {
      condition = column + comparison(criterion.op);
      switch (field.kind) {
        case FieldKind::Integer: {
          auto n = parse_integer(criterion.value);
          if (!n) return criterion_error(table, field, criterion.entry, "un nombre entier", criterion.value);
          clause.parameters.emplace_back(*n);
          break;
        }
        case FieldKind::Decimal: {
          auto d = parse_decimal(criterion.value);
          if (!d) {
            return criterion_error(table, field, criterion.entry, "un nombre décimal écrit avec un point",
                                   criterion.value);
          }
          clause.parameters.emplace_back(*d);
          break;
        }
        case FieldKind::Text:
        case FieldKind::Date:
          clause.parameters.emplace_back(criterion.value);
          break;
      }
    }
    conditions += conditions.empty() ? "(" : " AND (";
    conditions += condition + ")";
  }
  if (!conditions.empty()) clause.sql = " WHERE " + conditions;
  return clause;
}

// `table` has passed check_definition(): its key field exists.
Result<std::string> order_clause(const TableDef& table, const std::optional<Order>& order) {
  std::string key = quote_identifier(find_field(table, table.key)->name);
  if (!order) return " ORDER BY " + key;
  auto index = column_index(table, order->field, order->entry);
  if (!index) return index.error();
  const FieldDef& field = *find_field(table, order->field);
  const char* direction = order->descending ? " DESC" : "";
  if (same_name(field.name, table.key)) return " ORDER BY " + key + direction;
  return " ORDER BY " + quote_identifier(column_name(field, order->entry)) + direction + ", " + key + direction;
}

}  // namespace host::storage::detail
