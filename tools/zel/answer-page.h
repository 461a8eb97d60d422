#pragma once
// An answer of the bench phone, set for people to read.

#include "output.h"

namespace zel_command {

// Plain members first, one a line; then each list as a table. Secrets are masked unless `reveal`.
void print_answer(const Json &answer, bool reveal);

} // namespace zel_command
