#include "network-phone.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr const char *kRows = "select * from max_pdp order by max_id";

std::string leaf(const std::string &tag, const std::string &text) {
    return text.empty() ? "" : "<" + tag + ">" + text + "</" + tag + ">";
}

// One MaxPDP element; an empty text leaves its element out.
std::string spec(const std::string &network, const std::string &limit_2g, const std::string &limit_3g) {
    return "<MaxPDP>" + leaf("NetworkName", network) + leaf("MaxPDP2G", limit_2g) + leaf("MaxPDP3G", limit_3g) +
           "</MaxPDP>";
}

constexpr const char *kCount = "<NbMaxPDP>1</NbMaxPDP>";

} // namespace

class MaxPdp : public NetworkPhone {
  protected:
    void SetUp() override {
        NetworkPhone::SetUp();
        group_.emplace(ZEL_SVC_DATA_MAX_PDP);
        add_network("One", "26201", 5);
        choose_operator("One", "26201");
    }

    [[nodiscard]] std::optional<std::string> recorded(const char *key) const { return group_->text("max_pdp", key); }
    [[nodiscard]] std::optional<int> number(const char *key) const { return group_->number("max_pdp", key); }
    [[nodiscard]] SqliteRows rows() const { return NetworkPhone::rows(kRows); }
    void expect_nothing() const {
        EXPECT_THAT(rows(), IsEmpty());
        EXPECT_EQ(recorded("count"), std::nullopt);
        EXPECT_EQ(recorded("network_name_1"), std::nullopt);
    }
    static void set(const char *key, int value) { zel_svc_data_set_int(ZEL_SVC_DATA_MAX_PDP, "max_pdp", key, value); }

  private:
    std::optional<LoadedGroup> group_;
};

TEST_F(MaxPdp, OnlyTheLimitOf3gIsARow) {
    install_spec(spec("One", "2", "3"));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "5", "3"}}));
    EXPECT_EQ(number("count"), 1);
    EXPECT_EQ(recorded("network_name_1"), "One");
    EXPECT_EQ(number("max_pdp_2g_1"), 2);
    EXPECT_EQ(number("max_pdp_3g_1"), 3);
}

TEST_F(MaxPdp, FirstLimitOfANetworkStaysButEachIsRecorded) {
    install_spec(spec("One", "", "3") + spec("One", "", "6"));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "5", "3"}}));
    EXPECT_EQ(number("count"), 2);
    EXPECT_EQ(number("max_pdp_3g_1"), 3);
    EXPECT_EQ(number("max_pdp_3g_2"), 6);
    EXPECT_EQ(recorded("max_pdp_2g_1"), std::nullopt);
}

TEST_F(MaxPdp, LimitOf2gAloneTouchesNoRow) {
    install_spec(spec("One", "2", ""));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_EQ(number("count"), 1);
    EXPECT_EQ(number("max_pdp_2g_1"), 2);
    EXPECT_EQ(recorded("max_pdp_3g_1"), std::nullopt);
}

TEST_F(MaxPdp, ItemWithoutLimitsIsCounted) {
    install_spec(spec("One", "", "") + spec("", "", ""));
    EXPECT_EQ(number("count"), 2);
    EXPECT_EQ(recorded("network_name_1"), "One");
    EXPECT_EQ(recorded("network_name_2"), "");
    EXPECT_EQ(recorded("max_pdp_2g_1"), std::nullopt);
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(MaxPdp, LimitsAreReadAsNumbers) {
    install_spec(spec("One", "05", " 7x") + spec("Other", "many", "-1"));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "5", "7"}}));
    EXPECT_EQ(number("max_pdp_2g_1"), 5);
    EXPECT_EQ(number("max_pdp_3g_1"), 7);
    EXPECT_EQ(number("max_pdp_2g_2"), 0);
    EXPECT_EQ(number("max_pdp_3g_2"), -1);
}

