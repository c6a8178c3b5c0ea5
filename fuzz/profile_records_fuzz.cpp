// Arbitrary bytes as profile event records, through all three printers.
#include <cstddef>
#include <cstdint>

#include "fuzz/support/harness.h"
#include "nrxctl/base/profile_record.h"
#include "nrxctl/decoders/record_layout.h"
#include "nrxctl/decoders/record_text.h"
#include "nrxctl/decoders/scm_packets.h"

namespace {

void print_with_every_printer(const nrx::profile_record& record) {
    nrx::event_text line;
    const auto text = nrx::decode_profile_record(record, line);
    fuzz::require(text.starts_with("{ ") && text.ends_with('}'));
    fuzz::require(text.size() <= nrx::max_record_text);
    nrx::print_profile_record(record);
    nrx::dump_profile_record(record);
    nrx::print_scm_packet(record);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    nrx::print_complete_records({data, size}, print_with_every_printer);
    return 0;
}
