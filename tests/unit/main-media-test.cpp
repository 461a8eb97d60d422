#include "support/bench-phone.h"
#include "support/spec-text.h"

#include "zel-svc-element-act-main.h"

#include <gmock/gmock.h>

#include <set>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr const char *kMessage = "db/setting/sound/noti/msg_ringtone_path";
constexpr const char *kEmail = "db/setting/sound/noti/email_ringtone_path";
const std::string kPackage = "/opt/system/zel/mps/ZEL";

std::string element(const std::string &tag, const std::string &source) {
    return "<" + tag + " src=\"" + source + "\"></" + tag + ">";
}

} // namespace

struct ExpectedMedia {
    ZelSvcElementId element;
    const char *tag;
    const char *folder;
    std::vector<const char *> keys;
    std::vector<const char *> records;
    std::vector<const char *> labels; // of the result lines, for the keys in order or as told below
    std::vector<const char *> compared;

    friend void PrintTo(const ExpectedMedia &media, std::ostream *out) { *out << media.tag; }
};

class MediaFile : public BenchPhone, public testing::WithParamInterface<ExpectedMedia> {
  protected:
    [[nodiscard]] static std::string spec(const std::string &source) { return element(GetParam().tag, source); }
    [[nodiscard]] static std::string target(const std::string &name) { return GetParam().folder + name; }
};

TEST_P(MediaFile, IsCopiedAndBecomesThePhonesOwn) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    write(kPackage + "/Customer/XFV/media/first.bin", "first", 0640);
    install_spec(spec("/Customer/XFV/media/first.bin"));
    EXPECT_EQ(read(target("first.bin")), "first");
    for (const char *key : GetParam().keys)
        EXPECT_EQ(get_string(key), target("first.bin")) << key;
    for (const char *key : GetParam().records)
        EXPECT_EQ(group.text("sound", key), target("first.bin")) << key;
    const std::set<std::string> recorded{GetParam().records.begin(), GetParam().records.end()};
    for (const char *key : {"ring_tone", "msg_alert", "email_alert", "alarm_tone"})
        EXPECT_EQ(group.text("sound", key).has_value(), recorded.contains(key)) << key;
}

TEST_P(MediaFile, MissingFileDoesNotKeepTheKeysFromBeingSet) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install_spec(spec("/media/none.bin"));
    EXPECT_FALSE(exists(target("none.bin")));
    for (const char *key : GetParam().keys)
        EXPECT_EQ(get_string(key), target("none.bin")) << key;
    for (const char *key : GetParam().records)
        EXPECT_EQ(group.text("sound", key), target("none.bin")) << key;
}

TEST_P(MediaFile, OnlyTheAttributeSrcCounts) {
    write(kPackage + "/a.bin", "a");
    const std::string tag = GetParam().tag;
    install_spec("<" + tag + "></" + tag + "><" + tag + R"( Src="/a.bin" path="/a.bin"></)" + tag + ">");
    EXPECT_FALSE(exists(target("a.bin")));
    for (const char *key : GetParam().keys)
        EXPECT_EQ(get_string(key), std::nullopt) << key;
}

TEST_P(MediaFile, SrcNeedNotBeTheFirstAttribute) {
    write(kPackage + "/a.bin", "a");
    const std::string tag = GetParam().tag;
    install_spec("<" + tag + R"( name="x" src="/a.bin"></)" + tag + ">");
    EXPECT_EQ(read(target("a.bin")), "a");
}

TEST_P(MediaFile, EmptySourceIsIgnored) {
    install_spec(spec(""));
    EXPECT_EQ(get_string(GetParam().keys.at(0)), std::nullopt);
    set_string(GetParam().keys.at(0), "/x");
    EXPECT_THAT(verify_spec(spec("")), IsEmpty());
}

TEST_P(MediaFile, SourceWithoutASlashTakesTheWholePathsName) {
    install_spec(spec("t.mp3"));
    EXPECT_EQ(get_string(GetParam().keys.at(0)), target("ZELt.mp3"));
}

TEST_P(MediaFile, LongSourceIsCut) {
    const std::string source = "/" + std::string(210, 'n');
    install_spec(spec(source));
    EXPECT_EQ(get_string(GetParam().keys.at(0)), target(std::string(198, 'n')));
}

TEST_P(MediaFile, RefusedFirstKeyStopsTheOthers) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    write(kPackage + "/a.bin", "a");
    fail("vconf_set_str", GetParam().keys.at(0));
    install_spec(spec("/a.bin"));
    EXPECT_EQ(read(target("a.bin")), "a");
    for (const char *key : GetParam().keys)
        EXPECT_EQ(get_string(key), std::nullopt) << key;
    for (const char *key : GetParam().records)
        EXPECT_EQ(group.text("sound", key), std::nullopt) << key;
}

TEST_P(MediaFile, FileNamesAreCompared) {
    for (const char *key : GetParam().compared)
        set_string(key, "/somewhere/else/t.mp3");
    for (const char *source : {"/media/t.mp3", "/t.mp3", "t.mp3"}) {
        std::vector<ResultLine> expected;
        for (const char *label : GetParam().labels)
            expected.push_back(passed(std::string{label} + " Spec='t.mp3',Phone='t.mp3'"));
        EXPECT_EQ(verify_spec(spec(source)), expected) << source;
    }
    std::vector<ResultLine> expected;
    for (const char *label : GetParam().labels)
        expected.push_back(failed(std::string{label} + " Spec='u.mp3',Phone='t.mp3'"));
    EXPECT_EQ(verify_spec(spec("/media/u.mp3")), expected);
}

