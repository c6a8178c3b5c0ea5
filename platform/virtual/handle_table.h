// The objects of one kind that are lent out.
#pragma once

#include <algorithm>
#include <cstddef>
#include <utility>
#include <vector>

#include "platform/handle.h"

namespace platform::simulated {

// A program holds few objects at once, and gives back first what it took last; so they stand in a
// row, looked for from the end. Lending and taking back in turn allocates nothing.
template <class Object>
class handle_table {
public:
    // Lends an object out under a number that no object of this kind has, and returns the number.
    handle_id lend(handle_id id, Object object) {
        lent_.push_back({id, std::move(object)});
        return id;
    }

    // The object with that number, until the next change of the table; null if there is none.
    [[nodiscard]] const Object* find(handle_id id) const {
        const auto found = std::find_if(lent_.rbegin(), lent_.rend(),
                                        [&](const one_lent& one) { return one.id == id; });
        return found == lent_.rend() ? nullptr : &found->object;
    }
    [[nodiscard]] Object* find(handle_id id) {
        return const_cast<Object*>(std::as_const(*this).find(id));
    }

    // Takes the object with that number back, if there is one.
    void take_back(handle_id id) {
        std::erase_if(lent_, [&](const one_lent& one) { return one.id == id; });
    }

    [[nodiscard]] std::size_t size() const { return lent_.size(); }

    template <class Predicate>
    [[nodiscard]] std::size_t count_if(Predicate holds) const {
        return static_cast<std::size_t>(std::count_if(
            lent_.begin(), lent_.end(), [&](const one_lent& one) { return holds(one.object); }));
    }

private:
    struct one_lent {
        handle_id id;
        Object object;
    };

    std::vector<one_lent> lent_;
};

}  // namespace platform::simulated
