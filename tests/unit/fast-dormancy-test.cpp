#include "network-phone.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr const char *kRows = "select * from fast_dormancy order by dormant_id";

// One FastDormancy element; an empty text leaves its element out.
struct Item {
    std::string network;
    std::string enable;
    std::string lcd;
    std::string timeout;
    std::string version = {};
};

std::string leaf(const std::string &tag, const std::string &text) {
    return text.empty() ? "" : "<" + tag + ">" + text + "</" + tag + ">";
}

std::string spec(const Item &item) {
    return "<FastDormancy>" + leaf("NetworkName", item.network) + leaf("FastDormancyEnableStatus", item.enable) +
           leaf("TimeoutValue", item.timeout) + leaf("LCDStatus", item.lcd) + leaf("Version", item.version) +
           "</FastDormancy>";
}

std::string count(const std::string &text) { return "<NbFastDormancy>" + text + "</NbFastDormancy>"; }

} // namespace

class FastDormancy : public NetworkPhone {
  protected:
    void SetUp() override {
        NetworkPhone::SetUp();
        group_.emplace(ZEL_SVC_DATA_FAST_DORMANCY);
        add_network("One", "26201", 5);
        choose_operator("One", "26201");
    }

    [[nodiscard]] std::optional<std::string> recorded(const char *key) const { return group_->text("spec", key); }
    [[nodiscard]] std::optional<int> number(const char *key) const { return group_->number("spec", key); }
    [[nodiscard]] SqliteRows rows() const { return NetworkPhone::rows(kRows); }
    // Whatever an install left: rows of the table and recorded items.
    void expect_nothing() const {
        EXPECT_THAT(rows(), IsEmpty());
        EXPECT_EQ(recorded("count"), std::nullopt);
        EXPECT_EQ(recorded("network_name_1"), std::nullopt);
    }
    void record(int item, int enable, int lcd, int timeout, const char *version) const {
        const std::string n = std::to_string(item);
        set("enable_" + n, enable);
        set("lcd_" + n, lcd);
        set("time_out_" + n, timeout);
        zel_svc_data_set_str(ZEL_SVC_DATA_FAST_DORMANCY, "spec", ("version_" + n).c_str(), version);
    }
    static void set(const std::string &key, int value) {
        zel_svc_data_set_int(ZEL_SVC_DATA_FAST_DORMANCY, "spec", key.c_str(), value);
    }

  private:
    std::optional<LoadedGroup> group_;
};

TEST_F(FastDormancy, ScreenOnOfRelease8IsItsOwnColumn) {
    install_spec(spec({"One", "on", "on", "2.5", "rel8"}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "-1", "-1", "2500", "-1"}}));
    EXPECT_EQ(number("count"), 1);
    EXPECT_EQ(recorded("network_name_1"), "One");
    EXPECT_EQ(number("enable_1"), 1);
    EXPECT_EQ(number("lcd_1"), 1);
    EXPECT_EQ(number("time_out_1"), 2500);
    EXPECT_EQ(recorded("version_1"), "rel8");
}

TEST_F(FastDormancy, FourElementsOfANetworkShareOneRow) {
    install_spec(spec({"One", "on", "on", "10"}) + spec({"One", "on", "off", "3.25"}) +
                 spec({"One", "on", "on", "7", "rel8"}) + spec({"One", "on", "off", "0", "rel8"}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "10000", "3250", "7000", "0"}}));
    EXPECT_EQ(number("count"), 4);
    EXPECT_EQ(number("lcd_2"), 0);
    EXPECT_EQ(number("time_out_2"), 3250);
    EXPECT_EQ(recorded("version_2"), "");
    EXPECT_EQ(number("time_out_4"), 0);
}

TEST_F(FastDormancy, EveryOtherVersionIsTheOlderOne) {
    for (const char *version : {"rel7", "REL8", "rel8 ", "rel99"}) {
        install_spec(spec({"One", "on", "on", "4", version}));
        EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "4000", "-1", "-1", "-1"}})) << version;
    }
    EXPECT_EQ(recorded("version_2"), "REL8");
}

