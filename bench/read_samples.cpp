// read_samples FILE: reads a file of sensor samples as a load does before the upload: grouped, in
// order, with their deltas.
#include <cstdlib>

#include "nrxctl/replay/sample_file.h"

int main(int argc, char** argv) {
    if (argc != 2) return EXIT_FAILURE;
    return nrx::read_sample_file(argv[1]) ? EXIT_SUCCESS : EXIT_FAILURE;
}
