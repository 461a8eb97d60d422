// Spec files of a phone: which are parsed, and what an observer hears of them.

#include "base/zel-svc-observer.h"
#include "spec/zel-svc-element-dispatcher.h"
#include "spec/zel-svc-element-stack.h"
#include "spec/zel-svc-spec-file.h"
#include "spec/zel-svc-xml.h"
#include "support/bench-phone.h"

#include <gmock/gmock.h>

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace std::string_literals;

namespace {

const std::string kMark = "\xEF\xBB\xBF";
const std::string kPath = "/opt/system/zel/mps/ZEL/Customer/AAA/customer.xml";

// Writes what it hears into one list.
class Listener : public ZelSvcObserver {
  public:
    std::vector<std::string> heard;

    Listener() { zel_svc_set_observer(this); }
    ~Listener() override { zel_svc_set_observer(nullptr); }
    Listener(const Listener &) = delete;
    Listener &operator=(const Listener &) = delete;

    void unknown_element(std::string_view tag, std::int32_t offset) override { hear("unknown ", tag, offset); }
    void disabled_element(std::string_view tag, std::int32_t offset) override { hear("disabled ", tag, offset); }
    void unread_file(std::string_view path, std::string_view reason) override {
        heard.push_back("unread " + std::string(path) + ": " + std::string(reason));
    }
    void parsed_file(std::string_view path, std::int32_t result, ZelSvcTextPosition end) override {
        heard.push_back("parsed " + std::string(path) + ": " + std::to_string(result) + " at " +
                        std::to_string(end.offset) + ", " + std::to_string(end.line) + ":" +
                        std::to_string(end.column));
    }

  private:
    void hear(const char *what, std::string_view tag, std::int32_t offset) {
        heard.push_back(what + std::string(tag) + " at " + std::to_string(offset));
    }
};

class SpecFile : public zel_test::BenchPhone {
  protected:
    int parse(std::string_view bytes, int reset_filter = 1) {
        write(kPath, bytes);
        return zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_VERIFY, kPath.c_str(), reset_filter);
    }

    Listener listener;
};

} // namespace

TEST_F(SpecFile, IsParsedFromItsFourthByte) {
    EXPECT_EQ(parse(kMark + "<CustomerData>\n</CustomerData>"), 1);
    EXPECT_THAT(listener.heard, ElementsAre("parsed " + kPath + ": 0 at 33, 2:16"));
}

TEST_F(SpecFile, MarkIsSkippedUnlookedAt) {
    EXPECT_EQ(parse("xyz<CustomerData/>"), 1);
    EXPECT_THAT(listener.heard, ElementsAre("parsed " + kPath + ": 0 at 18, 1:16"));
}

TEST_F(SpecFile, WithoutAMarkIsNotParsed) {
    EXPECT_EQ(parse("<CustomerData/>"), 0);
    EXPECT_THAT(listener.heard, ElementsAre("unread " + kPath + ": the file has no byte-order mark"));
    EXPECT_EQ(parse("<"), 0);
}

TEST_F(SpecFile, MissingEmptyAndUnreadableFilesAreTold) {
    EXPECT_EQ(zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_INSTALL, "/nowhere/customer.xml", 1), 0);
    EXPECT_EQ(parse(""), 0);
    write("/opt/folder/file", "x");
    EXPECT_EQ(zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_INSTALL, "/opt/folder", 1), 0);
    EXPECT_EQ(zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_INSTALL, nullptr, 1), 0);
    ASSERT_EQ(listener.heard.size(), 3U);
    EXPECT_EQ(listener.heard[0], "unread /nowhere/customer.xml: No such file or directory");
    EXPECT_EQ(listener.heard[1], "unread " + kPath + ": the file is empty");
    EXPECT_THAT(listener.heard[2], testing::StartsWith("unread /opt/folder: "));
}

TEST_F(SpecFile, OfOneToThreeBytesIsAnEmptyDocument) {
    for (const std::string bytes : {"x", "xy", "xyz", "\xEF\xBB\xBF", "x<a"}) {
        listener.heard.clear();
        zel_svc_element_push(ZEL_SVC_ELEMENT_GPS);
        zel_svc_element_enable(ZEL_SVC_ELEMENT_GPS);
        EXPECT_EQ(parse(bytes), 1);
        EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_NONE);
        EXPECT_EQ(zel_svc_element_is_enabled(ZEL_SVC_ELEMENT_MAIN), 1);
        EXPECT_THAT(listener.heard,
                    ElementsAre("parsed " + kPath + ": 2 at " + std::to_string(bytes.size()) + ", 1:1"));
    }
}

