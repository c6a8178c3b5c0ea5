// The command line of every fuzz target.
#include <iterator>
#include <vector>

// Called by libFuzzer before it reads its command line. What the code under test writes goes to
// /dev/null, reports of the fuzzer and the sanitizers do not. A -close_fd_mask of the user's comes
// later and so prevails.
extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv) {
    static char nowhere[] = "-close_fd_mask=3";
    static std::vector<char*> words;
    words.assign(*argv, *argv + *argc);
    words.insert(std::next(words.begin()), nowhere);
    words.push_back(nullptr);
    ++*argc;
    *argv = words.data();
    return 0;
}
