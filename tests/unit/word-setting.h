#pragma once
// What every setting of one key or two that takes a fixed set of words does, for each of them and each of
// their words. A group of settings writes its rows down a second time, from the product's vocabulary, and
// instantiates the tests with them:
//
//     INSTANTIATE_TEST_SUITE_P(Gps, WordSetting, testing::ValuesIn(kExpectedGps), word_setting_name);
//
// The tests themselves are in word-setting-test.cpp.

#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <optional>
#include <ostream>
#include <span>
#include <string>
#include <string_view>

namespace zel_test {

struct ExpectedWord {
    std::string_view text;
    int number;
};

struct ExpectedRecord {
    const char *section = nullptr;
    const char *key = nullptr;
};

struct ExpectedSetting {
    ZelSvcElementId element;
    const char *tag;
    bool is_boolean;
    std::span<const ExpectedWord> words;
    const char *keys[2]; // the second may be null
    ZelSvcDataGroup group;
    ExpectedRecord records[2];
    const char *label; // of the result line
    bool unreadable_adds_line;
    bool exported_when_recorded_only;
    const char *parent = nullptr;          // the element that it must stand in
    bool recorded_after_first_key = false; // whatever becomes of the second

    friend void PrintTo(const ExpectedSetting &setting, std::ostream *out) { *out << setting.tag; }
};

inline constexpr ExpectedWord kSwitchWords[] = {{"on", 1}, {"off", 0}};

class WordSetting : public BenchPhone, public testing::WithParamInterface<ExpectedSetting> {
  protected:
    [[nodiscard]] static std::string spec(std::string_view text) {
        const std::string leaf = element(GetParam().tag, text);
        return GetParam().parent ? element(GetParam().parent, leaf) : leaf;
    }

    [[nodiscard]] static std::string element(const std::string &tag, std::string_view content) {
        return "<" + tag + ">" + std::string{content} + "</" + tag + ">";
    }

    std::optional<int> stored(const char *key) {
        if (GetParam().is_boolean) return get_bool(key);
        return get_int(key);
    }

    void store(int number) {
        if (GetParam().is_boolean)
            set_bool(GetParam().keys[0], number == 1);
        else
            set_int(GetParam().keys[0], number);
    }

    // A value that counts as unreadable: of another type.
    void make_unreadable() { set_string(GetParam().keys[0], "text"); }

    [[nodiscard]] static std::string setter() { return GetParam().is_boolean ? "vconf_set_bool" : "vconf_set_int"; }

    [[nodiscard]] static std::string line(std::string_view in_spec, std::string_view on_phone) {
        return std::string{GetParam().label} + " Spec='" + std::string{in_spec} + "',Phone='" + std::string{on_phone} +
               "'";
    }

    void expect_nothing_written(const LoadedGroup &group) {
        for (const char *key : GetParam().keys)
            if (key) {
                EXPECT_EQ(stored(key), std::nullopt) << key;
            }
        expect_nothing_recorded(group);
    }

    void expect_nothing_recorded(const LoadedGroup &group) {
        for (const ExpectedRecord &record : GetParam().records)
            if (record.key) {
                EXPECT_EQ(group.text(record.section, record.key), std::nullopt) << record.key;
            }
    }
};

inline std::string word_setting_name(const testing::TestParamInfo<ExpectedSetting> &setting) {
    return setting.param.tag;
}

} // namespace zel_test