TEST_F(FastDormancy, OffIsMinusOneWhateverTheTime) {
    install_spec(spec({"One", "on", "on", "10"}) + spec({"One", "off", "on", "10"}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "-1", "-1", "-1", "-1"}}));
    EXPECT_EQ(number("enable_2"), 0);
    EXPECT_EQ(number("time_out_2"), 10000);
}

TEST_F(FastDormancy, OnWithoutATimeIsZeroAndRecordsNoTime) {
    install_spec(spec({"One", "on", "off", ""}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "-1", "0", "-1", "-1"}}));
    EXPECT_EQ(number("count"), 1);
    EXPECT_EQ(recorded("time_out_1"), std::nullopt);
}

TEST_F(FastDormancy, TimesAreExactMilliseconds) {
    install_spec(spec({"One", "on", "on", "32.3"}) + spec({"One", "on", "off", "1e1"}) +
                 spec({"One", "on", "on", "soon", "rel8"}) + spec({"One", "on", "off", "9999999", "rel8"}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "32300", "10000", "0", "2147483647"}}));
    EXPECT_EQ(number("time_out_3"), 0);
}

TEST_F(FastDormancy, UnknownScreenStatusLeavesANewRowOffAndRecordsNothing) {
    for (const char *lcd : {"dim", "On", "on "})
        install_spec(spec({"One", "on", lcd, "2"}));
    install_spec(spec({"One", "off", "", "2"}) + spec({"One", "on", "", "2"}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "-1", "-1", "-1", "-1"}}));
    EXPECT_EQ(recorded("count"), std::nullopt);
}

TEST_F(FastDormancy, UnknownEnableStatusLeavesTheRowAsItWas) {
    install_spec(spec({"One", "on", "on", "10"}));
    for (const char *enable : {"", "enable", "ON"})
        install_spec(spec({"One", enable, "on", "2"}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "10000", "-1", "-1", "-1"}}));
    EXPECT_EQ(number("count"), 1);
}

TEST_F(FastDormancy, NewRowsFollowTheLargestId) {
    run("insert into fast_dormancy values(41, 99, 1, 2, 3, 4), (7, 98, 1, 2, 3, 4)");
    add_network("Two", "26202", 6);
    install_spec(spec({"One", "on", "on", "1"}) + spec({"Two", "on", "on", "2"}));
    EXPECT_EQ(rows(), (SqliteRows{{"7", "98", "1", "2", "3", "4"},
                                  {"41", "99", "1", "2", "3", "4"},
                                  {"42", "5", "1000", "-1", "-1", "-1"},
                                  {"43", "6", "2000", "-1", "-1", "-1"}}));
}

TEST_F(FastDormancy, RowOfANegativeIdIsNoRow) {
    run("insert into fast_dormancy values(-3, 5, 1, 2, 3, 4)");
    install_spec(spec({"One", "on", "on", "1"}));
    EXPECT_EQ(rows(), (SqliteRows{{"-3", "5", "1", "2", "3", "4"}, {"-2", "5", "1000", "-1", "-1", "-1"}}));
}

TEST_F(FastDormancy, FirstRowThatIsOneIsReused) {
    run("insert into fast_dormancy values(-3, 5, 1, 2, 3, 4), (8, 5, 1, 2, 3, 4), (9, 5, 1, 2, 3, 4)");
    install_spec(spec({"One", "on", "off", "6"}));
    EXPECT_EQ(rows(),
              (SqliteRows{
                  {"-3", "5", "1", "2", "3", "4"}, {"8", "5", "1", "6000", "3", "4"}, {"9", "5", "1", "2", "3", "4"}}));
}

TEST_F(FastDormancy, NoIdFollowsTheLargestInteger) {
    run("insert into fast_dormancy values(2147483647, 99, 1, 2, 3, 4)");
    install_spec(spec({"One", "on", "on", "1"}));
    EXPECT_EQ(rows().size(), 1U);
    EXPECT_EQ(recorded("count"), std::nullopt);
}

