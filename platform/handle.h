// The shape of every object that the host lends to the tool.
#pragma once

#include <cstdint>
#include <utility>

namespace platform {

// How the host numbers the objects that it lends out; 0 is none.
using handle_id = std::uint32_t;

// A move-only owner of one host object. Kind::release(id) gives the object back; it never fails.
template <class Kind>
class handle {
public:
    handle() = default;
    explicit handle(handle_id id) : id_(id) {}
    handle(handle&& other) noexcept : id_(std::exchange(other.id_, 0)) {}
    handle& operator=(handle&& other) noexcept {
        if (this != &other) {
            reset();
            id_ = std::exchange(other.id_, 0);
        }
        return *this;
    }
    handle(const handle&) = delete;
    handle& operator=(const handle&) = delete;
    ~handle() { reset(); }

    // Whether there is an object.
    explicit operator bool() const { return id_ != 0; }

    [[nodiscard]] handle_id id() const { return id_; }

    // Gives the object back now.
    void reset() {
        if (id_ != 0) Kind::release(std::exchange(id_, 0));
    }

private:
    handle_id id_ = 0;
};

}  // namespace platform
