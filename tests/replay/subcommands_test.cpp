// The subcommands that talk to the replay application: load, unload, and those of the state.
#include "nrxctl/replay/fast/event_memory.h"
#include "nrxctl/replay/replay_state.h"
#include "platform/virtual/replay_app.h"
#include "tests/replay/replay_host.h"
#include "tests/support/fault_sweep.h"
#include "tests/support/report_bytes.h"

namespace tests {

namespace {

const std::string usage =
    "usage:\n"
    "    nrxctl --replay load <file> <completion_policy: default|periodic|stop> <location: "
    "sram|dram>\n"
    "    nrxctl --replay unload <service...>\n"
    "    nrxctl --replay schedule-enable <delay-seconds> <service...>\n"
    "    nrxctl --replay enable <service...>\n"
    "    nrxctl --replay disable <service...>\n"
    "    nrxctl --replay get-status\n"
    "    nrxctl --replay generate <service> <signal-type: random|delta|step|sin> <interval> "
    "<num_samples|frequency_hz>\n"
    "    nrxctl --replay help\n";

const std::string no_such_service =
    library_report(source_file::services, "service != ((io_object_t) 0)");
const std::string unresolved = library_report(source_file::load_samples, "success");
const std::string load_failed = unresolved + unresolved;
const std::string no_argument = library_report(source_file::load_samples, "argc > optind");

// Reading the states and a connection to the client, as logged.
const std::string read_state = "call NRXApp 2 scalars [0x47] in [] results 0 capacity 384";
const std::string opened = "open client type 0";
const std::string closed = "close client";

std::string sample(const std::string& tag, const std::string& id, const std::string& timestamp) {
    return tag + ",sampleid=" + id +
           ",temperature=-100,x=0x14131211,y=-2,z=0x34333231,p=0x44434241,timestamp=" + timestamp +
           "\n";
}
const std::string three_services = sample("compass", "1", "5") + sample("pressure", "2", "3") +
                                   sample("compass", "0xb4b3b2b1", "0x14131216") +
                                   sample("accel", "4", "2");

// The records of those samples, as logged.
std::string axis_record(const std::string& delta_and_id) {
    return " 1c 00 00 00 " + delta_and_id + " 00 00 ff ff 11 12 13 14 fe ff ff ff 31 32 33 34";
}
const std::string accel_record = axis_record("00 00 00 00 04 00 00 00");

// A load request as logged: a service id, four numbers below 256, and records.
std::string request(const std::string& id, const std::string& numbers, const std::string& records) {
    std::string text = "call client 0 scalars [] in [" + id;
    for (const std::string& number : split(numbers))
        text += " " + number + " 00 00 00";
    return text + records + "]";
}

// Registers services and NRXApp with its client. No service has samples. Returns the driver of
// NRXApp's reports.
interface_driver& add_replay_services(machine& host) {
    add_service(host, "accel", 0x10);
    add_service(host, "gyro", 0x11);
    add_service(host, "compass", 0x04030201);
    add_service(host, "pressure", 0x13);
    interface_driver& service = add_service(host, "NRXApp", 0x51);
    const auto app = std::make_shared<platform::simulated::replay_app>(
        std::vector<platform::simulated::replay_service>{
            {0x10, 28}, {0x11, 28}, {0x04030201, 28}, {0x13, 20}});
    serve_replay(service, app);
    host.add({.name = "client", .driver = make_replay_client(app)}, host.find("NRXApp"));
    return service;
}

class replay_subcommands : public device_test {
protected:
    // Loads a file with this text, and the given arguments after its path.
    outcome load(std::string_view text, const lines& arguments = {}) {
        lines all{"load", sample_file(text)};
        all.insert(all.end(), arguments.begin(), arguments.end());
        return replay(all, &consumed);
    }

    void expect_load(const std::string& text, const std::string& out,
                     const std::string& reports = "") {
        const outcome result = load(text);
        EXPECT_EQ(result.out, out) << text;
        EXPECT_EQ(result.err, reports) << text;
    }

    // Makes the application return these states and accept any new ones.
    void set_reply(const byte_list& report) {
        app.set_report_source(0x47, [report](std::size_t, byte_list& reply) {
            reply = report;
            return platform::success;
        });
        app.set_report_sink(0x47, [](platform::byte_view) { return platform::success; });
    }

    // The method calls since the last time, as logged, with the opening and closing of the client.
    lines calls() {
        constexpr std::string_view no_outputs = " results 0 capacity 0";
        lines made;
        for (; logged_ < host.log().size(); ++logged_) {
            std::string line = host.log()[logged_];
            if (line.ends_with(no_outputs)) line.resize(line.size() - no_outputs.size());
            if (line == "open client type 0" || line == "close client" || line.starts_with("call "))
                made.push_back(line);
        }
        return made;
    }

