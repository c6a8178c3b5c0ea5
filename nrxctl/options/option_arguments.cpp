#include "nrxctl/options/option_arguments.h"

#include <optional>
#include <utility>

#include "nrxctl/base/explanation.h"
#include "nrxctl/nrxtoollib.h"
#include "nrxctl/options/messages.h"

namespace nrx::nrxctl {

namespace {

// Holds back what is written while it exists.
class held_output {
public:
    // Writes it on the streams that it was meant for.
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
    check_use();
    count_ = count;
    count_unused_ = true;
}

void option_settings::set_format(reply_format format, std::string_view option) {
    check_use();
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
            "--count must stand before --events, --scm, --spi-status or a run or monitor of "
            "--profile"};
    if (!unused_format_.empty())
        throw usage_error{
            std::string(unused_format_)
                .append(" must stand before --report, --command, --get-property or --hid-driver")};
}

std::string_view option_arguments::next() {
    return arguments_[static_cast<std::size_t>(index_++)];
}

std::uint32_t option_arguments::next_number(std::uint32_t max, std::string_view what) {
    const std::string_view argument = next();
    if (const auto number = read_number_up_to(max, argument)) return *number;
    throw usage_error{quoted(argument)
                          .append(" is not ")
                          .append(what)
                          .append("; expected a number from 0 to ")
                          .append(std::to_string(max))};
}

std::vector<std::uint8_t> option_arguments::required_payload() {
    auto payload = this->payload();
    if (payload.empty()) throw usage_error{"a value is missing"};
    return payload;
}

std::vector<std::uint8_t> option_arguments::payload() {
    std::vector<std::uint8_t> payload;
    parse_payload(arguments_, index_, payload);
    if (!at_end())
        throw usage_error{quoted(next()).append(" is no value; none begins with a minus sign")};
    return payload;
}

option_action option_arguments::family_action(const command_family& family) {
    const std::string_view first = next();
    const int begin = index_;
    explanation_list explanations;
    held_output held;
    auto result = arguments_check::refused;
    run_to_completion([&] { result = family.check(first, arguments_, index_); });
    if (result == arguments_check::misused) throw usage_error{joined(explanations.take())};
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
