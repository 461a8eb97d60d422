#pragma once
// Single facts about the phone that have no place of their own: slots, display lock, theme colour, restarts.

#include "phone.h"

#include <cstdint>
#include <string>
#include <string_view>

namespace zel_host {

void record(Phone &phone, std::string_view name, std::int64_t number);
void record(Phone &phone, std::string_view name, std::string_view text);
std::int64_t recorded_number(Phone &phone, std::string_view name, std::int64_t otherwise = 0);
std::string recorded_text(Phone &phone, std::string_view name);

} // namespace zel_host
