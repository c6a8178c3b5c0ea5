// A virtual host: its registry, its open objects, and its log of platform calls.
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
#include "platform/virtual/entry.h"
#include "platform/virtual/event_loop.h"
#include "platform/virtual/handle_table.h"
#include "platform/virtual/hid_sources.h"
#include "platform/virtual/interrupts.h"
#include "platform/virtual/machine_clock.h"
#include "platform/virtual/return_codes.h"

namespace platform::simulated {

// Lives from the start to the end of a platform call. The end of the call is a safe point: it
// serves a pending interrupt.
class call_scope {
public:
    explicit call_scope(std::optional<failure> injected) : injected_(injected) {}
    ~call_scope() { serve_interrupt(); }
    call_scope(const call_scope&) = delete;
    call_scope& operator=(const call_scope&) = delete;
    call_scope(call_scope&&) = delete;
    call_scope& operator=(call_scope&&) = delete;

    // Returns true if a failure was injected into the call. Not for a temporary, which would end
    // before the call does.
    [[nodiscard]] bool fails() const& { return injected_.has_value(); }
    [[nodiscard]] bool fails() const&& = delete;

    // The code that a failing call returns; success if its result is merely empty.
    [[nodiscard]] return_code code() const { return code_of(*injected_); }
    [[nodiscard]] bool has_empty_result() const { return injected_ == failure::empty_result; }

private:
    std::optional<failure> injected_;
};

class machine {
public:
    // Adds an entry to the registry, as a child of parent if one is given, and returns it. Its
    // classes must not change afterwards.
    entry_ref add(entry description, const entry_ref& parent = nullptr);

    // The first present entry with a registry name; null if there is none.
    [[nodiscard]] entry_ref find(std::string_view name) const;

    // Removes a service and everything attached to it, as when its driver terminates. Lookups no
    // longer return it, and calls on objects that are open on it fail with not_found.
    void remove(std::string_view name);

    // All entries in registration order, including those that are gone.
    [[nodiscard]] const std::vector<entry_ref>& entries() const { return entries_; }

    // The entries of a class or of a class derived from it.
    [[nodiscard]] const std::vector<entry_ref>& entries_of_class(std::string_view name) const;

    // The time at which the host booted; nullopt until it is set.
    void set_boot_time(calendar_instant boot_time) { boot_time_ = boot_time; }
    [[nodiscard]] std::optional<calendar_instant> boot_time() const { return boot_time_; }

    // What answers, for people.
    void set_description(std::string description) { description_ = std::move(description); }
    [[nodiscard]] const std::string& description() const { return description_; }

    // The HID event system; empty until it is set.
    void set_hid_events(hid_event_source_factory factory) { hid_events_ = std::move(factory); }
    [[nodiscard]] const hid_event_source_factory& hid_events() const { return hid_events_; }

    // --- open objects ---

    // Adds an object and returns its handle.
    handle_id open_object(handle_table::object added) { return handles_.insert(std::move(added)); }

    // The object of the given type of a handle; null if there is none. The pointer is valid
    // until an object is opened or released.
    template <class Object>
    [[nodiscard]] Object* find_object(handle_id id) {
        return handles_.find<Object>(id);
    }

    // The entry of such an object; null if there is no such object.
    template <class Object>
    [[nodiscard]] entry_ref provider(handle_id id) {
        const Object* object = find_object<Object>(id);
        return object == nullptr ? nullptr : object->provider;
    }

    // Removes an object from the table and from the event loop.
    void release_object(handle_id id);

    // Number of handles, plus the number of HID devices that are open, including devices whose
    // handle was released before they were closed.
    [[nodiscard]] std::size_t open_handles() const { return handles_.open_count(); }

    machine_clock& clock() { return clock_; }

    // The event loop of the thread.
    event_loop& loop() { return loop_; }

    // --- platform calls ---

    // Every platform call that can fail begins here: it is counted and logged with the text that
    // describe_call returns. The caller keeps the result until the call ends.
    template <class Describe>
    [[nodiscard]] call_scope begin_call(Describe describe_call) {
        if (recording_) log_.push_back(describe_call());
        return call_scope(count_call());
    }

    // Logs an event that is not a call itself, such as the release of a handle.
    template <class Describe>
    void log_event(Describe describe_event) {
        if (recording_) log_.push_back(describe_event());
    }

    // Starts recording the log.
    void record_calls() { recording_ = true; }
    [[nodiscard]] const std::vector<std::string>& log() const { return log_; }
    [[nodiscard]] std::size_t calls_made() const { return calls_made_; }

    // Makes the n-th platform call from now fail; 1 is the next call.
    void fail_call(std::size_t n, failure kind);

    // Runs an action just before the n-th platform call from now. The action may add further
    // actions and failures.
    void before_call(std::size_t n, std::function<void()> action);

private:
    // Runs the actions of the next call and returns its failure, if one was injected.
    std::optional<failure> count_call();

    struct injected_failure {
        std::size_t call;
        failure kind;
    };
    struct injected_action {
        std::size_t call;
        std::function<void()> run;
    };

    std::vector<entry_ref> entries_;
    std::map<std::string, std::vector<entry_ref>, std::less<>> by_class_;
    std::optional<calendar_instant> boot_time_;
    std::string description_ = "virtual NRX";
    hid_event_source_factory hid_events_;
    handle_table handles_;
    machine_clock clock_;
    event_loop loop_;
    std::vector<std::string> log_;
    bool recording_ = false;
    std::size_t calls_made_ = 0;
    std::vector<injected_failure> failures_;
    std::vector<injected_action> actions_;
};

}  // namespace platform::simulated
