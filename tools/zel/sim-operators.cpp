#include "sim-operators.h"

#include "commands.h"
#include "failure.h"
#include "package-check.h"
#include "sim-cards.h"

#include <spec/zel-svc-spec-file.h>
#include <zel-svc-configuration-customer-path.h>
#include <zel-svc-sim-auto-setting-match.h>
#include <zel-svc-sim-auto-setting-operators.h>

namespace zel_command {
namespace {

constexpr const char *kGivePackage = "Give the phone a package with 'zel phone package DIR'.";

std::vector<ZelSvcSimOperator> copy_of(std::span<const ZelSvcSimOperator> entries) {
    return {entries.begin(), entries.end()};
}

// The library keeps no more; what stands behind is passed over in silence.
void report_full_list(const Invocation &invocation, std::size_t count) {
    if (count < ZEL_SVC_MAX_OPERATORS) return;
    report(invocation.command->name + ": only the first " + std::to_string(count) +
           " entries are read; those behind them are never matched");
}

[[noreturn]] void fail_without_customer(const Invocation &invocation) {
    throw Failure{kFailed, invocation.command->name + ": the phone in '" + invocation.root + "' has no active customer",
                  "Make a customer the active one with 'zel install CUSTOMER' or 'zel imei CUSTOMER'."};
}

std::string asked_text(const ZelSvcSimOperator &entry, const std::string &msin) {
    switch (zel_svc_sim_asks(entry)) {
    case ZelSvcSimAsks::Msin:
        return "MSIN " + msin;
    case ZelSvcSimAsks::Gid:
        return "GID " + field_text(entry.gid);
    case ZelSvcSimAsks::SpName:
        return "SPN " + field_text(entry.sp_name);
    case ZelSvcSimAsks::Nothing:
        break;
    }
    return {};
}

} // namespace

std::string active_customer_name() {
    char name[10] = {};
    zel_svc_config_get_active_customer_name(name, sizeof name);
    return name;
}

void require_readable_files(const Invocation &invocation, const RunWatch &watch) {
    for (const FileProblem &problem : watch.file_problems()) {
        if (problem.path == ZEL_SVC_SPEC_ROOT)
            report(invocation.command->name + ": " + ZEL_SVC_SPEC_HEADER_PATH +
                   " counts more customers than it describes");
        else
            throw Failure{kFailed, invocation.command->name + ": " + problem_text(problem), kGivePackage};
    }
}

CustomerOperators operators_of(const Invocation &invocation, const std::string &customer) {
    const std::string code = customer.empty() ? active_customer_name() : customer;
    if (code.empty()) fail_without_customer(invocation);
    if (!zel_svc_customer_names_folder(code))
        throw Failure{kFailed, invocation.command->name + ": '" + code + "' is no customer's code",
                      "'zel customers' lists those of the package."};
    const RunWatch watch{false};
    CustomerOperators result{code, copy_of(zel_svc_sim_operators_of(code))};
    require_readable_files(invocation, watch);
    report_full_list(invocation, result.entries.size());
    return result;
}

std::vector<CustomerOperators> operators_of_package(const Invocation &invocation) {
    std::vector<ZelSvcCustomer> customers(ZEL_SVC_MAX_CUSTOMERS);
    std::int32_t count = 0;
    {
        const RunWatch watch{false};
        zel_svc_config_get_customer_list(customers.data(), &count);
        require_readable_files(invocation, watch);
    }
    std::vector<CustomerOperators> result;
    for (std::int32_t i = 0; i < count; ++i) {
        const std::string name = field_text(customers[static_cast<std::size_t>(i)].name);
        if (!name.empty()) result.push_back(operators_of(invocation, name));
    }
    return result;
}

std::string asked_text(const ZelSvcSimOperator &entry) {
    return asked_text(entry, field_text(entry.subset_code) + "...");
}

std::string asked_text_of_card(const ZelSvcSimOperator &entry, bool reveal) {
    const std::string code = field_text(entry.subset_code);
    const std::string shown = shown_first_digits(code, reveal);
    return asked_text(entry, shown == code ? code + "..." : shown);
}

Json operator_json(const ZelSvcSimOperator &entry, std::size_t index) {
    Json result{{"number", index + 1}};
    put_text(result, "customer", field_text(entry.customer_name));
    put_text(result, "network", field_text(entry.network_name));
    put_text(result, "mccmnc", field_text(entry.mccmnc));
    put_text(result, "subset_code", field_text(entry.subset_code));
    put_text(result, "gid", field_text(entry.gid));
    put_text(result, "sp_name", field_text(entry.sp_name));
    return result;
}

Json operator_json_of_card(const ZelSvcSimOperator &entry, std::size_t index, bool reveal) {
    Json result = operator_json(entry, index);
    put_text(result, "subset_code", shown_first_digits(field_text(entry.subset_code), reveal));
    return result;
}

int sim_operators(Invocation &invocation) {
    if (!invocation.has("all") && active_customer_name().empty()) fail_without_customer(invocation);
    const RunWatch watch{false};
    std::vector<ZelSvcSimOperator> list(ZEL_SVC_MAX_OPERATORS);
    std::int32_t count = 0;
    zel_svc_sim_auto_setting_get_operator_list(list.data(), &count, invocation.has("all") ? 1 : 0);
    require_readable_files(invocation, watch);
    list.resize(static_cast<std::size_t>(count));
    report_full_list(invocation, list.size());
    Json answer = Json::array();
    std::vector<std::vector<std::string>> rows;
    for (std::size_t i = 0; i < list.size(); ++i) {
        answer.push_back(operator_json(list[i], i));
        rows.push_back({std::to_string(i + 1), field_text(list[i].customer_name), field_text(list[i].mccmnc),
                        field_text(list[i].network_name), asked_text(list[i])});
    }
    if (invocation.json)
        print_json(answer);
    else
        print_table({"#", "CUSTOMER", "MCC+MNC", "NETWORK", "ASKS FOR"}, rows);
    return kDone;
}

} // namespace zel_command
