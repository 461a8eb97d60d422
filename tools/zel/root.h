#pragma once
// Which phone a command works on, and the lock that keeps two commands off the same one.

#include "command.h"

#include <string>

namespace zel_command {

// The folder named by --root or else by $ZEL_ROOT, as an absolute path; throws a Failure with kNoRoot when
// neither is given. Sets $ZEL_ROOT, which the bench phone reads at its first call.
std::string choose_root(const std::string &from_option);

// Held for the life of the process, then released by the kernel, however the process ends. It is a lock on
// the root folder itself, so it leaves nothing behind.
class RootLock {
  public:
    RootLock() = default;
    // Throws a Failure that names the process holding the lock. Readers share it.
    RootLock(const std::string &root, Access access);
    RootLock(RootLock &&other) noexcept;
    RootLock &operator=(RootLock &&other) noexcept;
    ~RootLock();

  private:
    int fd_ = -1;
};

} // namespace zel_command
