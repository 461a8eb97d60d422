#include "spec/zel-svc-language.h"

#include "base/zel-svc-text.h"

#include <array>

namespace {

struct Language {
    std::string_view name;
    std::string_view locale;
};

constexpr Language kLanguages[] = {
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

enum class By { Name, Locale };

// The other side of the value's row; the value itself when it looks like a locale; empty otherwise.
std::string_view other_side(std::string_view value, By by) {
    for (const Language &language : kLanguages) {
        const auto [from, to] =
            by == By::Name ? std::pair{language.name, language.locale} : std::pair{language.locale, language.name};
        if (from == value) return to;
    }
    const bool looks_like_locale = value.find('_', 1) != std::string_view::npos;
    return looks_like_locale ? value : std::string_view{};
}

} // namespace

int zel_svc_language_lookup(const char *value, char *out, int to_locale) {
    if (!value || !out) return 0;
    const std::string_view found = other_side(value, to_locale == 1 ? By::Name : By::Locale);
    zel_svc_text_copy(out, ZEL_SVC_LANGUAGE_SIZE, found);
    return found.empty() ? 0 : 1;
}

bool zel_svc_language_known(std::string_view text) { return !other_side(text, By::Name).empty(); }
