#include "handler/zel-svc-applies.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <vector>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr ZelSvcParseMode kModes[] = {ZEL_SVC_PARSE_MODE_FULL,          ZEL_SVC_PARSE_MODE_PARTIAL,
                                      ZEL_SVC_PARSE_MODE_CUSTOMER_LIST, ZEL_SVC_PARSE_MODE_SECURITY_LOCK,
                                      ZEL_SVC_PARSE_MODE_OPERATOR_LIST, ZEL_SVC_PARSE_MODE_OPERATOR,
                                      ZEL_SVC_PARSE_MODE_HEADER};

bool applies(ZelSvcParseAction action, ZelSvcParseMode mode, std::int32_t flag) {
    gbZelSvcNetworkAutoFlags.fill(flag == 1 ? 0 : 1);
    gbZelSvcNetworkAutoFlags[ZEL_SVC_AUTO_BOOKMARK] = flag;
    return zel_svc_group_applies(Occurrence{.kind = OccurrenceKind::End, .action = action, .mode = mode},
                                 ZEL_SVC_AUTO_BOOKMARK);
}

// The modes in which a group with this flag applies.
std::vector<ZelSvcParseMode> modes_of(ZelSvcParseAction action, std::int32_t flag) {
    std::vector<ZelSvcParseMode> modes;
    for (const ZelSvcParseMode mode : kModes)
        if (applies(action, mode, flag)) modes.push_back(mode);
    return modes;
}

void set_operator(std::string_view name) {
    ZelSvcSimOperator &current = zel_svc_current_operator();
    zel_svc_text_copy(current.network_name, sizeof current.network_name, name);
}

void add_network(std::string_view name, std::int32_t id) {
    ZelSvcNetworkEntry entry{};
    zel_svc_text_copy(entry.network_name, sizeof entry.network_name, name);
    entry.network_id = id;
    zel_svc_network_table_append(entry);
}

std::vector<std::int32_t> networks_of(std::string_view name) {
    std::vector<std::int32_t> ids;
    zel_svc_for_each_network(name, [&](const ZelSvcNetworkEntry &entry) { ids.push_back(entry.network_id); });
    return ids;
}

TEST(GroupApplies, InstallsTheSpecsDataInFullModeAndTheSimsInOperatorMode) {
    EXPECT_THAT(modes_of(ZEL_SVC_PARSE_ACTION_INSTALL, 0), ElementsAre(ZEL_SVC_PARSE_MODE_FULL));
    EXPECT_THAT(modes_of(ZEL_SVC_PARSE_ACTION_INSTALL, 1), ElementsAre(ZEL_SVC_PARSE_MODE_OPERATOR));
}

TEST(GroupApplies, VerifiesTheSpecsDataInPartialMode) {
    EXPECT_THAT(modes_of(ZEL_SVC_PARSE_ACTION_VERIFY, 0), ElementsAre(ZEL_SVC_PARSE_MODE_PARTIAL));
    EXPECT_THAT(modes_of(ZEL_SVC_PARSE_ACTION_VERIFY, 1), IsEmpty());
}

TEST(GroupApplies, NeverInAnExport) {
    EXPECT_THAT(modes_of(ZEL_SVC_PARSE_ACTION_ENCODE, 0), IsEmpty());
    EXPECT_THAT(modes_of(ZEL_SVC_PARSE_ACTION_ENCODE, 1), IsEmpty());
}

TEST(ItemApplies, InstallsEveryNetworksInFullModeAndTheOperatorsInOperatorMode) {
    set_operator("One");
    for (const ZelSvcParseMode mode : kModes)
        for (const std::int32_t flag : {0, 1})
            for (const std::string_view name : {"One", "Two", "default", ""}) {
                gbZelSvcNetworkAutoFlags.fill(flag);
                const Occurrence end{.kind = OccurrenceKind::End, .action = ZEL_SVC_PARSE_ACTION_INSTALL, .mode = mode};
                const bool expected = (mode == ZEL_SVC_PARSE_MODE_FULL && flag == 0) ||
                                      (mode == ZEL_SVC_PARSE_MODE_OPERATOR && flag == 1 && name == "One");
                EXPECT_EQ(zel_svc_item_applies(end, ZEL_SVC_AUTO_WB_AMR, name), expected) << mode << name;
            }
}

