#include "support/bench-phone.h"
#include "support/spec-text.h"

#include "spec/zel-svc-language.h"

#include <gmock/gmock.h>

#include <array>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr const char *kLanguage = "db/menu_widget/language";
constexpr const char *kRegion = "db/menu_widget/regionformat";
constexpr const char *kAutomatic = "db/setting/lang_automatic";

std::string language(const std::string &text) { return "<DefLanguage>" + text + "</DefLanguage>"; }
std::string no_sim(const std::string &text) { return "<DefLanguageNoSIM>" + text + "</DefLanguageNoSIM>"; }

} // namespace

class Language : public BenchPhone {
  protected:
    void expect_untouched(const LoadedGroup &group) {
        EXPECT_EQ(get_string(kLanguage), std::nullopt);
        EXPECT_EQ(get_string(kRegion), std::nullopt);
        EXPECT_EQ(get_bool(kAutomatic), std::nullopt);
        for (const char *key : {"lang", "lang_no_sim", "region", "lang_automatic"})
            EXPECT_EQ(group.text("phone", key), std::nullopt) << key;
    }
};

TEST_F(Language, WordBecomesTheLocaleOfLanguageAndRegion) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install_spec(language("english_us"));
    EXPECT_EQ(get_string(kLanguage), "en_US.UTF-8");
    EXPECT_EQ(get_string(kRegion), "en_US.UTF-8");
    EXPECT_EQ(get_bool(kAutomatic), false);
    EXPECT_EQ(group.text("phone", "lang"), "english_us");
    EXPECT_EQ(group.text("phone", "region"), "en_US.UTF-8");
    EXPECT_EQ(group.number("phone", "lang_automatic"), 0);
    EXPECT_EQ(group.text("phone", "lang_no_sim"), std::nullopt);
}

TEST_F(Language, AutomaticLeavesTheLanguage) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    set_string(kLanguage, "ko_KR.UTF-8");
    install_spec(language("automatic"));
    EXPECT_EQ(get_string(kLanguage), "ko_KR.UTF-8");
    EXPECT_EQ(get_bool(kAutomatic), true);
    EXPECT_EQ(group.number("phone", "lang_automatic"), 1);
    EXPECT_EQ(group.text("phone", "lang"), std::nullopt);
}

TEST_F(Language, NextLanguageEndsTheAutomaticChoice) {
    install_spec(language("automatic") + language("slovakian"));
    EXPECT_EQ(get_bool(kAutomatic), false);
    EXPECT_EQ(get_string(kLanguage), "sk_SK.UTF-8");
}

TEST_F(Language, LocaleIsTakenAsItIs) {
    install_spec(language("en_GB"));
    EXPECT_EQ(get_string(kLanguage), "en_GB.UTF-8");
}

TEST_F(Language, LongLocaleIsCut) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install_spec(language("aa_bbbbbbbbbbbbbbb"));
    EXPECT_EQ(get_string(kLanguage), "aa_bbbbbbbbbbbbbbb.");
    EXPECT_EQ(group.text("phone", "region"), "aa_bbbbbbbbbbbbbbb.");
    EXPECT_EQ(group.text("phone", "lang"), "aa_bbbbbbbbbbbbbbb");
}

TEST_F(Language, UnknownWordsChangeNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install_spec(language("german") + no_sim("german"));
    install_spec(language("Automatic") + language("") + no_sim("automatic") + no_sim(""));
    expect_untouched(group);
}

TEST_F(Language, RefusedLanguageStopsTheElement) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    fail("vconf_set_str", kLanguage);
    install_spec(language("english_us") + no_sim("english_us"));
    expect_untouched(group);
}

TEST_F(Language, RefusedRegionStopsTheElement) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    fail("vconf_set_str", kRegion);
    install_spec(language("english_us") + no_sim("english_us"));
    EXPECT_EQ(get_string(kLanguage), "en_US.UTF-8");
    EXPECT_EQ(get_bool(kAutomatic), std::nullopt);
    EXPECT_EQ(group.text("phone", "lang"), std::nullopt);
    EXPECT_EQ(group.text("phone", "lang_no_sim"), std::nullopt);
}

