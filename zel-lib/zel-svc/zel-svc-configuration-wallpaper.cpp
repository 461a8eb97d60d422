// The default wallpapers: the operator's own, or those that suit the colour of the handset.

#include "zel-svc-configuration-wallpaper.h"

#include "base/zel-svc-file.h"
#include "base/zel-svc-log.h"
#include "base/zel-svc-run-log.h"
#include "zel-svc-configuration-phase.h"
#include "zel-svc-configuration-phases.h"

#include <theme.h>

#include <cstdarg>
#include <cstdio>
#include <fcntl.h>

namespace {

constexpr std::string_view kOwnWallpaperCustomer = "XFV"; // brings its own, whatever the handset's colour
constexpr const char *kProductCode = "/csa/imei/prodcode.dat";
constexpr int kHomeKind = 2; // to the theme service

// A wallpaper that the phone shows, and how its lines call it.
struct Screen {
    const char *title; // "Home wallpaper's ..."
    const char *word;  // "(copy home file to original)"
    const char *shown;
    const char *temporary;
};

constexpr Screen kHome = {.title = "Home",
                          .word = "home",
                          .shown = "/opt/usr/share/settings/Wallpapers/Home_default.png",
                          .temporary = "/opt/usr/share/settings/Wallpapers/Home_default_1.png"};
constexpr Screen kLock = {.title = "Lock",
                          .word = "lock",
                          .shown = "/opt/usr/share/settings/Wallpapers/Lock_default.png",
                          .temporary = "/opt/usr/share/settings/Wallpapers/Lock_default_1.png"};

struct HandsetWallpapers {
    std::string_view model;
    std::string_view colour;
    const char *home;
    const char *lock;
};

constexpr HandsetWallpapers kHandsets[] = {
    {"Q7N0", "ZK", "/opt/usr/share/settings/Wallpapers/07.png", "/opt/usr/share/settings/Wallpapers/01.png"},
    {"Q7N0", "WR", "/opt/usr/share/settings/Wallpapers/06.png", "/opt/usr/share/settings/Wallpapers/11.png"},
};

int set_colours_from_home_wallpaper() {
    elm_init(0, nullptr);
    const int result = uxt_theme_set_suitable_system_color_info_from_image(kHome.shown, kHomeKind, nullptr);
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

void log_failed_copy(const Screen &screen, const char *from, const char *to) {
    zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] %s wallpaper's file copy failed(copy %s file to %s).\n",
                          screen.title, from, to);
}

// The wallpaper that was shown ends up under the colour's name, so a second run swaps back: wanted.
bool swap_wallpaper(const Screen &screen, const char *original) {
    if (__zel_svc_config_copy_file(original, screen.temporary) == 0) {
        log_failed_copy(screen, "original", "temp");
        return false;
    }
    if (__zel_svc_config_copy_file(screen.shown, original) == 0) {
        log_failed_copy(screen, screen.word, "original");
        return false;
    }
    if (__zel_svc_config_copy_file(screen.temporary, screen.shown) == 0) {
        log_failed_copy(screen, "temp", screen.word);
        return false;
    }
    if (zel_svc_file_remove(screen.temporary) == 0) return true;
    zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] %s wallpaper's file copy succeeded, remove failed.\n",
                          screen.title);
    return false;
}

void install_home(const char *original, bool colours_allowed) {
    if (!swap_wallpaper(kHome, original)) return;
    if (!colours_allowed) {
        zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] Home wallpaper's file copy succeeded, color setting "
                              "skip (because of FOTA).\n");
        return;
    }
    const int result = set_colours_from_home_wallpaper();
    if (result == 0)
        zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] Home wallpaper's file copy & color setting "
                              "succeeded.\n");
    else
        zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] Home wallpaper's file copy succeeded, color setting "
                              "failed(%d).\n",
                              result);
}

void install_lock(const char *original) {
    if (swap_wallpaper(kLock, original))
        zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] Lock wallpaper's file copy succeeded.\n");
}

const HandsetWallpapers *wallpapers_of(const ZelSvcHandset &handset) {
    for (const HandsetWallpapers &row : kHandsets)
        if (handset.model == row.model && handset.colour == row.colour) return &row;
    zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] Model & Color unknown, skip.\n");
    return nullptr;
}

void choose_by_product_code(bool colours_allowed) {
    if (__zel_svc_config_file_exists(kProductCode) == 0) {
        zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] Product code not existed, skip.\n");
        return;
    }
    const ZelSvcFd product_code = zel_svc_file_open(kProductCode, O_RDWR);
    if (!product_code) {
        ZEL_SVC_LOG("[Config][DefaultWallpaperByHWColor] fopen() for Product code failed.");
        zel_svc_run_log("[Config][DefaultWallpaperByHWColor] Product code not opened, default not set.\n");
        return;
    }
    const std::optional<ZelSvcHandset> handset = zel_svc_wallpaper_read_handset(product_code.get());
    const HandsetWallpapers *wallpapers = handset ? wallpapers_of(*handset) : nullptr;
    if (!wallpapers) return;
    zel_svc_guarded([=] { install_home(wallpapers->home, colours_allowed); });
    zel_svc_guarded([=] { install_lock(wallpapers->lock); });
}

void install_by_hardware_colour(bool colours_allowed) {
    zel_svc_wallpaper_log("[Config/Start] Install default wallpapar by H/W color.\n");
    zel_svc_guarded([=] { choose_by_product_code(colours_allowed); });
    zel_svc_wallpaper_log("[Config/Ended] Install default wallpapar by H/W color\n");
}

} // namespace

void zel_svc_wallpaper_log(const char *format, ...) {
    constexpr std::size_t kLongestLine = 200; // no line of the phase comes near it
    char line[kLongestLine];
    std::va_list arguments;
    va_start(arguments, format);
    std::vsnprintf(line, sizeof line, format, arguments);
    va_end(arguments);
    ZEL_SVC_LOG("%s", line);
    zel_svc_run_log("%s", line);
}

void zel_svc_config_install_wallpaper(std::string_view customer, int kind) {
    const bool full = kind == ZEL_SVC_INSTALL_CONFIG_MODE;
    if (full && customer == kOwnWallpaperCustomer)
        keep_operator_wallpaper();
    else
        install_by_hardware_colour(full);
}