TEST_F(MaxPdp, NewRowsFollowTheLargestId) {
    run("insert into max_pdp values(41, 99, 1), (7, 98, 1)");
    add_network("Two", "26202", 6);
    install_spec(spec("default", "", "4"));
    EXPECT_EQ(rows(), (SqliteRows{{"7", "98", "1"}, {"41", "99", "1"}, {"42", "5", "4"}, {"43", "6", "4"}}));
}

TEST_F(MaxPdp, NoIdFollowsTheLargestInteger) {
    run("insert into max_pdp values(2147483647, 99, 1)");
    install_spec(spec("One", "2", "3"));
    EXPECT_EQ(rows().size(), 1U);
    EXPECT_EQ(number("count"), 1);
    EXPECT_EQ(number("max_pdp_2g_1"), 2);
    EXPECT_EQ(recorded("max_pdp_3g_1"), std::nullopt);
}

TEST_F(MaxPdp, NameStandsForEachNetworkOfIt) {
    add_network("Two", "26202", 6);
    add_network("One", "26203", 7);
    install_spec(spec("One", "", "3"));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "5", "3"}, {"2", "7", "3"}}));
    EXPECT_EQ(number("count"), 1);
}

TEST_F(MaxPdp, DefaultAndNoNameStandForEveryNetwork) {
    install_spec(spec("default", "", "3"));
    add_network("Two", "26202", 6);
    install_spec(spec("", "", "4"));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "5", "3"}, {"2", "6", "4"}}));
    EXPECT_EQ(recorded("network_name_1"), "default");
    EXPECT_EQ(recorded("network_name_2"), "");
    EXPECT_EQ(number("max_pdp_3g_2"), 4);
}

TEST_F(MaxPdp, NamesWithoutANetworkAreRecordedAllTheSame) {
    install_spec(spec("Other", "2", "3"));
    zel_svc_network_table_clear();
    install_spec(spec("default", "", "4"));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_EQ(number("count"), 2);
    EXPECT_EQ(number("max_pdp_3g_1"), 3);
    EXPECT_EQ(number("max_pdp_3g_2"), 4);
}

TEST_F(MaxPdp, NamesAndTextsAreCutToTheirFields) {
    add_network(std::string(39, 'n'), "26202", 6);
    install_spec(spec(std::string(60, 'n'), std::string(18, '0') + "123", std::string(18, '0') + "456"));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "6", "4"}}));
    EXPECT_EQ(recorded("network_name_1"), std::string(39, 'n'));
    EXPECT_EQ(number("max_pdp_2g_1"), 1);
}

// When it applies

TEST_F(MaxPdp, FullInstallLeavesTheSimsItemsOut) {
    run("insert into max_pdp values(3, 5, 9)");
    set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, 1);
    install_spec(kCount + spec("One", "2", "3"));
    EXPECT_EQ(rows(), (SqliteRows{{"3", "5", "9"}}));
    EXPECT_EQ(recorded("count"), std::nullopt);
}

TEST_F(MaxPdp, OperatorInstallTakesTheOperatorsItemsOnly) {
    add_network("Two", "26202", 6);
    set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, 1);
    install_spec(spec("Two", "1", "1") + spec("One", "2", "3") + spec("default", "4", "4") + spec("", "5", "5") +
                     spec("one", "6", "6"),
                 ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(rows(), (SqliteRows{{"1", "5", "3"}}));
    EXPECT_EQ(number("count"), 1);
    EXPECT_EQ(recorded("network_name_1"), "One");
    EXPECT_EQ(number("max_pdp_2g_1"), 2);
    EXPECT_EQ(number("max_pdp_3g_1"), 3);
}

TEST_F(MaxPdp, OperatorInstallRegistersTheNetworkWhereItIsNew) {
    zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM2);
    set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, 1);
    install_spec(spec("One", "", "3") + spec("One", "2", ""), ZEL_SVC_PARSE_MODE_OPERATOR);
    const SqliteFile second{file(ZEL_SVC_NETWORK_DB_PATH_SIM2)};
    EXPECT_EQ(second.rows("select * from network_info"), (SqliteRows{{"1", "One", "26201"}}));
    EXPECT_EQ(second.rows(kRows), (SqliteRows{{"1", "1", "3"}}));
    EXPECT_EQ(number("count"), 2);
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(MaxPdp, OperatorInstallNeedsTheFlag) {
    install_spec(kCount + spec("One", "2", "3"), ZEL_SVC_PARSE_MODE_OPERATOR);
    expect_nothing();
}

