#include "platform/virtual/listeners.h"

#include <variant>

namespace platform::simulated {

namespace {

// A callback may replace itself: it is kept until its end.
template <class Callback, class... Arguments>
void call(Callback callback, const Arguments&... arguments) {
    if (callback) callback(arguments...);
}

}  // namespace

void record_listener::call_back() {
    const auto record = provider->records->take_record();
    call(on_record, byte_view(record));
}

void event_listener::call_back() {
    const hid_news news = source_->take_news();
    if (const auto* event = std::get_if<hid_event>(&news)) call(on_event, *event);
    if (std::holds_alternative<hid_reset>(news)) call(on_reset);
    if (const auto* update = std::get_if<statistics_update>(&news)) {
        call(on_statistics, byte_view(*update));
    }
}

}  // namespace platform::simulated
