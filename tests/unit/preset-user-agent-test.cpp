// The browser's user agent, built from a template.

#include "preset/zel-svc-preset-actions.h"
#include "support/bench-phone.h"

namespace {

struct UserAgent : zel_test::BenchPhone {
    std::string built(const std::string &pattern) {
        zel_svc_preset_set_user_agent(pattern.c_str());
        return get_string("db/browser/user_agent").value_or("(none)");
    }
    void tell(const char *name, const std::string &text) { call("system-set", {{"name", name}, {"text", text}}); }
};

TEST_F(UserAgent, IsTheTemplateWithItsPlaceholdersFilled) {
    tell("model", "SM-Q7N0");
    tell("build-version", "Q7N0DDU0AOL1");
    tell("platform-version", "2.4.0");
    const std::pair<const char *, const char *> cases[] = {
        {"", ""},
        {"plain", "plain"},
        {"Mozilla/5.0 ($(MODEL); Zel $(PLATFORM_VER)) Build/$(BUILD_VER)",
         "Mozilla/5.0 (SM-Q7N0; Zel 2.4) Build/Q7N0DDU0AOL1"},
        {"Mozilla $(MODEL) $(FOO)", "Mozilla SM-Q7N0 "},
        {"$(model)$( MODEL)$()x", "x"},
        {"a$b $ (MODEL) $", "a$b $ (MODEL) $"},
        {"$$(MODEL))", "$SM-Q7N0)"},
        {"a $(MODEL", "a "},
        {"a $(", "a "},
        {"$(MODEL$(MODEL)x", "x"},
        {"$(AAAAAAAAAAAAAAAAAAA)x", "x"},
        {"$(AAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAA)x", "x"},
    };
    for (const auto &[pattern, text] : cases)
        EXPECT_EQ(built(pattern), text) << pattern;
}

TEST_F(UserAgent, ThePlatformVersionIsItsFirstTwoParts) {
    const std::pair<const char *, const char *> cases[] = {
        {"2.4.0", "2.4"},
        {"2.4", "2.4"},
        {"2", "2"},
        {"12345", "1234"},
        {"12345.67890.1", "1234.6789"},
        {"2.", "2"},
        {"2..3", "2"},
        {".3", ".3"},
        {"", ""},
        {"1234.5678", "1234.5678"},
        {"abc.def", "abc.def"},
        {"...", ""},
        {"\xC3\xA9\xC3\xA9\xC3\xA9.1", "\xC3\xA9\xC3\xA9.1"},
        {"a\xC3\xA9\xC3\xA9.1", "a\xC3\xA9.1"},
    };
    for (const auto &[version, text] : cases) {
        tell("platform-version", version);
        EXPECT_EQ(built("$(PLATFORM_VER)"), text) << version;
    }
}

TEST_F(UserAgent, WhatThePhoneDoesNotTellIsLeftOut) {
    for (const char *name : {"model", "build-version", "platform-version"})
        call("system-set", {{"name", name}});
    EXPECT_EQ(built("[$(MODEL)|$(BUILD_VER)|$(PLATFORM_VER)]"), "[||]");
}

TEST_F(UserAgent, Has299BytesAtMostAndEndsInAWholeCharacter) {
    const std::string a(400, 'a');
    EXPECT_EQ(built(a), a.substr(0, 299));
    EXPECT_EQ(built(a.substr(0, 299)), a.substr(0, 299));
    EXPECT_EQ(built(a.substr(0, 298) + "\xC3\xA9"), a.substr(0, 298));
    EXPECT_EQ(built(a.substr(0, 297) + "\xC3\xA9"), a.substr(0, 297) + "\xC3\xA9");
    tell("model", std::string(300, 'm'));
    EXPECT_EQ(built("$(MODEL)"), std::string(299, 'm'));
}

TEST_F(UserAgent, BehindAValueThatDidNotFitNothingFollows) {
    const std::string a(298, 'a');
    tell("model", "\xC3\xA9");
    EXPECT_EQ(built(a + "$(MODEL)b"), a);
    tell("model", "12345");
    EXPECT_EQ(built(a + "$(MODEL)b"), a + "1");
    tell("model", "1");
    EXPECT_EQ(built(a + "$(MODEL)b"), a + "1");
}

} // namespace
