#include "phone-lock.h"

#include "content.h"
#include "verb.h"

#include <fcntl.h>
#include <sys/file.h>

namespace zel_host {
namespace {

constexpr const char *kLockName = "lock";

}

void take_lock(Phone &phone, const std::string &holder) {
    if (phone.lock()) return;
    Fd file(::openat(phone.state_folder(), kLockName, O_RDWR | O_CREAT | O_NOFOLLOW | O_CLOEXEC, 0600));
    if (!file) throw VerbFailed("cannot open the lock of '" + phone.path() + "'");
    if (::flock(file.get(), LOCK_EX | LOCK_NB) != 0)
        throw VerbFailed("'" + phone.path() + "' is in use by " + read_content(file.get()));
    if (::ftruncate(file.get(), 0) != 0 || !write_content(file.get(), holder))
        throw VerbFailed("cannot write the lock of '" + phone.path() + "'");
    phone.lock() = std::move(file);
}

} // namespace zel_host
