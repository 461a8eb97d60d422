// The whole document: which elements it has, in which order, and how often.

#include "dispatch/recording-table.h"
#include "spec/zel-svc-data.h"
#include "spec/zel-svc-element-stack.h"
#include "spec/zel-svc-encode.h"
#include "spec/zel-svc-parse-context.h"
#include "support/bench-phone.h"

#include <gmock/gmock.h>

#include <cstdlib>
#include <memory>
#include <regex>

using ::testing::ElementsAre;
using ::testing::HasSubstr;

namespace {

struct Encode : zel_test::BenchPhone {
    static std::string document() {
        char *bytes = nullptr;
        EXPECT_EQ(zel_svc_spec_encode_xml(&bytes), 1);
        const std::unique_ptr<char, decltype(&std::free)> owned{bytes, &std::free};
        return bytes ? bytes : "";
    }
    static void gives(const std::string &call, const std::string &text) { zel_test::export_texts()[call] = text; }
    // How often a tag is opened.
    static std::ptrdiff_t times(const std::string &text, const std::string &tag) {
        const std::regex open{"<" + tag + "[ >]"};
        return std::distance(std::sregex_iterator{text.begin(), text.end(), open}, {});
    }
};

int gAllowed = 0;

void *allocate_a_few(std::size_t count, std::size_t size) {
    return gAllowed-- > 0 ? std::calloc(count, size) : nullptr;
}

} // namespace

TEST_F(Encode, LeavesNoElementOpenAndStartsItsCountsAfresh) {
    zel_svc_element_push(ZEL_SVC_ELEMENT_GPS);
    zel_svc_element_count_up(ZEL_SVC_ELEMENT_DNS_IP_ADDR);
    gives("value NbProfile", "1");
    document();
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_NONE);
    EXPECT_EQ(zel_svc_element_get_count(ZEL_SVC_ELEMENT_DNS_IP_ADDR), 2);
    EXPECT_EQ(geZelSvcParseAction, ZEL_SVC_PARSE_ACTION_ENCODE);
}

TEST_F(Encode, RefusesANullDocument) { EXPECT_EQ(zel_svc_spec_encode_xml(nullptr), 0); }

// Each allocation fails once, until one run needs no more.
TEST_F(Encode, WithoutMemoryForAllOfItIsNoDocument) {
    const std::string whole = document();
    int result = 0;
    int allowed = 0;
    for (; result == 0; ++allowed) {
        ASSERT_LT(allowed, 100);
        gAllowed = allowed;
        char *bytes = nullptr;
        result = zel_svc_spec_encode_xml(&bytes, allocate_a_few);
        const std::unique_ptr<char, decltype(&std::free)> owned{bytes, &std::free};
        EXPECT_EQ(bytes != nullptr, result == 1);
        EXPECT_EQ(bytes ? std::string{bytes} : whole, whole);
        EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_NONE);
    }
    EXPECT_GT(allowed, 3);
}

// A start, a value, an end, and a count that is asked for its items.
TEST_F(Encode, WithoutMemoryForAHandlerIsNoDocumentThoughAllOthersAreAsked) {
    document();
    const std::size_t asked = zel_test::calls().size();
    for (const char *call : {"start DNS", "value GPSActivation", "end Settings", "value NbProfile"}) {
        zel_test::calls().clear();
        gives("value NbProfile", call == std::string{"start DNS"} ? "1" : "");
        gives(call, "no memory");
        char *bytes = nullptr;
        EXPECT_EQ(zel_svc_spec_encode_xml(&bytes), 0) << call;
        EXPECT_EQ(bytes, nullptr);
        EXPECT_GE(zel_test::calls().size(), asked) << call;
        EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_NONE);
        zel_test::export_texts().clear();
    }
    EXPECT_NE(document(), "");
}

