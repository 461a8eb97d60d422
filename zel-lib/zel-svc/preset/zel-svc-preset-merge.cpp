#include "preset/zel-svc-preset-merge.h"

#include "base/zel-svc-file.h"
#include "base/zel-svc-ini.h"
#include "base/zel-svc-log.h"
#include "preset/zel-svc-preset.h"
#include "zel-svc-configuration-customer-path.h"
#include "zel-svc.h"

#include <algorithm>
#include <string>

namespace {

constexpr const char *kValues = "default";
constexpr const char *kMarks = "upgrade_update";
constexpr const char *kPresetFile = "preset/zel-preset.ini";

std::string key_in(const char *section, const ZelSvcPresetRow &row) { return std::string{section} + ':' + row.key; }

// A string is quoted in the file. What does not sort behind a pair of quotes has no value worth quoting.
std::string merged_form(const ZelSvcPresetRow &row, std::string_view value) {
    if (row.type != ZelSvcPresetType::String) return std::string{value};
    return value > std::string_view{"\"\""} ? zel_svc_ini_quoted(value) : std::string{};
}

// A line that does not load back would take the whole merged file with it, or the line behind it.
bool loads_back(const ZelSvcPresetRow &row, std::string_view value, std::string_view merged) {
    constexpr std::size_t kLongestLine = 1022;
    constexpr std::size_t kKeyColumn = 30; // as the INI library writes it, " = " behind it
    const std::size_t line = std::max(std::string_view{row.key}.size(), kKeyColumn) + 3 + merged.size();
    if (line > kLongestLine || value.find('\n') != std::string_view::npos) return false;
    const std::size_t last = merged.find_last_not_of(" \t\v\f\r");
    return last == std::string_view::npos || merged[last] != '\\'; // which would join the next line to it
}

class Merge {
  public:
    Merge(ZelSvcIni &merged, ZelSvcPresetFlags &chosen, bool upgrade)
        : merged_(merged), chosen_(chosen), upgrade_(upgrade) {}

    void add(std::string_view package) {
        const ZelSvcIni file = ZelSvcIni::load(zel_svc_customer_preconfig_path(package, kPresetFile).c_str());
        if (!file) return;
        for (std::size_t i = 0; i < ZEL_SVC_PRESET_COUNT; ++i)
            if (take_value(file, ZEL_SVC_PRESETS[i])) mark(file, i);
    }

  private:
    bool take_value(const ZelSvcIni &file, const ZelSvcPresetRow &row) {
        const char *value = file.text(key_in(kValues, row));
        if (!value) return false;
        const std::string merged = merged_form(row, value);
        if (loads_back(row, value, merged)) return merged_.set(key_in(kValues, row), merged);
        ZEL_SVC_LOG("<Warning> Preset('%s') cannot be kept in a file, ignored.\n", row.key);
        return false;
    }

    void mark(const ZelSvcIni &file, std::size_t row) {
        if (!upgrade_) {
            chosen_[row] = true;
            return;
        }
        const std::string key = key_in(kMarks, ZEL_SVC_PRESETS[row]);
        if (file.has(key)) chosen_[row] = file.number(key, 0) == 1;
    }

    ZelSvcIni &merged_;
    ZelSvcPresetFlags &chosen_;
    bool upgrade_;
};

} // namespace

bool zel_svc_preset_merge(std::string_view customer, int kind, ZelSvcPresetFlags &chosen) {
    zel_svc_file_remove(ZEL_SVC_PRESET_MERGED_PATH);
    const ZelSvcFd file = zel_svc_file_open_output(ZEL_SVC_PRESET_MERGED_PATH, "zel-manager");
    ZelSvcIni merged = ZelSvcIni::load(file.get());
    if (!merged || !merged.add_section(kValues)) return false;
    Merge merge{merged, chosen, kind != ZEL_SVC_INSTALL_CONFIG_MODE};
    merge.add(ZEL_SVC_PRECONFIG_EVERY_CUSTOMER);
    merge.add(customer);
    return merged.dump(file.get());
}
