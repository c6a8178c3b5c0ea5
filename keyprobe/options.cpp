#include "keyprobe/options.h"

#include <array>
#include <cstdlib>
#include <getopt.h>

#include "keyprobe/collection.h"
#include "nrxctl/nrxtoollib.h"

namespace nrx::keyprobe {

namespace {

constexpr char collect_all_option = 's';  // not a short option

constexpr std::array long_options{
    option{"collectall", no_argument, nullptr, collect_all_option},
    option{"help", no_argument, nullptr, 'h'},
    option{},
};

[[noreturn]] void print_usage(const char* program_name) {
    text_line line;
    line.text("usage: ").text(program_name).text(" [--collectall]\n");
    write_error(line.view());
    end_process();
}

}  // namespace

int run(int argc, char** argv) {
    if (argc == 0) print_usage("keyprobe");
    // POSIXLY_CORRECT would end the parsing at the first argument that is not an option.
    ::unsetenv("POSIXLY_CORRECT");
    optind = 0;  // resets the parser, which an earlier run may have used
    while (true) {
        // -b and -f ARGUMENT are known so that the parser prints no message of its own for them
        // before the usage line.
        const int option = getopt_long(argc, argv, "bf:", long_options.data(), nullptr);
        if (option == -1) return EXIT_SUCCESS;
        if (option != collect_all_option) print_usage(argv[0]);
        collect_all();
    }
}

}  // namespace nrx::keyprobe
