#include "tests/support/hid_host.h"

namespace tests {

namespace {

class scripted_events final : public platform::simulated::hid_event_source {
public:
    explicit scripted_events(scripted_notifications notifications)
        : notifications_(std::move(notifications)) {}

    [[nodiscard]] std::optional<clock_time> next_due() const override {
        return notifications_.empty() ? std::nullopt : std::optional(notifications_.front().first);
    }
    platform::simulated::hid_notification pop_notification() override {
        auto first = std::move(notifications_.front().second);
        notifications_.pop_front();
        return first;
    }

private:
    scripted_notifications notifications_;
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

void set_hid_events_script(machine& host, scripted_notifications notifications) {
    host.set_hid_events([notifications = std::move(notifications)] {
        return std::make_unique<scripted_events>(notifications);
    });
}

}  // namespace tests
