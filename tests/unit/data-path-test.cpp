#include "spec/zel-svc-data.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

constexpr const char *kFiles[] = {
    "/opt/system/zel-default/data/zel-default-data.ini",
    "/opt/system/zel-default/data/zel-default-data-security.ini",
    "/opt/system/zel-default/data/zel-default-data-network.ini",
    "/opt/system/zel-default/data/zel-default-data-wb-amr.ini",
    "/opt/system/zel-default/data/zel-default-data-contact.ini",
    "/opt/system/zel-default/data/zel-default-data-calendar.ini",
    "/opt/system/zel-default/data/zel-default-data-multimedia.ini",
    "/opt/system/zel-default/data/zel-default-data-connectivity.ini",
    "/opt/system/zel-default/data/zel-default-data-voice-mail.ini",
    "/opt/system/zel-default/data/zel-default-data-message.ini",
    "/opt/system/zel-default/data/zel-default-data-email.ini",
    "/opt/system/zel-default/data/zel-default-data-email-account.ini",
    "/opt/system/zel-default/data/zel-default-data-active-sync.ini",
    "/opt/system/zel-default/data/zel-default-data-connection.ini",
    "/opt/system/zel-default/data/zel-default-data-fast-dormancy.ini",
    "/opt/system/zel-default/data/zel-default-data-bookmark.ini",
    "/opt/system/zel-default/data/zel-default-data-quick-access.ini",
    "/opt/system/zel-default/data/zel-default-data-browser.ini",
    "/opt/system/zel-default/data/zel-default-data-syncml-ds.ini",
    "/opt/system/zel-default/data/zel-default-data-max-pdp.ini",
    "/opt/system/zel-default/data/zel-default-data-gps.ini",
    "/opt/system/zel-default/data/zel-default-data-ims.ini",
};

struct SecondSimFile {
    int group;
    const char *path;
};

constexpr SecondSimFile kSecondSimFiles[] = {
    {8, "/opt/system/zel-default/data/zel-default-data-voice-mail-2.ini"},
    {13, "/opt/system/zel-default/data/zel-default-data-connection-2.ini"},
    {14, "/opt/system/zel-default/data/zel-default-data-fast-dormancy-2.ini"},
    {19, "/opt/system/zel-default/data/zel-default-data-max-pdp-2.ini"},
    {21, "/opt/system/zel-default/data/zel-default-data-ims-2.ini"},
};

std::string path_of(int group, unsigned variant) {
    char path[128];
    zel_svc_data_get_path(group, variant, path, sizeof path);
    return path;
}

const char *second_sim_file(int group) {
    for (const SecondSimFile &file : kSecondSimFiles)
        if (file.group == group) return file.path;
    return kFiles[group];
}

TEST(DataPath, EveryGroupHasItsFile) {
    ASSERT_EQ(std::size(kFiles), 22U);
    for (int group = 0; group < 22; ++group)
        for (const unsigned variant : {0U, 1U, 3U, 4294967295U, 4294967294U})
            EXPECT_EQ(path_of(group, variant), kFiles[group]) << variant;
}

TEST(DataPath, FiveGroupsHaveAFileOfTheSecondSim) {
    for (int group = 0; group < 22; ++group)
        EXPECT_EQ(path_of(group, 2), second_sim_file(group));
}

TEST(DataPath, OtherIndexesAreTheMainFile) {
    for (const int group : {0, 22, 23, -1, -22, 2147483647, -2147483647 - 1})
        for (const unsigned variant : {0U, 2U})
            EXPECT_EQ(path_of(group, variant), "/opt/system/zel-default/data/zel-default-data.ini") << group;
}

TEST(DataPath, GroupsHaveTheirNumbers) {
    EXPECT_EQ(ZEL_SVC_DATA_GROUP_COUNT, 22);
    const int named[] = {
        ZEL_SVC_DATA_MAIN,         ZEL_SVC_DATA_SECURITY,   ZEL_SVC_DATA_NETWORK,       ZEL_SVC_DATA_WB_AMR,
        ZEL_SVC_DATA_CONTACT,      ZEL_SVC_DATA_CALENDAR,   ZEL_SVC_DATA_MULTIMEDIA,    ZEL_SVC_DATA_CONNECTIVITY,
        ZEL_SVC_DATA_VOICE_MAIL,   ZEL_SVC_DATA_MESSAGE,    ZEL_SVC_DATA_EMAIL,         ZEL_SVC_DATA_EMAIL_ACCOUNT,
        ZEL_SVC_DATA_ACTIVE_SYNC,  ZEL_SVC_DATA_CONNECTION, ZEL_SVC_DATA_FAST_DORMANCY, ZEL_SVC_DATA_BOOKMARK,
        ZEL_SVC_DATA_QUICK_ACCESS, ZEL_SVC_DATA_BROWSER,    ZEL_SVC_DATA_SYNCML_DS,     ZEL_SVC_DATA_MAX_PDP,
        ZEL_SVC_DATA_GPS,          ZEL_SVC_DATA_IMS};
    EXPECT_THAT(named,
                ::testing::ElementsAre(0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16, 17, 18, 19, 20, 21));
}

TEST(DataPath, IsCutToTheCallersBuffer) {
    char path[11] = "untouched!";
    zel_svc_data_get_path(0, 0, path, 0);
    EXPECT_STREQ(path, "untouched!");
    zel_svc_data_get_path(0, 0, path, 6);
    EXPECT_STREQ(path, "/opt/");
    zel_svc_data_get_path(0, 0, nullptr, 6);
}

} // namespace
