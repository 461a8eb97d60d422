#pragma once
// What a phone holds after a scenario, as text: one named section of lines for each kind of thing that
// people and golden files look at. What differs between machines (line numbers of log prefixes, sizes of
// folders) is masked.

#include "phone.h"

#include <map>
#include <string>
#include <vector>

namespace zel_scenario {

// Section name, such as "keys" or "data/zel-default-data.ini", to its lines.
using PhoneState = std::map<std::string, std::vector<std::string>>;

PhoneState read_state(Phone &phone);

std::vector<std::string> lines_of(const std::string &text);
std::string text_of(const std::vector<std::string> &lines);

} // namespace zel_scenario
