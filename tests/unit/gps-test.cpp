// What switching the location service on and off does beyond the first key; the rest is a row of words.

#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr const char *kEnabled = "db/location/setting/GpsEnabled";
constexpr const char *kMyLocation = "db/location/setting/Usemylocation";

std::string activation(const std::string &text) { return "<GPS><GPSActivation>" + text + "</GPSActivation></GPS>"; }

} // namespace

class Gps : public BenchPhone {};

TEST_F(Gps, OnSwitchesTheUseOfTheLocationOnToo) {
    const LoadedGroup group{ZEL_SVC_DATA_GPS};
    install_spec(activation("on"));
    EXPECT_EQ(get_int(kEnabled), 1);
    EXPECT_EQ(get_int(kMyLocation), 1);
    EXPECT_EQ(group.text("gps", "gps_activation"), "1");
    EXPECT_EQ(group.text("gps", "use_my_location"), "1");
}

TEST_F(Gps, OffLeavesTheUseOfTheLocationOutOfIt) {
    const LoadedGroup group{ZEL_SVC_DATA_GPS};
    install_spec(activation("off"));
    EXPECT_EQ(get_int(kEnabled), 0);
    EXPECT_EQ(get_int(kMyLocation), std::nullopt);
    EXPECT_EQ(group.text("gps", "gps_activation"), "0");
    EXPECT_EQ(group.text("gps", "use_my_location"), std::nullopt);
}

TEST_F(Gps, OffAfterOnKeepsTheUseOfTheLocation) {
    const LoadedGroup group{ZEL_SVC_DATA_GPS};
    install_spec(activation("on"));
    install_spec(activation("off"));
    EXPECT_EQ(get_int(kEnabled), 0);
    EXPECT_EQ(get_int(kMyLocation), 1);
    EXPECT_EQ(group.text("gps", "gps_activation"), "0");
    EXPECT_EQ(group.text("gps", "use_my_location"), "1");
}

TEST_F(Gps, RefusedFirstKeyStopsOn) {
    const LoadedGroup group{ZEL_SVC_DATA_GPS};
    fail("vconf_set_int", kEnabled);
    install_spec(activation("on"));
    EXPECT_EQ(get_int(kMyLocation), std::nullopt);
    EXPECT_EQ(group.text("gps", "gps_activation"), std::nullopt);
    EXPECT_EQ(group.text("gps", "use_my_location"), std::nullopt);
}

TEST_F(Gps, RefusedSecondKeyKeepsOnOffTheRecord) {
    const LoadedGroup group{ZEL_SVC_DATA_GPS};
    fail("vconf_set_int", kMyLocation);
    install_spec(activation("on"));
    EXPECT_EQ(get_int(kEnabled), 1);
    EXPECT_EQ(group.text("gps", "gps_activation"), std::nullopt);
    EXPECT_EQ(group.text("gps", "use_my_location"), std::nullopt);
}

TEST_F(Gps, RefusedKeyKeepsOffOffTheRecord) {
    const LoadedGroup group{ZEL_SVC_DATA_GPS};
    fail("vconf_set_int", kEnabled);
    install_spec(activation("off"));
    EXPECT_EQ(get_int(kEnabled), std::nullopt);
    EXPECT_EQ(group.text("gps", "gps_activation"), std::nullopt);
}

TEST_F(Gps, CapitalsAndNumbersChangeNothing) {
    set_int(kEnabled, 1);
    for (const char *text : {"On", "1", "off ", "OFF"}) {
        install_spec(activation(text));
        EXPECT_EQ(get_int(kEnabled), 1) << text;
        EXPECT_THAT(verify_spec(activation(text)), IsEmpty()) << text;
    }
}

TEST_F(Gps, TwoIsNeitherOnNorOff) {
    const LoadedGroup group{ZEL_SVC_DATA_GPS};
    install_spec(activation("on"));
    set_int(kEnabled, 2);
    EXPECT_THAT(verify_spec(activation("on")), ElementsAre(failed("[GPS/GPSActivation] Spec='on',Phone='?\?'")));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_GPS_ACTIVATION), "??");
}

TEST_F(Gps, UseOfTheLocationIsNotCompared) {
    set_int(kEnabled, 1);
    set_int(kMyLocation, 0);
    EXPECT_THAT(verify_spec(activation("on")), ElementsAre(passed("[GPS/GPSActivation] Spec='on',Phone='on'")));
}

TEST_F(Gps, RecordOfTheUseAloneExportsNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_GPS};
    zel_svc_data_set_int(ZEL_SVC_DATA_GPS, "gps", "use_my_location", 1);
    set_int(kEnabled, 1);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_GPS_ACTIVATION), "");
}

} // namespace zel_test
