#include "keyprobe/options.h"
#include "nrxctl/nrxtoollib.h"

int main(int argc, char** argv) {
    const nrx::program_output output;
    return nrx::keyprobe::run(argc, argv);
}
