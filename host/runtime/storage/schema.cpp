#include "host/runtime/storage/schema.h"

#include <sqlite3.h>

#include <set>

#include "host/runtime/storage/query_text.h"
#include "host/runtime/storage/sqlite_handles.h"

namespace host::storage {

namespace {

const char* column_type(const FieldDef& field) {
  switch (field.kind) {
    case FieldKind::Integer: return "INTEGER NOT NULL DEFAULT 0";
    case FieldKind::Decimal: return "REAL NOT NULL DEFAULT 0";
    case FieldKind::Text:
    case FieldKind::Date: break;  // dates as "YYYY-MM-DD" text sort in date order
  }
  return "TEXT NOT NULL DEFAULT ''";
}

// Column names of an SQL table, upper-cased (SQLite ignores case in names).
Result<std::set<std::string>> existing_columns(const detail::Connection& connection, const std::string& table) {
  auto statement = connection.prepare("SELECT name FROM pragma_table_info(?)");
  if (!statement) return statement.error();
  detail::StatementUse use(*statement);
  sqlite3_bind_text64(statement->get(), 1, table.data(), table.size(), SQLITE_TRANSIENT, SQLITE_UTF8);
  std::set<std::string> columns;
  int rc;
  while ((rc = sqlite3_step(statement->get())) == SQLITE_ROW) {
    const auto* name = reinterpret_cast<const char*>(sqlite3_column_text(statement->get(), 0));
    columns.insert(upper_ascii(name != nullptr ? name : ""));
  }
  if (rc != SQLITE_DONE) return connection.error(rc, "read columns of " + table);
  return columns;
}

}  // namespace

Status MigrationContext::execute(std::string_view sql) const { return connection_.execute(sql); }

Result<bool> MigrationContext::has_table(const TableDef& table) const {
  auto columns = existing_columns(connection_, qualified_name(table));
  if (!columns) return columns.error();
  return !columns->empty();
}

Result<bool> MigrationContext::has_column(const TableDef& table, std::string_view column) const {
  auto columns = existing_columns(connection_, qualified_name(table));
  if (!columns) return columns.error();
  return columns->count(upper_ascii(column)) != 0;
}

std::vector<Migration> host_migrations() {
  return {
      // Files written before the version was kept: their tables only lack columns, which the
      // catalog adds.
      Migration{1, "schema version recorded", [](const MigrationContext&) { return Status(); }},
  };
}

namespace detail {

Status ensure_table(const Connection& connection, const TableDef& table) {
  std::string name = qualified_name(table);
  auto columns = existing_columns(connection, name);
  if (!columns) return columns.error();
  const FieldDef& key = *find_field(table, table.key);

  if (columns->empty()) {
    std::string sql = "CREATE TABLE " + quoted_table(table) + " (";
    bool first = true;
    for (const FieldDef& field : table.fields) {
      for (int entry = 1; entry <= field.repeat; ++entry) {
        if (!first) sql += ", ";
        first = false;
        sql += quote_identifier(column_name(field, entry)) + " " + column_type(field);
        if (&field == &key) sql += " PRIMARY KEY";
      }
    }
    return connection.execute(sql + ")");
  }

  if (columns->count(upper_ascii(key.name)) == 0) {
    return Error{ErrorKind::Failure,
                 "La table " + name + " de la base de données " + connection.path() +
                     " n'a pas de colonne clé " + key.name + " : elle ne peut pas être mise à jour.",
                 "existing table lacks its key column"};
  }
  for (const FieldDef& field : table.fields) {
    for (int entry = 1; entry <= field.repeat; ++entry) {
      std::string column = column_name(field, entry);
      if (columns->count(upper_ascii(column)) != 0) continue;
      Status added = connection.execute("ALTER TABLE " + quoted_table(table) + " ADD COLUMN " +
                                        quote_identifier(column) + " " + column_type(field));
      if (!added) return added;
    }
  }
  return {};
}

Result<bool> table_in_step(const Connection& connection, const TableDef& table) {
  auto columns = existing_columns(connection, qualified_name(table));
  if (!columns) return columns.error();
  for (const FieldDef& field : table.fields) {
    for (int entry = 1; entry <= field.repeat; ++entry) {
      if (columns->count(upper_ascii(column_name(field, entry))) == 0) return false;
    }
  }
  return true;
}

Result<bool> is_empty_file(const Connection& connection) {
  auto tables = connection.query_integer("SELECT count(*) FROM sqlite_schema WHERE type = 'table'");
  if (!tables) return tables.error();
  return *tables == 0;
}

}  // namespace detail

}  // namespace host::storage
