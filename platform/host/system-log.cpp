#include "system-log.h"

#include "clock.h"
#include "content.h"
#include "text.h"

#include <fcntl.h>

namespace zel_host {

int write_log(Phone &phone, int priority, std::string_view tag, std::string_view message) {
    nlohmann::json line{{"priority", priority}, {"time", now_us(phone)}};
    put_text(line, "tag", tag);
    put_text(line, "message", message);
    const std::string bytes = line.dump() + '\n';
    const Fd file(
        ::openat(phone.state_folder(), kLogName, O_WRONLY | O_APPEND | O_CREAT | O_NOFOLLOW | O_CLOEXEC, 0600));
    // One write, so that the lines of several processes stay whole.
    const bool written = file && ::write(file.get(), bytes.data(), bytes.size()) == static_cast<ssize_t>(bytes.size());
    return written ? static_cast<int>(message.size()) : -1;
}

void each_log_line(Phone &phone, const std::function<void(std::string_view line)> &use) {
    const Fd file(::openat(phone.state_folder(), kLogName, O_RDONLY | O_NOFOLLOW | O_CLOEXEC));
    if (!file) return;
    const std::string content = read_content(file.get());
    std::string_view rest = content;
    while (!rest.empty()) {
        const std::string_view line = rest.substr(0, rest.find('\n'));
        use(line);
        rest.remove_prefix(std::min(rest.size(), line.size() + 1));
    }
}

void clear_log(Phone &phone) {
    const Fd file(::openat(phone.state_folder(), kLogName, O_WRONLY | O_TRUNC | O_NOFOLLOW | O_CLOEXEC));
}

} // namespace zel_host
