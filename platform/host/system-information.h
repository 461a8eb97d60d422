#pragma once
// What the phone tells about itself: model, platform version, build version. Each may be unavailable.

#include "phone.h"

#include <optional>
#include <string>
#include <string_view>

namespace zel_host {

struct InformationRow {
    int key;                   // of system_info_get_value_string()
    std::string_view name;     // of a verb's argument and in the record
    std::string_view at_first; // on a new phone
};

inline constexpr InformationRow kInformation[] = {
    {.key = 0, .name = "model", .at_first = "Q7N0"},
    {.key = 1, .name = "platform-version", .at_first = "2.4.0"},
    {.key = 7, .name = "build-version", .at_first = "Q7N0BENCH1"},
};

std::optional<std::string> information(Phone &phone, const InformationRow &row);
void set_information(Phone &phone, const InformationRow &row, std::string_view text);
void withhold_information(Phone &phone, const InformationRow &row);

} // namespace zel_host
