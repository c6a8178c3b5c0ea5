#include "keyprobe/options.h"
#include "nrxctl/nrxtoollib.h"

int main(int argc, char** argv) {
    nrx::survive_closed_pipes();
    return nrx::keyprobe::run(argc, argv);
}
