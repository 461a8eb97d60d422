// The SIM locks that the active customer's file states.

#include "commands.h"
#include "failure.h"
#include "output.h"
#include "package-check.h"
#include "run-watch.h"

#include <zel-svc.h>

#include <span>

namespace zel_command {
namespace {

using LockText = char[20];

struct LockList {
    const char *name; // in JSON; people read it with blanks
    std::int32_t ZelSvcSecurityLock::*count;
    LockText (ZelSvcSecurityLock::*codes)[ZEL_SVC_MAX_LOCKS];
};

constexpr LockList kLists[] = {
    {"networks", &ZelSvcSecurityLock::network_lock_count, &ZelSvcSecurityLock::network_locks},
    {"service_providers", &ZelSvcSecurityLock::sp_lock_count, &ZelSvcSecurityLock::sp_locks},
    {"subsets", &ZelSvcSecurityLock::subset_lock_count, &ZelSvcSecurityLock::subset_locks},
    {"corporates", &ZelSvcSecurityLock::cp_lock_count, &ZelSvcSecurityLock::cp_locks},
};

// The codes that are there. The stated count may be any number, so it does not bound them.
std::span<const LockText> codes_of(const ZelSvcSecurityLock &locks, const LockList &list) {
    const std::span<const LockText> all{locks.*list.codes};
    std::size_t count = all.size();
    while (count > 0 && all[count - 1][0] == '\0')
        --count;
    return all.first(count);
}

Json json_of(const ZelSvcSecurityLock &locks) {
    Json answer = Json::object();
    for (const LockList &list : kLists) {
        Json codes = Json::array();
        for (const LockText &code : codes_of(locks, list))
            put_text(codes.emplace_back(Json::object()), "code", code);
        answer[list.name] = Json{{"count", locks.*list.count}, {"locks", std::move(codes)}};
    }
    put_text(answer, "auto_network_lock", locks.auto_network_lock);
    answer["auto_sim_lock"] = locks.auto_sim_lock == 1;
    answer["auto_sp_lock"] = locks.auto_sp_lock == 1;
    answer["unlock_count"] = locks.unlock_count;
    return answer;
}

void print_locks(const ZelSvcSecurityLock &locks) {
    std::vector<std::vector<std::string>> rows;
    for (const LockList &list : kLists) {
        std::string name{list.name};
        if (const std::size_t at = name.find('_'); at != std::string::npos) name[at] = ' ';
        std::string codes;
        for (const LockText &code : codes_of(locks, list))
            codes.append(codes.empty() ? "" : " ").append(code);
        rows.push_back({name, std::to_string(locks.*list.count), codes});
    }
    print_table({"LOCKED TO", "COUNT", "CODES"}, rows);
    print_line("");
    print_table({}, {{"auto network lock", locks.auto_network_lock},
                     {"auto SIM lock", locks.auto_sim_lock == 1 ? "on" : "off"},
                     {"auto SP lock", locks.auto_sp_lock == 1 ? "on" : "off"},
                     {"unlock count", std::to_string(locks.unlock_count)}});
}

} // namespace

int locks(Invocation &invocation) {
    const RunWatch watch{false};
    ZelSvcSecurityLock found{};
    if (zel_svc_config_get_security_lock_info(&found) == 0)
        throw Failure{kFailed, "locks: the phone in '" + invocation.root + "' has no active customer",
                      "Make a customer the active one with 'zel install CUSTOMER' or 'zel imei CUSTOMER'."};
    if (const std::vector<FileProblem> problems = watch.file_problems(); !problems.empty())
        throw Failure{kFailed, "locks: " + problem_text(problems.front()),
                      "Give the phone a package with 'zel phone package DIR'."};
    if (invocation.json)
        print_json(json_of(found));
    else
        print_locks(found);
    return kDone;
}

} // namespace zel_command
