#include "preset/zel-svc-preset-actions.h"

#include "base/zel-svc-text.h"

#include <system-info.h>
#include <vconf.h>

#include <cstdlib>
#include <memory>
#include <string>
#include <string_view>

namespace {

constexpr std::size_t kLongestUserAgent = 299;
constexpr std::size_t kLongestName = 19;
constexpr std::size_t kLongestVersionPart = 4;

std::string system_text(int key) {
    char *text = nullptr;
    if (system_info_get_value_string(key, &text) != 0 || !text) return {};
    const std::unique_ptr<char, decltype(&std::free)> owned{text, &std::free};
    return owned.get();
}

std::string_view version_part(std::string_view part) {
    return part.substr(0, zel_svc_text_cut(part, kLongestVersionPart));
}

// "2.4.0.1" -> "2.4"
std::string short_version(std::string_view version) {
    const std::size_t dot = version.find('.');
    std::string text{version_part(version.substr(0, dot))};
    if (dot == std::string_view::npos) return text;
    version.remove_prefix(dot + 1);
    const std::string_view minor = version_part(version.substr(0, version.find('.')));
    if (!minor.empty()) text.append(".").append(minor);
    return text;
}

std::string value_of(std::string_view name) {
    if (name.size() > kLongestName) return {};
    if (name == "MODEL") return system_text(SYSTEM_INFO_MODEL);
    if (name == "BUILD_VER") return system_text(SYSTEM_INFO_BUILD_VERSION);
    if (name == "PLATFORM_VER") return short_version(system_text(SYSTEM_INFO_PLATFORM_VERSION));
    return {};
}

// The text as far as it fits. Behind what did not fit nothing is added: a later piece would join two halves.
class UserAgent {
  public:
    void append(std::string_view piece) {
        if (full_) return;
        text_.append(piece);
        full_ = text_.size() > kLongestUserAgent;
        if (full_) text_.resize(zel_svc_text_cut(text_, kLongestUserAgent));
    }
    [[nodiscard]] const std::string &text() const { return text_; }

  private:
    std::string text_;
    bool full_ = false;
};

std::string filled(std::string_view pattern) {
    UserAgent agent;
    for (;;) {
        const std::size_t start = pattern.find("$(");
        agent.append(pattern.substr(0, start));
        const std::size_t end = start == std::string_view::npos ? start : pattern.find(')', start);
        if (end == std::string_view::npos) return agent.text(); // also a template that ends inside a placeholder
        agent.append(value_of(pattern.substr(start + 2, end - start - 2)));
        pattern.remove_prefix(end + 1);
    }
}

} // namespace

void zel_svc_preset_set_user_agent(const char *pattern) {
    vconf_set_str("db/browser/user_agent", filled(pattern).c_str());
}
