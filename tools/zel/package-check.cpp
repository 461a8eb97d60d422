#include "package-check.h"

#include "auto-flags.h"

#include <zel-svc.h>

#include <spec/zel-svc-spec-file.h>

namespace zel_command {
namespace {

bool names_a_folder(const std::string &customer) {
    return !customer.empty() && customer != "." && customer != ".." && customer.find('/') == std::string::npos;
}

} // namespace

std::string internal_name_of(const std::string &customer) {
    char name[10] = {};
    zel_svc_config_get_internal_customer_name(customer.c_str(), name, sizeof name);
    return name;
}

std::string problem_text(const FileProblem &problem) {
    if (problem.end.line == 0) return problem.path + ": " + problem.reason;
    return problem.path + ":" + std::to_string(problem.end.line) + ":" + std::to_string(problem.end.column) + ": " +
           problem.reason;
}

std::vector<std::string> problems_of_run(const std::string &customer, RunWatch &watch) {
    std::vector<std::string> result;
    if (zel_svc_config_chk_customer_name_exist_in_zel_bin(customer.c_str()) != 1)
        result.push_back("the package does not list the customer '" + customer + "' in " + ZEL_SVC_SPEC_HEADER_PATH);
    const std::string path = customer_file_path(customer);
    if (names_a_folder(customer) && !watch.has_read(path)) read_auto_flags(path);
    for (const FileProblem &problem : watch.file_problems())
        result.push_back(problem_text(problem));
    return result;
}

} // namespace zel_command
