#include "bus-address.h"

#include <array>
#include <cstdio>
#include <cstdlib>
#include <string_view>

namespace zel_host {
namespace {

constexpr const char *kVariable = "DBUS_SYSTEM_BUS_ADDRESS";
constexpr const char *kNobody = "unix:path=/dev/null/no-phone";
constexpr std::string_view kPlain = "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789-_/.\\*";

std::string escaped(std::string_view path) {
    std::string result;
    for (const char byte : path) {
        if (kPlain.find(byte) != std::string_view::npos) {
            result += byte;
            continue;
        }
        std::array<char, 4> code{};
        std::snprintf(code.data(), code.size(), "%%%02x", static_cast<unsigned>(static_cast<unsigned char>(byte)));
        result += code.data();
    }
    return result;
}

[[gnu::constructor]] void keep_off_the_machines_bus() {
    ::setenv(kVariable, kNobody, 1); // NOLINT(concurrency-mt-unsafe): before any thread
}

} // namespace

void set_bus_address(const std::string &root) {
    const std::string address = "unix:path=" + escaped(root + "/run/dbus/system_bus_socket");
    ::setenv(kVariable, address.c_str(), 1); // NOLINT(concurrency-mt-unsafe): the bench phone has one thread
}

} // namespace zel_host
