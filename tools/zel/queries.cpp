// Questions about the package and the phone's software that install nothing.

#include "commands.h"
#include "failure.h"
#include "output.h"
#include "package-check.h"
#include "run-watch.h"

#include <zel-svc.h>

#include <spec/zel-svc-spec-file.h>

namespace zel_command {
namespace {

[[noreturn]] void fail_without_package(const Invocation &invocation, const std::string &why) {
    throw Failure{kFailed, "cannot read the package of the phone in '" + invocation.root + "': " + why,
                  "Give the phone a package with 'zel phone package DIR'."};
}

void require_readable_package(const Invocation &invocation, const RunWatch &watch) {
    const std::vector<FileProblem> problems = watch.file_problems();
    if (!problems.empty()) fail_without_package(invocation, problem_text(problems.front()));
}

std::vector<ZelSvcCustomer> listed_customers() {
    std::vector<ZelSvcCustomer> list(ZEL_SVC_MAX_CUSTOMERS);
    std::int32_t count = 0;
    zel_svc_config_get_customer_list(list.data(), &count);
    list.resize(static_cast<std::size_t>(count < 0 ? 0 : count));
    return list;
}

} // namespace

int customers(Invocation &invocation) {
    const RunWatch watch{false};
    const std::vector<ZelSvcCustomer> list = listed_customers();
    require_readable_package(invocation, watch);
    if (!invocation.json) {
        std::vector<std::vector<std::string>> rows;
        for (const ZelSvcCustomer &customer : list)
            rows.push_back({customer.name, customer.path});
        print_table({"CUSTOMER", "FILE"}, rows);
        return kDone;
    }
    Json answer = Json::array();
    for (const ZelSvcCustomer &customer : list) {
        Json &entry = answer.emplace_back(Json::object());
        put_text(entry, "customer", customer.name);
        put_text(entry, "file", customer.path);
    }
    print_json(answer);
    return kDone;
}

int version(Invocation &invocation) {
    char text[20] = {};
    const bool known = zel_svc_config_get_zel_bin_version(text, sizeof text) == 1;
    Json answer{{"known", known}};
    put_text(answer, "version", text);
    if (invocation.json)
        print_json(answer);
    else
        print_line(text);
    if (known) return kDone;
    throw Failure{kFailed,
                  std::string{"version: "} + ZEL_SVC_SPEC_HEADER_PATH +
                      " names no package and version, so the answer is the one for an unknown package",
                  "Give the phone a package with 'zel phone package DIR'."};
}

int approval(Invocation &invocation) {
    ZelSvcApprovalVersion versions{};
    const bool known = zel_svc_config_get_approval_version(&versions) == 1;
    Json answer{{"known", known}};
    put_text(answer, "ap", versions.ap);
    put_text(answer, "cp", versions.cp);
    put_text(answer, "zel", versions.zel);
    if (invocation.json)
        print_json(answer);
    else if (known)
        print_table({}, {{"ap", versions.ap}, {"cp", versions.cp}, {"zel", versions.zel}});
    if (known) return kDone;
    throw Failure{kFailed,
                  "approval: /opt/system/zel-default/usr/zel/zel-approval-ver.ini is missing, cannot be read, or "
                  "states no version",
                  "An install copies it from the package's 'preconfig/CUSTOMER/usr' folder."};
}

} // namespace zel_command
