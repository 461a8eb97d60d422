// What the security-lock query hands over and what it leaves in the security group's file.

#include "service-phone.h"

#include <gmock/gmock.h>

#include <sstream>

namespace {

using testing::HasSubstr;
using testing::Not;

class SecurityLockRecord : public zel_test::ServicePhone {
  protected:
    void ask(const std::string &locks) {
        set_string("db/zel/salescode", "XFV");
        write_customer("XFV", "<Settings><Main><Security>" + locks + "</Security></Main></Settings>");
        ASSERT_EQ(zel_svc_config_get_security_lock_info(&locks_), 1);
    }

    // The value of a key in the group's file, without the padding and quotes of its layout.
    std::string recorded(const std::string &key) {
        std::istringstream lines{read(data_path("security"))};
        for (std::string line; std::getline(lines, line);) {
            const std::size_t equals = line.find('=');
            if (equals == std::string::npos) continue;
            std::string name = line.substr(0, equals);
            name.erase(name.find_last_not_of(' ') + 1);
            if (name != key && name != "security:" + key) continue;
            std::string value = line.substr(equals + 1);
            std::erase_if(value, [](char c) { return c == ' ' || c == '"'; });
            return value;
        }
        return "(absent)";
    }

    ZelSvcSecurityLock locks_ = {};
};

} // namespace

TEST_F(SecurityLockRecord, EveryFieldIsHandedOverAndRecorded) {
    ask("<NbNetworkLock>2</NbNetworkLock><NetworkLock>45001</NetworkLock><NetworkLock>45002</NetworkLock>"
        "<NbSPLock>1</NbSPLock><SPLock>11</SPLock><NbSubsetLock>1</NbSubsetLock><SubsetLock>22</SubsetLock>"
        "<NbCPLock>1</NbCPLock><CPLock>33</CPLock><AutoNetworkLock>on</AutoNetworkLock>"
        "<AutoSIMLock>on</AutoSIMLock><AutoSPLock>yes</AutoSPLock><UnlockCnt>10</UnlockCnt>");
    EXPECT_EQ(locks_.network_lock_count, 2);
    EXPECT_STREQ(locks_.network_locks[0], "45001");
    EXPECT_STREQ(locks_.network_locks[1], "45002");
    EXPECT_EQ(locks_.sp_lock_count, 1);
    EXPECT_STREQ(locks_.sp_locks[0], "11");
    EXPECT_EQ(locks_.subset_lock_count, 1);
    EXPECT_STREQ(locks_.subset_locks[0], "22");
    EXPECT_EQ(locks_.cp_lock_count, 1);
    EXPECT_STREQ(locks_.cp_locks[0], "33");
    EXPECT_STREQ(locks_.auto_network_lock, "on");
    EXPECT_EQ(locks_.auto_sim_lock, 1);
    EXPECT_EQ(locks_.auto_sp_lock, 0);
    EXPECT_EQ(locks_.unlock_count, 10);
    const std::pair<const char *, const char *> expected[] = {
        {"net_lock_count", "2"}, {"net_lock_0", "45001"},    {"net_lock_1", "45002"}, {"sp_lock_count", "1"},
        {"sp_lock_0", "11"},     {"subset_lock_count", "1"}, {"subset_lock_0", "22"}, {"cp_lock_count", "1"},
        {"cp_lock_0", "33"},     {"auto_net_lock", "on"},    {"auto_sim_lock", "1"},  {"auto_sp_lock", "0"},
        {"unlock_count", "10"},  {"net_lock_2", "(absent)"}};
    for (const auto &[key, value] : expected)
        EXPECT_EQ(recorded(key), value) << key << "\n" << read(data_path("security"));
}

TEST_F(SecurityLockRecord, SeventyOfAKindAreKept) {
    std::string entries;
    for (int i = 0; i < 75; ++i)
        entries += "<CPLock>c" + std::to_string(i) + "</CPLock>";
    ask("<NbCPLock>75</NbCPLock>" + entries);
    EXPECT_EQ(locks_.cp_lock_count, 75);
    EXPECT_STREQ(locks_.cp_locks[69], "c69");
    EXPECT_STREQ(locks_.auto_network_lock, "");
    EXPECT_EQ(recorded("cp_lock_69"), "c69");
    EXPECT_EQ(recorded("cp_lock_70"), "(absent)");
}

TEST_F(SecurityLockRecord, OnlyLocksAreRead) {
    const nlohmann::json before = [this] {
        set_string("db/zel/salescode", "XFV");
        return call("vconf-list");
    }();
    ask("</Security><Sound><TouchTone>on</TouchTone></Sound><Security><UnlockCnt>3</UnlockCnt>");
    EXPECT_EQ(locks_.unlock_count, 3);
    EXPECT_EQ(call("vconf-list"), before);
}

TEST_F(SecurityLockRecord, InstallRecordsNoLocks) {
    write_customer("XFV", "<Settings><Main><Security><UnlockCnt>3</UnlockCnt></Security></Main></Settings>");
    zel_svc_config_install_customer("XFV", 0);
    EXPECT_THAT(read(data_path("security")), Not(HasSubstr("unlock_count")));
}
