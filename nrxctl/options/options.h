// The command line of nrxctl.
#pragma once

#include <cstddef>
#include <span>
#include <string_view>

#include "nrxctl/options/option_arguments.h"

namespace nrx::nrxctl {

struct option_row {
    std::string_view name;       // without the dashes
    std::string_view arguments;  // in the usage
    std::size_t min_arguments;
    std::size_t max_arguments;
    std::string_view purpose;
    option_action (*read)(option_arguments& arguments);
};

inline constexpr int usage_error_status = 2;

// All options.
std::span<const option_row> option_table();

// Reads and checks the whole command line, then runs its options in order, and returns the exit
// status: 0 if all went well; 1 if the library refused an argument, anything failed, output was
// lost or memory ran out; 2 if the command line is wrong, which is said on standard error. A
// command line that is refused or wrong has no effect: no call of the platform is made. A value in
// a sample file that the library refuses, and lack of memory, end the run; any other failure ends
// the option alone.
int run(int argc, char** argv);

}  // namespace nrx::nrxctl