TEST_F(FastDormancy, NameStandsForEachNetworkOfIt) {
    add_network("Two", "26202", 6);
    add_network("One", "26203", 7);
    install_spec(spec({"One", "on", "on", "1"}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "1000", "-1", "-1", "-1"}, {"1", "7", "1000", "-1", "-1", "-1"}}));
    EXPECT_EQ(number("count"), 1);
}

TEST_F(FastDormancy, DefaultAndNoNameStandForEveryNetwork) {
    add_network("Two", "26202", 6);
    install_spec(spec({"default", "on", "on", "1"}) + spec({"", "on", "off", "2"}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "1000", "2000", "-1", "-1"}, {"1", "6", "1000", "2000", "-1", "-1"}}));
    EXPECT_EQ(number("count"), 2);
    EXPECT_EQ(recorded("network_name_1"), "default");
    EXPECT_EQ(recorded("network_name_2"), "");
}

TEST_F(FastDormancy, NamesWithoutANetworkAreRecordedAllTheSame) {
    install_spec(spec({"Other", "on", "on", "1"}) + spec({"one", "on", "on", "1"}));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_EQ(number("count"), 2);
    EXPECT_EQ(recorded("network_name_1"), "Other");
}

TEST_F(FastDormancy, EmptyNetworkTableRecordsOnly) {
    zel_svc_network_table_clear();
    install_spec(spec({"default", "on", "on", "1"}) + spec({"One", "maybe", "dim", "1"}));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_EQ(number("count"), 2);
    EXPECT_EQ(recorded("enable_2"), std::nullopt);
    EXPECT_EQ(recorded("lcd_2"), std::nullopt);
    EXPECT_EQ(number("time_out_2"), 1000);
    EXPECT_EQ(recorded("version_2"), "");
}

TEST_F(FastDormancy, LaterParseGoesOnBehindTheRecordedCount) {
    install_spec(spec({"One", "on", "on", "1"}));
    install_spec(spec({"One", "on", "off", "2"}));
    EXPECT_EQ(number("count"), 2);
    EXPECT_EQ(number("time_out_1"), 1000);
    EXPECT_EQ(number("time_out_2"), 2000);
}

TEST_F(FastDormancy, NamesAndTextsAreCutToTheirFields) {
    add_network(std::string(39, 'n'), "26202", 6);
    install_spec(spec({std::string(60, 'n'), "on", "on", "1", std::string(30, 'v')}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "6", "1000", "-1", "-1", "-1"}}));
    EXPECT_EQ(recorded("network_name_1"), std::string(39, 'n'));
    EXPECT_EQ(recorded("version_1"), std::string(19, 'v'));
}

TEST_F(FastDormancy, QuotesInNamesAreTextLikeAny) {
    add_table_entry("It's", "26202", 6);
    install_spec(spec({"It's", "on", "on", "1"}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "6", "1000", "-1", "-1", "-1"}}));
    EXPECT_EQ(recorded("network_name_1"), "It's");
}

// When it applies

TEST_F(FastDormancy, FullInstallLeavesTheSimsItemsOut) {
    run("insert into fast_dormancy values(3, 5, 1, 2, 3, 4)");
    set_auto_flag(ZEL_SVC_AUTO_FAST_DORMANCY, 1);
    install_spec(count("1") + spec({"One", "on", "on", "1"}) + spec({"default", "on", "on", "1"}));
    EXPECT_EQ(rows(), (SqliteRows{{"3", "5", "1", "2", "3", "4"}}));
    EXPECT_EQ(recorded("count"), std::nullopt);
}

TEST_F(FastDormancy, OperatorInstallTakesTheOperatorsItemsOnly) {
    add_network("Two", "26202", 6);
    set_auto_flag(ZEL_SVC_AUTO_FAST_DORMANCY, 1);
    install_spec(spec({"Two", "on", "on", "1"}) + spec({"One", "on", "on", "2"}) + spec({"default", "on", "on", "3"}) +
                     spec({"", "on", "on", "4"}) + spec({"one", "on", "on", "5"}),
                 ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "2000", "-1", "-1", "-1"}}));
    EXPECT_EQ(number("count"), 1);
    EXPECT_EQ(recorded("network_name_1"), "One");
}

