// The command line of nrxctl.
#pragma once

namespace nrx::nrxctl {

// Runs the options of the command line in order, each when it is parsed, and returns the exit
// status: 1 if any of them failed; 2 after a usage error, which is reported on standard error and
// ends the parsing. An argument with an invalid value ends the process with status 1.
int run(int argc, char** argv);

}  // namespace nrx::nrxctl