    interface_driver& app = add_replay_services(host);
    int consumed = 0;

private:
    std::size_t logged_ = 0;
};

}  // namespace

TEST_F(replay_subcommands, help_and_unknown_arguments_print_the_usage) {
    expect_replay({"help", "ignored"}, usage);
    for (const std::string subcommand : {"", "Load", "loa", "load ", "loads", "status"})
        expect_replay({subcommand, "accel"}, "Invalid subcommand " + subcommand + "\n\n" + usage);
    EXPECT_TRUE(host.log().empty());
}

TEST_F(replay_subcommands, status_reads_complete_entries) {
    std::vector<nrx::replay_state_entry> entries;
    for (const auto& [size, count] : rows<std::size_t, std::size_t>{
             {0, 0}, {1, 0}, {11, 0}, {384, 32}, {385, 0}, {12, 1}, {16, 1}}) {
        byte_list report = u32_report({0x10, 0x01020304, 2, 0xffffffff});
        report.resize(size);
        set_reply(report);
        capture([&] { entries = nrx::replay_status(); });
        EXPECT_EQ(entries.size(), count) << size;
    }
    EXPECT_EQ(entries.at(0).service_id, 0x10);
    EXPECT_EQ(entries.at(0).delay, 0x01020304U);
    EXPECT_EQ(entries.at(0).state, 2U);
}

TEST_F(replay_subcommands, status_prints_names_or_numbers) {
    set_reply(u32_report({0x13, 0x09090909, 0, 0x77, 0, 1, 0x10, 0, 2, 0x11, 0, 3, 0x3f9, 0, 0,
                          0xffffffff, 0, 0xffffffff}));
    add_service(host, "a long service name", 0x3f9);
    expect_replay({"get-status"},
                  "Replay status:\n"
                  "Service pressure   is inactive\n"
                  "Service 119        is loaded\n"
                  "Service accel      is enabled\n"
                  "Service gyro       is 3\n"
                  "Service a long service name is inactive\n"
                  "Service 4294967295 is 4294967295\n",
                  no_such_service + no_such_service);
    EXPECT_EQ(calls(), lines(2, read_state));
}

TEST_F(replay_subcommands, say_that_replay_is_not_enabled) {
    set_reply({1, 2, 3});
    for (const char* arguments : {"load", "load /nonexistent bogus", "unload accel", "enable",
                                  "disable accel", "schedule-enable junk", "get-status"}) {
        expect_replay(split(arguments), "Replay is not enabled\n");
        EXPECT_EQ(calls(), lines{read_state}) << arguments;
    }
    host.remove("NRXApp");
    expect_replay({"get-status"}, "Replay is not enabled\n",
                  library_report(source_file::channel, "service"));
}

TEST_F(replay_subcommands, states_are_set_for_all_services_in_order) {
    set_reply(byte_list(12));
    for (const auto& [arguments, delay, state] : rows<std::string, std::string, std::string>{
             {"enable compass 19", "00 00 00 00", "02"},
             {"disable compass 19", "00 00 00 00", "01"},
             {"schedule-enable 0x10203 compass 19", "03 02 01 00", "02"},
             {"schedule-enable -2 compass 19", "fe ff ff ff", "02"}}) {
        const auto result = replay(split(arguments), &consumed);
        EXPECT_EQ(calls().back(), "call NRXApp 1 scalars [0x47] in [01 02 03 04 " + delay + " " +
                                      state + " 00 00 00 13 00 00 00 " + delay + " " + state +
                                      " 00 00 00]");
        EXPECT_EQ(result.out + result.err, "") << arguments;
        EXPECT_EQ(consumed, static_cast<int>(split(arguments).size()) - 1);
    }
}

TEST_F(replay_subcommands, states_that_cannot_be_set_are_reported) {
    for (const char* arguments : {"enable", "disable", "schedule-enable", "schedule-enable 1"})
        expect_replay(split(arguments), "",
                      library_report(source_file::replay_state, "argc > optind"));
    expect_replay({"schedule-enable", "1s"}, "invalid delay (1s)\n");
    expect_replay({"enable", "accel", "nobody", "nobody"}, "",
                  no_such_service + library_report(source_file::replay_state, "success"));
    EXPECT_EQ(calls(), lines(6, read_state));
    const std::string code = "not in a state for this (0xe0000405)";
    expect_replay({"enable", "accel"}, "",
                  library_report(source_file::command_channel, "kr == 0 ", code) +
                      library_report(source_file::replay_state, "kr == 0 ", code));
}

TEST_F(replay_subcommands, load_checks_and_then_uploads_the_services_by_name) {
    expect_load(three_services,
                "accel: loaded 1 events\ncompass: loaded 2 events\npressure: loaded 1 events\n");
    const std::string pressure_record =
        " 14 00 00 00 01 00 00 00 02 00 00 00 00 00 ff ff 41 42 43 44";
    EXPECT_EQ(calls(), (lines{read_state, read_state, read_state, read_state, opened,
                              request("10 00 00 00", "01 01 00 1c", accel_record), closed, opened,
                              request("01 02 03 04", "01 01 00 38",
                                      axis_record("03 00 00 00 01 00 00 00") +
                                          axis_record("11 12 13 14 b1 b2 b3 b4")),
                              closed, opened,
                              request("13 00 00 00", "01 01 00 14", pressure_record), closed}));
    expect_replay({"get-status"},
                  "Replay status:\nService accel      is loaded\nService gyro       is inactive\n"
                  "Service compass    is loaded\nService pressure   is loaded\n");
}

TEST_F(replay_subcommands, load_counts_events_and_bytes_beyond_one_byte) {
    std::string many;
    for (int i = 0; i < 2400; ++i)
        many += sample("gyro", "1", "1");
    EXPECT_EQ(load(many).out, "gyro: loaded 2400 events\n");
    EXPECT_TRUE(calls().at(3).starts_with(
        "call client 0 scalars [] in [11 00 00 00 01 00 00 00 01 00 00 00 00 00 00 00 80 06 01 00 "
        "1c 00 00 00 "));
}

TEST_F(replay_subcommands, load_arguments_choose_filter_completion_and_location) {
    using row = std::tuple<std::string, std::string, int>;
    for (const auto& [arguments, numbers, count] :
         {row{"", "01 01 00 1c", 1}, row{"filter", "01 01 01 1c", 2},
          row{"default", "00 01 00 1c", 2}, row{"periodic dram", "01 01 00 1c", 3},
          row{"stop sram", "02 02 00 1c", 3}, row{"filter last local", "03 02 01 1c", 4},
          row{"last local nothing else", "03 02 00 1c", 3}}) {
        EXPECT_EQ(load(sample("accel", "4", "2"), split(arguments)).out,
                  "accel: loaded 1 events\n");
        EXPECT_EQ(calls().at(3), request("10 00 00 00", numbers, accel_record));
        EXPECT_EQ(consumed, count);
        replay({"unload", "accel"});
        calls();
    }
}

TEST_F(replay_subcommands, load_rejects_unknown_arguments_before_it_reads_the_file) {
    using row = std::pair<std::string, std::string>;
    for (const auto& [arguments, message] :
         {row{"Filter", "completion: Filter"}, row{"filter filter", "completion: filter"},
          row{"sram", "completion: sram"}, row{"stop Sram", "location: Sram"},
          row{"filter stop 1", "location: 1"}}) {
        const auto result = load("no,pair\n", split(arguments));
        EXPECT_EQ(result.out + result.err, "Invalid " + message + "\n");
    }
    expect_replay({"load"}, "", no_argument);
}

TEST_F(replay_subcommands, load_uploads_nothing_of_an_empty_or_bad_file) {
    const std::string good = sample("accel", "1", "1");
    expect_load("# nothing\n\nnobody\n", "Warning: Unknown event tag nobody\n");
    expect_load(good + "accel,x\n", "",
                library_report(source_file::sample_file, "pair.size() == 2") + load_failed);
    expect_load(good + "accel,sampleid=x\n", "error converting samples (x)\n");
    expect_replay({"load", "/nonexistent/samples"}, "",
                  library_report(source_file::sample_file, "fs") + load_failed);
    EXPECT_EQ(calls(), lines(4, read_state));
}

TEST_F(replay_subcommands, load_rejects_a_file_if_a_service_has_no_id_or_state) {
    host.find("compass")->properties = {};
    expect_load(three_services, "", load_failed);
    host.remove("compass");
    expect_load(three_services, "", no_such_service + load_failed);
    add_service(host, "compass", 0x77);
    expect_load(three_services, "", load_failed);
    EXPECT_EQ(calls(), lines(9, read_state));
    // Four platform calls find out that replay is enabled: two lookups, open and call.
    host.before_call(5, [&] { host.remove("NRXApp"); });
    expect_load(three_services, "", library_report(source_file::channel, "service") + load_failed);
}

TEST_F(replay_subcommands, load_rejects_a_file_if_a_service_has_samples) {
    for (const char* state : {"disable", "enable"}) {
        load(sample("pressure", "1", "1") + sample("compass", "1", "1"));
        replay({state, "compass", "pressure"});
        calls();
        expect_load(three_services,
                    "Service compass had already samples; you have to unload first\n");
        EXPECT_EQ(calls(), lines(3, read_state));
        replay({"unload", "compass", "pressure"});
    }
    set_reply(u32_report({0x10, 0, 3}));
    expect_load(three_services, "Service accel had already samples; you have to unload first\n");
}

TEST_F(replay_subcommands, load_reports_a_failed_upload_and_keeps_earlier_ones) {
    // The first status takes four platform calls, each of the three checks seven, and an upload
    // seven: two lookups of the id, its reading, NRXApp, its child, open, call.
    constexpr std::size_t accel_uploaded = 4 + 3 * 7 + 7;
    const auto expect_failure = [&](const std::string& reports) {
        expect_load(three_services, "accel: loaded 1 events\n", reports);
        replay({"unload", "accel"});
        EXPECT_EQ(replay({"get-status"}).out.find(" is loaded"), std::string::npos) << reports;
    };
    const std::string conn = source_file::service_conn;
    for (const auto& [call, reports] : rows<std::size_t, std::string>{
             {3, load_failed},
             {4, library_report(conn, "service") + load_failed},
             {5, library_report(conn, "child") + load_failed},
             {6, library_report(conn, "kr == 0 ", io_text) + load_failed},
             {7, library_report(source_file::load_samples, "kr == 0 ", io_text) + unresolved}}) {
        host.fail_call(accel_uploaded + call, failure::io);
        expect_failure(reports);
    }
    host.before_call(accel_uploaded + 1, [&] { host.remove("compass"); });
    expect_failure(no_such_service + load_failed);
}

TEST_F(replay_subcommands, unload_names_what_it_cannot_unload_and_continues) {
    load(three_services);
    calls();
    const auto result =
        replay({"unload", "compass", "nobody", "gyro", "0x10", "99999999999", "19"}, &consumed);
    EXPECT_EQ(result.out,
              "Service nobody not found\nService gyro can't be unloaded\n"
              "Service 99999999999 not found\n");
    EXPECT_EQ(result.err, no_such_service);
    EXPECT_EQ(consumed, 6);
    EXPECT_EQ(calls(), (lines{read_state, opened, "call client 1 scalars [] in [01 02 03 04]",
                              "call client 1 scalars [] in [11 00 00 00]",
                              "call client 1 scalars [] in [10 00 00 00]",
                              "call client 1 scalars [] in [13 00 00 00]", closed}));
    EXPECT_EQ(replay({"get-status"}).out.find("loaded"), std::string::npos);
}

TEST_F(replay_subcommands, unload_needs_an_argument_the_application_and_its_driver) {
    expect_replay({"unload"}, "", no_argument);
    EXPECT_EQ(calls(), lines{});
    host.remove("client");
    expect_replay({"unload", "accel"}, "",
                  library_report(source_file::service_conn, "child") + unresolved);
    host.before_call(5, [&] { host.remove("NRXApp"); });
    expect_replay({"unload", "accel"}, "",
                  library_report(source_file::service_conn, "service") + unresolved);
}

TEST_F(replay_subcommands, events_are_deleted_however_a_subcommand_ends) {
    const auto next_event = [] {
        void* event = nrx::event_memory::allocate(48);
        nrx::event_memory::deallocate(event);
        return event;
    };
    const void* before = next_event();
    for (const std::string text : {"", "accel,x\n", "accel,sampleid=x\n"})
        load(three_services + text);
    for (const char* signal : {"sin", "other"})
        replay({"generate", "gyro", signal, "1", "2"});
    EXPECT_EQ(next_event(), before);
}

TEST(replay_fault_sweep, every_failed_call_is_reported_and_nothing_stays_open) {
    const std::string samples = sample_file(
        "accel,sampleid=1,temperature=0,x=0,y=0,z=0,timestamp=0\n"
        "pressure,sampleid=1,temperature=0,p=0,timestamp=0\n");
    for (const std::string& arguments :
         lines{"load " + samples, "unload accel pressure", "enable accel 19", "disable accel",
               "schedule-enable 1 accel", "get-status"}) {
        const auto make_host = [&] {
            auto host = std::make_unique<machine>();
            add_replay_services(*host);
            if (arguments.starts_with("load")) return host;
            // Loads directly at the driver, because platform calls would count.
            for (byte_list request :
                 {u32_report({0x10, 1, 1, 0, 28, 28}), u32_report({0x13, 1, 1, 0, 20, 20})}) {
                request.resize(20U + request[20]);
                platform::call_outputs no_outputs;
                const auto kr = host->find("client")->driver->call(0, {{}, request}, no_outputs);
                EXPECT_EQ(kr, platform::success);
            }
            return host;
        };
        sweep_faults(make_host, {{[&] { run_replay(split(arguments)); }, "IONameMatch = \"WQR_",
                                  " can't be unloaded\n| not found\n"}});
    }
}

}  // namespace tests