TEST_F(FastDormancy, OperatorInstallRegistersTheNetworkWhereItIsNew) {
    zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM2);
    set_auto_flag(ZEL_SVC_AUTO_FAST_DORMANCY, 1);
    install_spec(spec({"One", "on", "on", "2"}), ZEL_SVC_PARSE_MODE_OPERATOR);
    const SqliteFile second{file(ZEL_SVC_NETWORK_DB_PATH_SIM2)};
    EXPECT_EQ(second.rows("select * from network_info"), (SqliteRows{{"1", "One", "26201"}}));
    EXPECT_EQ(second.rows(kRows), (SqliteRows{{"0", "1", "2000", "-1", "-1", "-1"}}));
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(FastDormancy, OperatorInstallNeedsTheFlag) {
    install_spec(count("1") + spec({"One", "on", "on", "1"}), ZEL_SVC_PARSE_MODE_OPERATOR);
    expect_nothing();
}

TEST_F(FastDormancy, OperatorWithoutNameHasNoItems) {
    choose_operator("", "26201");
    set_auto_flag(ZEL_SVC_AUTO_FAST_DORMANCY, 1);
    install_spec(spec({"", "on", "on", "1"}), ZEL_SVC_PARSE_MODE_OPERATOR);
    expect_nothing();
}

TEST_F(FastDormancy, OtherModesInstallNone) {
    for (const int flag : {0, 1})
        for (const ZelSvcParseMode mode : kModesWithoutItems) {
            set_auto_flag(ZEL_SVC_AUTO_FAST_DORMANCY, flag);
            install_spec(count("1") + spec({"One", "on", "on", "1"}), mode);
            expect_nothing();
        }
}

// The count

class FastDormancyCount : public FastDormancy {
  protected:
    void SetUp() override {
        FastDormancy::SetUp();
        add_network("Two", "26202", 6);
        run("insert into network_info values(9, 'Elsewhere', '20801'), (10, 'One again', '26201')");
        run("insert into fast_dormancy values(0, 5, 1, 1, 1, 1), (1, 6, 2, 2, 2, 2), (2, 9, 3, 3, 3, 3), "
            "(3, 10, 4, 4, 4, 4), (4, 77, 5, 5, 5, 5)");
    }
    [[nodiscard]] SqliteRows ids() const {
        return NetworkPhone::rows("select dormant_id from fast_dormancy order by 1");
    }
};

TEST_F(FastDormancyCount, FullInstallRemovesTheRowsOfTheCustomersNetworks) {
    set("count", 3);
    install_spec(count("0"));
    EXPECT_EQ(ids(), (SqliteRows{{"2"}, {"4"}}));
    EXPECT_EQ(number("count"), 3);
}

TEST_F(FastDormancyCount, OperatorInstallRemovesTheOperatorsRows) {
    set_auto_flag(ZEL_SVC_AUTO_FAST_DORMANCY, 1);
    install_spec(count("2"), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(ids(), (SqliteRows{{"1"}, {"2"}, {"4"}}));
}

TEST_F(FastDormancyCount, OtherFlagsAndModesRemoveNothing) {
    install_spec(count("1"), ZEL_SVC_PARSE_MODE_OPERATOR);
    for (const ZelSvcParseMode mode : kModesWithoutItems)
        install_spec(count("1"), mode);
    set_auto_flag(ZEL_SVC_AUTO_FAST_DORMANCY, 1);
    install_spec(count("1"));
    verify_spec(count("1"));
    EXPECT_EQ(ids().size(), 5U);
}

TEST_F(FastDormancyCount, IsComparedWithTheRecordedCount) {
    EXPECT_THAT(verify_spec(count("2")), ElementsAre(failed("[FastDormancy/NbFastDormancy] Spec='2',Phone='0'")));
    set("count", 2);
    EXPECT_THAT(verify_spec(count("2")), ElementsAre(passed("[FastDormancy/NbFastDormancy] Spec='2',Phone='2'")));
    EXPECT_THAT(verify_spec(count("02")), ElementsAre(failed("[FastDormancy/NbFastDormancy] Spec='02',Phone='2'")));
    EXPECT_THAT(verify_spec(count("2"), ZEL_SVC_PARSE_MODE_FULL), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_FAST_DORMANCY, 1);
    EXPECT_THAT(verify_spec(count("2")), IsEmpty());
}

TEST_F(FastDormancyCount, IsExported) {
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_FAST_DORMANCY), "0");
    set("count", 12);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_FAST_DORMANCY), "12");
    EXPECT_EQ(ids().size(), 5U);
}

