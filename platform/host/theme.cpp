#include "call.h"
#include "open-file.h"
#include "record.h"

#include <fcntl.h>
#include <theme.h>

namespace zel_host {
namespace {

// The theme service's error numbers here.
constexpr int kNoPicture = 1;
constexpr int kNotReserved = 2; // something in the argument that is to be null

int count_toolkit(Phone &phone, int step) {
    const std::int64_t users = recorded_number(phone, "toolkit_users") + step;
    record(phone, "toolkit_users", users < 0 ? 0 : users);
    return static_cast<int>(users < 0 ? 0 : users);
}

int derive_colors(Phone &phone, const char *path, int kind) {
    if (path == nullptr) return kNoPicture;
    const Fd picture(open_file(phone, path, O_RDONLY, 0));
    if (!picture) return kNoPicture;
    record(phone, "theme_picture", path);
    record(phone, "theme_kind", kind);
    return 0;
}

} // namespace
} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT int elm_init(int argc, char ** /*argv*/) {
    return answer<function("elm_init")>([](Phone &phone) { return count_toolkit(phone, 1); }, argc);
}

ZEL_HOST_EXPORT int elm_shutdown(void) {
    return answer<function("elm_shutdown")>([](Phone &phone) { return count_toolkit(phone, -1); });
}

ZEL_HOST_EXPORT int uxt_theme_set_suitable_system_color_info_from_image(const char *path, int kind, void *reserved) {
    return answer<function("uxt_theme_set_suitable_system_color_info_from_image")>(
        [&](Phone &phone) { return reserved == nullptr ? derive_colors(phone, path, kind) : kNotReserved; }, path,
        kind);
}
