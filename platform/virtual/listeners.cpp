#include "platform/virtual/listeners.h"

#include <variant>

namespace platform::simulated {

namespace {

// Takes a copy of the callback, because it may replace itself while it runs.
template <class Callback, class... Arguments>
void call(Callback callback, const Arguments&... arguments) {
    if (callback) callback(arguments...);
}

}  // namespace

void record_listener::call_back() {
    const auto record = provider->records->pop_record();
    call(on_record, byte_view(record));
}

void event_listener::call_back() {
    const hid_notification notification = source_->pop_notification();
    if (const auto* event = std::get_if<hid_event>(&notification)) call(on_event, *event);
    if (std::holds_alternative<hid_reset>(notification)) call(on_reset);
    if (const auto* update = std::get_if<statistics_update>(&notification)) {
        call(on_statistics, byte_view(*update));
    }
}

}  // namespace platform::simulated
