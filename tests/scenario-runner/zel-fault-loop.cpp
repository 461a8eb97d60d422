// Takes the journal of a scenario's last run, fails each distinct platform call of it once, and compares
// what each failure changed on the phone with the golden file `expected/faults`: one heading a fault, below
// it what the phone lacks ("-") and has instead ("+") against the run without a fault.

#include "golden.h"
#include "scenario.h"

#include <cstdio>
#include <exception>
#include <set>
#include <sstream>
#include <stdexcept>
#include <utility>

namespace {

using namespace zel_scenario;
using Call = std::pair<std::string, std::string>; // function, text argument

// Everything up to the last run of an entry point, which is the one under faults.
std::size_t last_run(const Scenario &scenario) {
    for (std::size_t i = scenario.steps.size(); i-- > 0;)
        if (scenario.steps[i].word == "run") return i;
    throw std::runtime_error("the scenario runs no entry point");
}

void prepare(const Scenario &scenario, ScenarioRun &run, std::size_t end) {
    for (std::size_t i = 0; i < end; ++i)
        run.do_step(scenario.steps[i]);
}

// The text that picks out a journal entry's call. A log message is no text of its own: it holds line numbers.
std::string picking_text(const Json &entry) {
    const Json &text = entry.at("text");
    return text.is_string() && entry.at("function") != "__dlog_print" ? text.get<std::string>() : std::string{};
}

// Whether the scenario wants the function to fail.
bool is_chosen(const Scenario &scenario, const std::string &function) {
    bool chosen = true;
    for (const ScenarioStep &step : scenario.steps) {
        if (step.word != "fail") continue;
        std::istringstream prefixes{step.rest};
        chosen = false;
        for (std::string prefix; prefixes >> prefix;)
            chosen = chosen || function.starts_with(prefix);
    }
    return chosen;
}

// The distinct calls of a good run, in the order of their first appearance.
std::vector<Call> journal_of_good_run(const Scenario &scenario, PhoneState &good) {
    const std::size_t last = last_run(scenario);
    ScenarioRun run{scenario};
    prepare(scenario, run, last);
    run.phone().call("journal-start");
    if (!run.run_entry_point(scenario.steps[last].rest).ended_normally) throw std::runtime_error("the good run fails");
    run.phone().call("journal-stop");
    std::vector<Call> calls;
    std::set<Call> seen;
    const Json journal = run.phone().call("journal-list");
    for (const Json &entry : journal.at("calls")) {
        Call call{entry.at("function").get<std::string>(), picking_text(entry)};
        if (is_chosen(scenario, call.first) && seen.insert(call).second) calls.push_back(std::move(call));
    }
    good = read_state(run.phone());
    return calls;
}

std::vector<std::string> outcome(const Scenario &scenario, const Call &call, const PhoneState &good) {
    const std::size_t last = last_run(scenario);
    ScenarioRun run{scenario};
    prepare(scenario, run, last);
    run.phone().call("fault-add", {{"function", call.first}, {"text", call.second}, {"from", 1}, {"times", 1}});
    const StepResult result = run.run_entry_point(scenario.steps[last].rest);
    std::vector<std::string> lines{"== " + call.first + " " + call.second};
    if (!result.ended_normally) lines.push_back("!! " + result.how + ": " + result.output);
    PhoneState state = read_state(run.phone());
    for (const auto &[section, before] : good)
        for (const std::string &line : line_difference(before, state[section]))
            lines.push_back(line.substr(0, 2) + section + ": " + line.substr(2));
    for (const auto &[section, after] : state)
        if (!good.contains(section))
            for (const std::string &line : after)
                lines.push_back("+ " + section + ": " + line);
    return lines;
}

} // namespace

int main(int argc, char **argv) try {
    if (argc != 2) {
        std::fprintf(stderr, "usage: zel-fault-loop FOLDER\n");
        return 2;
    }
    const Scenario scenario = read_scenario(argv[1]);
    PhoneState good;
    PhoneState faults;
    bool normal = true;
    const std::vector<Call> calls = journal_of_good_run(scenario, good);
    for (const Call &call : calls)
        for (std::string &line : outcome(scenario, call, good)) {
            normal = normal && !line.starts_with("!!");
            faults["faults"].push_back(std::move(line));
        }
    std::printf("%zu distinct calls failed once each\n", calls.size());
    const int differing = compare_with_golden(faults, scenario.folder / "expected");
    return differing == 0 && normal ? 0 : 1;
} catch (const std::exception &failure) {
    std::fprintf(stderr, "zel-fault-loop: %s\n", failure.what());
    return 1;
}
