#include "host/runtime/storage/sqlite_handles.h"

#include <sqlite3.h>

namespace host::storage::detail {

void Statement::reset() const noexcept {
  if (statement_) {
    sqlite3_reset(statement_.get());
    sqlite3_clear_bindings(statement_.get());
  }
}

void Statement::Finalize::operator()(sqlite3_stmt* statement) const noexcept { sqlite3_finalize(statement); }

Result<std::unique_ptr<Connection>> Connection::open(const std::string& path) {
  sqlite3* db = nullptr;
  int rc = sqlite3_open_v2(path.c_str(), &db, SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE | SQLITE_OPEN_NOMUTEX,
                           nullptr);
  if (rc != SQLITE_OK) {
    std::string detail = db != nullptr ? sqlite3_errmsg(db) : sqlite3_errstr(rc);
    sqlite3_close(db);
    return Error{ErrorKind::Failure, "Impossible d'ouvrir la base de données " + path + ".",
                 "sqlite3_open_v2: " + detail};
  }
  sqlite3_extended_result_codes(db, 1);
  return std::make_unique<Connection>(db, path);
}

Connection::~Connection() {
  // Statements still alive elsewhere keep the connection as a zombie until finalized.
  sqlite3_close_v2(db_);
}

Result<Statement> Connection::prepare(std::string_view sql) const {
  sqlite3_stmt* statement = nullptr;
  int rc = sqlite3_prepare_v3(db_, sql.data(), static_cast<int>(sql.size()), SQLITE_PREPARE_PERSISTENT, &statement,
                              nullptr);
  if (rc != SQLITE_OK) {
    sqlite3_finalize(statement);
    return error(rc, "prepare " + std::string(sql));
  }
  return Statement(statement);
}

Status Connection::execute(std::string_view sql) const {
  std::string text(sql);
  int rc = sqlite3_exec(db_, text.c_str(), nullptr, nullptr, nullptr);
  if (rc != SQLITE_OK) return error(rc, "exec " + text);
  return {};
}

Result<std::int64_t> Connection::query_integer(std::string_view sql) const {
  auto statement = prepare(sql);
  if (!statement) return statement.error();
  int rc = sqlite3_step(statement->get());
  if (rc != SQLITE_ROW) return error(rc == SQLITE_DONE ? SQLITE_ERROR : rc, "query " + std::string(sql));
  return static_cast<std::int64_t>(sqlite3_column_int64(statement->get(), 0));
}

Error Connection::error(int rc, std::string_view doing) const {
  std::string detail = std::string(doing) + ": " + sqlite3_errmsg(db_) + " (code " + std::to_string(rc) + ")";
  switch (rc & 0xff) {
    case SQLITE_BUSY:
    case SQLITE_LOCKED:
      return Error{ErrorKind::Busy,
                   "La base de données " + path_ + " est occupée par un autre programme ; réessayez dans un instant.",
                   detail};
    case SQLITE_CORRUPT:
    case SQLITE_NOTADB:
      return Error{ErrorKind::Failure, "La base de données " + path_ + " est endommagée.", detail};
    case SQLITE_FULL:
      return Error{ErrorKind::Failure, "Le disque de la base de données " + path_ + " est plein.", detail};
    case SQLITE_READONLY:
    case SQLITE_PERM:
    case SQLITE_CANTOPEN:
      return Error{ErrorKind::Failure, "Impossible d'écrire dans la base de données " + path_ + ".", detail};
    case SQLITE_IOERR:
      return Error{ErrorKind::Failure, "Erreur de lecture ou d'écriture sur la base de données " + path_ + ".",
                   detail};
    default:
      return Error{ErrorKind::Failure, "Erreur d'accès à la base de données " + path_ + ".", detail};
  }
}

int bind(sqlite3_stmt* statement, int index, const SqlValue& value, bool copy) {
  if (const auto* n = std::get_if<std::int64_t>(&value)) return sqlite3_bind_int64(statement, index, *n);
  if (const auto* d = std::get_if<double>(&value)) return sqlite3_bind_double(statement, index, *d);
  const std::string& text = std::get<std::string>(value);
  return sqlite3_bind_text64(statement, index, text.data(), text.size(), copy ? SQLITE_TRANSIENT : SQLITE_STATIC,
                             SQLITE_UTF8);
}

}  // namespace host::storage::detail
