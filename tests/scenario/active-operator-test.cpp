#include "service-phone.h"

#include <algorithm>
#include <cstring>

namespace {

ZelSvcSimOperator some_operator() {
    ZelSvcSimOperator entry = {};
    std::strcpy(entry.customer_name, "XFV");
    std::strcpy(entry.network_name, "Vodacom");
    std::strcpy(entry.mccmnc, "65501");
    std::strcpy(entry.subset_code, "12");
    std::strcpy(entry.gid, "FF");
    std::strcpy(entry.sp_name, "Vodacom SA");
    return entry;
}

constexpr const char *kKeys[] = {"db/private/zel/sim_auto_op_customer_name", "db/private/zel/sim_auto_op_network_name",
                                 "db/private/zel/sim_auto_op_mcc_mnc",       "db/private/zel/sim_auto_op_subset_code",
                                 "db/private/zel/sim_auto_op_sp_code",       "db/private/zel/sim_auto_op_sp_name"};

class ActiveOperator : public zel_test::ServicePhone {
  protected:
    std::vector<std::string> written_keys() {
        std::vector<std::string> keys;
        const nlohmann::json list = call("journal-list");
        for (const nlohmann::json &entry : list.at("calls"))
            if (entry.at("function").get<std::string>().rfind("vconf_set_", 0) == 0)
                keys.push_back(entry.at("text").get<std::string>());
        return keys;
    }

    const ZelSvcSimOperator entry_ = some_operator();
    ZelSvcSimOperator read_ = {};
};

} // namespace

TEST_F(ActiveOperator, OfTheFirstSlotIsInSixKeys) {
    EXPECT_EQ(zel_svc_sim_auto_setting_set_active_operator(&entry_, 1), 1);
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_customer_name"), "XFV");
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_network_name"), "Vodacom");
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_mcc_mnc"), "65501");
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_subset_code"), "12");
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_sp_code"), "FF");
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_sp_name"), "Vodacom SA");
    EXPECT_EQ(get_string("db/private/zel/sim2/sim_auto_op_network_name"), std::nullopt);
    EXPECT_TRUE(system_logged("vconf_set_str(ZelSimAutoOpCustomerName,'XFV') succeeded."));
    EXPECT_TRUE(system_logged("vconf_set_str(ZelSimAutoOpNetName,'Vodacom') succeeded."));
    EXPECT_TRUE(system_logged("Setting active operator(vconf) succeeded."));
    EXPECT_EQ(system_log().size(), 3U);
}

TEST_F(ActiveOperator, OfTheSecondSlotSharesTheCustomersName) {
    EXPECT_EQ(zel_svc_sim_auto_setting_set_active_operator(&entry_, 2), 1);
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_customer_name"), "XFV");
    EXPECT_EQ(get_string("db/private/zel/sim2/sim_auto_op_network_name"), "Vodacom");
    EXPECT_EQ(get_string("db/private/zel/sim2/sim_auto_op_mcc_mnc"), "65501");
    EXPECT_EQ(get_string("db/private/zel/sim2/sim_auto_op_subset_code"), "12");
    EXPECT_EQ(get_string("db/private/zel/sim2/sim_auto_op_sp_code"), "FF");
    EXPECT_EQ(get_string("db/private/zel/sim2/sim_auto_op_sp_name"), "Vodacom SA");
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_network_name"), std::nullopt);
    EXPECT_TRUE(system_logged("vconf_set_str(ZelSim2AutoOpNetName,'Vodacom') succeeded."));
}

TEST_F(ActiveOperator, AnyOtherSlotIsTheFirst) {
    EXPECT_EQ(zel_svc_sim_auto_setting_set_active_operator(&entry_, 0), 1);
    EXPECT_EQ(zel_svc_sim_auto_setting_get_active_operator(&read_, 7), 1);
    EXPECT_STREQ(read_.network_name, "Vodacom");
}

TEST_F(ActiveOperator, ComesBackAsItWasStored) {
    zel_svc_sim_auto_setting_set_active_operator(&entry_, 2);
    EXPECT_EQ(zel_svc_sim_auto_setting_get_active_operator(&read_, 2), 1);
    EXPECT_EQ(std::memcmp(&read_, &entry_, sizeof read_), 0);
}

