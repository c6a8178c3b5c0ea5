// What the tests of the replay family share: files of samples, and runs of a subcommand.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "tests/support/argument_vector.h"
#include "tests/support/device_test.h"
#include "tests/support/rows.h"

namespace tests {

// Writes a temporary file of samples and returns its path. The next call overwrites the file.
std::string sample_file(std::string_view text);

// Runs a subcommand, which is the first argument. Returns how many of the others it read.
int run_replay(const lines& arguments);

// Runs a subcommand and returns what it wrote. Stores how many arguments it read, if requested.
outcome replay(const lines& arguments, int* consumed = nullptr);

// Expects this output and these failure reports of a subcommand.
void expect_replay(const lines& arguments, const std::string& out, const std::string& reports = "");

}  // namespace tests
