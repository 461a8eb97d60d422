#pragma once
// Strings of the settings store.

#include <vconf.h>

#include <cstdlib>
#include <memory>
#include <optional>
#include <string>

// The value of a string key; nothing when it cannot be read.
inline std::optional<std::string> zel_svc_key_text(const char *key) {
    const std::unique_ptr<char, decltype(&std::free)> value{vconf_get_str(key), &std::free};
    if (!value) return std::nullopt;
    return std::string{value.get()};
}

// The same where no value and an empty one mean alike.
inline std::string zel_svc_key_text_or_empty(const char *key) { return zel_svc_key_text(key).value_or(std::string{}); }
