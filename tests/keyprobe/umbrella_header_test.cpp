// The umbrella header offers front ends no checks under the library's label. Each of these
// declarations compiles only if no function in scope has the name.
#include "nrxctl/nrxtoollib.h"

namespace nrx {

extern const int check;
extern const int check_success;

}  // namespace nrx
