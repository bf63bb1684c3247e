#include "host/runtime/storage/database.h"

#include <sqlite3.h>

#include <algorithm>
#include <system_error>
#include <utility>

#include "host/runtime/storage/field_dictionary.h"
#include "host/runtime/storage/query_text.h"
#include "host/runtime/storage/table_state.h"

namespace host::storage {

namespace {

// Rolls the opening transaction back unless it was committed.
class OpeningTransaction {
 public:
  explicit OpeningTransaction(const detail::Connection& connection) : connection_(connection) {}
  ~OpeningTransaction() {
    if (!committed_) (void)connection_.execute("ROLLBACK");
  }
  OpeningTransaction(const OpeningTransaction&) = delete;
  OpeningTransaction& operator=(const OpeningTransaction&) = delete;
  Status commit() {
    Status status = connection_.execute("COMMIT");
    committed_ = status.ok();
    return status;
  }

 private:
  const detail::Connection& connection_;
  bool committed_ = false;
};

Status configure(const detail::Connection& connection, int busy_timeout_ms) {
  // Another process's write makes us wait, not fail with "database is locked".
  sqlite3_busy_timeout(connection.get(), busy_timeout_ms);
  // WAL: readers never block the writer nor each other; the journal mode stays in the file.
  auto statement = connection.prepare("PRAGMA journal_mode = WAL");
  if (!statement) return statement.error();
  int rc = sqlite3_step(statement->get());
  if (rc != SQLITE_ROW) return connection.error(rc, "PRAGMA journal_mode = WAL");
  std::string mode = reinterpret_cast<const char*>(sqlite3_column_text(statement->get(), 0));
  if (mode != "wal") {
    return Error{ErrorKind::Failure,
                 "La base de données " + connection.path() + " ne peut pas être ouverte en mode partagé.",
                 "journal_mode is " + mode + " instead of wal"};
  }
  // FULL, not NORMAL: in WAL mode NORMAL syncs only at checkpoints, so a power loss could drop
  // transactions already reported committed. FULL syncs the WAL at every commit.
  return connection.execute("PRAGMA synchronous = FULL");
}

// True when the file needs no change: the current version, every table with every column, the
// field dictionary in step. A later release's file is not: the upgrade below refuses it.
Result<bool> file_in_step(const detail::Connection& db, const Catalog& catalog, StoredTable& dictionary, int latest) {
  auto version = db.query_integer("PRAGMA user_version");
  if (!version) return version.error();
  if (*version != latest) return false;
  for (const auto& table : catalog.tables()) {
    auto current = detail::table_in_step(db, *table);
    if (!current) return current.error();
    if (!*current) return false;
  }
  return field_dictionary_in_step(dictionary, catalog);
}

Status run_migrations(const detail::Connection& connection, std::vector<Migration> steps, int from_version) {
  std::sort(steps.begin(), steps.end(), [](const Migration& a, const Migration& b) { return a.version < b.version; });
  MigrationContext context(connection);
  for (const Migration& step : steps) {
    if (step.version <= from_version) continue;
    Status status = step.apply ? step.apply(context) : Status();
    if (!status) {
      return Error{ErrorKind::Failure,
                   "La mise à jour de la base de données " + connection.path() + " vers la version " +
                       std::to_string(step.version) + " a échoué.",
                   step.description + ": " + status.error().message + " " + status.error().detail};
    }
  }
  return {};
}

}  // namespace

Result<Database> Database::open(const std::filesystem::path& folder, Catalog catalog, OpenOptions options) {
  std::error_code ec;
  if (!std::filesystem::is_directory(folder, ec)) {
    return Error{ErrorKind::Failure, "Le dossier de données " + folder.string() + " n'existe pas.",
                 "not a directory: " + folder.string()};
  }
  if (!catalog.find("@@", "$CHP$")) catalog.add(field_dictionary_table());
  Status checked = catalog.check();
  if (!checked) return checked.error();
  for (std::size_t i = 0; i < options.migrations.size(); ++i) {
    bool repeated = false;
    for (std::size_t j = 0; j < i; ++j) repeated = repeated || options.migrations[i].version == options.migrations[j].version;
    if (repeated || options.migrations[i].version < 1) {
      return Error{ErrorKind::InvalidValue, "La liste des mises à jour de la base de données est incorrecte.",
                   "migration versions must be >= 1 and distinct"};
    }
  }
  int latest = 1;
  for (const Migration& step : options.migrations) latest = std::max(latest, step.version);

  std::filesystem::path path = folder / file_name;
  auto connection = detail::Connection::open(path.string());
  if (!connection) return connection.error();
  auto session = std::make_shared<detail::Session>();
  session->connection = std::move(*connection);
  const detail::Connection& db = *session->connection;
  Status configured = configure(db, options.busy_timeout_ms);
  if (!configured) return configured.error();

  auto shared_catalog = std::make_shared<const Catalog>(std::move(catalog));
  for (const auto& table : shared_catalog->tables()) {
    auto state = std::make_unique<detail::TableState>();
    state->definition = table;
    state->columns = detail::column_list(*table);
    session->tables[detail::table_key(table->base, table->name)] = std::move(state);
  }
  Database database(session, shared_catalog, path);
  auto dictionary = database.table("@@", "$CHP$");
  if (!dictionary) return dictionary.error();

  // Most opens find the file in step. Checking that under a read snapshot first means a
  // process that only reads never waits for the write lock that another process keeps taking.
  {
    Status begun = db.execute("BEGIN");
    if (!begun) return begun.error();
    OpeningTransaction reading(db);
    auto current = file_in_step(db, *shared_catalog, *dictionary, latest);
    if (!current) return current.error();
    Status ended = reading.commit();
    if (!ended) return ended.error();
    if (*current) return database;
  }

  // IMMEDIATE takes the write lock now: two processes upgrading at once take turns.
  Status begun = db.execute("BEGIN IMMEDIATE");
  if (!begun) return begun.error();
  OpeningTransaction opening(db);
  auto version = db.query_integer("PRAGMA user_version");
  if (!version) return version.error();
  if (*version > latest) {
    return Error{ErrorKind::NewerFile,
                 "La base de données " + path.string() + " a été écrite par une version plus récente du logiciel.",
                 "schema version " + std::to_string(*version) + ", this release knows up to " + std::to_string(latest)};
  }
  auto empty = detail::is_empty_file(db);
  if (!empty) return empty.error();
  // A new file is made at the current layout directly; the steps are for older files.
  if (!*empty) {
    Status migrated = run_migrations(db, options.migrations, static_cast<int>(*version));
    if (!migrated) return migrated.error();
  }
  for (const auto& table : shared_catalog->tables()) {
    Status ensured = detail::ensure_table(db, *table);
    if (!ensured) return ensured.error();
  }
  if (*version != latest) {
    Status set = db.execute("PRAGMA user_version = " + std::to_string(latest));
    if (!set) return set.error();
  }
  Status synced = sync_field_dictionary(*dictionary, *shared_catalog);
  if (!synced) return synced.error();
  Status committed = opening.commit();
  if (!committed) return committed.error();
  return database;
}

Result<StoredTable> Database::table(std::string_view base, std::string_view name) const {
  detail::TableState* state = session_->find(base, name);
  if (state == nullptr) {
    return Error{ErrorKind::UnknownName,
                 "La table " + std::string(base) + "." + std::string(name) + " est inconnue.",
                 "table not in the catalog"};
  }
  return StoredTable(session_, state);
}

Result<Transaction> Database::begin() {
  const detail::Connection& db = *session_->connection;
  if (sqlite3_get_autocommit(db.get()) == 0) {
    return Error{ErrorKind::Failure, "Une transaction est déjà en cours sur la base de données " + path_.string() + ".",
                 "nested transaction"};
  }
  Status begun = db.execute("BEGIN IMMEDIATE");
  if (!begun) return begun.error();
  return Transaction(session_);
}

Status Database::check_integrity() const {
  const detail::Connection& db = *session_->connection;
  auto statement = db.prepare("PRAGMA integrity_check");
  if (!statement) return statement.error();
  std::string findings;
  int rc;
  while ((rc = sqlite3_step(statement->get())) == SQLITE_ROW) {
    const auto* line = reinterpret_cast<const char*>(sqlite3_column_text(statement->get(), 0));
    std::string text = line != nullptr ? line : "";
    if (text != "ok") findings += (findings.empty() ? "" : "; ") + text;
  }
  if (rc != SQLITE_DONE) return db.error(rc, "PRAGMA integrity_check");
  if (!findings.empty()) {
    return Error{ErrorKind::Failure, "La base de données " + path_.string() + " est endommagée.", findings};
  }
  return {};
}

int Database::schema_version() const {
  auto version = session_->connection->query_integer("PRAGMA user_version");
  return version ? static_cast<int>(*version) : -1;
}

Transaction::Transaction(Transaction&& other) noexcept : session_(std::move(other.session_)) {}

Transaction::~Transaction() {
  if (session_) (void)session_->connection->execute("ROLLBACK");
}

Status Transaction::commit() {
  if (!session_) {
    return Error{ErrorKind::Failure, "La transaction n'est plus ouverte.", "commit after commit or move"};
  }
  Status committed = session_->connection->execute("COMMIT");
  if (committed) session_.reset();
  return committed;
}

}  // namespace host::storage
