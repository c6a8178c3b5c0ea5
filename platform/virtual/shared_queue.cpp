#include "platform/virtual/shared_queue.h"

namespace platform::simulated {

void shared_queue::add(byte_view entry) {
    // What was taken makes room again before there is more of it than of what is left.
    if (first_ > bytes_.size() / 2) {
        bytes_.erase(bytes_.begin(), bytes_.begin() + static_cast<std::ptrdiff_t>(first_));
        first_ = 0;
    }
    bytes_.insert(bytes_.end(), entry.begin(), entry.end());
    sizes_.push_back(entry.size());
}

void shared_queue::drop_first() {
    first_ += sizes_.front();
    sizes_.pop_front();
}

void shared_queue::clear() {
    bytes_.clear();
    first_ = 0;
    sizes_.clear();
}

}  // namespace platform::simulated
