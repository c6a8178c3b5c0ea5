// Several numbers of a sensor's reply in one line.
#pragma once

#include <cstddef>

#include "nrxctl/base/text_line.h"
#include "nrxctl/inspection/sensor_reports.h"

namespace nrx {

// Three signed 32-bit numbers with 16 fraction bits from an offset on, as fractions with blanks
// between them.
void append_fractions(text_line& line, const sensor_reply& reply, std::size_t offset);

// Nine of them, the rows apart from each other by bars.
void append_matrix(text_line& line, const sensor_reply& reply);

// Every signed 32-bit number of a reply, a blank behind each.
void append_numbers(text_line& line, const sensor_reply& reply);

}  // namespace nrx
