#include "attributes.h"
#include "call.h"

#include <cstring>
#include <security-server.h>
#include <smack.h>

namespace zel_host {
namespace {

int label_path(Phone &phone, const char *path, const char *label) {
    if (path == nullptr || label == nullptr) return -1;
    const Place place = resolve(phone.folder(), path, Follow::Last);
    errno = place.error;
    if (!place.file) return -1;
    errno = set_label(phone, place.file.get(), label);
    return errno == 0 ? 0 : -1;
}

int read_label(Phone &phone, const char *path, char **label) {
    if (path == nullptr || label == nullptr) return -1;
    const Place place = resolve(phone.folder(), path, Follow::NotLast);
    errno = place.error;
    if (!place.file) return -1;
    const std::optional<std::string> found = get_label(phone, place.file.get());
    errno = ENODATA;
    if (!found) return -1;
    char *copy = ::strdup(found->c_str());
    if (copy == nullptr) return -1;
    *label = copy;
    return 0;
}

} // namespace
} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT int security_server_label_access(const char *path, const char *label) {
    return answer<function("security_server_label_access")>(
        [&](Phone &phone) { return label_path(phone, path, label); }, path, label);
}

ZEL_HOST_EXPORT int smack_lgetlabel(const char *path, char **label) {
    return answer<function("smack_lgetlabel")>([&](Phone &phone) { return read_label(phone, path, label); }, path);
}
