#include "summary-parts.h"

#include <spec/zel-svc-data.h>

#include <array>

namespace zel_command {
namespace {

constexpr std::array kMediaFolders{"/opt/usr/share/settings/Wallpapers",
                                   "/opt/usr/share/settings/Ringtones",
                                   "/opt/usr/share/settings/Alerts",
                                   "/opt/usr/share/settings/Alarms",
                                   "/opt/usr/media/Images",
                                   "/opt/usr/media/Sounds",
                                   "/opt/usr/media/Videos",
                                   "/opt/usr/media/Downloads/Others",
                                   "/opt/usr/media/DCIM",
                                   "/opt/usr/media/Screenshots"};

std::string section_store_folder() {
    char path[256] = {};
    zel_svc_data_get_path(ZEL_SVC_DATA_MAIN, ZEL_SVC_DATA_SIM1, path, sizeof path);
    const std::string file = path;
    return file.substr(0, file.rfind('/'));
}

// Every file below a folder, named from there; none when there is no such folder.
Json files_below(const Phone &phone, const std::string &folder) {
    Json result = Json::array();
    Json answer;
    if (phone.try_call("tree", {{"path", folder}}, answer) != 0) return result;
    for (const Json &entry : answer["entries"]) {
        if (entry.value("kind", "") != "file") continue;
        Json &file = result.emplace_back(Json::object());
        put_text(file, "name", bytes_of(entry, "path").substr(folder.size() + 1));
        file["size"] = entry["size"];
    }
    return result;
}

} // namespace

Json summary_media(const Phone &phone) {
    Json result = Json::array();
    for (const char *folder : kMediaFolders)
        result.push_back({{"folder", folder}, {"files", files_below(phone, folder)}});
    return result;
}

Json summary_section_store(const Phone &phone) { return files_below(phone, section_store_folder()); }

} // namespace zel_command
