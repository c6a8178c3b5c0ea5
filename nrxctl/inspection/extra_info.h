// The blocks of information that a sensor's firmware composes as it likes.
#pragma once

#include <string_view>

#include "nrxctl/base/text_line.h"
#include "platform/bytes.h"

namespace nrx {

// Reads and prints the four blocks of a sensor (reports 0x39 to 0x3c); one that is not read is
// empty.
void print_extra_info(std::string_view service_name);

// Prints the items of a block, after a label, without anything between them. A tag byte opens each:
//   0  a 32-bit number   2  text, up to a NUL   4  numbers in hexadecimal from here on
//   1  a 64-bit number   3  line break          5  numbers in decimal from here on
// Any other tag ends the block with a line that says so and a dump of the whole block; a number
// that the block does not hold ends it with a failure report.
void print_info_block(platform::byte_view block, number_base& base);

}  // namespace nrx
