#pragma once
// What lists, pages and terminals do not show: subscriber numbers and passwords.

#include <string>
#include <string_view>

namespace zel_command {

// Whether the value of a key, such as "db/zel/sim_auto_setting/sim1_msin", is nobody's business.
bool is_secret(std::string_view key);

// Stands for a secret; its length says nothing about the value's. An empty value stays empty, so that a
// reader can tell "not set" from "hidden".
std::string masked(std::string_view value);

} // namespace zel_command
