#pragma once
// Presets: settings of the phone that are no part of a customer's file. A package folder may hold a preset
// file; the defaults of every customer and the customer's own are merged into one file, whose values go to
// the settings store or to a service.
//
//     zel_svc_preset_install("XFV", ZEL_SVC_INSTALL_CONFIG_MODE);   // all of them
//     zel_svc_preset_install("XFV", ZEL_SVC_INSTALL_FOTA_MODE);     // those that the package marks for upgrades

#include <string_view>

inline constexpr const char *ZEL_SVC_PRESET_MERGED_PATH = "/opt/system/zel-default/preset/zel-default-preset.ini";

// Kind 0 installs, any other value upgrades.
void zel_svc_preset_install(std::string_view customer, int kind);