TEST_F(Encode, ItemsFollowTheirCounts) {
    for (const auto &[count, item] : {std::pair{"NbBookmark", "Bookmark"},
                                      {"NbQuickAccess", "QuickAccess"},
                                      {"NbProfile", "Profile"},
                                      {"NbProfileHandle", "ProfileHandle"},
                                      {"NbDataSync", "DataSync"}}) {
        const std::string value = std::string{"value "} + count;
        for (const auto &[text, expected] : {std::pair{"", 0}, {"0", 0}, {"3", 3}, {"?\?", 0}, {"-2", 0}}) {
            gives(value, text);
            const std::string all = document();
            EXPECT_EQ(times(all, item), expected) << count << " " << text;
            EXPECT_THAT(all, HasSubstr(std::string{"<"} + count + ">" + text + "</" + count + ">\n"));
        }
    }
}

TEST_F(Encode, OfARecordedCountThatNoCustomerHasWritesTheNumberAlone) {
    for (const auto &[count, item] :
         {std::pair{"NbQuickAccess", "QuickAccess"}, {"NbProfile", "Profile"}, {"NbProfileHandle", "ProfileHandle"}}) {
        for (const auto &[text, expected] : {std::pair{"10000", 10000}, {"10001", 0}, {"2147483647", 0}}) {
            gives(std::string{"value "} + count, text);
            const std::string all = document();
            EXPECT_EQ(times(all, item), expected) << count;
            EXPECT_THAT(all, HasSubstr(std::string{"<"} + count + ">" + text + "</" + count + ">\n"));
            gives(std::string{"value "} + count, "0");
        }
    }
}

TEST_F(Encode, LimitsAndDormanciesFollowTheRecordedCounts) {
    for (const auto &[group, section, item] : {std::tuple{ZEL_SVC_DATA_MAX_PDP, "max_pdp", "MaxPDP"},
                                               {ZEL_SVC_DATA_FAST_DORMANCY, "spec", "FastDormancy"}}) {
        EXPECT_EQ(times(document(), item), 0) << "not loaded";
        zel_svc_data_load(group, ZEL_SVC_DATA_SIM1, 1);
        EXPECT_EQ(times(document(), item), 0) << "no count";
        for (const auto &[count, expected] : {std::pair{2, 2}, {0, 0}, {-1, 0}, {10000, 10000}, {10001, 0}}) {
            zel_svc_data_set_int(group, section, "count", count);
            EXPECT_EQ(times(document(), item), expected) << item << count;
        }
        zel_svc_data_free(group);
    }
}

TEST_F(Encode, LanguagesAreThereWhenTheyWereRecorded) {
    zel_svc_data_load(ZEL_SVC_DATA_MAIN, ZEL_SVC_DATA_SIM1, 1);
    EXPECT_EQ(times(document(), "DefLanguage"), 0);
    EXPECT_EQ(times(document(), "DefLanguageNoSIM"), 0);
    zel_svc_data_set_int(ZEL_SVC_DATA_MAIN, "phone", "lang_automatic", 0);
    EXPECT_EQ(times(document(), "DefLanguage"), 1);
    EXPECT_EQ(times(document(), "DefLanguageNoSIM"), 0);
    zel_svc_data_set_str(ZEL_SVC_DATA_MAIN, "phone", "lang_no_sim", "");
    EXPECT_EQ(times(document(), "DefLanguageNoSIM"), 1);
}

TEST_F(Encode, OfARepeatedGroupRunsStartValuesAndEndOfEachItem) {
    zel_svc_data_load(ZEL_SVC_DATA_MAX_PDP, ZEL_SVC_DATA_SIM1, 1);
    zel_svc_data_set_int(ZEL_SVC_DATA_MAX_PDP, "max_pdp", "count", 2);
    zel_test::calls().clear();
    document();
    const std::vector<std::string> all = zel_test::call_texts();
    const auto first = std::find(all.begin(), all.end(), "value NbMaxPDP");
    const std::vector<std::string> item{"start MaxPDP",   "start NetworkName", "value NetworkName", "end NetworkName",
                                        "start MaxPDP2G", "value MaxPDP2G",    "end MaxPDP2G",      "start MaxPDP3G",
                                        "value MaxPDP3G", "end MaxPDP3G",      "end MaxPDP"};
    ASSERT_GE(std::distance(first, all.end()), 25);
    EXPECT_TRUE(std::equal(item.begin(), item.end(), first + 2));
    EXPECT_TRUE(std::equal(item.begin(), item.end(), first + 13));
    EXPECT_EQ(*(first + 24), "start NbFastDormancy");
}
