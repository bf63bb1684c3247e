// One record of a table: the canonical text of every entry of every field.
#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "host/runtime/storage/status.h"
#include "host/runtime/storage/table_def.h"

namespace host::storage {

/// Values of one record, one text per SQL column, in the definition's column order.
/// Values are checked (width, kind) when the record is written, not when they are set.
class Record {
 public:
  /// An empty record of `table` (every value ""); `table` must not be null.
  explicit Record(std::shared_ptr<const TableDef> table);

  /// The table's definition.
  const TableDef& table() const { return *table_; }
  /// The shared definition, for building further records of the same table.
  const std::shared_ptr<const TableDef>& table_ptr() const { return table_; }

  /// Entry `entry` (1-based) of `field`; "" when the table has no such field or entry.
  const std::string& get(std::string_view field, int entry = 1) const;
  /// Sets a single field (entry 1); UnknownName when the table has no such field.
  Status set(std::string_view field, std::string value) { return set(field, 1, std::move(value)); }
  /// Sets entry `entry` (1-based) of `field`; UnknownName when there is no such field or entry.
  Status set(std::string_view field, int entry, std::string value);

  /// The value of the key field.
  const std::string& key() const { return values_[key_column_]; }
  /// Every value in column order (see column_index()).
  const std::vector<std::string>& values() const { return values_; }
  /// The value of column `column` (< column_count()), for callers that resolved a field once.
  std::string& at(std::size_t column) { return values_.at(column); }
  const std::string& at(std::size_t column) const { return values_.at(column); }
  /// Every value back to "".
  void clear();

  /// Same table and same values.
  bool operator==(const Record& other) const { return table_ == other.table_ && values_ == other.values_; }

 private:
  std::shared_ptr<const TableDef> table_;  // never null
  std::vector<std::string> values_;        // one per column
  std::size_t key_column_ = 0;             // index of the key in values_
};

}  // namespace host::storage