TEST_F(ActiveOperator, TheServiceProvidersNameIsReadUpTo14Bytes) {
    ZelSvcSimOperator entry = entry_;
    std::strcpy(entry.sp_name, "1234567890123456789");
    zel_svc_sim_auto_setting_set_active_operator(&entry, 1);
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_sp_name"), "1234567890123456789");
    zel_svc_sim_auto_setting_get_active_operator(&read_, 1);
    EXPECT_STREQ(read_.sp_name, "12345678901234");
}

TEST_F(ActiveOperator, LongStoredTextsAreCutToTheirFields) {
    const std::string text(50, 'x');
    for (const char *key : kKeys)
        set_string(key, text);
    EXPECT_EQ(zel_svc_sim_auto_setting_get_active_operator(&read_, 1), 1);
    EXPECT_EQ(read_.customer_name, std::string(9, 'x'));
    EXPECT_EQ(read_.network_name, std::string(39, 'x'));
    EXPECT_EQ(read_.mccmnc, std::string(9, 'x'));
    EXPECT_EQ(read_.subset_code, std::string(9, 'x'));
    EXPECT_EQ(read_.gid, std::string(9, 'x'));
    EXPECT_EQ(read_.sp_name, std::string(14, 'x'));
}

TEST_F(ActiveOperator, EachMissingKeyMakesTheResult0AndFillsTheRest) {
    const auto empty_fields = [&] {
        int count = 0;
        for (const char *field :
             {read_.customer_name, read_.network_name, read_.mccmnc, read_.subset_code, read_.gid, read_.sp_name})
            count += field[0] == '\0' ? 1 : 0;
        return count;
    };
    for (const char *key : kKeys) {
        zel_svc_sim_auto_setting_set_active_operator(&entry_, 1);
        call("vconf-unset", {{"key", key}});
        std::memset(&read_, 'x', sizeof read_);
        EXPECT_EQ(zel_svc_sim_auto_setting_get_active_operator(&read_, 1), 0) << key;
        EXPECT_EQ(empty_fields(), 1) << key;
    }
    EXPECT_STREQ(read_.sp_name, ""); // the last one that was missing
    EXPECT_STREQ(read_.gid, "FF");
}

TEST_F(ActiveOperator, WithoutARecordItTellsWhetherAllKeysExist) {
    EXPECT_EQ(zel_svc_sim_auto_setting_get_active_operator(nullptr, 1), 0);
    zel_svc_sim_auto_setting_set_active_operator(&entry_, 1);
    EXPECT_EQ(zel_svc_sim_auto_setting_get_active_operator(nullptr, 1), 1);
    EXPECT_EQ(zel_svc_sim_auto_setting_get_active_operator(nullptr, 2), 0);
}

TEST_F(ActiveOperator, AnEmptyCustomerNameLeavesTheStoredOne) {
    zel_svc_sim_auto_setting_set_active_operator(&entry_, 1);
    const ZelSvcSimOperator nobody = {};
    EXPECT_EQ(zel_svc_sim_auto_setting_set_active_operator(&nobody, 1), 1);
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_customer_name"), "XFV");
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_network_name"), "");
    EXPECT_TRUE(system_logged("vconf_set_str(ZelSimAutoOpNetName,'') succeeded."));
}

TEST_F(ActiveOperator, NullIsNotStored) { EXPECT_EQ(zel_svc_sim_auto_setting_set_active_operator(nullptr, 1), 0); }

TEST_F(ActiveOperator, KeysAreWrittenInOrder) {
    call("journal-start");
    zel_svc_sim_auto_setting_set_active_operator(&entry_, 2);
    EXPECT_EQ(written_keys(),
              (std::vector<std::string>{
                  "db/private/zel/sim_auto_op_customer_name", "db/private/zel/sim2/sim_auto_op_network_name",
                  "db/private/zel/sim2/sim_auto_op_mcc_mnc", "db/private/zel/sim2/sim_auto_op_subset_code",
                  "db/private/zel/sim2/sim_auto_op_sp_code", "db/private/zel/sim2/sim_auto_op_sp_name"}));
}

