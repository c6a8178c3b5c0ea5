// Sixteen bytes at once as this machine searches them, and as any other one does, against a search
// byte by byte.
#include "nrxctl/base/sixteen_bytes.h"

#include <algorithm>
#include <array>
#include <random>
#include <string>

#include <gtest/gtest.h>

namespace {

using text = std::array<char, nrx::sixteen_bytes::size>;

template <class Holds>
std::uint32_t bits_where(const Holds& holds) {
    std::uint32_t bits = 0;
    for (std::size_t i = 0; i < nrx::sixteen_bytes::size; ++i)
        bits |= std::uint32_t{holds(i)} << i;
    return bits;
}

template <class SixteenBytes>
void compare(const text& one, const text& other) {
    const SixteenBytes bytes(one.data());
    EXPECT_EQ(bytes.equal(SixteenBytes(other.data())),
              bits_where([&](std::size_t i) { return one[i] == other[i]; }));
    EXPECT_EQ(bytes.find(other[0], other[7], other[15]), bits_where([&](std::size_t i) {
                  return one[i] == other[0] || one[i] == other[7] || one[i] == other[15];
              }));
}

TEST(sixteen_bytes, find_what_a_search_byte_by_byte_finds) {
    std::mt19937 random(1);
    const auto any_byte = [&] { return static_cast<char>(random()); };
    const std::string edges("\x00\x01\x7f\x80\xfe\xff", 6);
    for (int round = 0; round < 2000 && !HasFailure(); ++round) {
        // Few values, so that they meet their like.
        const std::string values =
            round % 2 == 0 ? edges : std::string{any_byte(), any_byte(), any_byte()};
        const auto any = [&] { return values[random() % values.size()]; };
        text one;
        text other;
        std::generate(one.begin(), one.end(), any);
        std::generate(other.begin(), other.end(), any);
        compare<nrx::sixteen_bytes>(one, other);
        compare<nrx::sixteen_bytes_in_halves>(one, other);
    }
}

}  // namespace