TEST_P(MediaFile, UnreadableKeyAddsNoLine) {
    EXPECT_THAT(verify_spec(spec("/media/t.mp3")), IsEmpty());
    for (const char *key : GetParam().compared)
        set_int(key, 1);
    EXPECT_THAT(verify_spec(spec("/media/t.mp3")), IsEmpty());
}

TEST_P(MediaFile, VerificationCopiesNothing) {
    write(kPackage + "/a.bin", "a");
    verify_spec(spec("/a.bin"));
    EXPECT_FALSE(exists(target("a.bin")));
}

TEST_P(MediaFile, ExportSaysNothing) {
    for (const char *key : GetParam().keys)
        set_string(key, target("a.bin"));
    EXPECT_EQ(export_start(GetParam().element), "");
    export_end(GetParam().element);
}

INSTANTIATE_TEST_SUITE_P(Main, MediaFile,
                         testing::Values(ExpectedMedia{ZEL_SVC_ELEMENT_WALLPAPER,
                                                       "Wallpaper",
                                                       "/opt/usr/share/settings/Wallpapers/",
                                                       {"db/menu_widget/bgset"},
                                                       {},
                                                       {"[Wallpaper]"},
                                                       {"db/menu_widget/bgset"}},
                                         ExpectedMedia{ZEL_SVC_ELEMENT_RING_TONE,
                                                       "RingTone",
                                                       "/opt/usr/share/settings/Ringtones/",
                                                       {"db/setting/sound/call/ringtone_default_path",
                                                        "db/setting/sound/call/ringtone_path"},
                                                       {"ring_tone"},
                                                       {"[RingTone]"},
                                                       {"db/setting/sound/call/ringtone_default_path"}},
                                         ExpectedMedia{ZEL_SVC_ELEMENT_MESSAGE_TONE,
                                                       "MessageTone",
                                                       "/opt/usr/share/settings/Alerts/",
                                                       {kMessage, kEmail},
                                                       {"msg_alert", "email_alert"},
                                                       {"[MessageTone/MessageAlert]", "[MessageTone/EmailAlert]"},
                                                       {kMessage, kEmail}},
                                         ExpectedMedia{ZEL_SVC_ELEMENT_ALARM_TONE,
                                                       "AlarmTone",
                                                       "/opt/usr/share/settings/Alarms/",
                                                       {"db/private/com.quorvex.clock/alarm_app/default_alarm_tone"},
                                                       {"alarm_tone"},
                                                       {"[AlarmTone]"},
                                                       {"db/private/com.quorvex.clock/alarm_app/default_alarm_tone"}}),
                         [](const auto &media) { return std::string{media.param.tag}; });

class RepeatedMedia : public BenchPhone {};

TEST_F(RepeatedMedia, EveryFileIsCopiedAndTheFirstIsThePhonesOwn) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    write(kPackage + "/m/one.mp3", "1");
    write(kPackage + "/m/two.mp3", "2");
    install_spec(element("MessageTone", "/m/one.mp3") + element("MessageTone", "/m/two.mp3"));
    EXPECT_EQ(read("/opt/usr/share/settings/Alerts/one.mp3"), "1");
    EXPECT_EQ(read("/opt/usr/share/settings/Alerts/two.mp3"), "2");
    EXPECT_EQ(get_string(kMessage), "/opt/usr/share/settings/Alerts/one.mp3");
    EXPECT_EQ(get_string(kEmail), "/opt/usr/share/settings/Alerts/one.mp3");
    EXPECT_EQ(group.text("sound", "msg_alert"), "/opt/usr/share/settings/Alerts/one.mp3");
}

TEST_F(RepeatedMedia, OnlyTheFirstIsVerified) {
    set_string("db/menu_widget/bgset", "/w/one.jpg");
    EXPECT_THAT(verify_spec(element("Wallpaper", "/one.jpg") + element("Wallpaper", "/two.jpg")),
                ElementsAre(passed("[Wallpaper] Spec='one.jpg',Phone='one.jpg'")));
}

// AlarmTone is no repeating element: each one counts as the first, so the last one stays.
TEST_F(RepeatedMedia, LastAlarmToneStays) {
    install_spec(element("AlarmTone", "/one.mp3") + element("AlarmTone", "/two.mp3"));
    EXPECT_EQ(get_string("db/private/com.quorvex.clock/alarm_app/default_alarm_tone"),
              "/opt/usr/share/settings/Alarms/two.mp3");
}

TEST_F(RepeatedMedia, RefusedSecondSettingOfTheMessageAlertStopsTheEmailAlert) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    fail("vconf_set_str", kMessage, 2);
    install_spec(element("MessageTone", "/one.mp3"));
    EXPECT_EQ(get_string(kMessage), "/opt/usr/share/settings/Alerts/one.mp3");
    EXPECT_EQ(get_string(kEmail), std::nullopt);
    EXPECT_EQ(group.text("sound", "msg_alert"), std::nullopt);
}

TEST_F(RepeatedMedia, MessageToneLinesStandOnTheirOwn) {
    set_string(kEmail, "/x/one.mp3");
    EXPECT_THAT(verify_spec(element("MessageTone", "/one.mp3")),
                ElementsAre(passed("[MessageTone/EmailAlert] Spec='one.mp3',Phone='one.mp3'")));
}

TEST_F(RepeatedMedia, RingTonesSecondKeyIsRefusedAlone) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    fail("vconf_set_str", "db/setting/sound/call/ringtone_path");
    install_spec(element("RingTone", "/one.mp3"));
    EXPECT_EQ(get_string("db/setting/sound/call/ringtone_default_path"), "/opt/usr/share/settings/Ringtones/one.mp3");
    EXPECT_EQ(group.text("sound", "ring_tone"), std::nullopt);
}

} // namespace zel_test
