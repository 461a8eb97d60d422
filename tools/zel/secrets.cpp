#include "secrets.h"

#include <base/zel-svc-text.h>

#include <algorithm>
#include <array>

namespace zel_command {
namespace {

// Parts of the last segment of a key, in lower case.
constexpr std::array<std::string_view, 3> kSecretWords{"msin", "pwd", "password"};

std::string lower_case(std::string_view text) {
    std::string result{text};
    std::transform(result.begin(), result.end(), result.begin(), zel_svc_text_lower);
    return result;
}

} // namespace

bool is_secret(std::string_view key) {
    const std::size_t slash = key.rfind('/');
    const std::string segment = lower_case(slash == std::string_view::npos ? key : key.substr(slash + 1));
    return std::any_of(kSecretWords.begin(), kSecretWords.end(),
                       [&](std::string_view word) { return segment.find(word) != std::string::npos; });
}

std::string masked(std::string_view value) { return value.empty() ? "" : "********"; }

} // namespace zel_command
