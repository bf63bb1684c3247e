#include "host/runtime/storage/table_state.h"

#include <sqlite3.h>

#include <utility>

namespace host::storage::detail {

namespace {
// Distinct selections per table worth keeping prepared; programs use a handful each.
constexpr std::size_t max_idle_statements = 32;
}  // namespace

std::string table_key(std::string_view base, std::string_view name) {
  return upper_ascii(base) + "." + upper_ascii(name);
}

TableState* Session::find(std::string_view base, std::string_view name) const {
  auto it = tables.find(table_key(base, name));
  return it == tables.end() ? nullptr : it->second.get();
}

void load_row(sqlite3_stmt* statement, Record& record) {
  const TableDef& table = record.table();
  int column = 0;
  for (const FieldDef& field : table.fields) {
    for (int entry = 1; entry <= field.repeat; ++entry, ++column) {
      std::string& value = record.at(static_cast<std::size_t>(column));
      int type = sqlite3_column_type(statement, column);
      if (type == SQLITE_NULL) {
        value.clear();
      } else if (field.kind == FieldKind::Integer && type == SQLITE_INTEGER) {
        value = canonical_integer(sqlite3_column_int64(statement, column));
      } else if ((field.kind == FieldKind::Integer || field.kind == FieldKind::Decimal) &&
                 (type == SQLITE_INTEGER || type == SQLITE_FLOAT)) {
        value = canonical_decimal(sqlite3_column_double(statement, column));
      } else {
        // Texts, dates, and whatever text an older file holds in a numeric column, byte for byte.
        const auto* text = reinterpret_cast<const char*>(sqlite3_column_text(statement, column));
        int bytes = sqlite3_column_bytes(statement, column);
        value.assign(text != nullptr ? text : "", static_cast<std::size_t>(bytes));
      }
    }
  }
}

Result<Statement> take_statement(const Connection& connection, TableState& state, const std::string& sql) {
  auto it = state.idle.find(sql);
  if (it != state.idle.end()) {
    Statement statement = std::move(it->second);
    state.idle.erase(it);
    return statement;
  }
  return connection.prepare(sql);
}

void give_back_statement(TableState& state, const std::string& sql, Statement statement) noexcept {
  if (!statement) return;
  statement.reset();
  if (state.idle.size() >= max_idle_statements || state.idle.count(sql) != 0) return;  // dropped: finalized
  try {
    state.idle.emplace(sql, std::move(statement));
  } catch (...) {
    // Out of memory while caching: the statement is simply finalized.
  }
}

}  // namespace host::storage::detail
