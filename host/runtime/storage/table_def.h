// Definitions of the host's tables: fields, their kinds and widths, the key.
// A definition is plain data so that a new table is declared in one expression.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "host/runtime/storage/status.h"

namespace host::storage {

/// Kind of a field: decides its canonical text form and its SQL column type.
enum class FieldKind {
  Text,     ///< any UTF-8 text up to `width` characters; SQL TEXT
  Integer,  ///< "42", "-7"; "" for zero; SQL INTEGER
  Decimal,  ///< "12.5" with a point; "" for zero; SQL REAL
  Date,     ///< "YYYY-MM-DD"; "" when empty; SQL TEXT (compares in date order)
};

/// One field of a table.
struct FieldDef {
  std::string name;                  ///< as programs name it, upper case: "CODE", "NOMTAG"
  FieldKind kind = FieldKind::Text;  ///< canonical form and column type
  int width = 0;                     ///< maximum number of characters of a text; 0 for other kinds
  int repeat = 1;                    ///< number of entries: 1, or 10 for fields like NOMTAG
  std::string link;                  ///< link descriptor for the field dictionary ("C VNTCLI"), or ""
};

/// One table of one base.
struct TableDef {
  std::string base;              ///< "GESCOM", "$$", "@@", "BP"
  std::string name;              ///< "VNTEMAIL"
  std::vector<FieldDef> fields;  ///< in declaration order; a field's rank here is its NUMAL
  std::string key;               ///< name of the key field: text or integer, not repeated
};

/// A text field of `width` characters, `repeat` entries, with an optional link descriptor.
FieldDef text_field(std::string name, int width, int repeat = 1, std::string link = {});
/// An integer field, with an optional link descriptor ("C VNTCLI").
FieldDef integer_field(std::string name, std::string link = {});
/// A decimal field.
FieldDef decimal_field(std::string name);
/// A date field.
FieldDef date_field(std::string name);

/// "GESCOM.VNTEMAIL": the name of the table's SQL table and the prefix of its dictionary codes.
std::string qualified_name(const TableDef& table);
/// SQL column of one entry (1-based): "CODE" for a single field, "NOMTAG#3" for a repeated one.
std::string column_name(const FieldDef& field, int entry);
/// How messages name one entry: "CODE", "NOMTAG(3)".
std::string field_label(const FieldDef& field, int entry);

/// The field called `name` (ASCII case ignored), or null when the table has none.
const FieldDef* find_field(const TableDef& table, std::string_view name);
/// Number of SQL columns: the sum of the fields' entries.
std::size_t column_count(const TableDef& table);
/// Column position (0-based, declaration order) of entry `entry` of the field `name`;
/// UnknownName when the field does not exist or has no such entry.
Result<std::size_t> column_index(const TableDef& table, std::string_view name, int entry = 1);

/// Checks a definition: names present, no field twice, text widths > 0, repeat 1..99, a key
/// field that exists, is text or integer and is not repeated. Fails with UnknownName or InvalidValue.
Status check_definition(const TableDef& table);

/// True when a and b are equal ignoring ASCII case (the host's names are upper case).
bool same_name(std::string_view a, std::string_view b);
/// `name` with ASCII letters upper-cased: how names compare, in SQLite as in the host.
std::string upper_ascii(std::string_view name);

}  // namespace host::storage
