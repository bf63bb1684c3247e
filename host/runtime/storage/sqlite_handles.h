// Thin owners of SQLite's connection and statements, and the translation of
// SQLite's result codes into our Error. Internal to the storage library.
#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <utility>

#include "host/runtime/storage/status.h"
#include "host/runtime/storage/values.h"

struct sqlite3;
struct sqlite3_stmt;

namespace host::storage::detail {

/// Owns one prepared statement; finalized on destruction.
class Statement {
 public:
  Statement() = default;
  explicit Statement(sqlite3_stmt* statement) : statement_(statement) {}

  /// The raw statement, null when empty.
  sqlite3_stmt* get() const noexcept { return statement_.get(); }
  explicit operator bool() const noexcept { return statement_ != nullptr; }
  /// Ends the current run and forgets the bound values, so that no read snapshot stays open.
  void reset() const noexcept;

 private:
  struct Finalize {
    void operator()(sqlite3_stmt* statement) const noexcept;
  };
  std::unique_ptr<sqlite3_stmt, Finalize> statement_;
};

/// Resets a statement when a use of it ends, whatever the path out.
class StatementUse {
 public:
  explicit StatementUse(const Statement& statement) : statement_(statement) {}
  ~StatementUse() { statement_.reset(); }
  StatementUse(const StatementUse&) = delete;
  StatementUse& operator=(const StatementUse&) = delete;

 private:
  const Statement& statement_;
};

/// Owns one SQLite connection; closed on destruction.
class Connection {
 public:
  /// Opens (creating when missing) the file at `path`. Fails with Failure, message naming the file.
  static Result<std::unique_ptr<Connection>> open(const std::string& path);
  /// Takes ownership of an open connection; open() is the way to get one.
  Connection(sqlite3* db, std::string path) : db_(db), path_(std::move(path)) {}
  ~Connection();
  Connection(const Connection&) = delete;
  Connection& operator=(const Connection&) = delete;

  /// The raw connection.
  sqlite3* get() const noexcept { return db_; }
  /// The file's path, as given to open().
  const std::string& path() const noexcept { return path_; }

  /// Prepares one statement; Failure with SQLite's message and the SQL as detail.
  Result<Statement> prepare(std::string_view sql) const;
  /// Runs SQL that returns no rows (one or more statements).
  Status execute(std::string_view sql) const;
  /// Runs a query whose answer is one integer (a pragma, a count).
  Result<std::int64_t> query_integer(std::string_view sql) const;

  /// Our Error for SQLite's result code `rc`, raised while `doing` (technical words).
  Error error(int rc, std::string_view doing) const;

 private:
  sqlite3* db_;       // never null
  std::string path_;  // for messages
};

/// Binds `value` to parameter `index` (1-based). Texts are copied when `copy`; otherwise
/// they must outlive the statement's run. Returns SQLite's result code.
int bind(sqlite3_stmt* statement, int index, const SqlValue& value, bool copy);

}  // namespace host::storage::detail
