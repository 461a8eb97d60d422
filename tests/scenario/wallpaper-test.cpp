// The default wallpapers by the handset's colour.

#include "service-phone.h"

#include <filesystem>
#include <gmock/gmock.h>

namespace {

using ::testing::ElementsAre;

const std::string kWallpapers = "/opt/usr/share/settings/Wallpapers/";
constexpr const char *kProductCode = "/csa/imei/prodcode.dat";
const std::string kTag = "[Config][DefaultWallpaperByHWColor] ";

constexpr const char *kNotOpened = "Product code not opened, default not set.";

// The phase's lines between its first and its last, without their tag.
class Wallpaper : public zel_test::ServicePhone {
  protected:
    void SetUp() override {
        ServicePhone::SetUp();
        for (const char *name : {"01.png", "06.png", "07.png", "11.png", "Home_default.png", "Lock_default.png"})
            write(kWallpapers + name, std::string{"picture "} + name);
    }

    std::vector<std::string> run(const std::string &product_code, int kind = ZEL_SVC_INSTALL_CONFIG_MODE) {
        write(kProductCode, product_code);
        return run_again(kind);
    }

    std::vector<std::string> run_again(int kind = ZEL_SVC_INSTALL_CONFIG_MODE) {
        write("/opt/system/zel-default/output/zel-config.log", "");
        const std::size_t told_before = system_log().size();
        zel_svc_config_install_customer("BTU", kind);
        std::vector<std::string> lines = run_log_lines();
        const auto first =
            std::find(lines.begin(), lines.end(), "[Config/Start] Install default wallpapar by H/W color.");
        const auto last = std::find(first, lines.end(), "[Config/Ended] Install default wallpapar by H/W color");
        if (last == lines.end()) return {"the phase has no end"};
        std::vector<std::string> found;
        for (auto line = first + 1; line != last; ++line)
            found.push_back(line->starts_with(kTag) ? line->substr(kTag.size()) : *line);
        EXPECT_EQ(told_since(told_before), found == std::vector<std::string>{kNotOpened}
                                               ? std::vector<std::string>{"fopen() for Product code failed."}
                                               : found);
        return found;
    }

    // The phase's lines in the system log: the same as in the run log, one excepted.
    std::vector<std::string> told_since(std::size_t before) {
        std::vector<std::string> found;
        const std::vector<std::string> log = system_log();
        for (std::size_t i = before; i < log.size(); ++i) {
            const std::size_t tag = log[i].find(kTag);
            if (tag == std::string::npos) continue;
            const std::string text = log[i].substr(tag + kTag.size());
            found.push_back(text.substr(0, text.find('\n')));
        }
        return found;
    }

    std::string picture(const std::string &name) { return read(kWallpapers + name); }

    static std::string code(const std::string &model, const std::string &colour) {
        return "SM-" + model + "X" + colour + "ABCD";
    }

