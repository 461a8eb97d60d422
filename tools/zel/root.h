#pragma once
// Which phone a command works on.

#include <string>

namespace zel_command {

// The folder named by --root or else by $ZEL_ROOT, as an absolute path; throws a Failure with kNoRoot when
// neither is given. Sets $ZEL_ROOT, which the bench phone reads at its first call.
std::string choose_root(const std::string &from_option);

} // namespace zel_command
