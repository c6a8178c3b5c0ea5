// The command line of keyprobe.
#pragma once

namespace nrx::keyprobe {

// Runs the program with the arguments of main, which may be reordered, and returns its exit status.
// --collectall runs the collection each time it is parsed. Any other option, and an empty argument
// vector, print the usage line on standard error and end the process with status 1. Arguments that
// are not options are ignored, even if POSIXLY_CORRECT is set.
int run(int argc, char** argv);

}  // namespace nrx::keyprobe
