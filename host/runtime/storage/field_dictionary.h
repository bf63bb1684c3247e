// Upkeep of the field dictionary "@@"."$CHP$": one record per field of every
// table of the catalog, so that programs can find a table's fields and links.
#pragma once

#include "host/runtime/storage/catalog.h"
#include "host/runtime/storage/status.h"
#include "host/runtime/storage/stored_table.h"

namespace host::storage {

/// Makes `dictionary` hold exactly one record per field of every table of `catalog`: "CODE" =
/// base.table.field, "CODEC" = the field's name, "LIEN" = its link descriptor, "NUMAL" = its rank
/// from 1. Inserts, updates and removes only what differs; run it inside a transaction.
/// Fails with the errors of the record operations (a code longer than "CODE" allows: TooLong).
Status sync_field_dictionary(StoredTable& dictionary, const Catalog& catalog);
/// True when sync_field_dictionary() would change nothing; reads only. Fails with Busy or Failure.
Result<bool> field_dictionary_in_step(StoredTable& dictionary, const Catalog& catalog);

}  // namespace host::storage