TEST_F(MaxPdp, OperatorWithoutNameHasNoItems) {
    choose_operator("", "26201");
    set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, 1);
    install_spec(spec("", "2", "3"), ZEL_SVC_PARSE_MODE_OPERATOR);
    expect_nothing();
}

TEST_F(MaxPdp, OtherModesInstallNone) {
    for (const int flag : {0, 1})
        for (const ZelSvcParseMode mode : kModesWithoutItems) {
            set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, flag);
            install_spec(kCount + spec("One", "2", "3"), mode);
            expect_nothing();
        }
}

// The count

class MaxPdpCount : public MaxPdp {
  protected:
    void SetUp() override {
        MaxPdp::SetUp();
        add_network("Two", "26202", 6);
        run("insert into network_info values(9, 'Elsewhere', '20801'), (10, 'One again', '26201')");
        run("insert into max_pdp values(1, 5, 1), (2, 6, 2), (3, 9, 3), (4, 10, 4), (5, 77, 5), (6, 5, 6)");
    }
    [[nodiscard]] SqliteRows ids() const { return NetworkPhone::rows("select max_id from max_pdp order by 1"); }
};

TEST_F(MaxPdpCount, FullInstallRemovesTheLimitsOfTheCustomersNetworks) {
    install_spec(kCount);
    EXPECT_EQ(ids(), (SqliteRows{{"3"}, {"5"}}));
    EXPECT_EQ(recorded("count"), std::nullopt);
}

TEST_F(MaxPdpCount, OperatorInstallRemovesTheOperatorsLimits) {
    set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, 1);
    install_spec(kCount, ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(ids(), (SqliteRows{{"2"}, {"3"}, {"5"}}));
}

TEST_F(MaxPdpCount, OtherFlagsAndModesRemoveNothing) {
    install_spec(kCount, ZEL_SVC_PARSE_MODE_OPERATOR);
    for (const ZelSvcParseMode mode : kModesWithoutItems)
        install_spec(kCount, mode);
    set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, 1);
    install_spec(kCount);
    verify_spec(kCount);
    EXPECT_EQ(ids().size(), 6U);
}

TEST_F(MaxPdpCount, IsNeitherComparedNorExported) {
    set("count", 3);
    EXPECT_THAT(verify_spec("<NbMaxPDP>2</NbMaxPDP>"), IsEmpty());
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_MAX_PDP), "");
    EXPECT_EQ(ids().size(), 6U);
    EXPECT_EQ(number("count"), 3);
}

TEST_F(MaxPdp, LimitOfAnEarlierInstallStaysUntilTheCountRemovesIt) {
    install_spec(spec("One", "", "3"));
    install_spec(spec("One", "", "6"));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "5", "3"}}));
    install_spec(kCount + spec("One", "", "6"));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "5", "6"}}));
}

// Verification and export

TEST_F(MaxPdp, VerificationComparesWhatIsRecorded) {
    install_spec(spec("One", "2", "3") + spec("Two", "", "") + spec("One", "0", "") + spec("One", "", "9"));
    EXPECT_THAT(
        verify_spec(kCount + spec("One", "2", "4") + spec("Two", "", "") + spec("Any", "0", "1") + spec("", "5", "09") +
                    spec("One", "7", "")),
        ElementsAre(passed("[MaxPDP1/MaxPDP2G] Spec='2',Phone='2'"), failed("[MaxPDP1/MaxPDP3G] Spec='4',Phone='3'"),
                    passed("[MaxPDP3/MaxPDP2G] Spec='0',Phone='0'"), failed("[MaxPDP3/MaxPDP3G] Spec='1',Phone=''"),
                    failed("[MaxPDP4/MaxPDP2G] Spec='5',Phone=''"), failed("[MaxPDP4/MaxPDP3G] Spec='09',Phone='9'"),
                    failed("[MaxPDP5/MaxPDP2G] Spec='7',Phone=''")));
    EXPECT_EQ(number("count"), 4);
    EXPECT_EQ(rows(), (SqliteRows{{"1", "5", "3"}}));
}

