// SIM personalisation data goes into the lock table and the security group, in the lock query's parse alone.

#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

#include <array>

namespace zel_test {

using testing::IsEmpty;

namespace {

constexpr ZelSvcParseMode kQuery = ZEL_SVC_PARSE_MODE_SECURITY_LOCK;

std::string leaf(const std::string &tag, const std::string &text) { return "<" + tag + ">" + text + "</" + tag + ">"; }
std::string security(const std::string &children) { return "<Security>" + children + "</Security>"; }

struct ExpectedList {
    const char *count_tag;
    const char *entry_tag;
    const char *count_key;
    const char *entry_key;
    std::int32_t (*count)();
    const char *(*entry)(std::size_t);
};

const ZelSvcSecurityLock &table() { return zel_svc_collected_locks(); }

constexpr ExpectedList kExpectedLists[] = {
    {"NbNetworkLock", "NetworkLock", "net_lock_count", "net_lock_", [] { return table().network_lock_count; },
     [](std::size_t i) -> const char * { return table().network_locks[i]; }},
    {"NbSPLock", "SPLock", "sp_lock_count", "sp_lock_", [] { return table().sp_lock_count; },
     [](std::size_t i) -> const char * { return table().sp_locks[i]; }},
    {"NbSubsetLock", "SubsetLock", "subset_lock_count", "subset_lock_", [] { return table().subset_lock_count; },
     [](std::size_t i) -> const char * { return table().subset_locks[i]; }},
    {"NbCPLock", "CPLock", "cp_lock_count", "cp_lock_", [] { return table().cp_lock_count; },
     [](std::size_t i) -> const char * { return table().cp_locks[i]; }},
};

} // namespace

class LockList : public BenchPhone, public testing::WithParamInterface<ExpectedList> {
  protected:
    [[nodiscard]] static std::string count(const std::string &text) { return leaf(GetParam().count_tag, text); }
    [[nodiscard]] static std::string entry(const std::string &text) { return leaf(GetParam().entry_tag, text); }
    [[nodiscard]] static std::string key(int number) { return GetParam().entry_key + std::to_string(number); }
    static std::optional<std::string> recorded(const LoadedGroup &group, int number) {
        return group.text("security", key(number).c_str());
    }
    static std::optional<std::string> recorded_count(const LoadedGroup &group) {
        return group.text("security", GetParam().count_key);
    }
};

TEST_P(LockList, EntriesAreNumberedFromZero) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    install_spec(security(count("2") + entry("45001") + entry("45002")), kQuery);
    EXPECT_EQ(GetParam().count(), 2);
    EXPECT_STREQ(GetParam().entry(0), "45001");
    EXPECT_STREQ(GetParam().entry(1), "45002");
    EXPECT_STREQ(GetParam().entry(2), "");
    EXPECT_EQ(recorded_count(group), "2");
    EXPECT_EQ(recorded(group, 0), "45001");
    EXPECT_EQ(recorded(group, 1), "45002");
    EXPECT_EQ(recorded(group, 2), std::nullopt);
}

TEST_P(LockList, EntriesAreCutTo19Bytes) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    install_spec(security(entry("12345678901234567890123") + entry("123456789012345678\xC3\xA9")), kQuery);
    EXPECT_STREQ(GetParam().entry(0), "1234567890123456789");
    EXPECT_STREQ(GetParam().entry(1), "123456789012345678");
    EXPECT_EQ(recorded(group, 0), "1234567890123456789");
    EXPECT_EQ(recorded(group, 1), "123456789012345678");
}

TEST_P(LockList, SeventyAreKeptAndNoMore) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    std::string entries;
    for (int i = 0; i < 72; ++i)
        entries += entry("n" + std::to_string(i));
    install_spec(security(count("72") + entries), kQuery);
    EXPECT_EQ(GetParam().count(), 72);
    EXPECT_STREQ(GetParam().entry(69), "n69");
    EXPECT_EQ(recorded(group, 69), "n69");
    EXPECT_EQ(recorded(group, 70), std::nullopt);
    EXPECT_EQ(recorded(group, 71), std::nullopt);
}