TEST_F(Language, RefusedAutomaticFlagIsNotRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    fail("vconf_set_bool", kAutomatic);
    install_spec(language("english_us"));
    EXPECT_EQ(group.text("phone", "lang"), "english_us");
    EXPECT_EQ(group.text("phone", "lang_automatic"), std::nullopt);
}

TEST_F(Language, WordIsComparedAsItsLocale) {
    set_bool(kAutomatic, false);
    set_string(kLanguage, "en_US.UTF-8");
    EXPECT_THAT(verify_spec(language("english_us")),
                ElementsAre(passed("[Phone/DefLanguage] Spec='english_us',Phone='en_US'")));
    EXPECT_THAT(verify_spec(language("slovakian")),
                ElementsAre(failed("[Phone/DefLanguage] Spec='slovakian',Phone='en_US'")));
}

TEST_F(Language, StoredLocaleLosesItsEncoding) {
    set_string(kLanguage, "ko_KR.UTF-8");
    EXPECT_THAT(verify_spec(language("ko_KR")), ElementsAre(passed("[Phone/DefLanguage] Spec='ko_KR',Phone='ko_KR'")));
    set_string(kLanguage, "ko_KR");
    EXPECT_THAT(verify_spec(language("ko_KR")), ElementsAre(passed("[Phone/DefLanguage] Spec='ko_KR',Phone='ko_KR'")));
    set_string(kLanguage, "ko_KR.a.b");
    EXPECT_THAT(verify_spec(language("ko_KR")),
                ElementsAre(failed("[Phone/DefLanguage] Spec='ko_KR',Phone='ko_KR.a'")));
}

TEST_F(Language, AutomaticIsComparedByItsFlag) {
    set_string(kLanguage, "en_US.UTF-8");
    set_bool(kAutomatic, true);
    EXPECT_THAT(verify_spec(language("automatic") + language("english_us")),
                ElementsAre(passed("[Phone/DefLanguage] Spec='automatic',Phone='automatic'"),
                            failed("[Phone/DefLanguage] Spec='english_us',Phone='automatic'")));
    set_bool(kAutomatic, false);
    EXPECT_THAT(verify_spec(language("automatic")),
                ElementsAre(failed("[Phone/DefLanguage] Spec='automatic',Phone='en_US'")));
}

TEST_F(Language, UnreadableFlagFallsBackToTheLanguage) {
    set_string(kLanguage, "en_US.UTF-8");
    EXPECT_THAT(verify_spec(language("english_us")),
                ElementsAre(passed("[Phone/DefLanguage] Spec='english_us',Phone='en_US'")));
}

TEST_F(Language, UnreadableLanguageFails) {
    EXPECT_THAT(verify_spec(language("english_us") + no_sim("english_us")),
                ElementsAre(failed("[Phone/DefLanguage] Spec='english_us',Phone='?\?'"),
                            failed("[Phone/DefLanguageNoSIM] Spec='english_us',Phone='?\?'")));
}

TEST_F(Language, UnknownWordAddsNoLine) {
    set_string(kLanguage, "en_US.UTF-8");
    EXPECT_THAT(verify_spec(language("german") + no_sim("german") + no_sim("automatic")), IsEmpty());
}

TEST_F(Language, WordIsExported) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install_spec(language("bengali_bangladesh"));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_DEF_LANGUAGE), "bengali_bangladesh");
    set_string(kLanguage, "ko_KR.UTF-8");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_DEF_LANGUAGE), "ko_KR");
    set_string(kLanguage, "plain");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_DEF_LANGUAGE), "??");
    set_string(kLanguage, "");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_DEF_LANGUAGE), "??");
    set_int(kLanguage, 1);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_DEF_LANGUAGE), "??");
}

TEST_F(Language, AutomaticIsExported) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install_spec(language("automatic"));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_DEF_LANGUAGE), "automatic");
}

TEST_F(Language, UnrecordedLanguageIsNotExported) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    set_string(kLanguage, "en_US.UTF-8");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_DEF_LANGUAGE), "");
}

