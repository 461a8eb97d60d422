// The operator applications in every combination of before and after an upgrade.

#include "support/files-phone.h"
#include "support/operator-apps.h"
#include "zel-svc-configuration-phases.h"

#include <filesystem>

namespace {

using zel_test::kOperatorApps;

constexpr const char *kRunLog = "/opt/system/zel-default/output/zel-config.log";

std::string joined(const std::vector<std::string> &lines) {
    std::string text;
    for (const std::string &line : lines)
        text += line + '\n';
    return text;
}

ZelSvcAppsBefore flags_of(unsigned before) {
    ZelSvcAppsBefore flags = {};
    for (unsigned i = 0; i < 4; ++i)
        flags[i] = zel_test::holds(before, i);
    return flags;
}

struct OperatorApplications : zel_test::FilesPhone {
    void put(unsigned present) {
        for (unsigned i = 0; i < 4; ++i) {
            std::filesystem::remove(on_disk(kOperatorApps[i].executable));
            if (zel_test::holds(present, i)) write(kOperatorApps[i].executable, "app");
        }
    }
    std::string taken_log() {
        std::string text = run_log();
        write(kRunLog, "");
        return text;
    }
};

TEST_F(OperatorApplications, AreLookedForBeforeTheUpgrade) {
    for (unsigned before = 0; before <= zel_test::kEveryOperatorApp; ++before) {
        put(before);
        ZelSvcAppsBefore flags = {};
        zel_svc_config_check_apps_before_upgrade("INS", flags);
        EXPECT_EQ(flags, flags_of(before)) << before;
        EXPECT_EQ(taken_log(), joined(zel_test::lines_of_check(before)));
    }
}

TEST_F(OperatorApplications, AreDisabledWhenTheUpgradeBroughtThem) {
    for (unsigned before = 0; before <= zel_test::kEveryOperatorApp; ++before)
        for (unsigned after = 0; after <= zel_test::kEveryOperatorApp; ++after) {
            put(after);
            zel_svc_config_disable_apps("INS", flags_of(before));
            EXPECT_EQ(taken_log(), joined(zel_test::lines_of_disable(before, after))) << before << ' ' << after;
        }
}

TEST_F(OperatorApplications, BelongToOneCustomer) {
    put(zel_test::kEveryOperatorApp);
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