TEST_P(LockList, EntriesPastTheSeventiethOverwriteNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    std::string entries;
    for (int i = 0; i < 400; ++i)
        entries += entry("overflowing");
    install_spec(security(entries), kQuery);
    for (const ExpectedList &other : kExpectedLists) {
        EXPECT_EQ(other.count(), 0) << other.count_tag;
        if (other.entry_tag == GetParam().entry_tag) continue;
        EXPECT_STREQ(other.entry(0), "") << other.entry_tag;
    }
    EXPECT_STREQ(table().auto_network_lock, "");
    EXPECT_EQ(table().unlock_count, 0);
}

TEST_P(LockList, CountsAreKeptAsTheyAreRead) {
    for (const auto &[text, number] :
         {std::pair{"0", 0}, {"71", 71}, {"-3", -3}, {"07", 7}, {"three", 0}, {"99999999999", 2147483647}}) {
        const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
        install_spec(security(count(text)), kQuery);
        EXPECT_EQ(GetParam().count(), number) << text;
        EXPECT_EQ(recorded_count(group), std::to_string(number)) << text;
    }
}

TEST_P(LockList, OutsideSecurityTheyAreCollectedAllTheSame) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    install_spec(count("1") + entry("45001"), kQuery);
    EXPECT_EQ(GetParam().count(), 1);
    EXPECT_STREQ(GetParam().entry(0), "45001");
}

INSTANTIATE_TEST_SUITE_P(Locks, LockList, testing::ValuesIn(kExpectedLists),
                         [](const auto &list) { return std::string{list.param.entry_tag}; });

class SecurityLocks : public BenchPhone {
  protected:
    static std::optional<std::string> recorded(const LoadedGroup &group, const char *key) {
        return group.text("security", key);
    }

    // Hands a value handler a text that no file can hand it: an empty one.
    static void install_empty(ZelSvcElementId id) {
        Occurrence occurrence{.kind = OccurrenceKind::Value,
                              .element = id,
                              .tag = kZelSvcElementTable.at(static_cast<std::size_t>(id)).tag,
                              .action = ZEL_SVC_PARSE_ACTION_INSTALL,
                              .mode = kQuery,
                              .index = 0,
                              .offset = 0,
                              .text = "",
                              .attributes = nullptr,
                              .out = nullptr};
        kZelSvcElementTable.at(static_cast<std::size_t>(id)).value(occurrence);
    }
};

TEST_F(SecurityLocks, SwitchesAreOnForOnAlone) {
    for (const auto &[text, number] : {std::pair{"on", 1}, {"ON", 0}, {"yes", 0}, {"1", 0}, {"on ", 0}, {"off", 0}}) {
        const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
        install_spec(security(leaf("AutoSIMLock", text) + leaf("AutoSPLock", text)), kQuery);
        EXPECT_EQ(table().auto_sim_lock, number) << text;
        EXPECT_EQ(table().auto_sp_lock, number) << text;
        EXPECT_EQ(recorded(group, "auto_sim_lock"), std::to_string(number)) << text;
        EXPECT_EQ(recorded(group, "auto_sp_lock"), std::to_string(number)) << text;
    }
}

TEST_F(SecurityLocks, SwitchesAreIndependent) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    install_spec(security(leaf("AutoSPLock", "on")), kQuery);
    EXPECT_EQ(table().auto_sim_lock, 0);
    EXPECT_EQ(table().auto_sp_lock, 1);
    EXPECT_EQ(recorded(group, "auto_sim_lock"), std::nullopt);
}

TEST_F(SecurityLocks, AutoNetworkLockIsAText) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    install_spec(security(leaf("AutoNetworkLock", "On, please, everywhere")), kQuery);
    EXPECT_STREQ(table().auto_network_lock, "On, please, everywh");
    EXPECT_EQ(recorded(group, "auto_net_lock"), "On, please, everywh");
}

TEST_F(SecurityLocks, UnlockCountIsANumber) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    install_spec(security(leaf("UnlockCnt", " 10 times")), kQuery);
    EXPECT_EQ(table().unlock_count, 10);
    EXPECT_EQ(recorded(group, "unlock_count"), "10");
}

TEST_F(SecurityLocks, SecurityOpensWithAnEmptyTable) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    install_spec(security(leaf("NbSPLock", "3") + leaf("SPLock", "77") + leaf("AutoNetworkLock", "on") +
                          leaf("AutoSIMLock", "on") + leaf("UnlockCnt", "5")),
                 kQuery);
    install_spec(security(""), kQuery);
    const ZelSvcSecurityLock empty{};
    EXPECT_EQ(std::memcmp(&table(), &empty, sizeof empty), 0);
}

