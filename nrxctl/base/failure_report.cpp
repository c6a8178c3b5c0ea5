#include "nrxctl/base/failure_report.h"

#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

const char* text_or_empty(const char* text) {
    return text == nullptr ? "" : text;
}

std::uint64_t failures = 0;

void append_part(text_line& report, const char* part) {
    if (part != nullptr) report.text(part).text(" ");
}

}  // namespace

void report_failure(const char* label, const char* condition, const char* exit_label,
                    const char* message, const char* file, int line, platform::return_code code) {
    count_failure();
    text_line report;
    report.text("Assertion failed: ").text(text_or_empty(label)).text(": ");
    if (condition != nullptr) report.text("Check failed: ");
    append_part(report, condition);
    append_part(report, exit_label);
    append_part(report, message);
    if (file != nullptr && line != 0) report.text(file).text(":").number(line);
    if (code != platform::success) {
        report.text(" ").text(platform::return_code_text(code));
        report.text(" (0x").hex(static_cast<std::uint32_t>(code)).text(")");
    }
    write_error(report.text("\n").view());
}

void print_failure(std::string_view line) {
    count_failure();
    print_line(line);
}

void count_failure() {
    ++failures;
}

std::uint64_t failure_count() {
    return failures;
}

bool check_as(const char* label, bool holds, const char* condition, platform::return_code code,
              source_location location) {
    if (!holds)
        report_failure(label, condition, "bail", nullptr, location.file, location.line, code);
    return holds;
}

}  // namespace nrx