TEST_F(ActiveOperator, ClearingWritesKeysInOrder) {
    call("journal-start");
    zel_svc_sim_auto_setting_clear_active_operator();
    EXPECT_EQ(
        written_keys(),
        (std::vector<std::string>{
            "db/private/zel/sim_auto_op_network_name", "db/private/zel/sim_auto_op_mcc_mnc",
            "db/private/zel/sim_auto_op_subset_code", "db/private/zel/sim_auto_op_sp_code",
            "db/private/zel/sim_auto_op_sp_name", "db/private/zel/sim2/sim_auto_op_network_name",
            "db/private/zel/sim2/sim_auto_op_mcc_mnc", "db/private/zel/sim2/sim_auto_op_subset_code",
            "db/private/zel/sim2/sim_auto_op_sp_code", "db/private/zel/sim2/sim_auto_op_sp_name",
            "db/private/zel/sim_selection_show", "db/private/zel/sim2/sim_selection_show", "db/private/zel/sim_mcc_mnc",
            "db/private/zel/sim_msin", "db/private/zel/sim2/sim_mcc_mnc", "db/private/zel/sim2/sim_msin",
            "memory/private/zel/sim_changed", "memory/private/zel/sim2/sim_changed"}));
}

// Shown in the names of the tests.
struct RefusedWrite {
    int slot;
    const char *key;
    const char *message;
    friend void PrintTo(const RefusedWrite &write, std::ostream *out) { *out << write.key; }
};

class ActiveOperatorRefused : public ActiveOperator, public ::testing::WithParamInterface<RefusedWrite> {};

TEST_P(ActiveOperatorRefused, IsLoggedAndTheOthersAreStillWritten) {
    fail("vconf_set_str", GetParam().key, 1, -1, -7);
    EXPECT_EQ(zel_svc_sim_auto_setting_set_active_operator(&entry_, GetParam().slot), 0);
    EXPECT_TRUE(system_logged(GetParam().message));
    EXPECT_TRUE(system_logged("Setting active operator(vconf) failed."));
    EXPECT_EQ(get_string(GetParam().key), std::nullopt);
    EXPECT_EQ(call("vconf-list", {{"prefix", "db/private/zel/"}}).at("keys").size(), 5U);
}

INSTANTIATE_TEST_SUITE_P(
    EveryKey, ActiveOperatorRefused,
    ::testing::Values(
        RefusedWrite{1, "db/private/zel/sim_auto_op_customer_name",
                     "vconf_set_str(ZelSimAutoOpCustomerName,'XFV')=-7 failed."},
        RefusedWrite{2, "db/private/zel/sim_auto_op_customer_name",
                     "vconf_set_str(ZelSimAutoOpCustomerName,'XFV')=-7 failed."},
        RefusedWrite{1, "db/private/zel/sim_auto_op_network_name",
                     "vconf_set_str(ZelSimAutoOpNetName,'Vodacom')=-7 failed."},
        RefusedWrite{1, "db/private/zel/sim_auto_op_mcc_mnc", "vconf_set_str(ZelSimOpMccMnc)=-7 failed."},
        RefusedWrite{1, "db/private/zel/sim_auto_op_subset_code", "vconf_set_str(ZelSimAutoOpSubSetCode)=-7 failed."},
        RefusedWrite{1, "db/private/zel/sim_auto_op_sp_code", "vconf_set_str(ZelSimAutoOpSpCode)=-7 failed."},
        RefusedWrite{1, "db/private/zel/sim_auto_op_sp_name", "vconf_set_str(ZelSimAutoOpSpName)=-7 failed."},
        RefusedWrite{2, "db/private/zel/sim2/sim_auto_op_network_name",
                     "vconf_set_str(ZelSim2AutoOpNetName,'Vodacom')=-7 failed."},
        RefusedWrite{2, "db/private/zel/sim2/sim_auto_op_mcc_mnc", "vconf_set_str(ZelSim2AutoOpMccMnc)=-7 failed."},
        RefusedWrite{2, "db/private/zel/sim2/sim_auto_op_subset_code",
                     "vconf_set_str(ZelSim2AutoOpSubSetCode)=-7 failed."},
        RefusedWrite{2, "db/private/zel/sim2/sim_auto_op_sp_code", "vconf_set_str(ZelSim2AutoOpSpCode)=-7 failed."},
        RefusedWrite{2, "db/private/zel/sim2/sim_auto_op_sp_name", "vconf_set_str(ZelSim2AutoOpSpName)=-7 failed."}));

