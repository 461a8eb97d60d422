// Profile handles: the table of one Connections element, their verification and what an export says of them.

#include "connections.h"

#include "zel-svc-element-act-connection-handle.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

struct Service {
    const char *element;
    const char *label;
    int category;
    ZelSvcElementId id;
};
const std::vector<Service> kServices{
    {"ProfBrowser", "ProfBrowser", 1, ZEL_SVC_ELEMENT_PROF_BROWSER},
    {"ProfMMS", "ProfMMS", 2, ZEL_SVC_ELEMENT_PROF_MMS},
    {"ProfIntSharing", "ProfIntSharing", 5, ZEL_SVC_ELEMENT_PROF_INT_SHARING},
    {"ProfIMS", "ProfIMS", 0, ZEL_SVC_ELEMENT_PROF_IMS},
    {"ProfXCAP", "ProfXCAP", 7, ZEL_SVC_ELEMENT_PROF_XCAP},
    {"ProfEmergencyIMSCall", "ProfEmergencyImsCall", 6, ZEL_SVC_ELEMENT_PROF_EMERGENCY_IMS_CALL},
};

std::string name_of(std::string_view network) {
    const ZelSvcProfileHandle *handle = zel_svc_connection_find_handle(network);
    return handle ? std::string{handle->browser.view()} : "absent";
}

std::string browser(const std::string &network, const std::string &name) {
    return handle(network, tag("ProfBrowser", name));
}

std::string count() { return export_value(ZEL_SVC_ELEMENT_NB_PROFILE_HANDLE); }

} // namespace

class ConnectionHandle : public ConnectionPhone {
  protected:
    // A network that is known by its name alone, and its default of each service: "Default 1", "Default 2", ...
    void put_defaults() const {
        run("insert into network_info values(7, 'One', ''), (8, 'One', '26201')");
        for (const Service &service : kServices)
            put_profile("Default " + std::to_string(service.category), 7, service.category, 1);
    }
    void put_profile(const std::string &name, int network, int category, int is_default) const {
        run("insert into pdp_profile(profile_name, network_info_id, svc_category_id, default_internet_con) values('" +
            name + "', " + std::to_string(network) + ", " + std::to_string(category) + ", " +
            std::to_string(is_default) + ")");
    }
    static std::vector<ResultLine> verify(const std::string &names, ZelSvcParseMode mode = ZEL_SVC_PARSE_MODE_PARTIAL) {
        return verify_spec(connections(handle("One", names)), mode);
    }
};

TEST_F(ConnectionHandle, EveryNameIsKeptInItsField) {
    std::string names;
    for (const Service &service : kServices)
        names += tag(service.element, std::string{"by "} + service.element);
    install_connections(handle("One", names));
    const ZelSvcProfileHandle *kept = zel_svc_connection_find_handle("One");
    ASSERT_NE(kept, nullptr);
    EXPECT_EQ(kept->browser.view(), "by ProfBrowser");
    EXPECT_EQ(kept->mms.view(), "by ProfMMS");
    EXPECT_EQ(kept->internet_sharing.view(), "by ProfIntSharing");
    EXPECT_EQ(kept->ims.view(), "by ProfIMS");
    EXPECT_EQ(kept->xcap.view(), "by ProfXCAP");
    EXPECT_EQ(kept->emergency_ims_call.view(), "by ProfEmergencyIMSCall");
    EXPECT_EQ(kept->mccmnc.view(), "");
}

TEST_F(ConnectionHandle, NamesAreCutToTheirFields) {
    install_connections(browser(std::string(60, 'o'), std::string(250, 'n')));
    EXPECT_EQ(name_of(std::string(39, 'o')), std::string(199, 'n'));
}

TEST_F(ConnectionHandle, FirstOfTwoForANetworkIsUsed) {
    install_connections(browser("One", "first") + browser("Two", "other") + browser("One", "second"));
    EXPECT_EQ(name_of("One"), "first");
    EXPECT_EQ(name_of("Two"), "other");
    EXPECT_EQ(name_of("one"), "absent");
    EXPECT_EQ(count(), "3");
}

