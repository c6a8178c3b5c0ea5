#include "nrxctl/profiler/config_printer.h"
#include "nrxctl/profiler/profiler_config.h"
#include "tests/profiler/profiler_host.h"

namespace tests {

using nrx::profiler_config;
using nrx::profiler_state;

namespace {

const byte_list example_record = joined({
    words_of({0x0a, 0x04030201, 1, 0x08070605}),
    {'a', 'l', 'l', 0, 's', 'e', 'n', 's', 'x', 0, 0, 0},
    words_of({4, 5, 6, 7, 8}),
    words_of({0}),
});

}  // namespace

TEST(config_record, is_52_whole_bytes_with_every_field_in_its_place) {
    const auto read = nrx::decode_configs(example_record);
    ASSERT_EQ(read.size(), 1U);
    EXPECT_EQ(read[0].profiler, 0x0aU);
    EXPECT_EQ(read[0].component, 0x04030201U);
    EXPECT_EQ(read[0].state, profiler_state::disable);
    EXPECT_EQ(read[0].reports, 0x08070605U);
    const std::array<std::uint32_t, 8> services{0x006c6c61, 0x736e6573, 0x78, 4, 5, 6, 7, 8};
    EXPECT_EQ(read[0].services, services);
    EXPECT_EQ(nrx::encode_configs(read), example_record);
    byte_list two = joined({example_record, example_record});
    EXPECT_EQ(nrx::decode_configs(two).size(), 2U);
    two.pop_back();
    EXPECT_EQ(nrx::decode_configs(two).size(), 1U);
}

TEST(config_record, prints_as_a_line) {
    constexpr auto unknown_state = static_cast<profiler_state>(3);
    const rows<profiler_config, std::string> cases{
        {profiler_config{.profiler = 2, .component = 1, .reports = 0x5},
         "    profiler sensor     is enabled [component=gyro, reports=5]\n"},
        {profiler_config{
             .profiler = 2, .component = 9, .state = profiler_state::disable, .reports = 0},
         "    profiler sensor     is disabled [component=9, reports=0]\n"},
        {profiler_config{.profiler = 10, .state = profiler_state::stop},
         "    profiler wake       is stopd [component=, reports=ffffffff]\n"},
        {profiler_config{.profiler = 5, .state = unknown_state, .reports = 0xffff},
         "    profiler interrupt  is unknownd [component=gpio, reports=ffff]\n"},
        {profiler_config{.profiler = 7, .component = 3},
         "    profiler 7          is enabled [component=3, reports=ffffffff]\n"},
        {profiler_config{.profiler = 8, .component = 2},
         "    profiler control    is enabled [component=2, reports=ffffffff]\n"},
        {profiler_config{.profiler = 4294967295, .component = 4294967295},
         "    profiler 4294967295 is enabled [component=4294967295, reports=ffffffff]\n"},
        {profiler_config{.profiler = 0, .component = 3, .reports = 0x1f, .services = {0x006c6c61}},
         "    profiler exec       is enabled [component=command, reports=1f services= all]\n"},
        {profiler_config{.profiler = 0, .component = 4, .services = {0x736e6573, 0x62, 0, 0x63}},
         "    profiler exec       is enabled [component=extfunction, reports=ffffffff services= "
         "sens b]\n"},
        {profiler_config{.profiler = 0, .component = 2, .services = {0x61}},
         "    profiler exec       is enabled [component=workloop, reports=ffffffff]\n"},
        {profiler_config{.profiler = 1, .component = 4},
         "    profiler trace      is enabled [component=4, reports=ffffffff services=]\n"},
        {profiler_config{.profiler = 1, .component = 3, .services = {0x62006100, 0x61}},
         "    profiler trace      is enabled [component=interrupt, reports=ffffffff services=  "
         "a]\n"},
    };
    for (const auto& row : cases) {
        EXPECT_EQ(capture([&] { nrx::print_profiler_config(std::get<0>(row)); }).out,
                  std::get<1>(row));
    }
}

}  // namespace tests
