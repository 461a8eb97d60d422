#pragma once
// The phone's system log, ROOT/.platform/log: a line of JSON for each message, the message kept exactly.
//
//     {"message":"a.cpp: f(3) > text\n","priority":5,"tag":"ZEL","time":1700000000000000}

#include "phone.h"

#include <functional>
#include <string_view>

namespace zel_host {

inline constexpr const char *kLogName = "log";

// Bytes written; negative on failure.
int write_log(Phone &phone, int priority, std::string_view tag, std::string_view message);
void each_log_line(Phone &phone, const std::function<void(std::string_view line)> &use);
void clear_log(Phone &phone);

} // namespace zel_host
