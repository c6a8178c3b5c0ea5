// Clients of the virtual host that call back from the event loop.
#pragma once

#include <functional>
#include <memory>
#include <utility>

#include "platform/bytes.h"
#include "platform/virtual/entry.h"
#include "platform/virtual/event_loop.h"
#include "platform/virtual/hid_sources.h"

namespace platform::simulated {

// A HID device interface. Delivers the records of its device.
class record_listener final : public loop_source {
public:
    explicit record_listener(entry_ref device) : provider(std::move(device)) {}

    [[nodiscard]] std::optional<machine_clock::time> next_due() const override {
        return provider->present ? provider->records->next_due() : std::nullopt;
    }
    void call_back() override;

    const entry_ref provider;
    std::function<void(byte_view)> on_record;
};

// A client of the HID event system. Delivers the notifications of its source.
class event_listener final : public loop_source {
public:
    explicit event_listener(std::unique_ptr<hid_event_source> source)
        : source_(std::move(source)) {}

    [[nodiscard]] std::optional<machine_clock::time> next_due() const override {
        return source_->next_due();
    }
    void call_back() override;

    std::function<void(const hid_event&)> on_event;
    std::function<void()> on_reset;
    std::function<void(byte_view)> on_statistics;

private:
    const std::unique_ptr<hid_event_source> source_;
};

}  // namespace platform::simulated