// Verification

TEST_F(FastDormancy, VerificationComparesWhatIsRecorded) {
    install_spec(spec({"One", "on", "on", "2.5", "rel8"}) + spec({"One", "off", "off", "", ""}));
    EXPECT_THAT(verify_spec(count("2") + spec({"One", "on", "on", "2.5", "rel8"}) + spec({"Any", "off", "off", ""})),
                ElementsAre(passed("[FastDormancy/NbFastDormancy] Spec='2',Phone='2'"),
                            passed("[FastDormancy1/EnableStatus] Spec='on',Phone='on'"),
                            passed("[FastDormancy1/LCDStatus] Spec='on',Phone='on'"),
                            passed("[FastDormancy1/TimeOut] Spec='2.5',Phone='2.5'"),
                            passed("[FastDormancy1/Version] Spec='rel8',Phone='rel8'"),
                            passed("[FastDormancy2/EnableStatus] Spec='off',Phone='off'"),
                            passed("[FastDormancy2/LCDStatus] Spec='off',Phone='off'")));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "-1", "-1", "2500", "-1"}}));
    EXPECT_EQ(number("count"), 2);
}

TEST_F(FastDormancy, VerificationFailsWhatDiffers) {
    record(1, 0, 0, 32300, "rel8");
    EXPECT_THAT(verify_spec(count("1") + spec({"One", "on", "on", "32.30"})),
                ElementsAre(failed("[FastDormancy/NbFastDormancy] Spec='1',Phone='0'"),
                            failed("[FastDormancy1/EnableStatus] Spec='on',Phone='off'"),
                            failed("[FastDormancy1/LCDStatus] Spec='on',Phone='off'"),
                            failed("[FastDormancy1/TimeOut] Spec='32.30',Phone='32.3'"),
                            failed("[FastDormancy1/Version] Spec='',Phone='rel8'")));
}

TEST_F(FastDormancy, VerificationShowsWhatNoTextStandsForAsEmpty) {
    record(1, 2, -7, -5, "");
    EXPECT_THAT(verify_spec(spec({"One", "maybe", "dim", "1", "rel8"}) + spec({"One", "", "", "2"})),
                ElementsAre(failed("[FastDormancy1/EnableStatus] Spec='maybe',Phone=''"),
                            failed("[FastDormancy1/LCDStatus] Spec='dim',Phone=''"),
                            failed("[FastDormancy1/TimeOut] Spec='1',Phone=''"),
                            failed("[FastDormancy1/Version] Spec='rel8',Phone=''"),
                            passed("[FastDormancy2/EnableStatus] Spec='',Phone=''"),
                            passed("[FastDormancy2/LCDStatus] Spec='',Phone=''"),
                            failed("[FastDormancy2/TimeOut] Spec='2',Phone=''")));
}

TEST_F(FastDormancy, VerificationShowsSixDigitsOfATime) {
    record(1, 1, 1, 1234567, "");
    record(2, 1, 1, 1000000000, "");
    EXPECT_THAT(verify_spec(spec({"", "on", "on", "1234.57"}) + spec({"", "on", "on", "1000000"})),
                testing::AllOf(testing::Contains(passed("[FastDormancy1/TimeOut] Spec='1234.57',Phone='1234.57'")),
                               testing::Contains(failed("[FastDormancy2/TimeOut] Spec='1000000',Phone='1e+06'"))));
}

