#include "base/zel-svc-log.h"
#include "base/zel-svc-run-log.h"
#include "zel-svc-configuration-phases.h"

#include <theme.h>

namespace {

constexpr const char *kHomeWallpaper = "/opt/usr/share/settings/Wallpapers/Home_default.png";
constexpr int kHomeKind = 2;
constexpr std::string_view kOwnWallpaperCustomer = "XFV"; // brings its own, whatever the handset's colour

int set_colours_from_home_wallpaper() {
    elm_init(0, nullptr);
    const int result = uxt_theme_set_suitable_system_color_info_from_image(kHomeWallpaper, kHomeKind, nullptr);
    elm_shutdown();
    return result;
}

void keep_operator_wallpaper() {
    zel_svc_run_log("[Config][DefaultOpWallpaper] Skip default wallpaper by H/W color. (Vodacom Operator)\n");
    const int result = set_colours_from_home_wallpaper();
    if (result == 0)
        zel_svc_run_log("[Config][DefaultOpWallpaper] Home wallpaper's color setting succeeded.\n");
    else
        zel_svc_run_log("[Config][DefaultOpWallpaper] Home wallpaper's color setting failed(%d).\n", result);
}

void tell(const char *line) {
    ZEL_SVC_LOG("%s", line);
    zel_svc_run_log("%s", line);
}

void install_by_hardware_colour() {
    tell("[Config/Start] Install default wallpapar by H/W color.\n");
    tell("[Config/Ended] Install default wallpapar by H/W color\n");
}

} // namespace

void zel_svc_config_install_wallpaper(std::string_view customer, int kind) {
    if (kind == ZEL_SVC_INSTALL_CONFIG_MODE && customer == kOwnWallpaperCustomer)
        keep_operator_wallpaper();
    else
        install_by_hardware_colour();
}
