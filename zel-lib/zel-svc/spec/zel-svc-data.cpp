#include "spec/zel-svc-data.h"

#include "base/zel-svc-log.h"
#include "base/zel-svc-text.h"
#include "spec/zel-svc-data-group.h"

#include <string>

namespace {

using Form = ZelSvcDataEntry::Form;

constexpr std::size_t kNameMax = 100;
constexpr std::size_t kValueMax = 255;

// An entry's address, cut to what a name may hold.
struct EntryName {
    EntryName(const char *section_text, const char *key_text) {
        if (!section_text || !key_text || *section_text == '\0') return;
        section = section_text;
        full = section + ':' + key_text;
        section.resize(zel_svc_text_cut(section, kNameMax));
        full.resize(zel_svc_text_cut(full, kNameMax));
    }

    // A file can hold neither a nameless section nor a nameless key: one such line and none of it would load.
    [[nodiscard]] bool has_key() const { return !section.empty() && full.size() > section.size() + 1; }

    std::string section;
    std::string full;
};

const ZelSvcDataEntry *find_entry(int group, const char *section, const char *key) {
    const EntryName name{section, key};
    return name.has_key() ? zel_svc_data_group(group).entries.find(name.full) : nullptr;
}

// Null for a section header, which has no value to read.
const ZelSvcDataEntry *find_value(int group, const char *section, const char *key) {
    const ZelSvcDataEntry *entry = find_entry(group, section, key);
    return entry && entry->form != Form::Section ? entry : nullptr;
}

void set_entry(int group, const char *section, const char *key, std::string value, Form form) {
    ZelSvcDataGroupState &state = zel_svc_data_group(group);
    const EntryName name{section, key};
    if (!state.dictionary || name.section.empty()) return;
    if (!state.entries.find(name.section)) state.entries.put(name.section, {}, Form::Section);
    if (name.has_key()) state.entries.put(name.full, std::move(value), form);
}

} // namespace

void zel_svc_data_set_int(int group, const char *section, const char *key, int value) {
    set_entry(group, section, key, std::to_string(value), Form::Plain);
}

void zel_svc_data_set_str(int group, const char *section, const char *key, std::string_view value) {
    if (!section || !key || !zel_svc_data_group(group).dictionary) return;
    value = value.substr(0, value.find('\0'));
    value = value.substr(0, zel_svc_text_cut(value, kValueMax));
    if (value.find('\n') != std::string_view::npos)
        ZEL_SVC_LOG("<Warning> Line feed in section '%s', key '%s' is stored as a blank.\n", section, key);
    set_entry(group, section, key, zel_svc_ini_quoted(value), value.empty() ? Form::Plain : Form::Quoted);
}

void zel_svc_data_unset(int group, const char *section, const char *key) {
    if (!section) return;
    ZelSvcDataEntries &entries = zel_svc_data_group(group).entries;
    if (key && find_entry(group, section, key)) entries.erase(EntryName{section, key}.full);
    if (!key) entries.erase_section(EntryName{section, ""}.section);
}

int zel_svc_data_get_int(int group, const char *section, const char *key, int fallback) {
    const ZelSvcDataEntry *entry = find_value(group, section, key);
    return entry ? zel_svc_ini_number(entry->value) : fallback;
}

const char *zel_svc_data_get_str(int group, const char *section, const char *key) {
    const ZelSvcDataEntry *entry = find_value(group, section, key);
    return entry ? entry->value.c_str() : nullptr;
}

std::string_view zel_svc_data_get_text(int group, const char *section, const char *key) {
    const ZelSvcDataEntry *entry = find_value(group, section, key);
    if (!entry) return {};
    const std::string_view text = entry->value;
    return entry->form == Form::Quoted ? text.substr(1, text.size() - 2) : text;
}

int zel_svc_data_find(int group, const char *section, const char *key) {
    return find_entry(group, section, key) ? 1 : 0;
}
