// The command line of keyprobe.
#pragma once

namespace nrx::keyprobe {

// Runs the program with an argument vector as main gets it (the words may be reordered) and returns
// its exit status. --collectall runs the collection at once, each time it is given; any other
// option, and an empty vector, print the usage line on standard error and end the process with
// status 1. Words that are no options are passed over, whatever the environment tells the parser.
int run(int argc, char** argv);

}  // namespace nrx::keyprobe