TEST_F(MaxPdp, VerificationShowsALimitThatTheSpecLacks) {
    set("max_pdp_2g_1", 2);
    set("max_pdp_3g_1", -5);
    set("max_pdp_2g_2", -1); // reads as absent
    EXPECT_THAT(
        verify_spec(spec("One", "", "") + spec("One", "", "")),
        ElementsAre(failed("[MaxPDP1/MaxPDP2G] Spec='',Phone='2'"), failed("[MaxPDP1/MaxPDP3G] Spec='',Phone='-5'")));
}

TEST_F(MaxPdp, TheCountStartsVerificationAtTheFirstItemAgain) {
    set("max_pdp_2g_1", 1);
    set("max_pdp_2g_2", 2);
    verify_spec(spec("", "1", ""));
    EXPECT_THAT(verify_spec(spec("", "2", "")), ElementsAre(passed("[MaxPDP2/MaxPDP2G] Spec='2',Phone='2'")));
    set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, 1);
    verify_spec(kCount, ZEL_SVC_PARSE_MODE_FULL); // whatever flag and mode
    set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, 0);
    EXPECT_THAT(verify_spec(spec("", "1", "")), ElementsAre(passed("[MaxPDP1/MaxPDP2G] Spec='1',Phone='1'")));
}

TEST_F(MaxPdp, WhatIsNotVerifiedDoesNotCount) {
    set("max_pdp_2g_1", 1);
    EXPECT_THAT(verify_spec(spec("", "1", ""), ZEL_SVC_PARSE_MODE_FULL), IsEmpty());
    EXPECT_THAT(verify_spec(spec("", "1", ""), ZEL_SVC_PARSE_MODE_OPERATOR), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, 1);
    EXPECT_THAT(verify_spec(spec("", "1", "")), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, 0);
    EXPECT_THAT(verify_spec(spec("", "1", "")), ElementsAre(passed("[MaxPDP1/MaxPDP2G] Spec='1',Phone='1'")));
}

TEST_F(MaxPdp, ItemsAreExportedInTheirOrder) {
    install_spec(spec("One", "2", "3") + spec("default", "", "-7"));
    set("max_pdp_2g_2", -1);
    const auto item = [] {
        export_start(ZEL_SVC_ELEMENT_MAX_PDP);
        std::vector<std::string> texts{export_value(ZEL_SVC_ELEMENT_MAX_PDP_NETWORK_NAME),
                                       export_value(ZEL_SVC_ELEMENT_MAX_PDP_2G),
                                       export_value(ZEL_SVC_ELEMENT_MAX_PDP_3G)};
        export_end(ZEL_SVC_ELEMENT_MAX_PDP);
        return texts;
    };
    for (int round = 0; round < 2; ++round) {
        EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_MAX_PDP), "");
        EXPECT_THAT(item(), ElementsAre("One", "2", "3"));
        EXPECT_THAT(item(), ElementsAre("default", "", "-7"));
        EXPECT_THAT(item(), ElementsAre("", "", ""));
    }
}

// Lifecycle

TEST_F(MaxPdp, ItemLeftOpenIsDroppedByTheNext) {
    install_spec("<MaxPDP><NetworkName>One</NetworkName><MaxPDP3G>3</MaxPDP3G><broken");
    install_spec("<MaxPDP><MaxPDP2G>2</MaxPDP2G></MaxPDP>");
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_EQ(recorded("network_name_1"), "");
    EXPECT_EQ(number("max_pdp_2g_1"), 2);
}