TEST(ItemApplies, DefaultIsEveryOperatorsOnlyWhereTheGroupSaysSo) {
    set_operator("One");
    gbZelSvcNetworkAutoFlags.fill(1);
    const Occurrence end{
        .kind = OccurrenceKind::End, .action = ZEL_SVC_PARSE_ACTION_INSTALL, .mode = ZEL_SVC_PARSE_MODE_OPERATOR};
    for (const std::string_view name : {"One", "default"})
        EXPECT_TRUE(zel_svc_item_applies(end, ZEL_SVC_AUTO_WB_AMR, name, Wildcard::DefaultIsEverybodys)) << name;
    for (const std::string_view name : {"Two", "Default", ""})
        EXPECT_FALSE(zel_svc_item_applies(end, ZEL_SVC_AUTO_WB_AMR, name, Wildcard::DefaultIsEverybodys)) << name;
    EXPECT_FALSE(zel_svc_item_applies(end, ZEL_SVC_AUTO_WB_AMR, "default"));
}

TEST(ItemApplies, InInstallsOnly) {
    gbZelSvcNetworkAutoFlags.fill(0);
    for (const ZelSvcParseAction action : {ZEL_SVC_PARSE_ACTION_VERIFY, ZEL_SVC_PARSE_ACTION_ENCODE})
        for (const ZelSvcParseMode mode : kModes) {
            const Occurrence end{.kind = OccurrenceKind::End, .action = action, .mode = mode};
            EXPECT_FALSE(zel_svc_item_applies(end, ZEL_SVC_AUTO_WB_AMR, "One"));
        }
}

TEST(CurrentOperator, IsFoundByItsWholeName) {
    set_operator("One");
    EXPECT_TRUE(zel_svc_is_current_operators("One"));
    EXPECT_FALSE(zel_svc_is_current_operators("On"));
    EXPECT_FALSE(zel_svc_is_current_operators("one"));
    EXPECT_FALSE(zel_svc_is_current_operators("One "));
}

TEST(CurrentOperator, EmptyNameIsNobodys) {
    set_operator("");
    EXPECT_FALSE(zel_svc_is_current_operators(""));
    EXPECT_FALSE(zel_svc_is_current_operators("", Wildcard::DefaultIsEverybodys));
    set_operator("One");
    EXPECT_FALSE(zel_svc_is_current_operators(""));
    EXPECT_FALSE(zel_svc_is_current_operators("", Wildcard::DefaultIsEverybodys));
}

TEST(CurrentOperator, DefaultIsEverybodysOnlyWhereTheGroupSaysSo) {
    set_operator("One");
    EXPECT_FALSE(zel_svc_is_current_operators("default"));
    EXPECT_TRUE(zel_svc_is_current_operators("default", Wildcard::DefaultIsEverybodys));
    EXPECT_FALSE(zel_svc_is_current_operators("Default", Wildcard::DefaultIsEverybodys));
    EXPECT_TRUE(zel_svc_is_current_operators("One", Wildcard::DefaultIsEverybodys));
}

TEST(CurrentOperator, CutNamesMatchEachOther) {
    const std::string name(60, 'n');
    set_operator(name);
    EXPECT_TRUE(zel_svc_is_current_operators(std::string(39, 'n')));
    EXPECT_FALSE(zel_svc_is_current_operators(name));
}

TEST(Networks, NameStandsForItsEntriesInOrder) {
    add_network("One", 1);
    add_network("Two", 2);
    add_network("One", 3);
    add_network("default", 4);
    add_network("", 5);
    EXPECT_THAT(networks_of("One"), ElementsAre(1, 3));
    EXPECT_THAT(networks_of("Two"), ElementsAre(2));
    EXPECT_THAT(networks_of("Three"), IsEmpty());
    EXPECT_THAT(networks_of("one"), IsEmpty());
}

TEST(Networks, EmptyNameAndDefaultStandForAll) {
    add_network("One", 1);
    add_network("Two", 2);
    EXPECT_THAT(networks_of(""), ElementsAre(1, 2));
    EXPECT_THAT(networks_of("default"), ElementsAre(1, 2));
    EXPECT_THAT(networks_of("Default"), IsEmpty());
}

TEST(Networks, EmptyTableHasNone) {
    EXPECT_THAT(networks_of(""), IsEmpty());
    EXPECT_THAT(networks_of("One"), IsEmpty());
}

} // namespace
