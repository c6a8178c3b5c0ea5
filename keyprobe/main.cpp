#include "keyprobe/options.h"
#include "nrxctl/base/output.h"

int main(int argc, char** argv) {
    nrx::survive_closed_pipes();
    return nrx::keyprobe::run(argc, argv);
}