TEST_F(SecurityLocks, EmptyNumberWritesWhatTheTableHolds) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    install_spec(security(""), kQuery);
    install_empty(ZEL_SVC_ELEMENT_NB_NETWORK_LOCK);
    EXPECT_EQ(recorded(group, "net_lock_count"), "0");
    install_spec(security(leaf("NbNetworkLock", "4") + leaf("UnlockCnt", "9")), kQuery);
    zel_svc_data_unset(ZEL_SVC_DATA_SECURITY, "security", "net_lock_count");
    zel_svc_data_unset(ZEL_SVC_DATA_SECURITY, "security", "unlock_count");
    install_empty(ZEL_SVC_ELEMENT_NB_NETWORK_LOCK);
    install_empty(ZEL_SVC_ELEMENT_UNLOCK_CNT);
    EXPECT_EQ(table().network_lock_count, 4);
    EXPECT_EQ(recorded(group, "net_lock_count"), "4");
    EXPECT_EQ(recorded(group, "unlock_count"), "9");
}

TEST_F(SecurityLocks, EmptyTextsAreWritten) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    install_spec(security(leaf("AutoNetworkLock", "on") + leaf("NetworkLock", "45001")), kQuery);
    install_empty(ZEL_SVC_ELEMENT_AUTO_NETWORK_LOCK);
    install_empty(ZEL_SVC_ELEMENT_NETWORK_LOCK);
    EXPECT_STREQ(table().auto_network_lock, "");
    EXPECT_STREQ(table().network_locks[0], "");
    EXPECT_EQ(recorded(group, "auto_net_lock"), "");
    EXPECT_EQ(recorded(group, "net_lock_0"), "");
}

constexpr const char *kAll = "<Security><NbNetworkLock>1</NbNetworkLock><NetworkLock>45001</NetworkLock>"
                             "<NbSPLock>1</NbSPLock><SPLock>01</SPLock><NbSubsetLock>1</NbSubsetLock>"
                             "<SubsetLock>02</SubsetLock><NbCPLock>1</NbCPLock><CPLock>03</CPLock>"
                             "<AutoNetworkLock>on</AutoNetworkLock><AutoSIMLock>on</AutoSIMLock>"
                             "<AutoSPLock>on</AutoSPLock><UnlockCnt>10</UnlockCnt></Security>";
constexpr const char *kKeys[] = {"net_lock_count",    "net_lock_0",    "sp_lock_count", "sp_lock_0",
                                 "subset_lock_count", "subset_lock_0", "cp_lock_count", "cp_lock_0",
                                 "auto_net_lock",     "auto_sim_lock", "auto_sp_lock",  "unlock_count"};

TEST_F(SecurityLocks, EveryKeyIsWrittenByTheQuery) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    install_spec(kAll, kQuery);
    for (const char *key : kKeys)
        EXPECT_NE(recorded(group, key), std::nullopt) << key;
}

TEST_F(SecurityLocks, OtherModesPassThemBy) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    zel_svc_collected_locks().unlock_count = 7;
    for (const ZelSvcParseMode mode :
         {ZEL_SVC_PARSE_MODE_FULL, ZEL_SVC_PARSE_MODE_PARTIAL, ZEL_SVC_PARSE_MODE_CUSTOMER_LIST,
          ZEL_SVC_PARSE_MODE_OPERATOR_LIST, ZEL_SVC_PARSE_MODE_OPERATOR, ZEL_SVC_PARSE_MODE_HEADER})
        install_spec(kAll, mode);
    EXPECT_EQ(table().unlock_count, 7);
    EXPECT_STREQ(table().network_locks[0], "");
    for (const char *key : kKeys)
        EXPECT_EQ(recorded(group, key), std::nullopt) << key;
}

TEST_F(SecurityLocks, VerificationAndExportPassThemBy) {
    const LoadedGroup group{ZEL_SVC_DATA_SECURITY};
    zel_svc_collected_locks().unlock_count = 7;
    EXPECT_THAT(verify_spec(kAll, kQuery), IsEmpty());
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_UNLOCK_CNT), "");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NETWORK_LOCK), "");
    EXPECT_EQ(table().unlock_count, 7);
    for (const char *key : kKeys)
        EXPECT_EQ(recorded(group, key), std::nullopt) << key;
}

} // namespace zel_test
