// SIM auto setting's runs: what the platform calls after each start, and after a user's choice.

#include "commands.h"
#include "failure.h"
#include "package-check.h"
#include "run-watch.h"
#include "sim-cards.h"
#include "sim-operators.h"

#include <zel-svc-sim-auto-setting-slot.h>

#include <vconf.h>

#include <algorithm>
#include <cstdlib>
#include <sstream>

namespace zel_command {
namespace {

struct Meaning {
    const char *word;
    const char *text;
};
constexpr Meaning kMeanings[] = {
    {"installed", "An operator was installed."},
    {"user_chooses", "The user has to choose: 'zel sim match' tells among which, 'zel sim install' installs one."},
    {"nothing_installed", "Nothing was installed."},
    {"no_customer", ""},
    {"disabled", ""},
};

std::vector<std::string> lines_of_file(const Invocation &invocation, const char *path) {
    Json answer;
    if (invocation.phone.try_call("read", {{"path", path}}, answer) != 0) return {};
    std::istringstream text{bytes_of(answer, "content")};
    std::vector<std::string> lines;
    for (std::string line; std::getline(text, line);)
        lines.push_back(line);
    return lines;
}

// What the run wrote about a slot. The setting log is this run's only where the check log ends with a new SIM.
std::vector<std::string> trace(const Invocation &invocation, const ZelSvcSimSlot &slot) {
    std::vector<std::string> lines = lines_of_file(invocation, slot.check_log);
    if (lines.empty() || lines.back() != "SIM changed.") return lines;
    for (std::string &line : lines_of_file(invocation, slot.setting_log))
        lines.push_back(std::move(line));
    return lines;
}

Json traces_json(const Invocation &invocation) {
    Json result = Json::array();
    for (const int number : chosen_slots(invocation)) {
        Json slot{{"slot", number}, {"lines", Json::array()}};
        for (const std::string &line : trace(invocation, zel_svc_sim_slot(number)))
            put_text(slot["lines"].emplace_back(Json::object()), "line", line);
        result.push_back(std::move(slot));
    }
    return result;
}

void print_traces(const Json &slots) {
    for (const Json &slot : slots) {
        print_line("SIM " + slot.at("slot").dump());
        for (const Json &line : slot.at("lines"))
            print_line("  " + bytes_of(line, "line"));
    }
}

[[noreturn]] void fail_disabled(const Invocation &invocation, int result) {
    if (result == ZEL_SVC_SIM_NO_CUSTOMER)
        throw Failure{kFailed, "sim run: the phone in '" + invocation.root + "' has no active customer",
                      "Make a customer the active one with 'zel install CUSTOMER'."};
    throw Failure{kFailed, "sim run: SIM auto setting is off: 'db/private/zel/sim_auto_enable' is 0 or unreadable",
                  "A full install switches it on when the customer's file has an Auto flag \"on\", AutoEmailAccount "
                  "aside."};
}

int report_problems(const Invocation &invocation, const RunWatch &watch) {
    const std::vector<FileProblem> problems = watch.file_problems();
    for (const FileProblem &problem : problems)
        report(invocation.command->name + ": " + problem_text(problem));
    return problems.empty() ? kDone : kFailed;
}

std::vector<ZelSvcSimOperator> installable(const Invocation &invocation) {
    std::vector<ZelSvcSimOperator> list(ZEL_SVC_MAX_OPERATORS);
    std::int32_t count = 0;
    zel_svc_sim_auto_setting_get_operator_list(list.data(), &count, invocation.has("all") ? 1 : 0);
    list.resize(static_cast<std::size_t>(count));
    return list;
}

[[noreturn]] void fail_to_choose(const std::string &network, const std::vector<std::size_t> &found) {
    if (found.empty())
        throw Failure{kFailed, "sim install: no operator is named '" + network + "'",
                      "'zel sim operators' lists them; --all takes other customers' as well."};
    std::string numbers;
    for (const std::size_t number : found)
        numbers += (numbers.empty() ? "" : ", ") + std::to_string(number + 1);
    throw Failure{kFailed, "sim install: '" + network + "' has several entries: " + numbers,
                  "Name one with --number; 'zel sim operators' shows what they are."};
}

std::size_t numbered(const Invocation &invocation, std::size_t count) {
    const long long number = std::strtoll(invocation.value("number").c_str(), nullptr, 10); // checked to be digits
    if (number >= 1 && static_cast<unsigned long long>(number) <= count) return static_cast<std::size_t>(number - 1);
    throw Failure{kUsage, "--number is 1 to " + std::to_string(count), "'zel sim operators' lists the numbers."};
}

// Of several entries of that name the one for the SIM's MCC and MNC.
std::size_t named(const std::vector<ZelSvcSimOperator> &list, const std::string &network, const ZelSvcSimInfo &sim) {
    std::vector<std::size_t> found;
    for (std::size_t i = 0; i < list.size(); ++i)
        if (field_text(list[i].network_name) == network) found.push_back(i);
    if (found.size() == 1) return found.front();
    std::vector<std::size_t> of_sim;
    std::copy_if(found.begin(), found.end(), std::back_inserter(of_sim),
                 [&](std::size_t i) { return field_text(list[i].mccmnc) == field_text(sim.mccmnc); });
    if (of_sim.size() != 1) fail_to_choose(network, of_sim.empty() ? found : of_sim);
    return of_sim.front();
}

// What the caller of the library does once the user has chosen.
bool install_chosen(const ZelSvcSimOperator &entry, int number, const ZelSvcSimInfo &sim, bool readable) {
    const ZelSvcSimSlot &slot = zel_svc_sim_slot(number);
    zel_svc_sim_auto_setting_install_operator(&entry, number);
    bool done = zel_svc_sim_auto_setting_set_active_operator(&entry, number) == 1;
    if (readable) {
        done = vconf_set_str(slot.mccmnc.key, field_text(sim.mccmnc).c_str()) == 0 && done;
        done = vconf_set_str(slot.msin.key, field_text(sim.msin).c_str()) == 0 && done;
    }
    return vconf_set_int(slot.selection.key, 0) == 0 && done;
}

} // namespace

int sim_run(Invocation &invocation) {
    const RunWatch watch{invocation.verbose};
    const int result = zel_svc_sim_auto_setting_execute_by_sim();
    const Meaning &meaning = kMeanings[result];
    const Json slots = traces_json(invocation);
    if (invocation.json) print_json({{"result", result}, {"meaning", meaning.word}, {"slots", slots}});
    if (result == ZEL_SVC_SIM_NO_CUSTOMER || result == ZEL_SVC_SIM_DISABLED) fail_disabled(invocation, result);
    if (!invocation.json) {
        print_traces(slots);
        print_line(meaning.text);
    }
    return report_problems(invocation, watch);
}

int sim_install(Invocation &invocation) {
    const RunWatch watch{invocation.verbose};
    const int slot = chosen_slot(invocation);
    ZelSvcSimInfo sim{};
    const bool readable = zel_svc_sim_auto_setting_get_sim_info(&sim, slot) == 1;
    const std::vector<ZelSvcSimOperator> list = installable(invocation);
    if (invocation.has("number") == invocation.has("NETWORK"))
        throw Failure{kUsage, "either NETWORK or --number names the operator", "See 'zel sim install --help'."};
    const std::size_t chosen =
        invocation.has("number") ? numbered(invocation, list.size()) : named(list, invocation.value("NETWORK"), sim);
    const bool done = install_chosen(list[chosen], slot, sim, readable);
    if (invocation.json) {
        Json answer{{"slot", slot}, {"done", done}, {"sim_kept", readable}};
        answer["operator"] = operator_json_of_card(list[chosen], chosen, invocation.reveal);
        print_json(answer);
    } else {
        print_line("SIM " + std::to_string(slot) + ": " + field_text(list[chosen].network_name) + " of " +
                   field_text(list[chosen].customer_name) + " is installed and active.");
    }
    if (!readable)
        report("sim install: no SIM can be read in slot " + std::to_string(slot) +
               ", so the next 'zel sim run' takes any SIM there for a new one");
    const int problems = report_problems(invocation, watch);
    return done ? problems : kFailed;
}

int sim_clear(Invocation &invocation) {
    const bool done = zel_svc_sim_auto_setting_clear_active_operator() == 1;
    if (invocation.json) print_json({{"done", done}});
    if (done) return kDone;
    report("sim clear: not every key could be written; 'zel log --system' tells which");
    return kFailed;
}

} // namespace zel_command