TEST_F(MaxPdp, ValuesOutsideAnItemDoNothing) {
    install_spec("<MaxPDP3G>3</MaxPDP3G><MaxPDP2G>2</MaxPDP2G>" + spec("One", "", ""));
    EXPECT_EQ(number("count"), 1);
    EXPECT_EQ(recorded("max_pdp_2g_1"), std::nullopt);
    EXPECT_EQ(recorded("max_pdp_3g_1"), std::nullopt);
}

// Failures: the item is recorded without its 3G limit, nothing is said

class MaxPdpFailure : public MaxPdp {
  protected:
    void install_and_expect_no_3g_limit() {
        const int number_of_item = number("count").value_or(0) + 1;
        const std::string n = std::to_string(number_of_item);
        install_spec(kCount + spec("One", "2", "3"));
        EXPECT_EQ(number("count"), number_of_item);
        EXPECT_EQ(recorded(("network_name_" + n).c_str()), "One");
        EXPECT_EQ(number(("max_pdp_2g_" + n).c_str()), 2);
        EXPECT_EQ(recorded(("max_pdp_3g_" + n).c_str()), std::nullopt);
        EXPECT_EQ(run_log(), "");
        EXPECT_THAT(system_log(), IsEmpty());
    }
};

TEST_F(MaxPdpFailure, RefusedOpen) {
    fail("db_util_open");
    install_and_expect_no_3g_limit();
}

TEST_F(MaxPdpFailure, RefusedPrepare) {
    fail("sqlite3_prepare_v2");
    install_and_expect_no_3g_limit();
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(MaxPdpFailure, MissingTable) {
    run("drop table max_pdp");
    install_and_expect_no_3g_limit();
}

TEST_F(MaxPdpFailure, OtherColumns) {
    run("alter table max_pdp drop column max_pdp_3g");
    install_and_expect_no_3g_limit();
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(MaxPdpFailure, EachStatementThatFails) {
    for (const char *statement :
         {"select count(*) from max_pdp", "select count(*), max(max_id)", "insert into max_pdp"}) {
        fail("sqlite3_step", statement);
        install_and_expect_no_3g_limit();
        EXPECT_THAT(rows(), IsEmpty()) << statement;
        call("fault-clear");
    }
}

TEST_F(MaxPdpFailure, RefusedDeleteKeepsTheEarlierLimit) {
    run("insert into max_pdp values(3, 5, 9)");
    fail("sqlite3_step", "delete from max_pdp");
    install_spec(kCount + spec("One", "2", "3"));
    EXPECT_EQ(rows(), (SqliteRows{{"3", "5", "9"}}));
    EXPECT_EQ(number("max_pdp_3g_1"), 3);
}

TEST_F(MaxPdpFailure, LockedDatabase) {
    const SqliteFile other{file()};
    other.run("begin immediate");
    install_and_expect_no_3g_limit();
    other.run("rollback");
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(MaxPdpFailure, FirstNetworkThatFailsEndsTheItem) {
    add_network("Two", "26202", 6);
    add_network("Three", "26203", 7);
    run("create trigger no_two before insert on max_pdp when new.network_info_id=6 "
        "begin select raise(abort, 'no'); end");
    install_spec(spec("default", "", "3"));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "5", "3"}}));
    EXPECT_EQ(number("count"), 1);
    EXPECT_EQ(recorded("max_pdp_3g_1"), std::nullopt);
}

TEST_F(MaxPdpFailure, OperatorsNetworkThatCannotBeResolvedRecordsNothing) {
    set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, 1);
    run("create trigger no_update before update on network_info begin select raise(abort, 'no'); end");
    install_spec(spec("One", "2", "3"), ZEL_SVC_PARSE_MODE_OPERATOR);
    expect_nothing();
}

TEST_F(MaxPdpFailure, OperatorsLimitThatFailsIsNotRecorded) {
    set_auto_flag(ZEL_SVC_AUTO_MAX_PDP, 1);
    fail("sqlite3_step", "insert into max_pdp");
    install_spec(spec("One", "2", "3"), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_EQ(number("max_pdp_2g_1"), 2);
    EXPECT_EQ(recorded("max_pdp_3g_1"), std::nullopt);
}

} // namespace zel_test
