// A live walk over the records of a selection, one SQLite step at a time,
// so that walking a large table holds one record in memory.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "host/runtime/storage/record.h"
#include "host/runtime/storage/sqlite_handles.h"
#include "host/runtime/storage/status.h"
#include "host/runtime/storage/values.h"

namespace host::storage {

namespace detail {
struct Session;
struct TableState;
}  // namespace detail

/// Walks the records of one selection in its order. While a walk is under way it holds a read
/// snapshot of the file (other processes still read and write); close() or the end releases it.
/// Obtained from StoredTable::select(); keeps the database's connection alive.
class Cursor {
 public:
  Cursor(Cursor&& other) noexcept = default;
  Cursor& operator=(Cursor&& other) noexcept;
  ~Cursor();

  /// Starts (or restarts) the walk; true when a first record is current, false when none matches.
  /// Fails with Busy or Failure.
  Result<bool> first();
  /// Moves to the next record; false when there is no more (and on every later call).
  /// Before first() it starts the walk. Fails with Busy or Failure.
  Result<bool> next();
  /// The current record; meaningful after first() or next() returned true.
  const Record& record() const { return record_; }
  /// Ends the walk and releases the read snapshot; next() then returns false.
  void close() noexcept;

 private:
  friend class StoredTable;
  Cursor(std::shared_ptr<detail::Session> session, detail::TableState* state, std::string sql,
         detail::Statement statement, Record record);
  Result<bool> step();

  enum class Position { Before, On, End };
  std::shared_ptr<detail::Session> session_;  // keeps the connection open while the cursor lives
  detail::TableState* state_ = nullptr;       // owned by session_
  std::string sql_;                           // key of the statement cache
  detail::Statement statement_;               // parameters bound once, kept across restarts
  Record record_;                             // the current record, reused at every step
  Position position_ = Position::Before;
};

}  // namespace host::storage