TEST_F(FastDormancy, TheCountStartsVerificationAtTheFirstItemAgain) {
    record(1, 1, 1, 1000, "");
    record(2, 0, 0, 2000, "");
    verify_spec(spec({"", "on", "on", ""}));
    EXPECT_THAT(verify_spec(spec({"", "off", "off", ""})),
                ElementsAre(passed("[FastDormancy2/EnableStatus] Spec='off',Phone='off'"),
                            passed("[FastDormancy2/LCDStatus] Spec='off',Phone='off'")));
    EXPECT_THAT(verify_spec(count("0") + spec({"", "on", "on", ""})),
                testing::Contains(passed("[FastDormancy1/LCDStatus] Spec='on',Phone='on'")));
}

TEST_F(FastDormancy, WhatIsNotVerifiedDoesNotCount) {
    record(1, 1, 1, 1000, "");
    const std::string item = spec({"", "on", "on", ""});
    EXPECT_THAT(verify_spec(item, ZEL_SVC_PARSE_MODE_FULL), IsEmpty());
    EXPECT_THAT(verify_spec(item, ZEL_SVC_PARSE_MODE_OPERATOR), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_FAST_DORMANCY, 1);
    EXPECT_THAT(verify_spec(item), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_FAST_DORMANCY, 0);
    EXPECT_THAT(verify_spec(item), ElementsAre(passed("[FastDormancy1/EnableStatus] Spec='on',Phone='on'"),
                                               passed("[FastDormancy1/LCDStatus] Spec='on',Phone='on'")));
}

// Export

TEST_F(FastDormancy, ItemsAreExportedInTheirOrder) {
    install_spec(spec({"One", "on", "on", "2.5", "rel8"}) + spec({"default", "off", "off", ""}));
    const auto item = [] {
        export_start(ZEL_SVC_ELEMENT_FAST_DORMANCY);
        std::vector<std::string> texts{
            export_value(ZEL_SVC_ELEMENT_FAST_DORMANCY_NETWORK_NAME),
            export_value(ZEL_SVC_ELEMENT_FAST_DORMANCY_ENABLE_STATUS), export_value(ZEL_SVC_ELEMENT_TIMEOUT_VALUE),
            export_value(ZEL_SVC_ELEMENT_LCD_STATUS), export_value(ZEL_SVC_ELEMENT_FAST_DORMANCY_VERSION)};
        export_end(ZEL_SVC_ELEMENT_FAST_DORMANCY);
        return texts;
    };
    for (int round = 0; round < 2; ++round) {
        EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_FAST_DORMANCY), "2");
        EXPECT_THAT(item(), ElementsAre("One", "on", "2.5", "on", "rel8"));
        EXPECT_THAT(item(), ElementsAre("default", "off", "", "off", ""));
        EXPECT_THAT(item(), ElementsAre("", "", "", "", ""));
    }
}

TEST_F(FastDormancy, ValueWithoutARecordIsExportedEmpty) { EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_LCD_STATUS), ""); }

// Lifecycle

TEST_F(FastDormancy, ItemLeftOpenIsDroppedByTheNext) {
    install_spec("<FastDormancy><NetworkName>One</NetworkName><LCDStatus>on</LCDStatus><broken");
    install_spec("<FastDormancy><FastDormancyEnableStatus>off</FastDormancyEnableStatus></FastDormancy>");
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "-1", "-1", "-1", "-1"}}));
    EXPECT_EQ(recorded("count"), std::nullopt);
}

TEST_F(FastDormancy, ValuesOutsideAnItemDoNothing) {
    install_spec("<LCDStatus>on</LCDStatus><TimeoutValue>3</TimeoutValue>" + spec({"One", "off", "off", ""}));
    EXPECT_EQ(recorded("time_out_1"), std::nullopt);
    EXPECT_EQ(number("lcd_1"), 0);
}

// Failures: nothing is recorded, nothing is said

class FastDormancyFailure : public FastDormancy {
  protected:
    void install_and_expect_no_record() {
        install_spec(count("1") + spec({"One", "on", "on", "1"}));
        EXPECT_EQ(recorded("count"), std::nullopt);
        EXPECT_EQ(run_log(), "");
        EXPECT_THAT(system_log(), IsEmpty());
    }
};

