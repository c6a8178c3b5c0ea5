// Writes the fields of a record from a table of rows.
#pragma once

#include "nrxctl/base/profile_record.h"
#include "nrxctl/decoders/event_text.h"
#include "nrxctl/decoders/record_row.h"

namespace nrx {

// Appends each row: its key, its value, a comma.
void append_fields(event_text& line, const profile_record& record, const record_rows& fields);

}  // namespace nrx
