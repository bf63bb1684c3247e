#include "host/runtime/storage/record.h"

#include <utility>

namespace host::storage {

namespace {
const std::string empty_value;
}

Record::Record(std::shared_ptr<const TableDef> table) : table_(std::move(table)) {
  values_.resize(column_count(*table_));
  auto key = column_index(*table_, table_->key);
  key_column_ = key ? *key : 0;
}

const std::string& Record::get(std::string_view field, int entry) const {
  auto column = column_index(*table_, field, entry);
  return column ? values_[*column] : empty_value;
}

Status Record::set(std::string_view field, int entry, std::string value) {
  auto column = column_index(*table_, field, entry);
  if (!column) return column.error();
  values_[*column] = std::move(value);
  return {};
}

void Record::clear() {
  for (std::string& value : values_) value.clear();
}

}  // namespace host::storage
