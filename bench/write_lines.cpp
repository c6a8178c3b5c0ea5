// write_lines FILE: copies text to standard output, one write per line. What it takes is the floor
// for everything that prints as much a line at a time.
#include <cstdlib>
#include <string_view>
#include <vector>

#include "bench/read_file.h"
#include "nrxctl/base/output.h"

int main(int argc, char** argv) {
    if (argc != 2) return EXIT_FAILURE;
    const std::vector<std::uint8_t> bytes = bench::read_file(argv[1]);
    std::string_view text(reinterpret_cast<const char*>(bytes.data()), bytes.size());
    while (!text.empty()) {
        const auto line = text.substr(0, text.find('\n') + 1);
        nrx::write_output(line.empty() ? text : line);
        text.remove_prefix(line.empty() ? text.size() : line.size());
    }
    return bytes.empty() ? EXIT_FAILURE : EXIT_SUCCESS;
}
