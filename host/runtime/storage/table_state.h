// What the library keeps per open file and per table: the connection, each
// table's definition and its prepared statements. Internal to the storage library.
#pragma once

#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>

#include "host/runtime/storage/record.h"
#include "host/runtime/storage/sqlite_handles.h"
#include "host/runtime/storage/table_def.h"

namespace host::storage::detail {

/// Prepared statements of one table, prepared on first use and kept for the connection's life.
struct TableState {
  std::shared_ptr<const TableDef> definition;  ///< never null
  std::string columns;                         ///< quoted column list, column order
  Statement read;                              ///< SELECT columns WHERE key = ?
  Statement insert;                            ///< INSERT every column
  Statement update;                            ///< UPDATE every column WHERE key = ?
  Statement remove;                            ///< DELETE WHERE key = ?
  Statement count_all;                         ///< SELECT count(*)
  std::unordered_map<std::string, Statement> idle;  ///< selections and counts by SQL text, not in use
};

/// One open file: the connection and the tables of its catalog.
struct Session {
  std::unique_ptr<Connection> connection;  ///< declared first: destroyed after the statements
  std::map<std::string, std::unique_ptr<TableState>> tables;  ///< by table_key()

  /// The state of (base, name), ASCII case ignored; null when the catalog has no such table.
  TableState* find(std::string_view base, std::string_view name) const;
};

/// How Session::tables is keyed: "BASE.NAME" in ASCII upper case.
std::string table_key(std::string_view base, std::string_view name);

/// Copies the current row of `statement` (columns in column order) into `record`.
void load_row(sqlite3_stmt* statement, Record& record);

/// A statement for `sql`: an idle one of `state` when there is one, else freshly prepared.
Result<Statement> take_statement(const Connection& connection, TableState& state, const std::string& sql);
/// Gives a statement back to `state` for the next use of the same SQL (or drops it).
void give_back_statement(TableState& state, const std::string& sql, Statement statement) noexcept;

}  // namespace host::storage::detail
