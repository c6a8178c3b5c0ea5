// nrxctl: the entry points of the tool library as command-line options.

#include "nrxctl/nrxtoollib.h"
#include "nrxctl/options/options.h"
#include "platform/clock.h"

int main(int argc, char** argv) {
    const nrx::program_output output;
    nrx::tick_period = platform::tick_period();
    return nrx::nrxctl::run(argc, argv);
}
