#include "tests/support/hid_host.h"

namespace tests {

namespace {

class scripted_events final : public platform::simulated::hid_event_source {
public:
    explicit scripted_events(scripted_notifications news) : news_(std::move(news)) {}

    [[nodiscard]] std::optional<clock_time> next_due() const override {
        return news_.empty() ? std::nullopt : std::optional(news_.front().first);
    }
    platform::simulated::hid_notification pop_notification() override {
        auto first = std::move(news_.front().second);
        news_.pop_front();
        return first;
    }

private:
    scripted_notifications news_;
};

}  // namespace

std::optional<clock_time> scripted_records::next_due() const {
    const bool is_on = !modes.empty() && modes.back().second != 0;
    return is_on && !script.empty() ? std::optional(script.front().first) : std::nullopt;
}

byte_list scripted_records::pop_record() {
    byte_list first = std::move(script.front().second);
    script.pop_front();
    return first;
}

scripted_records& add_hid_device(machine& host, std::string_view name, std::int32_t location) {
    auto records = std::make_shared<scripted_records>();
    host.add({.name = std::string(name),
              .classes = {"KeltoNRXHIDDevice"},
              .properties = {{"LocationID", location}},
              .hid = std::make_shared<platform::simulated::virtual_hid_device>(),
              .records = records});
    return *records;
}

void set_hid_events_script(machine& host, scripted_notifications news) {
    host.set_hid_events(
        [news = std::move(news)] { return std::make_unique<scripted_events>(news); });
}

}  // namespace tests
