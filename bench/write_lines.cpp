// write_lines COUNT LENGTH: writes COUNT lines of LENGTH characters, one write per line.
// Its time is the lower bound for any program that prints as many lines this way.
#include <cstdlib>
#include <string>

#include "nrxctl/base/output.h"

int main(int argc, char** argv) {
    if (argc != 3) return EXIT_FAILURE;
    std::string line(std::strtoul(argv[2], nullptr, 10), '.');
    line += '\n';
    for (auto count = std::strtoul(argv[1], nullptr, 10); count > 0; --count) {
        nrx::write_output(line);
    }
    return EXIT_SUCCESS;
}
