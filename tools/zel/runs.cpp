// The entry points that the phone's boot code and factory tools call.

#include "commands.h"
#include "failure.h"
#include "output.h"
#include "package-check.h"
#include "run-watch.h"

#include <zel-svc.h>

#include <cstdio>

namespace zel_command {
namespace {

std::string active_customer() {
    char name[10] = {};
    zel_svc_config_get_active_customer_name(name, sizeof name);
    return name;
}

Json phases_json(const RunWatch &watch) {
    Json result = Json::array();
    for (const Phase &phase : watch.phases())
        result.push_back(
            {{"name", phase.name}, {"depth", phase.depth}, {"ended", phase.ended}, {"seconds", phase.seconds}});
    return result;
}

void print_run_json(const std::string &run, const std::string &customer, const RunWatch &watch,
                    const std::vector<std::string> &problems) {
    Json answer{{"run", run}};
    put_text(answer, "customer", customer);
    put_text(answer, "internal_name", internal_name_of(customer));
    answer["done"] = problems.empty();
    answer["problems"] = problems;
    answer["error_lines"] = watch.error_lines();
    answer["seconds"] = watch.seconds();
    answer["phases"] = phases_json(watch);
    print_json(answer);
}

void report_problems(const std::string &run, const std::string &customer, const std::vector<std::string> &problems) {
    for (const std::string &problem : problems)
        report(run + " of '" + customer + "': " + problem);
    report_plain("The run went on without it, as it would on a phone. 'zel customers' lists the package's "
                 "customers, 'zel log' shows what was done.");
}

void report_error_lines(const RunWatch &watch) {
    for (const std::string &line : watch.error_lines())
        report("run log: " + escaped_line(line));
}

int finish(const Invocation &invocation, const std::string &run, const std::string &customer, RunWatch &watch) {
    const std::vector<std::string> problems = problems_of_run(customer, watch);
    if (invocation.json) print_run_json(run, customer, watch, problems);
    if (!invocation.json) report_error_lines(watch);
    if (problems.empty()) return kDone;
    report_problems(run, customer, problems);
    return kFailed;
}

int finish_call(const Invocation &invocation, const std::string &run, bool done) {
    if (invocation.json) print_json({{"run", run}, {"done", done}});
    if (done) return kDone;
    report(run + ": the library reports a failure; 'zel log' and 'zel log --system' tell more");
    return kFailed;
}

} // namespace

int install(Invocation &invocation) {
    const std::string customer = invocation.value("CUSTOMER");
    RunWatch watch{invocation.verbose};
    zel_svc_config_set_pre_config_for_config_mode(customer.c_str());
    return finish(invocation, "install", customer, watch);
}

int upgrade(Invocation &invocation) {
    const std::string customer = invocation.value("CUSTOMER");
    RunWatch watch{invocation.verbose};
    zel_svc_config_upgrade_pre_config_for_fota_mode(customer.c_str());
    return finish(invocation, "upgrade", customer, watch);
}

int boot(Invocation &invocation) {
    const std::string customer = active_customer();
    RunWatch watch{invocation.verbose};
    zel_svc_config_upgrade_pre_config_for_normal_booting();
    if (!customer.empty()) return finish(invocation, "boot", customer, watch);
    throw Failure{kFailed, "boot: the phone in '" + invocation.root + "' has no active customer, so nothing was done",
                  "Configure it with 'zel install CUSTOMER' or 'zel upgrade CUSTOMER' first."};
}

int imei(Invocation &invocation) {
    const std::string customer = invocation.value("CUSTOMER");
    return finish_call(invocation, "imei", zel_svc_config_set_pre_config_for_imei(customer.c_str()) == 1);
}

int factory_reset(Invocation &invocation) {
    return finish_call(invocation, "factory-reset", zel_svc_config_set_pre_config_for_factory_reset() == 1);
}

int reboot(Invocation &invocation) {
    zel_svc_config_reboot();
    return finish_call(invocation, "reboot", true);
}

} // namespace zel_command
