// The whole collection, with each of its platform calls failing in turn.
#include "tests/support/fault_sweep.h"

#include "keyprobe/collection.h"
#include "tests/keyprobe/button_host.h"

namespace {

using tests::failure;
using tests::fault;

std::unique_ptr<tests::machine> make_host() {
    auto host = std::make_unique<tests::machine>();
    tests::put_button_services(*host);
    return host;
}

// Look-ups of a prefixed name that is not there make no difference; neither does a close that
// fails; a reply without bytes prints nothing, and is no failure.
bool is_told(const fault& one) {
    const auto good = tests::stats_text() + tests::diagnostics_text() + tests::assets_text() +
                      tests::features_text();
    const bool changed = one.result.out != good;
    const bool reported = one.result.err.find("Assertion failed: keyprobe: ") != std::string::npos;
    return reported || !changed || one.how == failure::nothing;
}

TEST(collection_fault_sweep, every_failure_is_told_and_the_last_step_is_always_tried) {
    tests::sweep_faults(make_host, nrx::keyprobe::collect_all, is_told);
    tests::sweep_faults(make_host, nrx::keyprobe::collect_all, [](const fault& one) {
        return one.result.out.find("hidreport get 0xe0") != std::string::npos ||
               one.result.err.find("keyprobe/hid_feature_reports.cpp") != std::string::npos;
    });
}

}  // namespace
