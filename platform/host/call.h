#pragma once
// How a platform call is answered: on the process's phone, journalled, failed when a fault says so, and with
// no exception leaving it.
//
//     int vconf_set_int(const char *key, int value) {
//         return answer<function("vconf_set_int")>([&](Phone &phone) { return set(phone, key, value); }, key, value);
//     }

#include "export.h"
#include "fault.h"
#include "function.h"
#include "journal.h"
#include "phone.h"

#include <cerrno>
#include <exception>
#include <type_traits>

namespace zel_host {

// The text of a call's argument with a given number; "" when that is no text, or null.
template <typename... Arguments> const char *text_argument(int number, const Arguments &...arguments) {
    const char *text = "";
    int at = 0;
    [[maybe_unused]] const auto look = [&](const auto &argument) {
        if constexpr (std::is_convertible_v<decltype(argument), const char *>)
            if (at == number && argument != nullptr) text = argument;
        ++at;
    };
    (look(arguments), ...);
    return text;
}

template <std::size_t Row, typename Body, typename... Arguments>
auto answer(Body body, const Arguments &...arguments) -> std::invoke_result_t<Body, Phone &> {
    using Result = std::invoke_result_t<Body, Phone &>;
    constexpr const Function &row = kFunctions[Row];
    const auto failed = [](int result, int error) {
        errno = error;
        if constexpr (std::is_same_v<Result, int>) return result;
        if constexpr (std::is_pointer_v<Result>) return Result{nullptr};
    };
    try {
        Phone *phone = process_phone();
        if (phone == nullptr) return failed(row.result, ENODEV);
        if (phone->page().journal_on.load(std::memory_order_relaxed) != 0) journal(*phone, row, {Value(arguments)...});
        if (any_faults(*phone)) {
            const Fault *fault = matching_fault(*phone, row, text_argument(row.text, arguments...));
            if (fault != nullptr) return failed(fault->result, fault->error);
        }
        return body(*phone);
    } catch (const std::exception &) {
        return failed(row.result, EIO);
    }
}

} // namespace zel_host
