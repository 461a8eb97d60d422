#pragma once
// Strings of the settings store.

#include "base/zel-svc-free.h"

#include <vconf.h>

#include <optional>
#include <string>

// The value of a string key; nothing when it cannot be read.
inline std::optional<std::string> zel_svc_key_text(const char *key) {
    const ZelSvcOwnedText value{vconf_get_str(key)};
    if (!value) return std::nullopt;
    return std::string{value.get()};
}

// The same where no value and an empty one mean alike.
inline std::string zel_svc_key_text_or_empty(const char *key) { return zel_svc_key_text(key).value_or(std::string{}); }
