#include "host/runtime/storage/field_dictionary.h"

#include <map>
#include <string>

#include "host/runtime/storage/values.h"

namespace host::storage {

namespace {

struct Entry {
  std::string codec;
  std::string lien;
  std::string numal;
  bool operator==(const Entry&) const = default;
};

using Entries = std::map<std::string, Entry>;  // by CODE

Entries wanted_entries(const Catalog& catalog) {
  Entries wanted;
  for (const auto& table : catalog.tables()) {
    for (std::size_t i = 0; i < table->fields.size(); ++i) {
      const FieldDef& field = table->fields[i];
      wanted[qualified_name(*table) + "." + field.name] =
          Entry{field.name, field.link, canonical_integer(static_cast<std::int64_t>(i + 1))};
    }
  }
  return wanted;
}

Result<Entries> present_entries(StoredTable& dictionary) {
  Entries present;
  auto cursor = dictionary.select();
  if (!cursor) return cursor.error();
  for (;;) {
    auto more = cursor->next();
    if (!more) return more.error();
    if (!*more) return present;
    const Record& record = cursor->record();
    present[record.get("CODE")] = Entry{record.get("CODEC"), record.get("LIEN"), record.get("NUMAL")};
  }
}

}  // namespace

Result<bool> field_dictionary_in_step(StoredTable& dictionary, const Catalog& catalog) {
  auto present = present_entries(dictionary);
  if (!present) return present.error();
  return *present == wanted_entries(catalog);
}

Status sync_field_dictionary(StoredTable& dictionary, const Catalog& catalog) {
  Entries wanted = wanted_entries(catalog);
  auto found = present_entries(dictionary);
  if (!found) return found.error();
  const Entries& present = *found;

  Record record = dictionary.new_record();
  for (const auto& [code, entry] : wanted) {
    auto it = present.find(code);
    if (it != present.end() && it->second == entry) continue;
    record.clear();
    for (Status status : {record.set("CODE", code), record.set("CODEC", entry.codec), record.set("LIEN", entry.lien),
                          record.set("NUMAL", entry.numal)}) {
      if (!status) return status;
    }
    Status written = it == present.end() ? dictionary.insert(record) : dictionary.update(record);
    if (!written) return written;
  }
  for (const auto& [code, entry] : present) {
    if (wanted.count(code) != 0) continue;
    Status removed = dictionary.remove(code);
    if (!removed) return removed;
  }
  return {};
}

}  // namespace host::storage
