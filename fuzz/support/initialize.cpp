// The start-up hook of every fuzz target.
#include <iterator>
#include <vector>

// libFuzzer calls this before it parses its command line. Adds an option that sends the output of
// the code under test to /dev/null; reports of the fuzzer and the sanitizers are still shown. A
// -close_fd_mask on the command line comes later and takes precedence.
extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv) {
    static char discard_output[] = "-close_fd_mask=3";
    static std::vector<char*> arguments;
    arguments.assign(*argv, *argv + *argc);
    arguments.insert(std::next(arguments.begin()), discard_output);
    arguments.push_back(nullptr);
    ++*argc;
    *argv = arguments.data();
    return 0;
}
