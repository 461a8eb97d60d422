#include "base/zel-svc-fs-status.h"

#include "base/zel-svc-file.h"
#include "base/zel-svc-folder-walk.h"
#include "base/zel-svc-ini.h"

#include <cstdint>
#include <string>

namespace {

// A category may count several folders.
struct MediaFolder {
    std::size_t category;
    const char *path;
};

constexpr MediaFolder kFolders[] = {
    {0, "/opt/usr/share/settings/Wallpapers"},
    {1, "/opt/usr/share/settings/Ringtones"},
    {2, "/opt/usr/share/settings/Alerts"},
    {3, "/opt/usr/share/settings/Alarms"},
    {4, "/opt/usr/media/Images"},
    {5, "/opt/usr/media/Sounds"},
    {6, "/opt/usr/media/Videos"},
    {7, "/opt/usr/media/Downloads/Others"},
    {8, "/opt/usr/media/DCIM"},
    {9, "/opt/usr/media/Screenshots"},
};

struct Total {
    std::uint32_t size = 0;
    std::int32_t count = 0;
};

void add_folder(Total &total, const char *path) {
    using Step = ZelSvcFolderWalk::Step;
    ZelSvcFolderWalk walk{path};
    for (Step step = walk.next(); step != Step::End; step = walk.next()) {
        if (step != Step::Entry) continue;
        total.size += static_cast<std::uint32_t>(walk.status().st_size);
        ++total.count;
        if (walk.is_folder()) walk.enter();
    }
}

Total total_of(std::size_t category) {
    Total total;
    for (const MediaFolder &folder : kFolders)
        if (folder.category == category) add_folder(total, folder.path);
    return total;
}

} // namespace

void __zel_svc_config_fs_status_write(int mode) {
    const bool after_install = mode == 1;
    if (after_install) {
        zel_svc_file_remove(ZEL_SVC_FS_STATUS_CONFIG_PATH);
        zel_svc_file_remove(ZEL_SVC_FS_STATUS_VERIFY_PATH);
    }
    const char *path = after_install ? ZEL_SVC_FS_STATUS_CONFIG_PATH : ZEL_SVC_FS_STATUS_VERIFY_PATH;
    const ZelSvcFd file = zel_svc_file_open_output(path, "*");
    ZelSvcIni ini = ZelSvcIni::load(file.get());
    if (!ini) return;
    for (std::size_t i = 0; i < ZEL_SVC_FS_STATUS_CATEGORIES.size(); ++i) {
        const Total total = total_of(i);
        const std::string key = std::string{"media:"} + ZEL_SVC_FS_STATUS_CATEGORIES[i];
        ini.add_section("media");
        ini.set(key + "_size", std::to_string(total.size));
        ini.set(key + "_count", std::to_string(total.count));
    }
    ini.dump(file.get());
}