class ClearActiveOperator : public ActiveOperator {
  protected:
    void SetUp() override {
        ActiveOperator::SetUp();
        zel_svc_sim_auto_setting_set_active_operator(&entry_, 1);
        zel_svc_sim_auto_setting_set_active_operator(&entry_, 2);
        for (const char *key : {"db/private/zel/sim_mcc_mnc", "db/private/zel/sim_msin",
                                "db/private/zel/sim2/sim_mcc_mnc", "db/private/zel/sim2/sim_msin"})
            set_string(key, "12345");
        set_int("db/private/zel/sim_selection_show", 1);
        set_int("db/private/zel/sim2/sim_selection_show", 1);
        set_bool("memory/private/zel/sim_changed", true);
        set_bool("memory/private/zel/sim2/sim_changed", true);
    }

    // Every key but the refused one, and the customer's name, which no clearing touches.
    void expect_cleared_but(const std::string &kept) {
        const nlohmann::json list = call("vconf-list");
        for (const nlohmann::json &key : list.at("keys"))
            if (key.at("key").get<std::string>().find("private/zel/") != std::string::npos) expect_cleared(key, kept);
    }

    static void expect_cleared(const nlohmann::json &key, const std::string &kept) {
        if (key.at("key") == kept || key.at("key") == "db/private/zel/sim_auto_op_customer_name") return;
        const nlohmann::json &value = key.at("value");
        EXPECT_TRUE(value == "" || value == 0 || value == false) << key;
    }
};

TEST_F(ClearActiveOperator, LeavesOnlyTheCustomersName) {
    EXPECT_EQ(zel_svc_sim_auto_setting_clear_active_operator(), 1);
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_customer_name"), "XFV");
    expect_cleared_but("");
    EXPECT_EQ(system_log().back().substr(system_log().back().find("> ")),
              "> Clearing active operator(vconf) succeeded.");
}

struct RefusedClear {
    const char *function;
    const char *key;
    const char *message; // null: none of its own
    friend void PrintTo(const RefusedClear &clear, std::ostream *out) { *out << clear.key; }
};

class ClearActiveOperatorRefused : public ClearActiveOperator, public ::testing::WithParamInterface<RefusedClear> {};

TEST_P(ClearActiveOperatorRefused, MakesTheResult0AndClearsTheRest) {
    fail(GetParam().function, GetParam().key, 1, -1, -3);
    EXPECT_EQ(zel_svc_sim_auto_setting_clear_active_operator(), 0);
    EXPECT_TRUE(!GetParam().message || system_logged(GetParam().message));
    EXPECT_TRUE(system_logged("Clearing active operator(vconf) failed."));
    const auto failures = [](const std::string &line) { return line.find("=-3 failed.") != std::string::npos; };
    const std::vector<std::string> log = system_log();
    EXPECT_EQ(std::count_if(log.begin(), log.end(), failures), GetParam().message ? 1 : 0);
    expect_cleared_but(GetParam().key);
}

INSTANTIATE_TEST_SUITE_P(
    EveryKey, ClearActiveOperatorRefused,
    ::testing::Values(
        RefusedClear{"vconf_set_str", "db/private/zel/sim_auto_op_network_name",
                     "vconf_set_str(ZelSimAutoOpNetName,'')=-3 failed."},
        RefusedClear{"vconf_set_str", "db/private/zel/sim2/sim_auto_op_sp_name",
                     "vconf_set_str(ZelSim2AutoOpSpName)=-3 failed."},
        RefusedClear{"vconf_set_int", "db/private/zel/sim_selection_show",
                     "vconf_set_int(ZelSimSelectionShow,0)=-3 failed."},
        RefusedClear{"vconf_set_int", "db/private/zel/sim2/sim_selection_show",
                     "vconf_set_int(ZelSim2SelectionShow,0)=-3 failed."},
        RefusedClear{"vconf_set_str", "db/private/zel/sim_mcc_mnc", "vconf_set_str(ZelSimMccMnc,'')=-3 failed."},
        RefusedClear{"vconf_set_str", "db/private/zel/sim_msin", "vconf_set_str(ZelSimMsin,'')=-3 failed."},
        RefusedClear{"vconf_set_str", "db/private/zel/sim2/sim_mcc_mnc", "vconf_set_str(ZelSim2MccMnc,'')=-3 failed."},
        RefusedClear{"vconf_set_str", "db/private/zel/sim2/sim_msin", "vconf_set_str(ZelSim2Msin,'')=-3 failed."},
        RefusedClear{"vconf_set_bool", "memory/private/zel/sim_changed", nullptr},
        RefusedClear{"vconf_set_bool", "memory/private/zel/sim2/sim_changed", nullptr}));
