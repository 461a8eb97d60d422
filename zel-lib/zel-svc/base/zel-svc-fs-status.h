#pragma once
// Sizes and counts of the media folders, kept after an install and compared by a later verification.

#include <array>

inline constexpr const char *ZEL_SVC_FS_STATUS_CONFIG_PATH = "/opt/system/zel-default/output/zel-fs-status-config.ini";
inline constexpr const char *ZEL_SVC_FS_STATUS_VERIFY_PATH = "/opt/system/zel-default/output/zel-fs-status-verify.ini";

// Section "media" of both files holds "NAME_size" and "NAME_count" of each.
inline constexpr std::array ZEL_SVC_FS_STATUS_CATEGORIES = {
    "wallpaper", "ringtone", "alerttone", "alarmtone", "image", "sound", "video", "others", "camera", "screenshot"};

// Mode 1, after an install, deletes both files and writes the first; any other mode writes the second.
void __zel_svc_config_fs_status_write(int mode);
