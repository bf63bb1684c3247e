// The table definitions the host knows, and the definitions of the host's own tables.
#pragma once

#include <memory>
#include <string_view>
#include <vector>

#include "host/runtime/storage/status.h"
#include "host/runtime/storage/table_def.h"

namespace host::storage {

/// A list of table definitions, one per (base, table).
class Catalog {
 public:
  /// Adds a definition; it is checked by check(), which Database::open() runs.
  void add(TableDef table);
  /// The definition of (base, name), ASCII case ignored; null when unknown.
  std::shared_ptr<const TableDef> find(std::string_view base, std::string_view name) const;
  /// Every definition, in the order they were added.
  const std::vector<std::shared_ptr<const TableDef>>& tables() const { return tables_; }
  /// Checks every definition (check_definition()) and that no (base, table) comes twice.
  Status check() const;

 private:
  std::vector<std::shared_ptr<const TableDef>> tables_;
};

/// "GESCOM"."VNTEMAIL": the mail templates, key CODE.
TableDef mail_template_table();
/// "$$"."PREF": the settings records (the user's mail settings among them), key CODE.
TableDef preference_table();
/// "@@"."$CHP$": the field dictionary, one record per field of every table, key CODE.
TableDef field_dictionary_table();

/// Every table the host knows. A new table is one more line here.
Catalog host_catalog();

}  // namespace host::storage
