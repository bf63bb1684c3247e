// The file's layout: SQL tables made from the catalog, and the steps that bring
// a file written by an older release up to the current schema version.
#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "host/runtime/storage/status.h"
#include "host/runtime/storage/table_def.h"

namespace host::storage {

namespace detail {
class Connection;
}

/// What a migration step may do to the file, inside the opening transaction.
class MigrationContext {
 public:
  explicit MigrationContext(const detail::Connection& connection) : connection_(connection) {}
  /// Runs SQL that returns no rows; Failure with SQLite's message.
  Status execute(std::string_view sql) const;
  /// True when the file has the SQL table of `table`.
  Result<bool> has_table(const TableDef& table) const;
  /// True when the SQL table of `table` has the column `column` ("NOMTAG#3").
  Result<bool> has_column(const TableDef& table, std::string_view column) const;

 private:
  const detail::Connection& connection_;
};

/// One step of the schema: run on a file whose version is below `version`, in version order.
/// Tables and columns missing from the catalog's definitions are added after the steps, so a step
/// only transforms data (copy, rename, fill in).
struct Migration {
  int version = 0;                                           ///< version the file has after the step
  std::string description;                                   ///< what the step does, for the log
  std::function<Status(const MigrationContext&)> apply;      ///< the step; an error rolls back the open
};

/// The steps of this release; the last one's version is the current schema version.
std::vector<Migration> host_migrations();

namespace detail {

/// Creates the SQL table of `table`, or adds the columns its definition gained since the file was
/// written (data kept; new columns read ""). Failure when an existing table lacks the key column.
Status ensure_table(const Connection& connection, const TableDef& table);
/// True when the SQL table of `table` exists with every column of the definition.
Result<bool> table_in_step(const Connection& connection, const TableDef& table);
/// True when the file holds no table yet (a new file).
Result<bool> is_empty_file(const Connection& connection);

}  // namespace detail

}  // namespace host::storage
