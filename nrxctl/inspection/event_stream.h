// The stream that the printers of HID events, reset notices and statistics updates share.
#pragma once

#include <ostream>

namespace nrx {

// One for the whole process: a format that one of the printers switches to stays for whatever they
// print afterwards. What is written to it stands there until the line ends.
std::ostream& event_stream();

// Ends the line: writes it on standard output in one write.
void end_event_line();

}  // namespace nrx
