#include "main-settings-rows.h"
#include "setting-groups.h"

namespace zel_test {

INSTANTIATE_TEST_SUITE_P(Main, WordSetting, testing::ValuesIn(kExpectedSettings), word_setting_name);

// Every row with a key is tested: by the words above or, for these, on its own.
TEST(MainSettings, EveryRowHasItsTests) {
    std::set<ZelSvcElementId> tested{ZEL_SVC_ELEMENT_RNG_VOLUME, ZEL_SVC_ELEMENT_MSG_TONE_VOLUME,
                                     ZEL_SVC_ELEMENT_KEY_VOLUME};
    for (const ExpectedSetting &setting : kExpectedSettings)
        tested.insert(setting.element);
    EXPECT_EQ(elements_with_keys({zel_svc_main_settings(), zel_svc_network_settings()}), tested);
}

} // namespace zel_test
