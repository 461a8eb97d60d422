// Cell broadcast is recorded for the message service and nothing else. Its channel index belongs to the
// process, and every test is a process of its own.

#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::IsEmpty;

namespace {

std::string sms(const std::string &children) { return "<Messages><SMS>" + children + "</SMS></Messages>"; }
std::string count(const std::string &text) { return "<NbCellBroadcastChannel>" + text + "</NbCellBroadcastChannel>"; }
std::string channel(const std::string &text) { return "<CellBroadcastChannel>" + text + "</CellBroadcastChannel>"; }
std::string broadcast(const std::string &text) { return "<CellBroadcast>" + text + "</CellBroadcast>"; }

} // namespace

class CellBroadcast : public BenchPhone {
  protected:
    static std::optional<std::string> recorded(const LoadedGroup &group, const char *key) {
        return group.text("sms", key);
    }
};

TEST_F(CellBroadcast, OnAndOffAreRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    install_spec(sms(broadcast("on")));
    EXPECT_EQ(recorded(group, "cb"), "1");
    install_spec(sms(broadcast("off")));
    EXPECT_EQ(recorded(group, "cb"), "0");
}

TEST_F(CellBroadcast, OtherTextsAreNotRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    for (const char *text : {"", "On", "on ", "1"}) {
        install_spec(sms(broadcast(text)));
        EXPECT_EQ(recorded(group, "cb"), std::nullopt) << text;
    }
}

TEST_F(CellBroadcast, ChannelsAreNumberedFromOneAfterTheCount) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    install_spec(sms(count("2") + channel("50") + channel("0919")));
    EXPECT_EQ(recorded(group, "cb_channel_count"), "2");
    EXPECT_EQ(recorded(group, "cb_channel_0"), std::nullopt);
    EXPECT_EQ(recorded(group, "cb_channel_1"), "50");
    EXPECT_EQ(recorded(group, "cb_channel_2"), "919");
    EXPECT_EQ(recorded(group, "cb_channel_3"), std::nullopt);
}

TEST_F(CellBroadcast, ChannelsBeforeAnyCountBeginAtZero) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    install_spec(sms(channel("50") + channel("51")));
    EXPECT_EQ(recorded(group, "cb_channel_0"), "50");
    EXPECT_EQ(recorded(group, "cb_channel_1"), "51");
    EXPECT_EQ(recorded(group, "cb_channel_count"), std::nullopt);
}

TEST_F(CellBroadcast, LaterParseGoesOnWhereTheLastOneEnded) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    install_spec(sms(count("1") + channel("50")));
    install_spec(sms(channel("51")));
    EXPECT_EQ(recorded(group, "cb_channel_2"), "51");
    install_spec(sms(count("1") + channel("52")));
    EXPECT_EQ(recorded(group, "cb_channel_1"), "52");
    EXPECT_EQ(recorded(group, "cb_channel_2"), "51");
}

TEST_F(CellBroadcast, EmptyCountAndEmptyChannelDoNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    install_spec(sms(count("3") + channel("50") + count("") + channel("") + channel("51")));
    EXPECT_EQ(recorded(group, "cb_channel_count"), "3");
    EXPECT_EQ(recorded(group, "cb_channel_1"), "50");
    EXPECT_EQ(recorded(group, "cb_channel_2"), "51");
    EXPECT_EQ(recorded(group, "cb_channel_3"), std::nullopt);
}

TEST_F(CellBroadcast, CountMayContradictTheChannels) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    install_spec(sms(count("many") + channel("50") + channel("51")));
    EXPECT_EQ(recorded(group, "cb_channel_count"), "0");
    EXPECT_EQ(recorded(group, "cb_channel_2"), "51");
}

TEST_F(CellBroadcast, VerificationSaysNothingAndKeepsTheIndex) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    install_spec(sms(count("2") + channel("50")));
    EXPECT_THAT(verify_spec(sms(broadcast("on") + count("2") + channel("50") + channel("51"))), IsEmpty());
    install_spec(sms(channel("51")));
    EXPECT_EQ(recorded(group, "cb_channel_2"), "51");
}

TEST_F(CellBroadcast, ExportSaysNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    install_spec(sms(broadcast("on") + count("1") + channel("50")));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_CELL_BROADCAST), "");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_CELL_BROADCAST_CHANNEL), "");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_CELL_BROADCAST_CHANNEL), "");
}

TEST_F(CellBroadcast, NoKeyOfThePhoneIsWritten) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    const nlohmann::json before = call("vconf-list");
    install_spec(sms(broadcast("on") + count("1") + channel("50")));
    EXPECT_EQ(recorded(group, "cb_channel_1"), "50");
    EXPECT_EQ(call("vconf-list"), before);
}

} // namespace zel_test
