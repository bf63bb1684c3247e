#include "host/runtime/storage/stored_table.h"

#include <sqlite3.h>

#include <utility>

#include "host/runtime/storage/query_text.h"
#include "host/runtime/storage/table_state.h"

namespace host::storage {

namespace {

bool is_key_conflict(int rc) { return rc == SQLITE_CONSTRAINT_PRIMARYKEY || rc == SQLITE_CONSTRAINT_UNIQUE; }

// Prepares `statement` on first use; the SQL text is built only then.
template <class MakeSql>
Status ensure_prepared(const detail::Connection& connection, detail::Statement& statement, MakeSql make_sql) {
  if (statement) return {};
  auto prepared = connection.prepare(make_sql());
  if (!prepared) return prepared.error();
  statement = std::move(*prepared);
  return {};
}

Status bind_all(const detail::Connection& connection, sqlite3_stmt* statement, const std::vector<SqlValue>& values,
                bool copy, int first = 1) {
  for (std::size_t i = 0; i < values.size(); ++i) {
    int rc = detail::bind(statement, first + static_cast<int>(i), values[i], copy);
    if (rc != SQLITE_OK) return connection.error(rc, "bind");
  }
  return {};
}

}  // namespace

const TableDef& StoredTable::definition() const { return *state_->definition; }

Record StoredTable::new_record() const { return Record(state_->definition); }

Error StoredTable::not_found(std::string_view key) const {
  return Error{ErrorKind::NotFound,
               "Aucun enregistrement de clé \"" + std::string(key) + "\" dans la table " +
                   qualified_name(definition()) + ".",
               "no row with that key"};
}

Error StoredTable::duplicate(std::string_view key) const {
  return Error{ErrorKind::Duplicate,
               "Un enregistrement de clé \"" + std::string(key) + "\" existe déjà dans la table " +
                   qualified_name(definition()) + ".",
               "primary key conflict"};
}

std::string StoredTable::key_column() const {
  return detail::quote_identifier(find_field(definition(), definition().key)->name);
}

Result<SqlValue> StoredTable::key_value(std::string_view key) const {
  const FieldDef& field = *find_field(definition(), definition().key);
  if (field.kind == FieldKind::Integer) {
    auto n = parse_integer(key);
    if (!n) {
      return Error{ErrorKind::InvalidValue,
                   "La clé " + field.name + " de la table " + qualified_name(definition()) +
                       " est un nombre entier, pas \"" + std::string(key) + "\".",
                   "key is not an integer"};
    }
    return SqlValue(*n);
  }
  return SqlValue(std::string(key));
}

Result<std::vector<SqlValue>> StoredTable::values_for_write(const Record& record) const {
  const TableDef& table = definition();
  if (record.table_ptr() != state_->definition &&
      (qualified_name(record.table()) != qualified_name(table) || record.values().size() != column_count(table))) {
    return Error{ErrorKind::UnknownName,
                 "L'enregistrement n'appartient pas à la table " + qualified_name(table) + ".",
                 "record of " + qualified_name(record.table())};
  }
  if (record.key().empty()) {
    return Error{ErrorKind::InvalidValue,
                 "La clé " + find_field(table, table.key)->name + " d'un enregistrement de la table " +
                     qualified_name(table) + " ne peut pas être vide.",
                 "empty key"};
  }
  std::vector<SqlValue> values;
  values.reserve(record.values().size());
  std::size_t column = 0;
  for (const FieldDef& field : table.fields) {
    for (int entry = 1; entry <= field.repeat; ++entry, ++column) {
      auto value = to_sql_value(table, field, entry, record.values()[column]);
      if (!value) return value.error();
      values.push_back(std::move(*value));
    }
  }
  return values;
}

Result<Record> StoredTable::read(std::string_view key) {
  Record record = new_record();
  Status status = read(key, record);
  if (!status) return status.error();
  return record;
}

Status StoredTable::read(std::string_view key, Record& into) {
  const detail::Connection& connection = *session_->connection;
  detail::TableState& state = *state_;
  Status prepared = ensure_prepared(connection, state.read, [&] {
    return "SELECT " + state.columns + " FROM " + detail::quoted_table(definition()) + " WHERE " + key_column() +
           " = ?";
  });
  if (!prepared) return prepared;
  auto bound_key = key_value(key);
  if (!bound_key) return bound_key.error();
  detail::StatementUse use(state.read);
  int rc = detail::bind(state.read.get(), 1, *bound_key, false);
  if (rc != SQLITE_OK) return connection.error(rc, "bind key");
  rc = sqlite3_step(state.read.get());
  if (rc == SQLITE_DONE) return not_found(key);
  if (rc != SQLITE_ROW) return connection.error(rc, "read " + qualified_name(definition()));
  if (into.table_ptr() != state.definition) into = new_record();
  detail::load_row(state.read.get(), into);
  return {};
}

Result<Cursor> StoredTable::select(const Selection& selection) {
  auto where = detail::where_clause(definition(), selection.criteria);
  if (!where) return where.error();
  auto order = detail::order_clause(definition(), selection.order);
  if (!order) return order.error();
  std::string sql = "SELECT " + state_->columns + " FROM " + detail::quoted_table(definition()) + where->sql + *order;
  auto statement = detail::take_statement(*session_->connection, *state_, sql);
  if (!statement) return statement.error();
  // Copied: the cursor outlives the selection it was built from.
  Status bound = bind_all(*session_->connection, statement->get(), where->parameters, true);
  if (!bound) {
    detail::give_back_statement(*state_, sql, std::move(*statement));
    return bound.error();
  }
  return Cursor(session_, state_, std::move(sql), std::move(*statement), new_record());
}

Result<std::int64_t> StoredTable::count(const std::vector<Criterion>& criteria) {
  const detail::Connection& connection = *session_->connection;
  auto where = detail::where_clause(definition(), criteria);
  if (!where) return where.error();
  std::string sql = "SELECT count(*) FROM " + detail::quoted_table(definition()) + where->sql;
  auto statement = detail::take_statement(connection, *state_, sql);
  if (!statement) return statement.error();
  Result<std::int64_t> result = std::int64_t{0};
  {
    detail::StatementUse use(*statement);
    Status bound = bind_all(connection, statement->get(), where->parameters, false);
    if (!bound) {
      result = bound.error();
    } else {
      int rc = sqlite3_step(statement->get());
      if (rc == SQLITE_ROW) {
        result = static_cast<std::int64_t>(sqlite3_column_int64(statement->get(), 0));
      } else {
        result = connection.error(rc, "count " + qualified_name(definition()));
      }
    }
  }
  detail::give_back_statement(*state_, sql, std::move(*statement));
  return result;
}

Status StoredTable::insert(const Record& record) {
  const detail::Connection& connection = *session_->connection;
  detail::TableState& state = *state_;
  auto values = values_for_write(record);
  if (!values) return values.error();
  Status prepared = ensure_prepared(connection, state.insert, [&] {
    std::string placeholders;
    for (std::size_t i = 0; i < values->size(); ++i) placeholders += i == 0 ? "?" : ", ?";
    return "INSERT INTO " + detail::quoted_table(definition()) + " (" + state.columns + ") VALUES (" +
           placeholders + ")";
  });
  if (!prepared) return prepared;
  detail::StatementUse use(state.insert);
  Status bound = bind_all(connection, state.insert.get(), *values, false);
  if (!bound) return bound;
  int rc = sqlite3_step(state.insert.get());
  if (is_key_conflict(rc)) return duplicate(record.key());
  if (rc != SQLITE_DONE) return connection.error(rc, "insert into " + qualified_name(definition()));
  return {};
}

Status StoredTable::update(const Record& record) { return update(record.key(), record); }

Status StoredTable::update(std::string_view key, const Record& record) {
  const detail::Connection& connection = *session_->connection;
  detail::TableState& state = *state_;
  auto values = values_for_write(record);
  if (!values) return values.error();
  auto bound_key = key_value(key);
  if (!bound_key) return bound_key.error();
  Status prepared = ensure_prepared(connection, state.update, [&] {
    std::string assignments;
    for (const FieldDef& field : definition().fields) {
      for (int entry = 1; entry <= field.repeat; ++entry) {
        if (!assignments.empty()) assignments += ", ";
        assignments += detail::quote_identifier(column_name(field, entry)) + " = ?";
      }
    }
    return "UPDATE " + detail::quoted_table(definition()) + " SET " + assignments + " WHERE " + key_column() + " = ?";
  });
  if (!prepared) return prepared;
  detail::StatementUse use(state.update);
  Status bound = bind_all(connection, state.update.get(), *values, false);
  if (!bound) return bound;
  int rc = detail::bind(state.update.get(), static_cast<int>(values->size()) + 1, *bound_key, false);
  if (rc != SQLITE_OK) return connection.error(rc, "bind key");
  rc = sqlite3_step(state.update.get());
  if (is_key_conflict(rc)) return duplicate(record.key());
  if (rc != SQLITE_DONE) return connection.error(rc, "update " + qualified_name(definition()));
  if (sqlite3_changes64(connection.get()) == 0) return not_found(key);
  return {};
}

Status StoredTable::remove(std::string_view key) {
  const detail::Connection& connection = *session_->connection;
  detail::TableState& state = *state_;
  Status prepared = ensure_prepared(connection, state.remove, [&] {
    return "DELETE FROM " + detail::quoted_table(definition()) + " WHERE " + key_column() + " = ?";
  });
  if (!prepared) return prepared;
  auto bound_key = key_value(key);
  if (!bound_key) return bound_key.error();
  detail::StatementUse use(state.remove);
  int rc = detail::bind(state.remove.get(), 1, *bound_key, false);
  if (rc != SQLITE_OK) return connection.error(rc, "bind key");
  rc = sqlite3_step(state.remove.get());
  if (rc != SQLITE_DONE) return connection.error(rc, "delete from " + qualified_name(definition()));
  if (sqlite3_changes64(connection.get()) == 0) return not_found(key);
  return {};
}

}  // namespace host::storage
