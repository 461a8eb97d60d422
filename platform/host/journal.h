#pragma once
// The journal: which platform functions were called with which arguments. Off until it is started.

#include "function.h"
#include "phone.h"

#include <cstdint>
#include <functional>
#include <initializer_list>
#include <string_view>
#include <type_traits>

namespace zel_host {

// One argument of a call: a text (null shows as null), or a number; other pointers are not shown.
struct Value {
    enum class Kind { Text, Number, Null, Hidden } kind = Kind::Hidden;
    std::string_view text{};
    std::int64_t number = 0;

    template <typename T> explicit Value(const T &argument) {
        if constexpr (std::is_convertible_v<T, const char *>) {
            const char *bytes = argument;
            kind = bytes == nullptr ? Kind::Null : Kind::Text;
            if (bytes != nullptr) text = bytes;
        } else if constexpr (std::is_integral_v<T>) {
            kind = Kind::Number;
            number = static_cast<std::int64_t>(argument);
        }
    }
};

void journal(Phone &phone, const Function &row, std::initializer_list<Value> arguments);

// The calls in order; `arguments` is a JSON list, texts that are no UTF-8 with U+FFFD.
void each_call(Phone &phone, const std::function<void(std::string_view function, std::string_view arguments)> &use);
void clear_journal(Phone &phone);

} // namespace zel_host
