#pragma once
// The phone's key-value store.

#include "phone.h"

#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace zel_host {

enum class KeyType : std::int64_t { Integer, Boolean, Text };

struct KeyValue {
    KeyType type = KeyType::Integer;
    std::int64_t number = 0; // Integer, Boolean
    std::string text;        // Text
};

inline constexpr std::string_view kMemoryKeys = "memory/"; // keys that begin so do not outlive a restart

std::optional<KeyValue> get_key(Phone &phone, std::string_view key);
void set_key(Phone &phone, std::string_view key, KeyType type, std::int64_t number);
void set_key(Phone &phone, std::string_view key, std::string_view text);
bool unset_key(Phone &phone, std::string_view key);
void unset_keys(Phone &phone, std::string_view prefix);
// All keys that begin with `prefix`, in order.
void each_key(Phone &phone, std::string_view prefix,
              const std::function<void(std::string_view key, const KeyValue &value)> &use);

} // namespace zel_host
