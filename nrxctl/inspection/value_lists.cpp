#include "nrxctl/inspection/value_lists.h"

#include "nrxctl/base/fixed_point.h"

namespace nrx {

namespace {

constexpr std::size_t number_size = sizeof(std::int32_t);
constexpr std::size_t row_size = 3 * number_size;

void append_fraction(text_line& line, const sensor_reply& reply, std::size_t offset) {
    constexpr int digits = 6;
    line.fixed(reply.s32(offset) / fixed_point_one, digits);
}

}  // namespace

void append_fractions(text_line& line, const sensor_reply& reply, std::size_t offset) {
    append_fraction(line, reply, offset);
    append_fraction(line.text(" "), reply, offset + number_size);
    append_fraction(line.text(" "), reply, offset + 2 * number_size);
}

void append_matrix(text_line& line, const sensor_reply& reply) {
    append_fractions(line, reply, 0);
    append_fractions(line.text(" | "), reply, row_size);
    append_fractions(line.text(" | "), reply, 2 * row_size);
}

void append_numbers(text_line& line, const sensor_reply& reply) {
    for (std::size_t i = 0; i < reply.count_of_words(); ++i) {
        line.number(reply.s32(i * number_size)).text(" ");
    }
}

}  // namespace nrx
