// The clients that have subscribed to a sensor's samples.
#pragma once

#include <string_view>

#include "platform/bytes.h"

namespace nrx {

// Asks a sensor service for its clients (command 0x39) and prints them as a table, with a label in
// front of each line. Prints nothing if the service does not reply; a service that is missing or
// cannot be opened is reported.
void print_client_table(std::string_view label, std::string_view service_name);

// Prints the heading of the table and a line for each entry in use. An entry has 31 bytes, packed:
//    0  12 bytes  name, up to a NUL       24  s32  time limit
//   12  s32       report interval         28  u8   0: not in use
//   16  s32       batch                   29  u8   option, a flag
//   20  s32       threshold               30  u8   power
// An incomplete entry at the end is ignored.
void print_clients(std::string_view label, platform::byte_view entries);

}  // namespace nrx
