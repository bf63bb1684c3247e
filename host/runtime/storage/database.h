// The host's tables in one SQLite file, <data folder>/vntemail.sqlite.
//
// Usage:
//   auto db = Database::open(folder, host_catalog());
//   if (!db) show(db.error().message);
//   auto templates = db->table("GESCOM", "VNTEMAIL");
//   auto record = templates->read("VNTEFAC");
#pragma once

#include <filesystem>
#include <memory>
#include <string_view>
#include <vector>

#include "host/runtime/storage/catalog.h"
#include "host/runtime/storage/cursor.h"
#include "host/runtime/storage/record.h"
#include "host/runtime/storage/schema.h"
#include "host/runtime/storage/selection.h"
#include "host/runtime/storage/status.h"
#include "host/runtime/storage/stored_table.h"
#include "host/runtime/storage/table_def.h"

namespace host::storage {

namespace detail {
struct Session;
}

/// How a file is opened.
struct OpenOptions {
  std::vector<Migration> migrations = host_migrations();  ///< steps for files of older releases
  int busy_timeout_ms = 5000;  ///< how long an operation waits while another process writes
};

class Transaction;

/// One open database file. Movable, not copyable; closed when the last Database, StoredTable,
/// Cursor or Transaction made from it is gone. For use from one thread.
class Database {
 public:
  /// Name of the file inside the data folder.
  static constexpr const char* file_name = "vntemail.sqlite";

  /// Opens <folder>/vntemail.sqlite, creating it when missing: WAL journal, full sync, busy
  /// timeout; then, in one transaction, runs the migration steps the file lacks, creates the
  /// catalog's tables or adds their new columns, and brings "@@"."$CHP$" in step with the
  /// catalog (added to it when absent). Fails with Failure (folder missing, file unreadable, a
  /// step that failed: nothing changed), NewerFile (a later release's file: left untouched), Busy,
  /// or InvalidValue (a bad definition in the catalog).
  static Result<Database> open(const std::filesystem::path& folder, Catalog catalog, OpenOptions options = {});

  /// The table (base, name), ASCII case ignored; UnknownName when the catalog has no such table.
  Result<StoredTable> table(std::string_view base, std::string_view name) const;

  /// Starts a transaction holding the write lock, so that several writes commit together.
  /// Fails with Busy (another process writes longer than the timeout) or Failure (one is open).
  Result<Transaction> begin();

  /// Runs SQLite's integrity check; Failure ("... est endommagée.") with the findings as detail.
  Status check_integrity() const;
  /// The file's schema version (PRAGMA user_version); -1 when it cannot be read.
  int schema_version() const;
  /// The catalog the file was opened with (with "@@"."$CHP$").
  const Catalog& catalog() const { return *catalog_; }
  /// Full path of the file.
  const std::filesystem::path& path() const { return path_; }

 private:
  Database(std::shared_ptr<detail::Session> session, std::shared_ptr<const Catalog> catalog,
           std::filesystem::path path)
      : session_(std::move(session)), catalog_(std::move(catalog)), path_(std::move(path)) {}
  std::shared_ptr<detail::Session> session_;  // never null
  std::shared_ptr<const Catalog> catalog_;    // never null
  std::filesystem::path path_;
};

/// An open transaction: writes made meanwhile commit together with commit(); rolled back when
/// destroyed without commit(). Movable, not copyable.
class Transaction {
 public:
  Transaction(Transaction&& other) noexcept;
  Transaction& operator=(Transaction&&) = delete;
  Transaction(const Transaction&) = delete;
  ~Transaction();

  /// Commits every write since begin(). On Busy or Failure nothing is committed and the
  /// destructor rolls back.
  Status commit();

 private:
  friend class Database;
  explicit Transaction(std::shared_ptr<detail::Session> session) : session_(std::move(session)) {}
  std::shared_ptr<detail::Session> session_;  // null once committed or moved from
};

}  // namespace host::storage
