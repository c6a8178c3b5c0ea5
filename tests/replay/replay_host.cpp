#include "tests/replay/replay_host.h"

#include <cstdlib>
#include <unistd.h>

#include "nrxctl/replay/replay_command.h"
#include "platform/virtual/replay_app.h"
#include "tests/support/word_vector.h"

namespace tests {

sample_text_file::sample_text_file(std::string_view text)
    : path_(testing::TempDir() + "samples-XXXXXX") {
    const int file = ::mkstemp(path_.data());
    EXPECT_EQ(::write(file, text.data(), text.size()), static_cast<ssize_t>(text.size()));
    ::close(file);
}

sample_text_file::~sample_text_file() {
    ::unlink(path_.c_str());
}

interface_driver& put_replay_services(machine& host) {
    put_service(host, "accel", 0x10);
    put_service(host, "gyro", 0x11);
    put_service(host, "compass", 0x04030201);
    put_service(host, "pressure", 0x13);
    interface_driver& service = put_service(host, "NRXApp", 0x51);
    const auto app = std::make_shared<platform::simulated::replay_app>(
        std::vector<platform::simulated::replay_service>{
            {0x10, 28}, {0x11, 28}, {0x04030201, 28}, {0x13, 20}});
    serve_replay(service, app);
    host.add({.name = "client", .unit = make_replay_client(app)}, host.find("NRXApp"));
    return service;
}

int run_replay(lines words) {
    const word_vector all(std::move(words));
    int index = 1;
    nrx::replay_command(all.all()[0], all.all(), index);
    return index - 1;
}

outcome replay(const lines& words, int* taken) {
    int count = 0;
    outcome written = capture([&] { count = run_replay(words); });
    if (taken != nullptr) *taken = count;
    return written;
}

void says(const lines& words, const std::string& out, const std::string& reports) {
    const outcome written = replay(words);
    EXPECT_EQ(written.out, out) << testing::PrintToString(words);
    EXPECT_EQ(written.err, reports) << testing::PrintToString(words);
}

void replay_test::SetUp() {
    device_test::SetUp();
    app = &put_replay_services(host);
}

outcome replay_test::load(std::string_view text, lines further) {
    const sample_text_file file(text);
    further.insert(further.begin(), {"load", file.path()});
    return replay(further, &taken);
}

void replay_test::load_says(std::string_view text, const std::string& out,
                            const std::string& reports) {
    const sample_text_file file(text);
    says({"load", file.path()}, out, reports);
}

void replay_test::answer_with(const byte_list& report) {
    app->set_report_source(0x47, [report](std::size_t, byte_list& reply) {
        reply = report;
        return platform::success;
    });
    app->set_report_sink(0x47, [](platform::byte_view) { return platform::success; });
}

lines replay_test::calls() {
    constexpr std::string_view no_outputs = " results 0 room 0";
    lines made;
    for (; seen_ < host.log().size(); ++seen_) {
        std::string line = host.log()[seen_];
        if (!line.starts_with("call ")) continue;
        if (line.ends_with(no_outputs)) line.resize(line.size() - no_outputs.size());
        made.push_back(line);
    }
    return made;
}

}  // namespace tests
