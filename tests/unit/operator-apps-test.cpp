// The operator applications in every combination of before and after an upgrade.

#include "support/files-phone.h"
#include "zel-svc-configuration-phases.h"

#include <filesystem>

namespace {

constexpr const char *kRunLog = "/opt/system/zel-default/output/zel-config.log";

struct App {
    const char *name;
    const char *package;
    const char *executable;
};

constexpr App kApps[] = {
    {"SkatamfaBeats", "com.skatamfa.beats", "/opt/usr/apps/com.skatamfa.beats/bin/jiobeats"},
    {"SkatamfaOnDemand", "com.skatamfa.ondemand", "/opt/usr/apps/com.skatamfa.ondemand/bin/jioondemand"},
    {"SkatamfaXPressNews", "ZFQ9uYrIPH", "/opt/usr/apps/ZFQ9uYrIPH/bin/ZFQ9uYrIPH.SkatamfaNews"},
    {"MySkatamfa", "AOzuftR6Ou", "/opt/usr/apps/AOzuftR6Ou/bin/AOzuftR6Ou.MySkatamfa"},
};

struct OperatorApplications : zel_test::FilesPhone {
    void put(unsigned present) {
        for (unsigned i = 0; i < 4; ++i) {
            std::filesystem::remove(on_disk(kApps[i].executable));
            if ((present >> i & 1U) != 0) write(kApps[i].executable, "app");
        }
    }
    std::string taken_log() {
        std::string text = run_log();
        write(kRunLog, "");
        return text;
    }
};

TEST_F(OperatorApplications, AreLookedForBeforeTheUpgrade) {
    for (unsigned before = 0; before < 16; ++before) {
        put(before);
        ZelSvcAppsBefore flags = {};
        zel_svc_config_check_apps_before_upgrade("INS", flags);
        std::string expected = "[Config/Start] Check App existence before App upgrade (FOTA).\n";
        for (unsigned i = 0; i < 4; ++i) {
            const bool there = (before >> i & 1U) != 0;
            EXPECT_EQ(flags[i], there) << before;
            expected +=
                std::string{"[Config] "} + kApps[i].name +
                (there ? " App already existed before App upgrade.\n" : " App NOT existed before App upgrade.\n");
        }
        EXPECT_EQ(taken_log(), expected + "[Config/End] Check App existence before App upgrade (FOTA).\n");
    }
}

TEST_F(OperatorApplications, AreDisabledWhenTheUpgradeBroughtThem) {
    for (unsigned before = 0; before < 16; ++before)
        for (unsigned after = 0; after < 16; ++after) {
            put(after);
            ZelSvcAppsBefore flags = {};
            for (unsigned i = 0; i < 4; ++i)
                flags[i] = (before >> i & 1U) != 0;
            zel_svc_config_disable_apps("INS", flags);
            std::string expected = "[Config/Start] Disable App as default.\n";
            for (unsigned i = 0; i < 4; ++i) {
                const std::string app = std::string{"[Config] "} + kApps[i].name + " App ";
                if (flags[i])
                    expected += app + "is NOT NEW, skip.\n";
                else if ((after >> i & 1U) != 0)
                    expected += app + "normally existed.\n" + app + "is disabled(result=0).\n";
                else
                    expected += app + "NOT existed.\n";
            }
            EXPECT_EQ(taken_log(), expected + "[Config/Ended] Disable App as default.\n") << before << ' ' << after;
        }
}

TEST_F(OperatorApplications, BelongToOneCustomer) {
    put(15);
    for (const char *customer : {"XFV", "ins", "INS2", ""}) {
        ZelSvcAppsBefore flags = {};
        zel_svc_config_check_apps_before_upgrade(customer, flags);
        zel_svc_config_disable_apps(customer, flags);
        zel_svc_config_remove_apps(customer);
        EXPECT_EQ(taken_log(), "[Config] No need to check App existence.\n[Config] No need to disable App as default.\n"
                               "[Config] No need to remove App manually(FOTA).\n");
        EXPECT_EQ(flags, ZelSvcAppsBefore{});
    }
    EXPECT_TRUE(call("app-list").at("applications").empty());
}

} // namespace
