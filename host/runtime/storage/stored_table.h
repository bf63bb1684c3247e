// Record operations on one table of an open database.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "host/runtime/storage/cursor.h"
#include "host/runtime/storage/record.h"
#include "host/runtime/storage/selection.h"
#include "host/runtime/storage/status.h"
#include "host/runtime/storage/table_def.h"

namespace host::storage {

namespace detail {
struct Session;
struct TableState;
}  // namespace detail

/// One table of an open Database. Cheap to copy; keeps the connection alive. Every write is
/// its own transaction unless a Transaction is open. Not for use from several threads at once.
class StoredTable {
 public:
  /// The table's definition.
  const TableDef& definition() const;
  /// A new record of this table, every value "".
  Record new_record() const;

  /// The record whose key is `key`. NotFound when there is none; InvalidValue for a key that is
  /// not a number on an integer key; Busy or Failure from the file.
  Result<Record> read(std::string_view key);
  /// As read(key), into `into` (reusing its memory; replaced when it belongs to another table).
  Status read(std::string_view key, Record& into);

  /// A cursor over the records that meet every criterion, in the selection's order; nothing is
  /// read until first() or next(). Fails with UnknownName or InvalidValue for a bad criterion.
  Result<Cursor> select(const Selection& selection = {});
  /// Number of records that meet every criterion. Fails as select(), or Busy or Failure.
  Result<std::int64_t> count(const std::vector<Criterion>& criteria = {});

  /// Adds a record. Duplicate when its key exists, InvalidValue for an empty key or a value not of
  /// its kind, TooLong for a text over its width (nothing written in every case).
  Status insert(const Record& record);
  /// Replaces the record whose key is the record's key. NotFound when there is none; the value
  /// errors of insert().
  Status update(const Record& record);
  /// Replaces the record whose key is `key` by `record`, whose key may differ (renaming).
  /// NotFound when `key` has no record; Duplicate when the new key is taken by another record.
  Status update(std::string_view key, const Record& record);
  /// Deletes the record whose key is `key`; NotFound when there is none.
  Status remove(std::string_view key);

 private:
  friend class Database;
  StoredTable(std::shared_ptr<detail::Session> session, detail::TableState* state)
      : session_(std::move(session)), state_(state) {}
  Result<std::vector<SqlValue>> values_for_write(const Record& record) const;
  Result<SqlValue> key_value(std::string_view key) const;
  std::string key_column() const;
  Error not_found(std::string_view key) const;
  Error duplicate(std::string_view key) const;

  std::shared_ptr<detail::Session> session_;  // never null
  detail::TableState* state_;                 // owned by session_
};

}  // namespace host::storage
