// The clients that have subscribed to a sensor's samples.
#pragma once

#include <string_view>

#include "platform/bytes.h"

namespace nrx {

// Asks a sensor service for its clients (command 0x39) and prints them as a table, label before
// each line. Nothing is printed if the service does not answer; that it is missing or cannot be
// opened is reported.
void print_client_table(std::string_view label, std::string_view service_name);

// Prints the table's heading, and a line for each entry in use. Entries are 31 bytes, packed:
//    0  12 bytes  name, up to a NUL       24  s32  time limit
//   12  s32       report interval         28  u8   0: not in use
//   16  s32       batch                   29  u8   option, a flag
//   20  s32       threshold               30  u8   power
// A trailing part is no entry.
void print_clients(std::string_view label, platform::byte_view entries);

}  // namespace nrx
