#include "zel-svc-configuration-verification.h"

#include "base/zel-svc-file.h"
#include "base/zel-svc-ini.h"
#include "base/zel-svc-text.h"

#include <algorithm>
#include <cstdio>

namespace {

// The applications that every customer gets, and the customer's own: what was to be done and what came of it.
struct ApplicationSet {
    std::string_view name;
    const char *list_path;
    const char *result_path;
};

constexpr ApplicationSet kSets[] = {
    {"Default", "/opt/system/zel-default/app/applist_def.ini", "/opt/system/zel-default/app/appresult_def.ini"},
    {"Customer", "/opt/system/zel-default/app/applist.ini", "/opt/system/zel-default/app/appresult.ini"},
};

constexpr std::string_view kUnknown = "unknown";
constexpr std::size_t kTypeMax = 9;
constexpr std::size_t kOperationMax = 20;

// "result:result_007"
std::string numbered(const char *name, int number) {
    char digits[16];
    std::snprintf(digits, sizeof digits, "%03d", number);
    return std::string{name} + digits;
}

std::string_view cut(std::string_view text, std::size_t limit) { return text.substr(0, zel_svc_text_cut(text, limit)); }

// The tool writes what it did as "op=install" among other things.
std::string_view operation_in(std::string_view description) {
    constexpr std::string_view kMark = "op=";
    const std::size_t mark = description.find(kMark);
    if (mark == std::string_view::npos) return kUnknown;
    const std::string_view rest = description.substr(mark + kMark.size());
    return cut(rest.substr(0, std::min(rest.find_first_of("\n:\""), rest.size())), kOperationMax);
}

std::string_view text_or_unknown(const ZelSvcIni &file, const std::string &key) {
    const char *text = file.text(key);
    return text ? std::string_view{text} : kUnknown;
}

std::string application_text(const ZelSvcIni &applications, const ZelSvcIni &results, int number) {
    const char *description = results.text(numbered("result:description_", number));
    if (!description) return "File unknown";
    std::string text{text_or_unknown(applications, numbered("zel packages:name_", number))};
    text.append("(").append(cut(text_or_unknown(applications, numbered("zel packages:type_", number)), kTypeMax));
    return text.append(",").append(operation_in(description)).append(")");
}

void add_application(ZelSvcResultList &list, std::string line, const char *result) {
    const bool passed = result && std::string_view{result} == "success";
    if (!result) line += ",Result unknown";
    if (result && !passed) line.append(",").append(result);
    list.add(line, passed);
}

void verify_set(const ApplicationSet &set, ZelSvcResultList &list) {
    const std::string label = std::string{"[App]["}.append(set.name);
    // A phone without a list has nothing to miss.
    if (__zel_svc_config_file_exists(set.result_path) == 0) return list.add(label + "] App NOT existed.", true);
    const ZelSvcIni results = ZelSvcIni::load(set.result_path);
    const ZelSvcIni applications = ZelSvcIni::load(set.list_path);
    if (!results || !applications) return;
    // The count stands in a file: a list that is full ends it.
    const int count = results.number("result:count", 0);
    for (int i = 1; i <= count && !list.is_full(); ++i)
        add_application(list, label + std::to_string(i) + "] " + application_text(applications, results, i),
                        results.text(numbered("result:result_", i)));
}

} // namespace

void zel_svc_config_verify_applications(ZelSvcResultList &list) {
    for (const ApplicationSet &set : kSets)
        verify_set(set, list);
}
