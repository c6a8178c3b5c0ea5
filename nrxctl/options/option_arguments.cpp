#include "nrxctl/options/option_arguments.h"

#include <optional>
#include <utility>

#include "nrxctl/nrxtoollib.h"
#include "nrxctl/options/messages.h"

namespace nrx::nrxctl {

namespace {

// Holds back what is written while it exists.
class held_output {
public:
    // Writes it on the streams that it was meant for, standard output first.
    void release() {
        installed_output_.reset();
        installed_error_.reset();
        write_output(output_.text());
        write_error(error_.text());
    }

private:
    memory_sink output_;
    memory_sink error_;
    std::optional<scoped_sink> installed_output_{std::in_place, standard_stream::output, output_};
    std::optional<scoped_sink> installed_error_{std::in_place, standard_stream::error, error_};
};

std::string joined(const std::vector<std::string>& texts) {
    std::string lines;
    for (const std::string& text : texts)
        lines.append(lines.empty() ? "" : "\n").append(text);
    return lines;
}

}  // namespace

void option_settings::set_count(std::uint32_t count) {
    count_ = count;
    count_unused_ = true;
}

void option_settings::set_format(reply_format format, std::string_view option) {
    format_ = format;
    unused_format_ = option;
}

std::optional<std::uint32_t> option_settings::use_count() {
    count_unused_ = false;
    return count_;
}

reply_format option_settings::use_format() {
    unused_format_ = {};
    return format_;
}

void option_settings::check_use() const {
    if (count_unused_)
        throw usage_error{
            "--count must come before --events, --scm, --spi-status or a run or monitor of "
            "--profile"};
    if (!unused_format_.empty())
        throw usage_error{
            std::string(unused_format_)
                .append(" must come before --report, --command, --get-property or --hid-driver")};
}

std::string_view option_arguments::next() {
    return arguments_[static_cast<std::size_t>(index_++)];
}

std::uint32_t option_arguments::next_number(number_range range, std::string_view kind) {
    const std::string_view argument = next();
    const auto number = read_number_up_to(range.max, argument);
    if (number && *number >= range.min) return *number;
    throw usage_error{quoted(argument)
                          .append(" is not ")
                          .append(kind)
                          .append("; expected a number from ")
                          .append(std::to_string(range.min))
                          .append(" to ")
                          .append(std::to_string(range.max))};
}

std::vector<std::uint8_t> option_arguments::payload() {
    const bool has_argument = !at_end();
    std::vector<std::uint8_t> payload;
    parse_payload(arguments_, index_, payload);
    if (has_argument && at_end() && payload.empty()) throw usage_error{"a value is missing"};
    if (!at_end())
        throw usage_error{quoted(next()).append(" is not a value; values cannot be negative")};
    return payload;
}

option_action option_arguments::family_action(const command_family& family) {
    const std::string_view first = next();
    const int begin = index_;
    explanation_list explanations;
    held_output held;
    auto result = arguments_check::refused;  // also if the check ends the process
    run_to_completion([&] { result = family.check(first, arguments_, index_); });
    if (result == arguments_check::usage_error) throw usage_error{joined(explanations.take())};
    if (result == arguments_check::refused) {
        held.release();
        print_explanations(explanations);
        end_process();
    }
    index_ = static_cast<int>(arguments_.size());
    return [=, run = family.run, arguments = arguments_] {
        int index = begin;
        run(first, arguments, index);
    };
}

}  // namespace nrx::nrxctl
