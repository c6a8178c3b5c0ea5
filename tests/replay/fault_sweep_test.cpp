// Every subcommand of the replay family survives the failure of any platform call.

#include "tests/support/fault_sweep.h"

#include "tests/replay/replay_host.h"

namespace tests {

namespace {

// A host on which nothing is loaded yet, and one on which everything is.
std::unique_ptr<machine> make_host() {
    auto host = std::make_unique<machine>();
    put_replay_services(*host);
    return host;
}

// Loaded past the host, whose platform calls count.
std::unique_ptr<machine> make_loaded_host() {
    auto host = make_host();
    for (byte_list request :
         {words_of({0x10, 1, 1, 0, 28, 28}), words_of({0x13, 1, 1, 0, 20, 20})}) {
        request.resize(20U + request[20]);
        platform::call_outputs nothing;
        const auto kr = host->find("client")->unit->call(0, {{}, request}, nothing);
        EXPECT_EQ(kr, platform::success);
    }
    return host;
}

// Unloading has a message for what it cannot find or unload; a service may be registered under an
// empty name.
bool is_told_somehow(const fault& one) {
    const bool is_nameless = one.how == failure::nothing && one.name.starts_with("name of ");
    return is_nameless || is_told(one) ||
           one.result.out.find(" can't be unloaded\n") != std::string::npos ||
           one.result.out.find(" not found\n") != std::string::npos;
}

}  // namespace

TEST(replay_fault_sweep, subcommands_tell_of_every_failure_and_leave_nothing_open) {
    const sample_text_file samples(
        "accel,sampleid=1,temperature=0,x=0,y=0,z=0,timestamp=0\n"
        "pressure,sampleid=1,temperature=0,p=0,timestamp=0\n");
    sweep_faults(
        make_host,
        [&] {
            run_replay({"load", samples.path()});
        },
        is_told_somehow);
    for (const lines& words : std::vector<lines>{{"unload", "accel", "pressure"},
                                                 {"enable", "accel", "19"},
                                                 {"disable", "accel"},
                                                 {"schedule-enable", "1", "accel"},
                                                 {"get-status"}}) {
        sweep_faults(
            make_loaded_host, [&] { run_replay(words); }, is_told_somehow);
    }
}

}  // namespace tests
