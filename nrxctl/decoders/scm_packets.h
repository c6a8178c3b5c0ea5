// The transfers on the coprocessor's buses, and their data.
#pragma once

#include <cstdint>
#include <string>

#include "nrxctl/base/profile_record.h"

namespace nrx {

// Follows the bus transfers in a stream of records.
class scm_packet_printer {
public:
    // Prints a line on standard output for a transfer on a known bus in a known direction, and for
    // each data record that is not empty and has the timestamp of the last transfer printed (0
    // before the first). Prints nothing for any other record.
    void print(const profile_record& record);

private:
    void print_transfer(const profile_record& record);
    void print_data(const profile_record& record) const;

    std::string label_;                // of the last transfer: bus name, dot, event
    std::uint64_t last_transfer_ = 0;  // its timestamp
};

// Prints a record with one scm_packet_printer, which lives as long as the process. A
// record_printer; for one thread at a time.
void print_scm_packet(const profile_record& record);

}  // namespace nrx