TEST_F(Language, NoSimSetsTheLanguageAndLeavesTheAutomaticChoice) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    set_bool(kAutomatic, true);
    install_spec(no_sim("french_canada"));
    EXPECT_EQ(get_string(kLanguage), "fr_CA.UTF-8");
    EXPECT_EQ(get_string(kRegion), "fr_CA.UTF-8");
    EXPECT_EQ(get_bool(kAutomatic), true);
    for (const char *key : {"lang", "lang_no_sim", "region"})
        EXPECT_EQ(group.text("phone", key), "french_canada") << key;
    EXPECT_EQ(group.text("phone", "lang_automatic"), std::nullopt);
}

TEST_F(Language, NoSimDoesNotAskForTheAutomaticChoice) {
    set_bool(kAutomatic, true);
    set_string(kLanguage, "fr_CA.UTF-8");
    EXPECT_THAT(verify_spec(no_sim("french_canada")),
                ElementsAre(passed("[Phone/DefLanguageNoSIM] Spec='french_canada',Phone='fr_CA'")));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_DEF_LANGUAGE_NO_SIM), "french_canada");
}

TEST_F(Language, NoSimIsExportedWhateverIsRecorded) {
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_DEF_LANGUAGE_NO_SIM), "??");
    set_string(kLanguage, "zh_TW.UTF-8");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_DEF_LANGUAGE_NO_SIM), "chinese_traditional_taiwan");
}

namespace {

struct Names {
    const char *word;
    const char *locale;
};

constexpr Names kNames[] = {
    {"english_us", "en_US"},
    {"english_canada", "en_CA"},
    {"english_philippines", "en_PH"},
    {"spanish_latin", "es_US"},
    {"portuguese_latin", "pt_BR"},
    {"french_canada", "fr_CA"},
    {"slovakian", "sk_SK"},
    {"chinese_simplified", "zh_CN"},
    {"chinese_traditional_taiwan", "zh_TW"},
    {"chinese_traditional_hongkong", "zh_HK"},
    {"indonesia", "id_ID"},
    {"vietnamese", "vi_VN"},
    {"bengali_bangladesh", "bn_BD"},
};

struct Found {
    int result;
    std::string text;
};

Found look_up(const char *value, int to_locale) {
    std::array<char, ZEL_SVC_LANGUAGE_SIZE> out;
    out.fill('x');
    const int result = zel_svc_language_lookup(value, out.data(), to_locale);
    return {result, out.data()};
}

} // namespace

TEST(LanguageLookup, FindsEveryLanguageBothWays) {
    for (const Names &names : kNames) {
        EXPECT_EQ(look_up(names.word, 1).text, names.locale);
        EXPECT_EQ(look_up(names.locale, 0).text, names.word);
        EXPECT_EQ(look_up(names.word, 1).result, 1);
        EXPECT_TRUE(zel_svc_language_known(names.word));
    }
}

TEST(LanguageLookup, TakesAnUnderscoreFromTheSecondCharacterOnForALocale) {
    EXPECT_EQ(look_up("en_GB", 1).text, "en_GB");
    EXPECT_EQ(look_up("en_GB", 0).text, "en_GB");
    EXPECT_EQ(look_up("e_", 1).text, "e_");
    EXPECT_EQ(look_up("_GB", 1).result, 0);
    EXPECT_EQ(look_up("__", 1).result, 1);
}

TEST(LanguageLookup, FindsNothingElseAndClearsTheBuffer) {
    for (const char *value : {"german", "", "English", "korean"}) {
        EXPECT_EQ(look_up(value, 1).result, 0) << value;
        EXPECT_EQ(look_up(value, 1).text, "");
        EXPECT_FALSE(zel_svc_language_known(value));
    }
}

TEST(LanguageLookup, AnyOtherDirectionIsByLocale) { EXPECT_EQ(look_up("en_US", 7).text, "english_us"); }

TEST(LanguageLookup, CutsALongLocale) {
    const std::string locale = "a_" + std::string(300, 'b');
    EXPECT_EQ(look_up(locale.c_str(), 1).text, locale.substr(0, 255));
}

TEST(LanguageLookup, NullGivesNothing) {
    std::array<char, ZEL_SVC_LANGUAGE_SIZE> out{};
    EXPECT_EQ(zel_svc_language_lookup(nullptr, out.data(), 1), 0);
    EXPECT_EQ(zel_svc_language_lookup("english_us", nullptr, 1), 0);
}

} // namespace zel_test
