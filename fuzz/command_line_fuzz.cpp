// The arguments of nrxctl, one per line. A command line that is refused has made no call of the
// platform; one that is accepted runs on a host without services, and leaves nothing open.
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

#include "fuzz/support/argument_list.h"
#include "fuzz/support/harness.h"
#include "nrxctl/base/output.h"
#include "nrxctl/options/options.h"
#include "platform/virtual/current_machine.h"

namespace {

using nrx::nrxctl::usage_error_status;

// Generating samples could take hours, and a path could name a device file that blocks.
bool is_tame(std::string_view argument) {
    return argument != "generate" && argument != "load";
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::string text("nrxctl\n");
    text.append(fuzz::as_text(data, size));
    const fuzz::argument_list list = fuzz::split_arguments(text);
    const auto arguments = list.arguments();
    if (!std::all_of(arguments.begin(), arguments.end(), is_tame)) return 0;
    platform::simulated::machine host;
    const platform::simulated::installed_machine installed(host);
    nrx::memory_sink out;
    nrx::memory_sink err;
    const nrx::scoped_sink installed_out(nrx::standard_stream::output, out);
    const nrx::scoped_sink installed_err(nrx::standard_stream::error, err);
    const int status = nrx::nrxctl::run(list.count(), const_cast<char**>(arguments.data()));
    fuzz::require(status >= 0 && status <= usage_error_status);
    fuzz::require(host.open_handles() == 0);
    if (status == usage_error_status) {
        fuzz::require(host.calls_made() == 0 && out.text().empty());
        fuzz::require(err.text().starts_with("nrxctl: "));
    }
    return 0;
}
