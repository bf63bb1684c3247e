#include "host/runtime/storage/table_def.h"

#include <utility>

namespace host::storage {

namespace {

constexpr int max_repeat = 99;

Error definition_error(const TableDef& table, std::string detail) {
  return Error{ErrorKind::InvalidValue,
               "La définition de la table " + qualified_name(table) + " est incorrecte.",
               std::move(detail)};
}

char ascii_upper(char c) { return (c >= 'a' && c <= 'z') ? static_cast<char>(c - 'a' + 'A') : c; }

}  // namespace

FieldDef text_field(std::string name, int width, int repeat, std::string link) {
  return FieldDef{std::move(name), FieldKind::Text, width, repeat, std::move(link)};
}

FieldDef integer_field(std::string name, std::string link) {
  return FieldDef{std::move(name), FieldKind::Integer, 0, 1, std::move(link)};
}

FieldDef decimal_field(std::string name) { return FieldDef{std::move(name), FieldKind::Decimal, 0, 1, {}}; }

FieldDef date_field(std::string name) { return FieldDef{std::move(name), FieldKind::Date, 0, 1, {}}; }

std::string qualified_name(const TableDef& table) { return table.base + "." + table.name; }

std::string column_name(const FieldDef& field, int entry) {
  return field.repeat == 1 ? field.name : field.name + "#" + std::to_string(entry);
}

std::string field_label(const FieldDef& field, int entry) {
  return field.repeat == 1 ? field.name : field.name + "(" + std::to_string(entry) + ")";
}

bool same_name(std::string_view a, std::string_view b) {
  if (a.size() != b.size()) return false;
  for (std::size_t i = 0; i < a.size(); ++i) {
    if (ascii_upper(a[i]) != ascii_upper(b[i])) return false;
  }
  return true;
}

std::string upper_ascii(std::string_view name) {
  std::string upper(name);
  for (char& c : upper) c = ascii_upper(c);
  return upper;
}

const FieldDef* find_field(const TableDef& table, std::string_view name) {
  for (const FieldDef& field : table.fields) {
    if (same_name(field.name, name)) return &field;
  }
  return nullptr;
}

std::size_t column_count(const TableDef& table) {
  std::size_t n = 0;
  for (const FieldDef& field : table.fields) n += static_cast<std::size_t>(field.repeat);
  return n;
}

Result<std::size_t> column_index(const TableDef& table, std::string_view name, int entry) {
  std::size_t index = 0;
  for (const FieldDef& field : table.fields) {
    if (same_name(field.name, name)) {
      if (entry < 1 || entry > field.repeat) {
        return Error{ErrorKind::UnknownName,
                     "Le champ " + field.name + " de la table " + qualified_name(table) +
                         " n'a pas d'élément " + std::to_string(entry) + " (il en a " +
                         std::to_string(field.repeat) + ").",
                     "entry out of range"};
      }
      return index + static_cast<std::size_t>(entry - 1);
    }
    index += static_cast<std::size_t>(field.repeat);
  }
  return Error{ErrorKind::UnknownName,
               "Le champ " + std::string(name) + " n'existe pas dans la table " + qualified_name(table) + ".",
               "unknown field"};
}

Status check_definition(const TableDef& table) {
  if (table.base.empty() || table.name.empty()) return definition_error(table, "empty base or table name");
  if (table.fields.empty()) return definition_error(table, "no field");
  for (std::size_t i = 0; i < table.fields.size(); ++i) {
    const FieldDef& field = table.fields[i];
    if (field.name.empty()) return definition_error(table, "field " + std::to_string(i + 1) + " has no name");
    // '#' separates a field from its entry in column names.
    if (field.name.find('#') != std::string::npos) {
      return definition_error(table, "field " + field.name + ": '#' is reserved for entries");
    }
    if (field.repeat < 1 || field.repeat > max_repeat) {
      return definition_error(table, "field " + field.name + ": repeat must be 1.." + std::to_string(max_repeat));
    }
    if (field.kind == FieldKind::Text && field.width <= 0) {
      return definition_error(table, "text field " + field.name + " needs a width > 0");
    }
    for (std::size_t j = 0; j < i; ++j) {
      if (same_name(table.fields[j].name, field.name)) {
        return definition_error(table, "field " + field.name + " declared twice");
      }
    }
  }
  const FieldDef* key = find_field(table, table.key);
  if (key == nullptr) return definition_error(table, "key field '" + table.key + "' is not a field");
  if (key->repeat != 1) return definition_error(table, "key field " + key->name + " is repeated");
  if (key->kind != FieldKind::Text && key->kind != FieldKind::Integer) {
    return definition_error(table, "key field " + key->name + " must be text or integer");
  }
  return {};
}

}  // namespace host::storage