TEST_F(SpecFile, ActionIsSetWhateverBecomesOfTheFile) {
    geZelSvcParseAction = ZEL_SVC_PARSE_ACTION_INSTALL;
    zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_ENCODE, "/nowhere", 0);
    EXPECT_EQ(geZelSvcParseAction, ZEL_SVC_PARSE_ACTION_ENCODE);
    parse(kMark);
    EXPECT_EQ(geZelSvcParseAction, ZEL_SVC_PARSE_ACTION_VERIFY);
}

TEST_F(SpecFile, FilterIsResetOnlyWhenAskedAndOnlyForAFileThatIsParsed) {
    zel_svc_element_enable(ZEL_SVC_ELEMENT_GPS);
    zel_svc_element_set_stop(ZEL_SVC_ELEMENT_GPS);
    parse("<no mark/>", 1);
    parse(kMark + "<a/>", 0);
    EXPECT_EQ(zel_svc_element_is_enabled(ZEL_SVC_ELEMENT_MAIN), 0);
    EXPECT_EQ(zel_svc_element_is_stop(ZEL_SVC_ELEMENT_GPS), 1);
    parse(kMark + "<a/>", 1);
    EXPECT_EQ(zel_svc_element_is_enabled(ZEL_SVC_ELEMENT_MAIN), 1);
    EXPECT_EQ(zel_svc_element_is_stop(ZEL_SVC_ELEMENT_GPS), 0);
}

TEST_F(SpecFile, ResultAndPlaceOfAnErrorAreTold) {
    EXPECT_EQ(parse(kMark + "<CustomerData>\n  <Main>\n    <=>\n"), 1);
    EXPECT_EQ(parse(kMark + "<CustomerData>\n  <Main>\n"), 1);
    EXPECT_EQ(parse(kMark + "\n\n~"), 1);
    EXPECT_THAT(listener.heard, ElementsAre("unknown = at 31", "parsed " + kPath + ": 2 at 35, 4:1",
                                            "parsed " + kPath + ": 2 at 27, 3:1", "parsed " + kPath + ": 1 at 5, 3:1"));
}

TEST_F(SpecFile, StopEndsTheParseWithItsElement) {
    zel_svc_element_set_stop(ZEL_SVC_ELEMENT_NETWORK);
    parse(kMark + "<CustomerData><Network></Network><Unseen/></CustomerData>", 0);
    EXPECT_THAT(listener.heard, ElementsAre("parsed " + kPath + ": 6 at 60, 1:58"));
}

TEST_F(SpecFile, UnknownAndDisabledElementsAreToldWithTheirPlace) {
    zel_svc_element_enable(ZEL_SVC_ELEMENT_MAIN);
    parse(kMark + "<SW-Configuration><Main/><New>x</New><Settings/></SW-Configuration>", 0);
    EXPECT_THAT(listener.heard, ElementsAre("disabled SW-Configuration at 3", "unknown New at 28",
                                            "disabled Settings at 40", "parsed " + kPath + ": 0 at 70, 1:68"));
}

TEST_F(SpecFile, WithoutAnObserverNothingIsTold) {
    zel_svc_set_observer(nullptr);
    EXPECT_EQ(parse(kMark + "<New/>"), 1);
    EXPECT_THAT(listener.heard, IsEmpty());
}

TEST_F(SpecFile, TruncatedAnywhereIsStillAFile) {
    const std::string whole = kMark + "<CustomerData><Main><Unknown>x</Unknown></Main></CustomerData>";
    for (std::size_t length = 1; length <= whole.size(); ++length) {
        listener.heard.clear();
        ASSERT_EQ(parse(whole.substr(0, length)), 1);
        const std::string result = length == whole.size() ? ": 0 at " : ": 2 at ";
        ASSERT_EQ(listener.heard.back(), "parsed " + kPath + result + std::to_string(length) +
                                             ", 1:" + std::to_string(std::max<std::size_t>(length, 3) - 2));
    }
}

TEST_F(SpecFile, LargeFileIsRead) {
    std::string bytes = kMark + "<CustomerData>";
    while (bytes.size() < 8UL * 1024 * 1024)
        bytes += "<Display></Display>\n";
    EXPECT_EQ(parse(bytes + "</CustomerData>"), 1);
    EXPECT_THAT(listener.heard.back(), testing::HasSubstr(": 0 at "));
}

TEST_F(SpecFile, FailedOpenIsTold) {
    write(kPath, kMark + "<a/>");
    fail("zel_platform_open", kPath);
    EXPECT_EQ(zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_INSTALL, kPath.c_str(), 1), 0);
    EXPECT_THAT(listener.heard, ElementsAre("unread " + kPath + ": Input/output error"));
}
