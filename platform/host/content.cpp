#include "content.h"

#include <array>
#include <cerrno>
#include <unistd.h>

namespace zel_host {

std::string read_content(int fd) {
    std::string content;
    std::array<char, 8192> block{};
    while (true) {
        const ssize_t size = ::read(fd, block.data(), block.size());
        if (size < 0 && errno == EINTR) continue;
        if (size <= 0) return content;
        content.append(block.data(), static_cast<std::size_t>(size));
    }
}

bool write_content(int fd, std::string_view bytes) {
    while (!bytes.empty()) {
        const ssize_t size = ::write(fd, bytes.data(), bytes.size());
        if (size < 0 && errno == EINTR) continue;
        if (size <= 0) return false;
        bytes.remove_prefix(static_cast<std::size_t>(size));
    }
    return true;
}

} // namespace zel_host
