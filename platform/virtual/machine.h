// A virtual host: its registry, what it has lent out, and what it was asked.
#pragma once

#include <functional>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/clock.h"
#include "platform/handle.h"
#include "platform/virtual/begun_call.h"
#include "platform/virtual/entry.h"
#include "platform/virtual/event_loop.h"
#include "platform/virtual/failure.h"
#include "platform/virtual/handle_table.h"
#include "platform/virtual/hid_event_source.h"
#include "platform/virtual/machine_clock.h"

namespace platform::simulated {

class machine {
public:
    // Registers an entry, as a child of parent if one is given, and returns it. Its classes do not
    // change any more.
    entry_ref add(entry described, const entry_ref& parent = nullptr);

    // The first present entry with a registry name; null if there is none.
    [[nodiscard]] entry_ref find(std::string_view name) const;

    // Takes a service away with all that is attached to it, as when its driver goes down: look-ups
    // no longer see it, and what is open on it fails with not_found.
    void remove(std::string_view name);

    // All entries in registration order, those that are gone included.
    [[nodiscard]] const std::vector<entry_ref>& entries() const { return entries_; }

    // Those of a class, or of a class derived from it.
    [[nodiscard]] const std::vector<entry_ref>& entries_of_class(std::string_view name) const;

    // When the host was started; none, at first, if it does not tell.
    void set_boot_time(calendar_instant booted) { boot_time_ = booted; }
    [[nodiscard]] std::optional<calendar_instant> boot_time() const { return boot_time_; }

    // The HID event system; none at first.
    void set_hid_events(hid_event_system events) { hid_events_ = std::move(events); }
    [[nodiscard]] const hid_event_system& hid_events() const { return hid_events_; }

    // --- what is lent out ---

    // Lends an object out; its handle.
    handle_id lend(handle_table::object lent) { return handles_.lend(std::move(lent)); }

    // The object of a kind behind a handle, until the next change of what is lent out; null if
    // there is none.
    template <class Kind>
    [[nodiscard]] Kind* lent(handle_id id) {
        return handles_.find<Kind>(id);
    }

    // The entry of such an object; null if there is none.
    template <class Kind>
    [[nodiscard]] entry_ref provider(handle_id id) {
        const Kind* object = lent<Kind>(id);
        return object == nullptr ? nullptr : object->provider;
    }

    // Takes a handle back, of whichever kind, and its object off the event loop.
    void take_back(handle_id id);

    // How many handles of all kinds are out, and HID devices still open, those included whose
    // object was released before it was closed.
    [[nodiscard]] std::size_t open_handles() const { return handles_.still_open(); }

    machine_clock& clock() { return clock_; }

    // The event loop of the thread.
    event_loop& loop() { return loop_; }

    // --- what was asked ---

    // Every platform call that can fail starts here: it is counted and logged in the words that
    // describe_call gives. Returns how the call is to fail, if it is, to be kept until its end.
    template <class Describe>
    [[nodiscard]] begun_call begin_call(Describe describe_call) {
        if (recording_) log_.push_back(describe_call());
        return begun_call(count_call());
    }

    // Logs an event that is no call of its own (a connection closed).
    template <class Describe>
    void note(Describe describe_event) {
        if (recording_) log_.push_back(describe_event());
    }

    // Turns the log on; it is off at first.
    void record_calls() { recording_ = true; }
    [[nodiscard]] const std::vector<std::string>& log() const { return log_; }
    [[nodiscard]] std::size_t calls_made() const { return calls_made_; }

    // Makes the n-th platform call from now (1 is the next) fail.
    void fail_call(std::size_t n, failure how);

    // Runs an action just before the n-th platform call from now; it may plan further ones.
    void before_call(std::size_t n, std::function<void()> action);

private:
    std::optional<failure> count_call();

    struct planned_failure {
        std::size_t call;
        failure how;
    };
    struct planned_action {
        std::size_t call;
        std::function<void()> run;
    };

    std::vector<entry_ref> entries_;
    std::map<std::string, std::vector<entry_ref>, std::less<>> by_class_;
    std::optional<calendar_instant> boot_time_;
    hid_event_system hid_events_;
    handle_table handles_;
    machine_clock clock_;
    event_loop loop_;
    std::vector<std::string> log_;
    bool recording_ = false;
    std::size_t calls_made_ = 0;
    std::vector<planned_failure> failures_;
    std::vector<planned_action> actions_;
};

}  // namespace platform::simulated