TEST_F(ConnectionHandle, ConnectionsEmptyTheTableInEveryAction) {
    for (const ZelSvcParseAction action :
         {ZEL_SVC_PARSE_ACTION_INSTALL, ZEL_SVC_PARSE_ACTION_VERIFY, ZEL_SVC_PARSE_ACTION_ENCODE}) {
        install_connections(browser("One", "kept"));
        EXPECT_EQ(count(), "1");
        parse_spec(connections(""), action, ZEL_SVC_PARSE_MODE_FULL);
        EXPECT_EQ(count(), "0") << action;
        EXPECT_EQ(name_of("One"), "absent") << action;
    }
}

TEST_F(ConnectionHandle, FiftyAreKept) {
    std::string many;
    for (int i = 1; i <= 53; ++i)
        many += browser("Network " + std::to_string(i), "kept");
    install_connections(many);
    EXPECT_EQ(count(), "50");
    EXPECT_EQ(name_of("Network 50"), "kept");
    EXPECT_EQ(name_of("Network 51"), "absent");
    install_spec(browser("One more", "kept"));
    EXPECT_EQ(count(), "50");
}

TEST_F(ConnectionHandle, FullAndPartialModeTakeThoseWithoutTheFlag) {
    for (const ZelSvcParseMode mode : {ZEL_SVC_PARSE_MODE_FULL, ZEL_SVC_PARSE_MODE_PARTIAL}) {
        set_auto_flag(ZEL_SVC_AUTO_PROFILE, 0);
        install_connections(browser("One", "kept"), mode);
        EXPECT_EQ(count(), "1") << mode;
        set_auto_flag(ZEL_SVC_AUTO_PROFILE, 1);
        install_connections(browser("One", "lost"), mode);
        EXPECT_EQ(count(), "0") << mode;
    }
}

