#include "base/zel-svc-file.h"
#include "base/zel-svc-run-log.h"
#include "preset/zel-svc-fs-update.h"
#include "zel-svc-configuration-customer-path.h"

namespace {

// What an operation gets: its path on the phone, and the same path in the package's tree.
struct Paths {
    std::string phone;
    std::string tree;
};

struct Operation {
    const char *name;
    void (*run)(const Paths &paths);
};

// A number has one operation: the first of these that is there.
constexpr Operation kOperations[] = {
    {"rm", [](const Paths &paths) { zel_svc_file_remove(paths.phone.c_str()); }},
    {"rm_r", [](const Paths &paths) { __zel_svc_config_clear_dir(paths.phone.c_str(), 1); }},
    {"cp", [](const Paths &paths) { __zel_svc_config_copy_file(paths.tree.c_str(), paths.phone.c_str()); }},
    {"cp_r", [](const Paths &paths) { zel_svc_file_copy_dir_like(paths.tree.c_str(), paths.phone.c_str()); }},
};

// Scripts name what they touch from the phone's root on and never climb.
bool stays_below_root(std::string_view path) {
    if (!path.starts_with('/')) return false;
    for (std::size_t start = 1; start <= path.size();) {
        const std::size_t end = std::min(path.find('/', start), path.size());
        if (path.substr(start, end - start) == "..") return false;
        start = end + 1;
    }
    return true;
}

std::string without_trailing_slashes(std::string path) {
    while (path.size() > 1 && path.ends_with('/'))
        path.pop_back();
    return path;
}

void run(const Operation &operation, std::string_view package, std::string path) {
    path = without_trailing_slashes(std::move(path));
    if (!stays_below_root(path)) return;
    const std::string tree = zel_svc_customer_preconfig_path(package, "fsupdate/fs") + path;
    operation.run({.phone = std::move(path), .tree = tree});
}

// False when the number has no operation: the section ends in front of it.
bool run_number(std::string_view package, const ZelSvcIni &script, const std::string &section, int number) {
    for (const Operation &operation : kOperations) {
        const std::string key = section + ':' + std::to_string(number) + '_' + operation.name;
        const char *path = script.text(key);
        if (!path) continue;
        if (*path == '\0') return true;
        run(operation, package, path);
        zel_svc_run_log("[FSUpdate] Run /%s/%s.\n", std::string{package}.c_str(), key.c_str());
        return true;
    }
    return false;
}

} // namespace

void zel_svc_fs_update_run_section(std::string_view package, const ZelSvcIni &script, const std::string &section) {
    for (int number = 1; run_number(package, script, section, number);)
        ++number;
}
