// Which events each row of the element table hands on.

#include "spec/zel-svc-element-table.h"
#include "unit/element-rows.h"

#include <gtest/gtest.h>
#include <set>
#include <string>

namespace {

using zel_test::kElementRows;

// Elements that only hold others, and what nobody reads.
const std::set<std::string_view> kContainers = {"SW-Configuration", "MobileData",  "PublicName",
                                                "NickName",         "Settings",    "Main",
                                                "Display",          "Sound",       "KeyTone",
                                                "ExtraSound",       "Phone",       "DateTimeFormat",
                                                "Contact",          "Calendar",    "Multimedia",
                                                "Camera",           "BT",          "Wifi",
                                                "Messages",         "SMS",         "MsgTypeThreshold",
                                                "PushMsg",          "MMS",         "MmsSending",
                                                "MmsReceiving",     "Email",       "EmailSending",
                                                "EmailReceiving",   "NbAccount",   "Incoming",
                                                "Outgoing",         "ActiveSync",  "SyncSchedule",
                                                "EasEmail",         "EasCalendar", "Browser",
                                                "eManual",          "Proxy",       "Gateway",
                                                "StaticIP",         "DNS",         "DBList",
                                                "ContactDB",        "CalendarDB",  "GPS",
                                                "NbSetting",        "VoLTE",       "RCS"};

// Values of a profile that every profile has alike on the phone.
const std::set<std::string_view> kUnused = {"PSparam", "TrafficClass", "Protocol", "SecureConn", "LingerTime"};

const std::set<std::string_view> kStarts = {"GeneralInfo", "Security",  "Wallpaper",  "RingTone",
                                            "MessageTone", "AlarmTone", "Connections"};

const std::set<std::string_view> kStartsAndEnds = {"NetworkInfo", "Network", "MaxPDP",   "WbAmr",       "FastDormancy",
                                                   "Voicemail",   "Account", "Bookmark", "QuickAccess", "ProfileHandle",
                                                   "Profile",     "SyncML",  "DataSync", "IMSSetting",  "Setting"};

// "start", "value" and "end", each by its first letter.
std::string expected_events(std::size_t row) {
    const std::string_view tag = kElementRows[row].tag;
    if (tag == "CustomerDataSet") return "e";
    if (tag == "CustomerData") return kElementRows[row].parent.empty() ? "" : "s";
    if (kContainers.contains(tag) || kUnused.contains(tag)) return "";
    if (kStarts.contains(tag)) return "s";
    return kStartsAndEnds.contains(tag) ? "se" : "v";
}

std::string events(const ZelSvcElement &row) {
    return std::string(row.start ? "s" : "") + (row.value ? "v" : "") + (row.end ? "e" : "");
}

} // namespace

TEST(ElementTable, RowsHandOnTheEventsOfTheirElements) {
    for (std::size_t row = 0; row < kElementRows.size(); ++row) {
        const std::string found = events(kZelSvcElementTable[row]);
        EXPECT_EQ(found, expected_events(row)) << row << " " << kElementRows[row].tag;
    }
}
