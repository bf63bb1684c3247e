// SQL text of the statements on one table. Values never enter the text:
// they are bound as parameters. Internal to the storage library.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "host/runtime/storage/selection.h"
#include "host/runtime/storage/status.h"
#include "host/runtime/storage/table_def.h"
#include "host/runtime/storage/values.h"

namespace host::storage::detail {

/// An SQL identifier in double quotes, inner quotes doubled.
std::string quote_identifier(std::string_view name);
/// The SQL table of a definition, quoted: "GESCOM.VNTEMAIL".
std::string quoted_table(const TableDef& table);
/// Every column, quoted, in column order, separated by commas.
std::string column_list(const TableDef& table);

/// A WHERE clause ("" when there is no criterion) and the values to bind, in order.
struct WhereClause {
  std::string sql;                 ///< " WHERE ..." or ""
  std::vector<SqlValue> parameters;  ///< one per "?" of sql
};

/// The clause for `criteria`. Fails with UnknownName (field, entry) or InvalidValue (a value
/// that is not a number where the field is a number, "/" on a decimal field).
Result<WhereClause> where_clause(const TableDef& table, const std::vector<Criterion>& criteria);
/// " ORDER BY ..." for `order`, key order when empty; UnknownName for an unknown field or entry.
Result<std::string> order_clause(const TableDef& table, const std::optional<Order>& order);

}  // namespace host::storage::detail
