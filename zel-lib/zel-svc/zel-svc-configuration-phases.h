#pragma once
// The phases of an install run, in the order in which a run has them. Each writes its own lines.

#include "zel-svc.h"

#include <array>
#include <string_view>

// The customer's file, for configuration mode (all of it) and normal booting (what an upgrade reads again),
// and once more for a second SIM.
void zel_svc_config_install_spec(std::string_view customer, int kind);

// "/opt/system/zel-default/usr", filled anew with every customer's user files and this customer's over them.
void zel_svc_config_copy_user_folder(std::string_view customer);

void zel_svc_config_set_power_animation(std::string_view customer);

// Texts that other components show: the customer and the country.
void zel_svc_config_set_customer_strings();

// The wallpaper that suits the handset's colour, or the operator's own with the colours that suit it.
void zel_svc_config_install_wallpaper(std::string_view customer, int kind);

// Which of the operator applications were there before an upgrade.
inline constexpr std::size_t ZEL_SVC_OPERATOR_APP_COUNT = 4;
using ZelSvcAppsBefore = std::array<bool, ZEL_SVC_OPERATOR_APP_COUNT>;

void zel_svc_config_check_apps_before_upgrade(std::string_view customer, ZelSvcAppsBefore &before);
void zel_svc_config_install_apps(std::string_view customer);
void zel_svc_config_disable_apps(std::string_view customer, const ZelSvcAppsBefore &before);
void zel_svc_config_remove_apps(std::string_view customer);
