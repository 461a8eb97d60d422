#pragma once
// The phone's applications, as its package tools know them.

#include "phone.h"

#include <functional>
#include <string>
#include <string_view>

namespace zel_host {

// The most of a name or an answer that fits on a line of the tools' results.
inline constexpr std::size_t kLongestInResult = 900;

struct Application {
    std::string name;
    std::string type;
    std::string state;   // "installed", "disabled", "removed"; "" when no tool has handled it
    std::string refusal; // what the tools answer instead of doing something with it; "" when they obey
};

// What is known of an application; all but its name empty when nothing is.
Application application(Phone &phone, std::string_view name);
void keep_application(Phone &phone, const Application &application);
void each_application(Phone &phone, const std::function<void(const Application &application)> &use);

} // namespace zel_host
