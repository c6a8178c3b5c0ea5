// hex_dump_file FILE: prints a file as a hexadecimal dump.
#include <cstdlib>
#include <vector>

#include "bench/read_file.h"
#include "nrxctl/base/hex_dump.h"

int main(int argc, char** argv) {
    if (argc != 2) return EXIT_FAILURE;
    const std::vector<std::uint8_t> bytes = bench::read_file(argv[1]);
    nrx::hex_dump(bytes);
    return bytes.empty() ? EXIT_FAILURE : EXIT_SUCCESS;
}
