#include "group-settings-rows.h"
#include "setting-groups.h"

#include <gmock/gmock.h>

namespace zel_test {

INSTANTIATE_TEST_SUITE_P(Personal, WordSetting, testing::ValuesIn(kExpectedPersonal), word_setting_name);
INSTANTIATE_TEST_SUITE_P(Browser, WordSetting, testing::ValuesIn(kExpectedBrowser), word_setting_name);
INSTANTIATE_TEST_SUITE_P(Sms, WordSetting, testing::ValuesIn(kExpectedSms), word_setting_name);
INSTANTIATE_TEST_SUITE_P(Mms, WordSetting, testing::ValuesIn(kExpectedMms), word_setting_name);

// Every row with a key is tested: by the words above or, for these, as a number.
TEST(PersonalSettings, EveryRowHasItsTests) {
    std::set<ZelSvcElementId> tested{ZEL_SVC_ELEMENT_CLI_DIGITS};
    for (const ExpectedSetting &setting : kExpectedPersonal)
        tested.insert(setting.element);
    EXPECT_EQ(elements_with_keys({zel_svc_gps_settings(), zel_svc_contact_settings(), zel_svc_multimedia_settings(),
                                  zel_svc_connectivity_settings()}),
              tested);
}

TEST(BrowserSettings, EveryRowHasItsTests) {
    EXPECT_EQ(elements_with_keys({zel_svc_browser_settings()}),
              std::set<ZelSvcElementId>{ZEL_SVC_ELEMENT_COOKIE_OPTION});
}

TEST(MessageSettings, EveryRowHasItsTests) {
    std::set<ZelSvcElementId> tested{ZEL_SVC_ELEMENT_PAGE_LIMIT, ZEL_SVC_ELEMENT_THRESHOLD_VALUE,
                                     ZEL_SVC_ELEMENT_MAX_RECIPIENT, ZEL_SVC_ELEMENT_DELIVERY_CUST_TIME,
                                     ZEL_SVC_ELEMENT_MAX_RECIPIENT_MMS};
    for (const ExpectedSetting &setting : kExpectedSms)
        tested.insert(setting.element);
    for (const ExpectedSetting &setting : kExpectedMms)
        tested.insert(setting.element);
    EXPECT_EQ(elements_with_keys({zel_svc_sms_settings(), zel_svc_push_settings(), zel_svc_mms_settings()}), tested);
}

} // namespace zel_test
