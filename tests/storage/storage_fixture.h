// Shared pieces of the storage tests: a temporary data folder, a catalog with a
// training table beside the host's tables, and record builders.
#pragma once

#include <gtest/gtest.h>
#include <stdlib.h>

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <initializer_list>
#include <string>
#include <utility>

#include "host/runtime/storage/database.h"

namespace storage_test {

using namespace host::storage;

/// A fresh folder under the system's temporary folder, removed with everything in it.
class TempFolder {
 public:
  TempFolder() {
    std::string pattern = (std::filesystem::temp_directory_path() / "vnt-storage-XXXXXX").string();
    if (mkdtemp(pattern.data()) == nullptr) ADD_FAILURE() << "mkdtemp failed";
    path_ = pattern;
  }
  ~TempFolder() {
    std::error_code ec;
    std::filesystem::remove_all(path_, ec);
  }
  TempFolder(const TempFolder&) = delete;
  TempFolder& operator=(const TempFolder&) = delete;
  const std::filesystem::path& path() const { return path_; }
  std::filesystem::path file() const { return path_ / Database::file_name; }

 private:
  std::filesystem::path path_;
};

/// A training session table with every field kind, an integer key and a link.
inline TableDef session_table() {
  return TableDef{"BP",
                  "FORMA",
                  {integer_field("IDENT"), text_field("COFOR", 20), date_field("DATDB"), integer_field("NBSTAG"),
                   decimal_field("PRIX"), integer_field("VNTCLI_IDENT", "C VNTCLI")},
                  "IDENT"};
}

/// The host's tables plus the session table.
inline Catalog test_catalog() {
  Catalog catalog = host_catalog();
  catalog.add(session_table());
  return catalog;
}

/// Opens the database of `folder` with `catalog`, failing the test when it cannot.
inline Database open_or_fail(const std::filesystem::path& folder, Catalog catalog = test_catalog(),
                             OpenOptions options = {}) {
  auto db = Database::open(folder, std::move(catalog), std::move(options));
  if (!db) {
    std::fprintf(stderr, "open failed: %s / %s\n", db.error().message.c_str(), db.error().detail.c_str());
    std::abort();
  }
  return std::move(*db);
}

/// The table (base, name), failing the test when it is unknown.
inline StoredTable table_or_fail(const Database& db, std::string_view base, std::string_view name) {
  auto table = db.table(base, name);
  if (!table) {
    std::fprintf(stderr, "no table: %s\n", table.error().message.c_str());
    std::abort();
  }
  return *table;
}

/// A record of `table` with the given (field, value) pairs (entry 1).
inline Record make_record(const StoredTable& table,
                          std::initializer_list<std::pair<const char*, std::string>> values) {
  Record record = table.new_record();
  for (const auto& [field, value] : values) EXPECT_TRUE(record.set(field, value).ok()) << field;
  return record;
}

/// The keys a selection yields, in order, joined by spaces.
inline std::string keys_of(StoredTable& table, const Selection& selection) {
  auto cursor = table.select(selection);
  if (!cursor) return "error: " + cursor.error().message;
  std::string keys;
  for (;;) {
    auto more = cursor->next();
    if (!more) return keys + " error: " + more.error().message;
    if (!*more) return keys;
    keys += (keys.empty() ? "" : " ") + cursor->record().key();
  }
}

}  // namespace storage_test
