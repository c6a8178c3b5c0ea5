#include "nrxctl/options/messages.h"

#include <unistd.h>

#include "platform/host.h"

namespace nrx::nrxctl {

namespace {

bool error_is_terminal() {
    return ::isatty(STDERR_FILENO) != 0;
}

}  // namespace

std::string host_line() {
    return "host: " + platform::host_description();
}

void print_message(std::string_view text) {
    write_error(text_line().text("nrxctl: ").text(text).text("\n").view());
}

void print_explanations(explanation_list& explanations) {
    for (const std::string& text : explanations.take())
        print_message(text);
}

void announce_host() {
    if (error_is_terminal()) print_message(host_line());
}

void echo_payload(std::string_view target, platform::byte_view payload) {
    if (payload.empty() || !error_is_terminal()) return;
    memory_sink dump;
    {
        const scoped_sink installed(standard_stream::output, dump);
        hex_dump(payload);
    }
    text_line line;
    line.text("writing ").number(payload.size()).text(payload.size() == 1 ? " byte" : " bytes");
    print_message(line.text(" to ").text(target).text(":").view());
    write_error(dump.text());
}

}  // namespace nrx::nrxctl
