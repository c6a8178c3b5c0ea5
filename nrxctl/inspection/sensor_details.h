// What the firmware of a sensor reports at detail level 2: blocks of extra information, registers
// and performance counters.
#pragma once

#include <string_view>

#include "nrxctl/base/text_line.h"
#include "platform/bytes.h"

namespace nrx {

// Reads and prints the four information blocks of a sensor (reports 0x39 to 0x3c). A block that
// cannot be read prints as an empty one.
void print_extra_info(std::string_view service_name);

// Prints the items of a block after a label, with nothing between them. Each item starts with a tag
// byte:
//   0  a 32-bit number   2  text, up to a NUL   4  numbers are hexadecimal from here on
//   1  a 64-bit number   3  line break          5  numbers are decimal from here on
// Any other tag ends the block with a line that says so and a dump of the whole block. A number
// that extends beyond the block ends it with a failure report. The base of the numbers carries over
// from block to block.
void print_info_block(platform::byte_view block, number_base& base);

// Reads and prints the registers of a sensor (report 0x38) in one line. If the list counts more
// registers than it holds, this is reported and none of them is printed.
void print_register_list(std::string_view service_name);

// Reads and prints the performance counters of the always-on processor (reports 0x26 and 0x31) in
// one line, up to the last complete one. If the performance monitor is not supported or not in
// automatic mode, prints a line that says so. Counters that cannot be read are reported, and no
// line is printed.
void print_perf_counters(std::string_view service_name);

}  // namespace nrx