    void remove(const std::string &name) { std::filesystem::remove_all(root() + kWallpapers + name); }
};

constexpr const char *kModelFound = "Model='Q7N0' recognized.";
constexpr const char *kBlackFound = "Color='ZK' recognized.";
constexpr const char *kHomeDone = "Home wallpaper's file copy & color setting succeeded.";
constexpr const char *kLockDone = "Lock wallpaper's file copy succeeded.";

TEST_F(Wallpaper, OfABlackHandsetIsSwapped) {
    EXPECT_THAT(run(code("Q7N0", "ZK")), ElementsAre(kModelFound, kBlackFound, kHomeDone, kLockDone));
    EXPECT_EQ(picture("Home_default.png"), "picture 07.png");
    EXPECT_EQ(picture("07.png"), "picture Home_default.png");
    EXPECT_EQ(picture("Lock_default.png"), "picture 01.png");
    EXPECT_EQ(picture("01.png"), "picture Lock_default.png");
    EXPECT_EQ(picture("06.png"), "picture 06.png");
    EXPECT_EQ(picture("11.png"), "picture 11.png");
    EXPECT_FALSE(exists(kWallpapers + "Home_default_1.png"));
    EXPECT_FALSE(exists(kWallpapers + "Lock_default_1.png"));
    EXPECT_EQ(call("status").at("theme_picture"), kWallpapers + "Home_default.png");
    EXPECT_EQ(call("status").at("theme_kind"), 2);
    EXPECT_EQ(call("status").at("toolkit_users"), 0);
}

TEST_F(Wallpaper, ItsColoursAreSetWhileTheToolkitRuns) {
    call("journal-start");
    run(code("Q7N0", "ZK"));
    const nlohmann::json journal = call("journal-list");
    std::vector<std::string> found;
    for (const auto &entry : journal.at("calls")) {
        const std::string name = entry.at("function");
        if (name.starts_with("elm_") || name.starts_with("uxt_")) found.push_back(name);
    }
    EXPECT_THAT(found, ElementsAre("elm_init", "uxt_theme_set_suitable_system_color_info_from_image", "elm_shutdown"));
}

TEST_F(Wallpaper, OfAWhiteHandsetIsSwapped) {
    EXPECT_THAT(run(code("Q7N0", "WR")), ElementsAre(kModelFound, "Color='WR' recognized.", kHomeDone, kLockDone));
    EXPECT_EQ(picture("Home_default.png"), "picture 06.png");
    EXPECT_EQ(picture("06.png"), "picture Home_default.png");
    EXPECT_EQ(picture("Lock_default.png"), "picture 11.png");
    EXPECT_EQ(picture("11.png"), "picture Lock_default.png");
    EXPECT_EQ(picture("07.png"), "picture 07.png");
    EXPECT_EQ(picture("01.png"), "picture 01.png");
}

TEST_F(Wallpaper, ASecondRunSwapsBack) {
    for (const char *colour : {"ZK", "WR"}) {
        run(code("Q7N0", colour));
        run_again();
        for (const char *name : {"01.png", "06.png", "07.png", "11.png", "Home_default.png", "Lock_default.png"})
            EXPECT_EQ(picture(name), std::string{"picture "} + name) << colour;
    }
}

TEST_F(Wallpaper, AFotaUpgradeSetsNoColours) {
    EXPECT_THAT(run(code("Q7N0", "ZK"), ZEL_SVC_INSTALL_FOTA_MODE),
                ElementsAre(kModelFound, kBlackFound,
                            "Home wallpaper's file copy succeeded, color setting skip (because of FOTA).", kLockDone));
    EXPECT_EQ(picture("Home_default.png"), "picture 07.png");
    EXPECT_EQ(call("status").at("theme_picture"), "");
}

TEST_F(Wallpaper, AFailedColourSettingShowsItsNumber) {
    fail("uxt_theme_set_suitable_system_color_info_from_image", "", 1, -1, -12);
    EXPECT_THAT(run(code("Q7N0", "ZK")),
                ElementsAre(kModelFound, kBlackFound,
                            "Home wallpaper's file copy succeeded, color setting failed(-12).", kLockDone));
    EXPECT_EQ(call("status").at("toolkit_users"), 0);
}

TEST_F(Wallpaper, WithoutAProductCodeNothingIsDone) {
    EXPECT_THAT(run_again(), ElementsAre("Product code not existed, skip."));
    EXPECT_EQ(picture("Home_default.png"), "picture Home_default.png");
}

TEST_F(Wallpaper, AProductCodeThatDoesNotOpenEndsThePhase) {
    write(std::string{kProductCode} + "/folder", "");
    EXPECT_THAT(run_again(), ElementsAre(kNotOpened));
    EXPECT_TRUE(system_logged(kTag + "fopen() for Product code failed."));
    EXPECT_FALSE(system_logged(kTag + "Product code not opened, default not set.\n"));
}

TEST_F(Wallpaper, AShortProductCodeEndsThePhase) {
    EXPECT_THAT(run("Q7N0XZKABC"), ElementsAre("Model name not found.", "Color='XZ' recognized."));
    EXPECT_THAT(run("ZKABCD"), ElementsAre("Model name not found.", kBlackFound));
    EXPECT_THAT(run("ZKABC"), ElementsAre("Model name not found.", "Color code not found."));
    EXPECT_THAT(run(""), ElementsAre("Model name not found.", "Color code not found."));
    EXPECT_EQ(picture("Home_default.png"), "picture Home_default.png");
}

TEST_F(Wallpaper, TheShortestProductCodeHas11Bytes) {
    EXPECT_THAT(run("Q7N0XZKABCD"), ElementsAre(kModelFound, kBlackFound, kHomeDone, kLockDone));
}

TEST_F(Wallpaper, AnUnknownHandsetIsSkipped) {
    EXPECT_THAT(run(code("Q7N1", "ZK")),
                ElementsAre("Model='Q7N1' recognized.", kBlackFound, "Model & Color unknown, skip."));
    EXPECT_THAT(run(code("Q7N0", "ZR")),
                ElementsAre(kModelFound, "Color='ZR' recognized.", "Model & Color unknown, skip."));
    EXPECT_THAT(run(code("q7n0", "zk")),
                ElementsAre("Model='q7n0' recognized.", "Color='zk' recognized.", "Model & Color unknown, skip."));
    EXPECT_EQ(picture("Home_default.png"), "picture Home_default.png");
}

TEST_F(Wallpaper, AProductCodeWithNulBytesIsUnknown) {
    EXPECT_THAT(run(std::string(20, '\0')),
                ElementsAre("Model='' recognized.", "Color='' recognized.", "Model & Color unknown, skip."));
}

TEST_F(Wallpaper, EveryLineIsInBothLogs) {
    run(code("Q7N0", "ZK"));
    for (const char *line : {kModelFound, kBlackFound, kHomeDone, kLockDone})
        EXPECT_TRUE(system_logged(kTag + line + "\n")) << line;
}

TEST_F(Wallpaper, AMissingOriginalFailsTheFirstCopy) {
    remove("07.png");
    EXPECT_THAT(run(code("Q7N0", "ZK")),
                ElementsAre(kModelFound, kBlackFound, "Home wallpaper's file copy failed(copy original file to temp).",
                            kLockDone));
    EXPECT_EQ(picture("Home_default.png"), "picture Home_default.png");
    EXPECT_FALSE(exists(kWallpapers + "07.png"));
    EXPECT_EQ(call("status").at("theme_picture"), "");
}

TEST_F(Wallpaper, AMissingWallpaperFailsTheSecondCopy) {
    remove("Home_default.png");
    remove("Lock_default.png");
    EXPECT_THAT(run(code("Q7N0", "ZK")),
                ElementsAre(kModelFound, kBlackFound, "Home wallpaper's file copy failed(copy home file to original).",
                            "Lock wallpaper's file copy failed(copy lock file to original)."));
    EXPECT_EQ(picture("07.png"), "picture 07.png");
    EXPECT_EQ(call("status").at("theme_picture"), "");
}

TEST_F(Wallpaper, AWallpaperThatCannotBeWrittenFailsTheThirdCopy) {
    // The second open of each shown file is the one that writes it.
    fail("zel_platform_open", kWallpapers + "Home_default.png", 2);
    fail("zel_platform_open", kWallpapers + "Lock_default.png", 2);
    EXPECT_THAT(run(code("Q7N0", "ZK")),
                ElementsAre(kModelFound, kBlackFound, "Home wallpaper's file copy failed(copy temp file to home).",
                            "Lock wallpaper's file copy failed(copy temp file to lock)."));
    EXPECT_EQ(picture("Home_default.png"), "picture Home_default.png");
    EXPECT_EQ(call("status").at("theme_picture"), "");
}

TEST_F(Wallpaper, ATemporaryThatCannotBeRemovedSetsNoColours) {
    // Its parent is opened when it is made, for its label, and to remove it.
    for (const char *name : {"Home_default_1.png", "Lock_default_1.png"})
        write(kWallpapers + name, "there before"); // so that no copy makes it
    fail("zel_platform_open_parent", kWallpapers + "Home_default_1.png");
    fail("zel_platform_open_parent", kWallpapers + "Lock_default_1.png");
    EXPECT_THAT(run(code("Q7N0", "ZK")),
                ElementsAre(kModelFound, kBlackFound, "Home wallpaper's file copy succeeded, remove failed.",
                            "Lock wallpaper's file copy succeeded, remove failed."));
    EXPECT_EQ(picture("Home_default.png"), "picture 07.png");
    EXPECT_EQ(call("status").at("theme_picture"), "");
}

TEST_F(Wallpaper, ALockThatFailsKeepsTheHomeSwapped) {
    remove("01.png");
    EXPECT_THAT(run(code("Q7N0", "ZK")), ElementsAre(kModelFound, kBlackFound, kHomeDone,
                                                     "Lock wallpaper's file copy failed(copy original file to temp)."));
    EXPECT_EQ(picture("Home_default.png"), "picture 07.png");
}

} // namespace
