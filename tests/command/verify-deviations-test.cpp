// A phone made from the example package, and what each way of coming off it does to the verification.

#include "program.h"

#include "support/source-dir.h"
#include "support/sqlite-file.h"

#include <gmock/gmock.h>

#include <filesystem>
#include <regex>

using namespace zel_test;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

namespace {

struct VerifyDeviations : ZelCommand {
    VerifyDeviations() { create_arguments["package"] = source_dir() + "/examples/package"; }

    // The lines that fail, as the report has them.
    static std::vector<std::string> failures() {
        const Outcome outcome = run_zel({"verify", "--failures", "--json", "--reveal"});
        const auto answer = nlohmann::json::parse(outcome.out, nullptr, false);
        std::vector<std::string> lines;
        for (const auto &value : answer["values"])
            lines.push_back(value["line"]);
        EXPECT_EQ(outcome.code, lines.empty() ? 0 : 4) << outcome.err;
        return lines;
    }

    void replace_in(const std::string &path, const std::string &from, const std::string &to) {
        std::string text = read(path);
        const std::size_t place = text.find(from);
        ASSERT_NE(place, std::string::npos) << path << " has no " << from;
        write(path, text.replace(place, from.size(), to));
    }
};

} // namespace

TEST_F(VerifyDeviations, EachFailsItsOwnLinesAndNoOther) {
    ASSERT_EQ(run_zel({"install", "XFV"}).code, 0);
    EXPECT_THAT(failures(), IsEmpty()) << "right after the install";

    // A key.
    const int gps = get_int("db/location/setting/GpsEnabled").value_or(-1);
    set_int("db/location/setting/GpsEnabled", 1 - gps);
    const std::string spec = gps == 1 ? "on" : "off";
    const std::string phone = gps == 1 ? "off" : "on";
    EXPECT_THAT(failures(), ElementsAre("[Spec][GPS/GPSActivation] Spec='" + spec + "',Phone='" + phone + "'"));
    call("vconf-unset", {{"key", "db/location/setting/GpsEnabled"}});
    EXPECT_THAT(failures(), ElementsAre("[Spec][GPS/GPSActivation] Spec='" + spec + "',Phone='?\?'"));
    set_int("db/location/setting/GpsEnabled", gps);
    EXPECT_THAT(failures(), IsEmpty());

    // A file.
    write("/opt/usr/media/Images/new.png", "12345");
    EXPECT_THAT(failures(), ElementsAre("[FS] media/image size 0=>5", "[FS] media/image count 0=>1"));
    std::filesystem::remove(root() + "/opt/usr/media/Images/new.png");
    EXPECT_THAT(failures(), IsEmpty());

    // An application.
    const std::string app = "/opt/system/zel-default/app/";
    write(app + "applist.ini", "[zel packages]\nname_001 = com.example.own\ntype_001 = tpk\n");
    write(app + "appresult.ini", "[result]\ncount = 1\ndescription_001 = \"op=install\"\nresult_001 = fail\n");
    EXPECT_THAT(failures(), ElementsAre("[App][Customer1] com.example.own(tpk,install),fail"));
    replace_in(app + "appresult.ini", "fail", "success");
    EXPECT_THAT(failures(), IsEmpty());

    // An entry of the section store.
    const std::string dormancy = "/opt/system/zel-default/data/zel-default-data-fast-dormancy.ini";
    const std::string whole = read(dormancy);
    replace_in(dormancy, "time_out_2", "gone");
    const auto lost = failures();
    ASSERT_EQ(lost.size(), 1U);
    EXPECT_THAT(lost[0], ::testing::MatchesRegex("\\[Spec\\]\\[FastDormancy2/TimeOut\\] Spec='[0-9.]+',Phone=''"));
    write(dormancy, whole);
    EXPECT_THAT(failures(), IsEmpty());

    // A row of the network database: the one that the first profile of the file became.
    const SqliteFile networks{root() + "/opt/dbspace/.dnet.db"};
    const std::string connections = read("/opt/system/zel-default/data/zel-default-data-connection.ini");
    std::smatch row;
    const std::string recorded = connections.substr(connections.find("[spec]"));
    ASSERT_TRUE(std::regex_search(recorded, row, std::regex{"profile_id_1 *= *([0-9]+)"}));
    const std::string where = " where profile_id=" + row[1].str();
    const std::string apn = networks.rows("select apn from pdp_profile" + where).at(0).at(0);
    networks.run("update pdp_profile set apn='another'" + where);
    EXPECT_THAT(failures(), ElementsAre("[Spec][Profile1/APN] Spec='" + apn + "',Phone='another'"));
    networks.run("update pdp_profile set apn='" + apn + "'" + where);
    EXPECT_THAT(failures(), IsEmpty());

    // The bookmark service.
    call("bookmarks-clear");
    const auto bookmarks = failures();
    ASSERT_GE(bookmarks.size(), 2U);
    EXPECT_THAT(bookmarks[0], ::testing::MatchesRegex("\\[Spec\\]\\[Bookmark/NbBookmark\\] Spec='[0-9]+',Phone='0'"));
    for (std::size_t i = 1; i < bookmarks.size(); ++i)
        EXPECT_EQ(bookmarks[i], "[Spec][Bookmark" + std::to_string(i) + "] Reading phone failed");
}
