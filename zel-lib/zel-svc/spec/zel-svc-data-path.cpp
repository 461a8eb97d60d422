#include "spec/zel-svc-data.h"

#include "base/zel-svc-text.h"

#include <array>

namespace {

struct GroupFiles {
    const char *sim1;
    const char *sim2 = nullptr; // null: both SIMs share the first
};

constexpr std::array<GroupFiles, ZEL_SVC_DATA_GROUP_COUNT> kGroupFiles = {{
    {"/opt/system/zel-default/data/zel-default-data.ini"},
    {"/opt/system/zel-default/data/zel-default-data-security.ini"},
    {"/opt/system/zel-default/data/zel-default-data-network.ini"},
    {"/opt/system/zel-default/data/zel-default-data-wb-amr.ini"},
    {"/opt/system/zel-default/data/zel-default-data-contact.ini"},
    {"/opt/system/zel-default/data/zel-default-data-calendar.ini"},
    {"/opt/system/zel-default/data/zel-default-data-multimedia.ini"},
    {"/opt/system/zel-default/data/zel-default-data-connectivity.ini"},
    {"/opt/system/zel-default/data/zel-default-data-voice-mail.ini",
     "/opt/system/zel-default/data/zel-default-data-voice-mail-2.ini"},
    {"/opt/system/zel-default/data/zel-default-data-message.ini"},
    {"/opt/system/zel-default/data/zel-default-data-email.ini"},
    {"/opt/system/zel-default/data/zel-default-data-email-account.ini"},
    {"/opt/system/zel-default/data/zel-default-data-active-sync.ini"},
    {"/opt/system/zel-default/data/zel-default-data-connection.ini",
     "/opt/system/zel-default/data/zel-default-data-connection-2.ini"},
    {"/opt/system/zel-default/data/zel-default-data-fast-dormancy.ini",
     "/opt/system/zel-default/data/zel-default-data-fast-dormancy-2.ini"},
    {"/opt/system/zel-default/data/zel-default-data-bookmark.ini"},
    {"/opt/system/zel-default/data/zel-default-data-quick-access.ini"},
    {"/opt/system/zel-default/data/zel-default-data-browser.ini"},
    {"/opt/system/zel-default/data/zel-default-data-syncml-ds.ini"},
    {"/opt/system/zel-default/data/zel-default-data-max-pdp.ini",
     "/opt/system/zel-default/data/zel-default-data-max-pdp-2.ini"},
    {"/opt/system/zel-default/data/zel-default-data-gps.ini"},
    {"/opt/system/zel-default/data/zel-default-data-ims.ini",
     "/opt/system/zel-default/data/zel-default-data-ims-2.ini"},
}};

} // namespace

void zel_svc_data_get_path(int group, unsigned variant, char *path, std::size_t size) {
    if (!path) return;
    const bool known = group >= 0 && group < ZEL_SVC_DATA_GROUP_COUNT;
    const GroupFiles &files = kGroupFiles[known ? static_cast<std::size_t>(group) : std::size_t{ZEL_SVC_DATA_MAIN}];
    zel_svc_text_copy(path, size, variant == ZEL_SVC_DATA_SIM2 && files.sim2 ? files.sim2 : files.sim1);
}
