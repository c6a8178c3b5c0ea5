// Standard output and standard error, a whole line in one write.
//
// Output that cannot be written (a full disk, a closed pipe) is dropped; the tool goes on, because
// what it does to the device must not depend on who reads along. What does nothing but write may
// end there, and is told.
#pragma once

#include <string_view>

namespace nrx {

// Writes text, which brings its own line feeds, on standard output in one write. False if not all
// of it could be written.
bool write_output(std::string_view text);

// Writes text and a line feed on standard output in one write.
void print_line(std::string_view text);

// Writes text, which brings its own line feeds, on standard error in one write.
void write_error(std::string_view text);

// Lets a write into a pipe that nobody reads fail instead of ending the process. A program calls it
// once, first.
void survive_closed_pipes();

}  // namespace nrx
