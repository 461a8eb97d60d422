#include "spec/zel-svc-data-group.h"

#include "base/zel-svc-file.h"
#include "base/zel-svc-text.h"

#include <algorithm>
#include <array>
#include <fcntl.h>

namespace {

using Form = ZelSvcDataEntry::Form;

constexpr int kFileMode = 0755;
constexpr std::size_t kPathSize = 128;
constexpr std::size_t kValueMax = 255;

std::array<ZelSvcDataGroupState, ZEL_SVC_DATA_GROUP_COUNT> gstZelSvcDataGroups;

struct GroupPath {
    GroupPath(int group, unsigned variant) { zel_svc_data_get_path(group, variant, text, sizeof text); }
    char text[kPathSize] = {};
};

ZelSvcFd create_file(const char *path) {
    zel_svc_file_remove(path);
    ZelSvcFd file = zel_svc_file_open(path, O_RDWR | O_CREAT | O_TRUNC, kFileMode);
    if (file) __zel_svc_config_set_file_attr(path, kFileMode, ZEL_SVC_FILE_OWNER, ZEL_SVC_FILE_GROUP, "*");
    return file;
}

bool is_number(std::string_view value) {
    if (value.starts_with('-')) value.remove_prefix(1);
    return !value.empty() && std::all_of(value.begin(), value.end(), [](char c) { return c >= '0' && c <= '9'; });
}

// A loaded value has lost its quotes and must get them back, or what follows a "#" in it would be lost. One
// that holds both kinds of quotes stood without and stays so.
std::string loaded_as_written(std::string_view value) {
    value = value.substr(0, zel_svc_text_cut(value, kValueMax));
    const bool has_both = value.find('"') != std::string_view::npos && value.find('\'') != std::string_view::npos;
    return is_number(value) || has_both ? std::string{value} : zel_svc_ini_quoted(value);
}

bool write_entry(ZelSvcIni &dictionary, const ZelSvcDataEntry &entry) {
    if (entry.form == Form::Section) return dictionary.append(entry.name, nullptr);
    if (entry.form != Form::Loaded) return dictionary.append(entry.name, entry.value.c_str());
    return dictionary.append(entry.name, loaded_as_written(entry.value).c_str());
}

bool update_dictionary(ZelSvcDataGroupState &group) {
    group.dictionary.clear();
    return std::all_of(group.entries.begin(), group.entries.end(),
                       [&group](const ZelSvcDataEntry &entry) { return write_entry(group.dictionary, entry); });
}

} // namespace

ZelSvcDataGroupState &zel_svc_data_group(int group) {
    const bool known = group >= 0 && group < ZEL_SVC_DATA_GROUP_COUNT;
    return gstZelSvcDataGroups[known ? static_cast<std::size_t>(group) : std::size_t{ZEL_SVC_DATA_MAIN}];
}

void zel_svc_data_load(int group, unsigned variant, int create) {
    zel_svc_data_free(group);
    const GroupPath path{group, variant};
    const ZelSvcFd file = create == 1 ? create_file(path.text) : zel_svc_file_open(path.text, O_RDONLY);
    ZelSvcDataGroupState &state = zel_svc_data_group(group);
    ZelSvcIni dictionary = ZelSvcIni::load(file.get());
    ZelSvcDataEntries entries;
    for (const auto &[name, value] : dictionary.entries())
        entries.put(name, value ? value : "", value ? Form::Loaded : Form::Section);
    // Without memory for all of them the group stays unloaded.
    state.entries = std::move(entries);
    state.dictionary = std::move(dictionary);
}

void zel_svc_data_dump(int group, unsigned variant) {
    ZelSvcDataGroupState &state = zel_svc_data_group(group);
    // The file is not emptied before everything that goes into it is there.
    if (!state.dictionary || !update_dictionary(state)) return;
    const GroupPath path{group, variant};
    if (const ZelSvcFd file = zel_svc_file_open(path.text, O_WRONLY | O_CREAT | O_TRUNC, kFileMode))
        state.dictionary.dump(file.get());
}

void zel_svc_data_free(int group) {
    ZelSvcDataGroupState &state = zel_svc_data_group(group);
    state.entries.clear();
    state.dictionary = {};
}
