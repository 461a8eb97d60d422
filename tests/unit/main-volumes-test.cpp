#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

#include <climits>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

struct ExpectedVolume {
    ZelSvcElementId element;
    const char *tag;
    const char *key;
    const char *record;

    friend void PrintTo(const ExpectedVolume &volume, std::ostream *out) { *out << volume.tag; }
};

class Volume : public BenchPhone, public testing::WithParamInterface<ExpectedVolume> {
  protected:
    [[nodiscard]] static std::string spec(const std::string &text) {
        const std::string tag = GetParam().tag;
        return "<" + tag + ">" + text + "</" + tag + ">";
    }
    [[nodiscard]] static std::string line(const std::string &spec_and_phone) {
        return "[" + std::string{GetParam().tag} + "] " + spec_and_phone;
    }
};

TEST_P(Volume, LevelIsStoredForSpeakerAndEarphone) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install_spec(spec("5"));
    EXPECT_EQ(get_int(GetParam().key), 1285);
    EXPECT_EQ(group.text("sound", GetParam().record), "5");
}

TEST_P(Volume, TextIsRecordedAsItStands) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install_spec(spec("07"));
    EXPECT_EQ(get_int(GetParam().key), 0x0707);
    EXPECT_EQ(group.text("sound", GetParam().record), "07");
}

TEST_P(Volume, NumbersAreReadAsTheCLibraryReadsThem) {
    install_spec(spec("loud"));
    EXPECT_EQ(get_int(GetParam().key), 0);
    install_spec(spec("+3 bars"));
    EXPECT_EQ(get_int(GetParam().key), 0x0303);
    // Not limited to a byte: 300 | (300 << 8).
    install_spec(spec("300"));
    EXPECT_EQ(get_int(GetParam().key), 0x12D2C);
    // -1 | (-1 << 8), without leaving 32 bits.
    install_spec(spec("-1"));
    EXPECT_EQ(get_int(GetParam().key), -1);
    install_spec(spec("99999999999"));
    EXPECT_EQ(get_int(GetParam().key), -1);
}

TEST_P(Volume, RefusedKeyIsNotRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    fail("vconf_set_int", GetParam().key);
    install_spec(spec("5"));
    EXPECT_EQ(group.text("sound", GetParam().record), std::nullopt);
}

TEST_P(Volume, BothLevelsMustEqualTheSpec) {
    set_int(GetParam().key, 1285);
    EXPECT_THAT(verify_spec(spec("5")), ElementsAre(passed(line("Spec='5',Phone='(Speaker)5,(Earphone)5'"))));
    set_int(GetParam().key, 773);
    EXPECT_THAT(verify_spec(spec("5")), ElementsAre(failed(line("Spec='5',Phone='(Speaker)5,(Earphone)3'"))));
    set_int(GetParam().key, 0x0503);
    EXPECT_THAT(verify_spec(spec("5")), ElementsAre(failed(line("Spec='5',Phone='(Speaker)3,(Earphone)5'"))));
}

TEST_P(Volume, LevelsAreComparedAsTexts) {
    set_int(GetParam().key, 0x0505);
    EXPECT_THAT(verify_spec(spec("05")), ElementsAre(failed(line("Spec='05',Phone='(Speaker)5,(Earphone)5'"))));
}

TEST_P(Volume, LevelsAreSingleBytesOfTheStoredNumber) {
    set_int(GetParam().key, -1);
    EXPECT_THAT(verify_spec(spec("255")), ElementsAre(passed(line("Spec='255',Phone='(Speaker)255,(Earphone)255'"))));
}

TEST_P(Volume, UnreadableKeyAddsNoLine) {
    EXPECT_THAT(verify_spec(spec("5")), IsEmpty());
    set_string(GetParam().key, "1285");
    EXPECT_THAT(verify_spec(spec("5")), IsEmpty());
}

TEST_P(Volume, SpeakerLevelIsExported) {
    set_int(GetParam().key, 0x0903);
    EXPECT_EQ(export_value(GetParam().element), "3");
}

TEST_P(Volume, UnreadableKeyIsExportedEmpty) { EXPECT_EQ(export_value(GetParam().element), ""); }

INSTANTIATE_TEST_SUITE_P(Main, Volume,
                         testing::Values(ExpectedVolume{ZEL_SVC_ELEMENT_RNG_VOLUME, "RngVolume",
                                                        "db/private/sound/volume/ringtone", "ring_vol"},
                                         ExpectedVolume{ZEL_SVC_ELEMENT_MSG_TONE_VOLUME, "MsgToneVolume",
                                                        "db/private/sound/volume/notification", "msg_vol"},
                                         ExpectedVolume{ZEL_SVC_ELEMENT_KEY_VOLUME, "KeyVolume",
                                                        "db/private/sound/volume/system", "sys_vol"}),
                         [](const auto &volume) { return std::string{volume.param.tag}; });

} // namespace zel_test
