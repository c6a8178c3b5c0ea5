// Loading and unloading: requests, messages, and the reports of every failure in their order.
#include "tests/replay/replay_host.h"

namespace tests {

using lines = std::vector<std::string>;

namespace {

const std::string success_failed = failed("replay/load_subcommand.cpp", "success");
const std::string service_failed = failed("base/channel.cpp", "service");
const std::string no_such_service =
    failed("base/service_discovery.cpp", "service != ((io_object_t) 0)");
const std::string read_state = "call NRXApp 2 scalars [0x47] in [] results 0 room 384";

std::string sample(const std::string& tag, int id, int timestamp) {
    return tag + ",sampleid=" + std::to_string(id) +
           ",temperature=100,x=1,y=2,z=3,p=4,timestamp=" + std::to_string(timestamp) + "\n";
}

// How the records of those samples look in the log.
std::string axis_record(const std::string& delta, const std::string& id) {
    return " 1c 00 00 00 " + delta + " 00 00 00 " + id +
           " 00 00 00 00 00 01 00 01 00 00 00 02 00 00 00 03 00 00 00";
}

std::string pressure_record(const std::string& delta, const std::string& id) {
    return " 14 00 00 00 " + delta + " 00 00 00 " + id + " 00 00 00 00 00 01 00 04 00 00 00";
}

// A load request in the log: five words whose upper bytes are 0, and records.
std::string request(const lines& header, const std::string& records) {
    std::string text = "call client 0 scalars [] in [";
    for (std::size_t i = 0; i < header.size(); ++i)
        text += (i == 0 ? "" : " ") + header[i] + " 00 00 00";
    return text + records + "]";
}

}  // namespace

class load : public replay_test {
protected:
    outcome run(lines further = {}) {
        further.insert(further.begin(), {"load", file.path()});
        return replay(further, &taken);
    }

    // Loads samples of one kind ahead of what is tested.
    void load_before(const std::string& text) {
        const sample_text_file before(text);
        EXPECT_EQ(replay({"load", before.path()}).err, "");
        calls();
    }