TEST_F(FastDormancyFailure, RefusedOpen) {
    fail("db_util_open");
    install_and_expect_no_record();
}

TEST_F(FastDormancyFailure, RefusedPrepare) {
    fail("sqlite3_prepare_v2");
    install_and_expect_no_record();
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(FastDormancyFailure, MissingTable) {
    run("drop table fast_dormancy");
    install_and_expect_no_record();
}

TEST_F(FastDormancyFailure, OtherColumns) {
    run("alter table fast_dormancy drop column lcd_on_timeout");
    install_and_expect_no_record();
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(FastDormancyFailure, EachStatementThatFails) {
    for (const char *statement :
         {"select dormant_id", "select count(*), max(dormant_id)", "insert into fast_dormancy"}) {
        fail("sqlite3_step", statement);
        install_and_expect_no_record();
        EXPECT_THAT(rows(), IsEmpty()) << statement;
        call("fault-clear");
    }
    fail("sqlite3_step", "update fast_dormancy");
    install_and_expect_no_record();
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "-1", "-1", "-1", "-1"}}));
}

TEST_F(FastDormancyFailure, RowThatCannotBeReadIsNotTakenForNone) {
    run("insert into fast_dormancy values(3, 5, 1, 2, 3, 4)");
    fail("sqlite3_step", "select dormant_id");
    install_spec(spec({"One", "on", "on", "1"})); // without the count, which would remove the row first
    EXPECT_EQ(recorded("count"), std::nullopt);
    EXPECT_EQ(rows(), (SqliteRows{{"3", "5", "1", "2", "3", "4"}}));
}

TEST_F(FastDormancyFailure, RefusedDeleteKeepsNoItemOut) {
    run("insert into fast_dormancy values(3, 5, 1, 2, 3, 4)");
    fail("sqlite3_step", "delete from fast_dormancy");
    install_spec(count("1") + spec({"One", "on", "on", "1"}));
    EXPECT_EQ(rows(), (SqliteRows{{"3", "5", "1000", "2", "3", "4"}}));
    EXPECT_EQ(number("count"), 1);
}

TEST_F(FastDormancyFailure, LockedDatabase) {
    run("insert into fast_dormancy values(3, 5, 1, 2, 3, 4)");
    {
        const SqliteFile other{file()};
        other.run("begin immediate");
        install_and_expect_no_record();
        other.run("rollback");
    }
    EXPECT_EQ(rows(), (SqliteRows{{"3", "5", "1", "2", "3", "4"}}));
}

TEST_F(FastDormancyFailure, OneNetworkKeepsTheRecordOutButNoOtherNetwork) {
    add_network("Two", "26202", 6);
    add_network("Three", "26203", 7);
    run("create trigger no_two before insert on fast_dormancy when new.network_info_id=6 "
        "begin select raise(abort, 'no'); end");
    install_spec(spec({"default", "on", "on", "1"}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "5", "1000", "-1", "-1", "-1"}, {"1", "7", "1000", "-1", "-1", "-1"}}));
    EXPECT_EQ(recorded("count"), std::nullopt);
}

TEST_F(FastDormancyFailure, OperatorsNetworkThatCannotBeResolved) {
    set_auto_flag(ZEL_SVC_AUTO_FAST_DORMANCY, 1);
    run("create trigger no_update before update on network_info begin select raise(abort, 'no'); end");
    install_spec(spec({"One", "on", "on", "1"}), ZEL_SVC_PARSE_MODE_OPERATOR);
    expect_nothing();
}

TEST_F(FastDormancyFailure, OperatorsNetworkThatIsNone) {
    set_auto_flag(ZEL_SVC_AUTO_FAST_DORMANCY, 1);
    run("update network_info set network_info_id=-1");
    choose_operator("New", "26299");
    install_spec(spec({"New", "on", "on", "1"}), ZEL_SVC_PARSE_MODE_OPERATOR);
    expect_nothing();
}

} // namespace zel_test
