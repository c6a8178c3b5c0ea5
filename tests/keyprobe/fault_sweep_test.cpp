// The whole collection, with each of its platform calls failing in turn.
#include "tests/support/fault_sweep.h"

#include "keyprobe/collection.h"
#include "tests/keyprobe/button_host.h"

namespace {

using namespace tests;

std::unique_ptr<machine> make_host() {
    auto host = std::make_unique<machine>();
    put_button_services(*host);
    return host;
}

// Whether every step came to its end; reports without bytes leave their banner alone.
bool all_is_printed(const outcome& result) {
    for (const char* banner : {"keyprobe wqr-button 0xd1=", "get-assets=", "hidreport get 0xe4"}) {
        if (result.out.find(banner) == std::string::npos) return false;
    }
    return true;
}

// A failure reaches the front end's own check; a close that fails is not told.
bool is_told_by_the_front_end(const fault& one) {
    const bool is_a_close = one.name.starts_with("close ");
    const bool by_the_front_end =
        one.result.err.find("Assertion failed: keyprobe: ") != std::string::npos;
    return is_a_close || by_the_front_end || (is_told(one) && all_is_printed(one.result));
}

TEST(collection_fault_sweep, every_failure_is_told_and_the_last_step_is_always_tried) {
    sweep_faults(make_host, nrx::keyprobe::collect_all, is_told_by_the_front_end);
    sweep_faults(make_host, nrx::keyprobe::collect_all, [](const fault& one) {
        return one.result.out.find("hidreport get 0xe0") != std::string::npos ||
               one.result.err.find("keyprobe/hid_feature_reports.cpp") != std::string::npos;
    });
}

}  // namespace