    sample_text_file file{sample("gyro", 1, 5) + sample("pressure", 2, 3) + sample("gyro", 3, 9) +
                          sample("accel", 4, 2)};
    int taken = 0;
};

TEST_F(load, checks_and_then_uploads_each_service_in_the_order_of_their_names) {
    const auto result = run();
    EXPECT_EQ(result.out,
              "accel: loaded 1 events\ngyro: loaded 2 events\npressure: loaded 1 events\n");
    EXPECT_EQ(result.err, "");
    EXPECT_EQ(calls(),
              (lines{read_state, read_state, read_state, read_state,
                     request({"10", "01", "01", "00", "1c"}, axis_record("00", "04")),
                     request({"11", "01", "01", "00", "38"},
                             axis_record("03", "01") + axis_record("04", "03")),
                     request({"13", "01", "01", "00", "14"}, pressure_record("01", "02"))}));
    EXPECT_EQ(logged("open").size(), 7U);
    EXPECT_EQ(logged("close").size(), 7U);
    EXPECT_EQ(replay({"get-status"}).out,
              "Replay status:\nService accel      is loaded\nService gyro       is loaded\n"
              "Service compass    is inactive\nService pressure   is loaded\n");
}

TEST_F(load, words_choose_filter_completion_and_location) {
    struct options_row {
        lines words;
        std::string completion;
        std::string location;
        std::string filter;
        int taken = 0;
    };
    const sample_text_file one(sample("accel", 4, 2));
    for (const auto& [words, completion, location, filter, taken_words] : std::vector<options_row>{
             {{}, "01", "01", "00", 1},
             {{"filter"}, "01", "01", "01", 2},
             {{"default"}, "00", "01", "00", 2},
             {{"periodic", "dram"}, "01", "01", "00", 3},
             {{"stop", "sram"}, "02", "02", "00", 3},
             {{"filter", "last", "local"}, "03", "02", "01", 4},
             {{"last", "local", "nothing", "else"}, "03", "02", "00", 3},
         }) {
        lines all{"load", one.path()};
        all.insert(all.end(), words.begin(), words.end());
        const auto result = replay(all, &taken);
        EXPECT_EQ(result.out, "accel: loaded 1 events\n");
        EXPECT_EQ(calls().back(),
                  request({"10", completion, location, filter, "1c"}, axis_record("00", "04")));
        EXPECT_EQ(taken, taken_words);
        replay({"unload", "accel"});
        calls();
    }
}

TEST_F(load, words_that_are_none_of_these_stop_it_before_the_file_is_read) {
    for (const auto& [words, message] : std::vector<std::pair<lines, std::string>>{
             {{"Filter"}, "Invalid completion: Filter\n"},
             {{"filter", "filter"}, "Invalid completion: filter\n"},
             {{"sram"}, "Invalid completion: sram\n"},
             {{"stop", "Sram"}, "Invalid location: Sram\n"},
             {{"filter", "stop", "1"}, "Invalid location: 1\n"},
         }) {
        lines all{"load", "/nonexistent/samples"};
        all.insert(all.end(), words.begin(), words.end());
        const auto result = replay(all);
        EXPECT_EQ(result.out, message);
        EXPECT_EQ(result.err, "");
    }
    EXPECT_EQ(replay({"load"}).err, failed("replay/load_subcommand.cpp", "argc > optind"));
}

TEST_F(load, a_file_without_samples_uploads_nothing) {
    const sample_text_file nothing("# nothing\n\nnobody\n");
    const auto result = replay({"load", nothing.path()});
    EXPECT_EQ(result.out, "Warning: Unknown event tag nobody\n");
    EXPECT_EQ(result.err, "");
    EXPECT_EQ(calls(), lines{read_state});
}

TEST_F(load, a_file_that_cannot_be_read_is_reported_and_two_more_times) {
    const auto missing = replay({"load", "/nonexistent/samples"});
    EXPECT_EQ(missing.err,
              failed("replay/sample_file.cpp", "fs") + success_failed + success_failed);
    const sample_text_file bad(sample("accel", 1, 1) + "accel,x\n");
    const auto refused = replay({"load", bad.path()});
    EXPECT_EQ(refused.err, failed("replay/sample_file.cpp", "pair.size() == 2") + success_failed +
                               success_failed);
    EXPECT_EQ(missing.out + refused.out, "");
    EXPECT_EQ(calls(), (lines{read_state, read_state}));
}

TEST_F(load, a_number_that_is_none_ends_the_process_and_releases_everything) {
    const sample_text_file bad(sample("accel", 1, 1) + "accel,sampleid=x\n");
    const auto result = replay({"load", bad.path()});
    EXPECT_EQ(result.out, "error converting samples (x)\n");
    EXPECT_EQ(result.status, 1);
}

TEST_F(load, a_service_without_id_or_state_refuses_the_whole_file) {
    host.remove("gyro");
    const auto unknown = run();
    EXPECT_EQ(unknown.err, no_such_service + success_failed + success_failed);
    EXPECT_EQ(unknown.out, "");
    put_service(host, "gyro", 0x77);
    const auto absent = run();
    EXPECT_EQ(absent.err, success_failed + success_failed);
    EXPECT_EQ(absent.out, "");
    for (const std::string& call : calls())
        EXPECT_EQ(call, read_state);
}

TEST_F(load, a_service_that_has_samples_refuses_the_whole_file_with_a_message_alone) {
    for (const char* state : {"disable", "enable"}) {
        load_before(sample("pressure", 1, 1));
        replay({state, "pressure"});
        calls();
        const auto result = run();
        EXPECT_EQ(result.out, "Service pressure had already samples; you have to unload first\n");
        EXPECT_EQ(result.err, "");
        EXPECT_EQ(calls(), (lines{read_state, read_state, read_state, read_state}));
        replay({"unload", "pressure"});
    }
}

TEST_F(load, a_state_that_cannot_be_read_again_fails_the_check) {
    // Four platform calls tell that replay is enabled: two look-ups, the opening and the call.
    host.before_call(5, [&] { host.remove("NRXApp"); });
    const auto result = run();
    EXPECT_EQ(result.err, service_failed + success_failed + success_failed);
    EXPECT_EQ(result.out, "");
}

TEST_F(load, what_fails_in_the_upload_is_reported_and_leaves_what_was_uploaded_before) {
    const std::string conn = "base/service_conn.cpp";
    const std::string io = "device i/o failure (0xe0000401)";
    // The upload of gyro begins with the look-ups of its id, then of NRXApp, its child and the
    // opening, then the call; how a good run goes tells which platform calls these are.
    run();
    std::size_t accel_upload = 0;
    const auto& log = host.log();
    std::size_t counted = 0;
    for (const std::string& line : log) {
        const bool is_call = !line.starts_with("release ") && !line.starts_with("close ");
        if (is_call) ++counted;
        if (line.starts_with("call client 0 scalars [] in [10 ")) accel_upload = counted;
    }
    replay({"unload", "accel", "gyro", "pressure"});
    struct upload_failure {
        std::size_t call;  // of the upload of gyro
        std::string reports;
        std::size_t further_call = 0;  // fails as well
    };
    for (const auto& [call, reports, further_call] : std::vector<upload_failure>{
             {1, no_such_service + success_failed + success_failed, 2},
             {4, failed(conn, "service") + success_failed + success_failed},
             {5, failed(conn, "child") + success_failed + success_failed},
             {6, failed(conn, "kr == 0 ", io) + success_failed + success_failed},
             {7, failed("replay/load_subcommand.cpp", "kr == 0 ", io) + success_failed},
         }) {
        host.fail_call(accel_upload + call, failure::io);
        if (further_call != 0) host.fail_call(accel_upload + further_call, failure::io);
        const auto result = run();
        EXPECT_EQ(result.err, reports) << call;
        EXPECT_EQ(result.out, "accel: loaded 1 events\n") << call;
        replay({"unload", "accel"});
        EXPECT_EQ(replay({"get-status"}).out.find(" is loaded"), std::string::npos) << call;
    }
}

TEST_F(load, unloading_names_what_it_cannot_unload_and_goes_on) {
    run();
    calls();
    const auto result =
        replay({"unload", "gyro", "nobody", "compass", "0x10", "99999999999", "19"}, &taken);
    EXPECT_EQ(result.out,
              "Service nobody not found\nService compass can't be unloaded\n"
              "Service 99999999999 not found\n");
    EXPECT_EQ(result.err, no_such_service);
    EXPECT_EQ(taken, 6);
    EXPECT_EQ(calls(), (lines{read_state, "call client 1 scalars [] in [11 00 00 00]",
                              "call client 1 scalars [] in [12 00 00 00]",
                              "call client 1 scalars [] in [10 00 00 00]",
                              "call client 1 scalars [] in [13 00 00 00]"}));
    EXPECT_EQ(replay({"get-status"}).out.find("loaded"), std::string::npos);
}

TEST_F(load, unloading_needs_a_word_a_replay_application_and_its_driver) {
    const std::string unload_file = "replay/unload_subcommand.cpp";
    EXPECT_EQ(replay({"unload"}).err, failed(unload_file, "argc > optind"));
    EXPECT_EQ(calls(), lines{});
    host.remove("client");
    const auto result = replay({"unload", "accel"});
    EXPECT_EQ(result.err,
              failed("base/service_conn.cpp", "child") + failed(unload_file, "success"));
    EXPECT_EQ(result.out, "");
}

}  // namespace tests
