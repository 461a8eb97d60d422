#pragma once
// The rows of every group of settings.

#include "zel-svc-element-act-browser.h"
#include "zel-svc-element-act-connectivity.h"
#include "zel-svc-element-act-contact.h"
#include "zel-svc-element-act-gps.h"
#include "zel-svc-element-act-main.h"
#include "zel-svc-element-act-message.h"
#include "zel-svc-element-act-multimedia.h"
#include "zel-svc-element-act-network.h"

#include <set>
#include <vector>

namespace zel_test {

using SettingGroups = std::vector<std::span<const Setting>>;

inline SettingGroups setting_groups() {
    return {zel_svc_main_settings(),    zel_svc_network_settings(),    zel_svc_gps_settings(),
            zel_svc_contact_settings(), zel_svc_multimedia_settings(), zel_svc_connectivity_settings(),
            zel_svc_sms_settings(),     zel_svc_push_settings(),       zel_svc_mms_settings(),
            zel_svc_browser_settings()};
}

inline const Setting *setting_row(ZelSvcElementId element) {
    for (const auto &group : setting_groups())
        if (const Setting *row = zel_svc_setting_find(group, element)) return row;
    return nullptr;
}

// The elements of these groups that write keys of the phone.
inline std::set<ZelSvcElementId> elements_with_keys(const SettingGroups &groups) {
    std::set<ZelSvcElementId> elements;
    for (const auto &group : groups)
        for (const Setting &row : group)
            if (row.stores[0].key) elements.insert(row.element);
    return elements;
}

} // namespace zel_test