TEST_F(ConnectionHandle, OperatorModeTakesTheOperatorsWithTheFlag) {
    set_operator("One");
    const std::string all = browser("Two", "a") + browser("One", "mine") + browser("default", "b") + browser("", "c");
    install_connections(all, ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(count(), "0");
    set_auto_flag(ZEL_SVC_AUTO_PROFILE, 1);
    install_connections(all, ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(count(), "1");
    EXPECT_EQ(name_of("One"), "mine");
    set_operator("");
    install_connections(all + tag("ProfileHandle", tag("ProfBrowser", "nameless")), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(count(), "0");
}

TEST_F(ConnectionHandle, OtherModesTakeNone) {
    set_operator("One");
    for (const int flag : {0, 1})
        for (const ZelSvcParseMode mode : {ZEL_SVC_PARSE_MODE_CUSTOMER_LIST, ZEL_SVC_PARSE_MODE_SECURITY_LOCK,
                                           ZEL_SVC_PARSE_MODE_OPERATOR_LIST, ZEL_SVC_PARSE_MODE_HEADER}) {
            set_auto_flag(ZEL_SVC_AUTO_PROFILE, flag);
            install_connections(browser("One", "lost"), mode);
            EXPECT_EQ(count(), "0") << mode;
        }
}

TEST_F(ConnectionHandle, HandleLeftOpenIsDroppedByTheNext) {
    install_spec("<Connections><ProfileHandle><NetworkName>One</NetworkName><ProfBrowser>lost</ProfBrowser><broken");
    install_connections(handle("One", tag("ProfMMS", "Pictures")));
    EXPECT_EQ(count(), "1");
    EXPECT_EQ(name_of("One"), "");
}

TEST_F(ConnectionHandle, ValuesOutsideAHandleDoNothing) {
    install_connections(tag("ProfBrowser", "lost") + tag("NbProfileHandle", "7") + handle("One", ""));
    EXPECT_EQ(count(), "1");
    EXPECT_EQ(name_of("One"), "");
}

TEST_F(ConnectionHandle, NothingIsWrittenByHandles) {
    install_connections(browser("One", "Web"));
    EXPECT_THAT(networks(), IsEmpty());
    EXPECT_THAT(profiles("*"), IsEmpty());
    EXPECT_EQ(mirrored("count"), std::nullopt);
}

TEST_F(ConnectionHandle, EachNameIsComparedWithItsServicesDefault) {
    put_defaults();
    for (const Service &service : kServices) {
        const std::string phone = "Default " + std::to_string(service.category);
        const std::string label = std::string{"["} + service.label + "] Spec='";
        EXPECT_THAT(verify(tag(service.element, phone)),
                    ElementsAre(passed(label + phone + "',Phone='" + phone + "'")));
        EXPECT_THAT(verify(tag(service.element, "default")),
                    ElementsAre(failed(label + "default',Phone='" + phone + "'")));
    }
}

TEST_F(ConnectionHandle, LinesStandInTheOrderOfTheServices) {
    put_defaults();
    std::string names;
    for (std::size_t i = kServices.size(); i-- > 0;)
        names += tag(kServices[i].element, "x");
    EXPECT_THAT(verify(names), ElementsAre(failed("[ProfBrowser] Spec='x',Phone='Default 1'"),
                                           failed("[ProfMMS] Spec='x',Phone='Default 2'"),
                                           failed("[ProfIntSharing] Spec='x',Phone='Default 5'"),
                                           failed("[ProfIMS] Spec='x',Phone='Default 0'"),
                                           failed("[ProfXCAP] Spec='x',Phone='Default 7'"),
                                           failed("[ProfEmergencyImsCall] Spec='x',Phone='Default 6'")));
    EXPECT_THAT(verify(""), IsEmpty());
}

TEST_F(ConnectionHandle, FirstDefaultOfAServiceIsThePhonesAndOthersAreNone) {
    run("insert into network_info values(7, 'One', ''), (8, 'Two', '')");
    put_profile("No default", 7, 1, 0);
    put_profile("Default", 7, 1, 1);
    put_profile("Another", 7, 1, 1);
    put_profile("Other", 8, 2, 1);
    EXPECT_THAT(
        verify(tag("ProfBrowser", "Default") + tag("ProfMMS", "Other")),
        ElementsAre(passed("[ProfBrowser] Spec='Default',Phone='Default'"), failed("[ProfMMS] Spec='Other',Phone=''")));
}

TEST_F(ConnectionHandle, NetworkThatHasAnMccMncIsNotCompared) {
    run("insert into network_info values(8, 'One', '26201')");
    put_profile("Web", 8, 1, 1);
    EXPECT_THAT(verify(tag("ProfBrowser", "Web")), IsEmpty());
    run("update network_info set network_name='Two', mccmnc=''");
    EXPECT_THAT(verify(tag("ProfBrowser", "Web")), IsEmpty());
}

TEST_F(ConnectionHandle, VerifiedWhereverItApplies) {
    put_defaults();
    const std::string name = tag("ProfBrowser", "Default 1");
    EXPECT_EQ(verify(name, ZEL_SVC_PARSE_MODE_PARTIAL).size(), 1U);
    EXPECT_EQ(verify(name, ZEL_SVC_PARSE_MODE_FULL).size(), 1U);
    EXPECT_EQ(verify(name, ZEL_SVC_PARSE_MODE_OPERATOR).size(), 0U);
    EXPECT_EQ(verify(name, ZEL_SVC_PARSE_MODE_HEADER).size(), 0U);
    set_auto_flag(ZEL_SVC_AUTO_PROFILE, 1);
    set_operator("One");
    EXPECT_EQ(verify(name, ZEL_SVC_PARSE_MODE_PARTIAL).size(), 0U);
    EXPECT_EQ(verify(name, ZEL_SVC_PARSE_MODE_FULL).size(), 0U);
    EXPECT_EQ(verify(name, ZEL_SVC_PARSE_MODE_OPERATOR).size(), 1U);
    EXPECT_EQ(count(), "0"); // and none is stored
}

TEST_F(ConnectionHandle, NothingIsSaidWhenThePhoneCannotBeRead) {
    put_defaults();
    const std::string name = tag("ProfBrowser", "Default 1");
    for (const char *statement : {"select network_info_id", "select profile_name"}) {
        call("fault-clear");
        fail("sqlite3_step", statement);
        EXPECT_THAT(verify(name), IsEmpty()) << statement;
    }
    call("fault-clear");
    fail("sqlite3_step", "select profile_name", 6, 1); // the last service
    EXPECT_THAT(verify(name), IsEmpty());
    for (const int opening : {1, 2}) {
        call("fault-clear");
        fail("db_util_open", ZEL_SVC_NETWORK_DB_PATH_SIM1, opening, 1);
        EXPECT_THAT(verify(name), IsEmpty()) << opening;
    }
    call("fault-clear");
    EXPECT_EQ(verify(name).size(), 1U);
    run("drop table pdp_profile");
    EXPECT_THAT(verify(name), IsEmpty());
    EXPECT_EQ(open_databases(), 0U);
}

TEST_F(ConnectionHandle, QuotesAreTextLikeAny) {
    run("insert into network_info values(7, 'O''ne', '')");
    put_profile("W''eb", 7, 1, 1);
    EXPECT_THAT(verify_spec(connections(handle("O'ne", tag("ProfBrowser", "W'eb")))),
                ElementsAre(passed("[ProfBrowser] Spec='W'eb',Phone='W'eb'")));
}

TEST_F(ConnectionHandle, ExportGivesThePhonesDefaultsOfEachHandleInTurn) {
    put_defaults();
    run("insert into network_info values(9, 'Two', '')");
    put_profile("Second web", 9, 1, 1);
    install_connections(browser("One", "a") + browser("Two", "b") + browser("Unknown", "c"));
    const auto texts = [] {
        std::vector<std::string> result;
        export_start(ZEL_SVC_ELEMENT_PROFILE_HANDLE);
        result.push_back(export_value(ZEL_SVC_ELEMENT_PROFILE_HANDLE_NETWORK_NAME));
        for (const Service &service : kServices)
            result.push_back(export_value(service.id));
        export_end(ZEL_SVC_ELEMENT_PROFILE_HANDLE);
        return result;
    };
    EXPECT_THAT(texts(),
                ElementsAre("One", "Default 1", "Default 2", "Default 5", "Default 0", "Default 7", "Default 6"));
    EXPECT_THAT(texts(), ElementsAre("Two", "Second web", "", "", "", "", ""));
    EXPECT_THAT(texts(), ElementsAre("", "", "", "", "", "", "")); // not found: nothing, not half of it
    for (int i = 0; i < 60; ++i)
        EXPECT_THAT(texts(), ElementsAre("", "", "", "", "", "", ""));
    EXPECT_EQ(count(), "3");
    export_start(ZEL_SVC_ELEMENT_CONNECTIONS);
    export_end(ZEL_SVC_ELEMENT_CONNECTIONS);
    EXPECT_EQ(count(), "0");
}

TEST_F(ConnectionHandle, DefaultWithoutANameIsShownAsNone) {
    put_defaults();
    run("update pdp_profile set profile_name=null where svc_category_id=1");
    EXPECT_THAT(verify(tag("ProfBrowser", "Web") + tag("ProfMMS", "Default 2")),
                ElementsAre(failed("[ProfBrowser] Spec='Web',Phone=''"),
                            passed("[ProfMMS] Spec='Default 2',Phone='Default 2'")));
    install_connections(browser("One", "Web"));
    export_start(ZEL_SVC_ELEMENT_PROFILE_HANDLE);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_PROF_BROWSER), "");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_PROF_MMS), "Default 2");
    export_end(ZEL_SVC_ELEMENT_PROFILE_HANDLE);
}

TEST_F(ConnectionHandle, ExportOutsideAHandleSaysNothing) { EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_PROF_BROWSER), ""); }

} // namespace zel_test
