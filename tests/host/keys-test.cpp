#include "support/bench-phone.h"

#include <cstdlib>
#include <vconf.h>

namespace {

struct Keys : zel_test::BenchPhone {};

TEST_F(Keys, AreKeptWithTheirType) {
    EXPECT_EQ(vconf_set_int("db/a", -7), 0);
    EXPECT_EQ(vconf_set_bool("db/b", 5), 0);
    EXPECT_EQ(vconf_set_str("db/c", "text"), 0);
    EXPECT_EQ(get_int("db/a"), -7);
    EXPECT_EQ(get_bool("db/b"), true);
    EXPECT_EQ(get_string("db/c"), "text");
}

TEST_F(Keys, OfAnotherTypeAreUnreadable) {
    set_int("db/a", 1);
    int value = 99;
    EXPECT_LT(vconf_get_bool("db/a", &value), 0);
    EXPECT_EQ(vconf_get_str("db/a"), nullptr);
    EXPECT_EQ(value, 99);
}

TEST_F(Keys, CanBeReadBackByThePhone) {
    set_string("db/c", "");
    char *text = vconf_get_str("db/c");
    EXPECT_STREQ(text, "");
    std::free(text);
    set_bool("db/b", false);
    int value = 99;
    EXPECT_EQ(vconf_get_bool("db/b", &value), 0);
    EXPECT_EQ(value, 0);
}

TEST_F(Keys, AbsentOnesFailAndLeaveTheOutput) {
    int value = 99;
    EXPECT_LT(vconf_get_int("db/none", &value), 0);
    EXPECT_EQ(value, 99);
    EXPECT_EQ(vconf_get_str("db/none"), nullptr);
}

TEST_F(Keys, FailByInjectedFaultFromTheCallNamed) {
    fail("vconf_set_int", "db/a", 2, 1, -5);
    EXPECT_EQ(vconf_set_int("db/a", 1), 0);
    EXPECT_EQ(vconf_set_int("db/b", 1), 0);
    EXPECT_EQ(vconf_set_int("db/a", 2), -5);
    EXPECT_EQ(get_int("db/a"), 1);
    EXPECT_EQ(vconf_set_int("db/a", 3), 0);
    EXPECT_EQ(get_int("db/a"), 3);
}

TEST_F(Keys, OfSlotsAreThereFromTheStart) {
    EXPECT_EQ(get_int("memory/telephony/sim_slot_count"), 1);
    EXPECT_EQ(get_int("memory/telephony/sim_slot"), 0);
    EXPECT_EQ(get_int("memory/telephony/sim_slot2"), std::nullopt);
}

} // namespace
