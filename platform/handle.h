// Owning handles of host objects.
#pragma once

#include <cstdint>
#include <utility>

namespace platform {

// Identifies an object that is open on the host; 0 means no object.
using handle_id = std::uint32_t;

// Move-only owner of a host object. The destructor releases the object through Kind::release, which
// never fails.
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

    // Returns true if the handle owns an object.
    explicit operator bool() const { return id_ != 0; }

    [[nodiscard]] handle_id id() const { return id_; }

    // Releases the object now.
    void reset() {
        if (id_ != 0) Kind::release(std::exchange(id_, 0));
    }

private:
    handle_id id_ = 0;
};

}  // namespace platform
