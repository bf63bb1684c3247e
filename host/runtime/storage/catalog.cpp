#include "host/runtime/storage/catalog.h"

#include <utility>

namespace host::storage {

void Catalog::add(TableDef table) { tables_.push_back(std::make_shared<const TableDef>(std::move(table))); }

std::shared_ptr<const TableDef> Catalog::find(std::string_view base, std::string_view name) const {
  for (const auto& table : tables_) {
    if (same_name(table->base, base) && same_name(table->name, name)) return table;
  }
  return nullptr;
}

Status Catalog::check() const {
  for (std::size_t i = 0; i < tables_.size(); ++i) {
    Status status = check_definition(*tables_[i]);
    if (!status) return status;
    for (std::size_t j = 0; j < i; ++j) {
      // Their SQL tables would be one and the same: SQLite ignores case in names.
      if (same_name(qualified_name(*tables_[j]), qualified_name(*tables_[i]))) {
        return Error{ErrorKind::InvalidValue,
                     "La table " + qualified_name(*tables_[i]) + " est définie deux fois.",
                     "duplicate table definition"};
      }
    }
  }
  return {};
}

// Widths leave room above the longest texts of the default templates (a designation of 54
// characters, a subject of 67, a tag field of 23); the message slices are fixed at 255.
TableDef mail_template_table() {
  return TableDef{"GESCOM",
                  "VNTEMAIL",
                  {
                      text_field("CODE", 30),
                      text_field("DESIG", 100),
                      text_field("DEST", 10),
                      text_field("DEST_COPIE", 10),
                      text_field("DEST_COPIE_CACHEE", 10),
                      text_field("EMAIL_DEST", 255),
                      text_field("EMAIL_DEST_COPIE", 255),
                      text_field("EMAIL_DEST_CACHEE", 255),
                      text_field("OBJET_EMAIL", 255),
                      text_field("MESSAGE_EMAIL", 255),
                      text_field("MESSAGE_EMAIL2", 255),
                      text_field("MESSAGE_EMAIL3", 255),
                      date_field("DATE_CREATION"),
                      text_field("HEURE_CREATION", 12),
                      text_field("NOMTAG", 30, 10),
                      text_field("CODECHAMPTAG", 100, 10),
                      text_field("LIBELTAG", 80, 10),
                      text_field("TYPE", 5),
                  },
                  "CODE"};
}

// CODE holds a user name followed by "|EMAIL"; INF1..INF10 hold servers, accounts, addresses.
TableDef preference_table() {
  TableDef table{"$$", "PREF", {text_field("CODE", 100)}, "CODE"};
  for (int i = 1; i <= 10; ++i) table.fields.push_back(text_field("INF" + std::to_string(i), 255));
  return table;
}

TableDef field_dictionary_table() {
  return TableDef{"@@",
                  "$CHP$",
                  {
                      text_field("CODE", 160),  // base.table.field
                      text_field("CODEC", 60),  // the field's name
                      text_field("LIEN", 160),  // link descriptor, "" when none
                      integer_field("NUMAL"),   // rank of the field in its table, from 1
                  },
                  "CODE"};
}

Catalog host_catalog() {
  Catalog catalog;
  catalog.add(mail_template_table());
  catalog.add(preference_table());
  catalog.add(field_dictionary_table());
  return catalog;
}

}  // namespace host::storage
