#include <array>
#include <optional>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/profile_records.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/base/word_table.h"
#include "nrxctl/decoders/record_text.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "nrxctl/profiler/subcommands.h"

namespace nrx::profile {

namespace {

// What the words of "get-logs" ask for.
struct log_choice {
    bool firmware = false;
    bool errors = false;
    bool human = false;
};

struct choice_word {
    std::string_view word;
    bool log_choice::*chosen;
};

constexpr std::array choice_words{
    choice_word{"errdump", &log_choice::errors},
    choice_word{"fwdump", &log_choice::firmware},
    choice_word{"human", &log_choice::human},
};

std::optional<log_choice> choose_logs(argument_words& words) {
    log_choice choice;
    while (const auto word = words.take()) {
        const choice_word* known = find_word_row(choice_words, *word);
        if (known == nullptr) return std::nullopt;
        choice.*(known->chosen) = true;
    }
    return choice;
}

struct action_word {
    std::string_view word;
    error_action action;
};

constexpr std::array action_words{
    action_word{"panic", error_action::panic},
    action_word{"nothing", error_action::nothing},
};

}  // namespace

void signal_error_dump(argument_words& /*words*/) {
    make_error_dump();
}

void show_logs(argument_words& words) {
    const auto choice = choose_logs(words);
    if (!choice) {
        print_line("Invalid parameter");
        check(false, "false");
        return;
    }
    const record_printer print = select_record_printer(choice->human);
    if (choice->firmware || !choice->errors) {
        read_profile_records(print);
        read_profiler_log(print);
        print_line("\n");
    }
    if (choice->errors) {
        print_line("errdump");
        read_profiler_log(print, stored_records::error_dump);
        print_line("\n");
    }
}

// A word that is missing is as invalid as any other.
void set_action_on_error(argument_words& words) {
    const std::string_view word = words.take().value_or("");
    const action_word* known = find_word_row(action_words, word);
    if (known == nullptr) {
        print_line(text_line().text("invalid argument: ").text(word).view());
        return;
    }
    const platform::return_code kr = nrx::set_error_action(known->action);
    check_success(kr, "kr == 0 ");
}

}  // namespace nrx::profile
