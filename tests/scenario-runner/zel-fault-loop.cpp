// Takes the journal of a scenario's last run, fails each platform call of it, and compares what each failure
// changed on the phone with the golden file `expected/faults`: one heading a fault, below it what the phone lacks
// ("-") and has instead ("+") against the run without a fault; "answer" is what the entry point printed.
//
// Each distinct call is failed once, on a phone of its own. A scenario with the step `again` fails every single
// call ("#2" is the second of its kind), all on one phone, and after each fault the entry point runs undisturbed:
// it must then leave what it left before the fault, or the loop fails.

#include "golden.h"
#include "scenario.h"

#include <algorithm>
#include <cstdio>
#include <exception>
#include <map>
#include <sstream>
#include <stdexcept>
#include <utility>

namespace {

using namespace zel_scenario;
using Lines = std::vector<std::string>;

struct Call {
    std::string function;
    std::string text; // its text argument
    int number;       // among the calls of the function with this text, from 1
};

std::size_t last_of(const Scenario &scenario, const std::string &word) {
    for (std::size_t i = scenario.steps.size(); i-- > 0;)
        if (scenario.steps[i].word == word) return i;
    throw std::runtime_error("the scenario has no step: " + word);
}

// The run of an entry point that is under faults.
std::size_t last_run(const Scenario &scenario) { return last_of(scenario, "run"); }

bool is_repeated(const Scenario &scenario) {
    for (const ScenarioStep &step : scenario.steps)
        if (step.word == "again") return true;
    return false;
}

void prepare(const Scenario &scenario, ScenarioRun &run, std::size_t from, std::size_t end) {
    for (std::size_t i = from; i < end; ++i)
        run.do_step(scenario.steps[i]);
}

PhoneState look(ScenarioRun &run, const StepResult &result) {
    PhoneState state = read_state(run.phone());
    if (!result.output.empty()) state["answer"] = lines_of(result.output);
    return state;
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

// The calls of a run that may fail, in the order in which they came.
std::vector<Call> journalled_calls(const Scenario &scenario, Phone &phone) {
    std::vector<Call> calls;
    std::map<std::pair<std::string, std::string>, int> seen;
    const Json journal = phone.call("journal-list");
    for (const Json &entry : journal.at("calls")) {
        Call call{entry.at("function").get<std::string>(), picking_text(entry), 0};
        if (!is_chosen(scenario, call.function)) continue;
        call.number = ++seen[{call.function, call.text}];
        if (call.number == 1 || is_repeated(scenario)) calls.push_back(std::move(call));
    }
    return calls;
}

void must_end_normally(const StepResult &result) {
    if (!result.ended_normally) throw std::runtime_error("the run without a fault fails: " + result.how);
}

void set_fault(Phone &phone, const Call &call) {
    phone.call("fault-add", {{"function", call.function}, {"text", call.text}, {"from", call.number}, {"times", 1}});
}

std::string heading(const Call &call) {
    const std::string text = "== " + call.function + " " + call.text;
    if (call.number == 1) return text;
    return text + (call.text.empty() ? "#" : " #") + std::to_string(call.number);
}

// What a fault did; a line that begins with "!!" is never right.
Lines outcome(const Call &call, const StepResult &result, const PhoneState &good, const PhoneState &state) {
    Lines lines{heading(call)};
    if (!result.ended_normally) lines.push_back("!! " + result.how + ": " + result.output);
    for (std::string &line : state_difference(good, state))
        lines.push_back(std::move(line));
    return lines;
}

Lines each_on_a_phone_of_its_own(const Scenario &scenario) {
    const std::size_t last = last_run(scenario);
    ScenarioRun undisturbed{scenario};
    prepare(scenario, undisturbed, 0, last);
    undisturbed.phone().call("journal-start");
    const StepResult normal = undisturbed.run_entry_point(scenario.steps[last].rest);
    must_end_normally(normal);
    undisturbed.phone().call("journal-stop");
    const PhoneState good = look(undisturbed, normal);
    Lines lines;
    for (const Call &call : journalled_calls(scenario, undisturbed.phone())) {
        ScenarioRun run{scenario};
        prepare(scenario, run, 0, last);
        set_fault(run.phone(), call);
        const StepResult result = run.run_entry_point(scenario.steps[last].rest);
        for (std::string &line : outcome(call, result, good, look(run, result)))
            lines.push_back(std::move(line));
    }
    return lines;
}

// One phone on which the steps behind `again` are done again and again.
class RepeatedRun {
  public:
    explicit RepeatedRun(const Scenario &scenario)
        : scenario_{scenario}, first_{last_of(scenario, "again")}, last_{last_run(scenario)}, run_{scenario} {
        prepare(scenario, run_, 0, first_);
        once(nullptr); // what the first run makes, the second one finds
    }

    Phone &phone() { return run_.phone(); }

    // With the fault of a call, or undisturbed.
    std::pair<StepResult, PhoneState> once(const Call *call) {
        prepare(scenario_, run_, first_ + 1, last_);
        if (call) set_fault(phone(), *call);
        StepResult result = run_.run_entry_point(scenario_.steps[last_].rest);
        phone().call("fault-clear");
        if (!call) must_end_normally(result);
        PhoneState state = look(run_, result);
        for (const char *log : {"run-log", "system-log"})
            drop_earlier_lines(state, log);
        return {std::move(result), std::move(state)};
    }

  private:
    void drop_earlier_lines(PhoneState &state, const std::string &log) {
        const auto found = state.find(log);
        if (found == state.end()) return;
        const std::size_t earlier = std::exchange(log_sizes_[log], found->second.size());
        found->second.erase(found->second.begin(), found->second.begin() + static_cast<std::ptrdiff_t>(earlier));
        if (found->second.empty()) state.erase(found);
    }

    const Scenario &scenario_;
    std::size_t first_;
    std::size_t last_;
    ScenarioRun run_;
    std::map<std::string, std::size_t> log_sizes_;
};

Lines all_on_one_phone(const Scenario &scenario) {
    RepeatedRun run{scenario};
    run.phone().call("journal-start");
    const PhoneState good = run.once(nullptr).second;
    run.phone().call("journal-stop");
    Lines lines;
    for (const Call &call : journalled_calls(scenario, run.phone())) {
        const auto [result, state] = run.once(&call);
        for (std::string &line : outcome(call, result, good, state))
            lines.push_back(std::move(line));
        for (const std::string &line : state_difference(good, run.once(nullptr).second))
            lines.push_back("!! after the next run: " + line);
    }
    return lines;
}

} // namespace

int main(int argc, char **argv) try {
    if (argc != 2) {
        std::fprintf(stderr, "usage: zel-fault-loop FOLDER\n");
        return 2;
    }
    const Scenario scenario = read_scenario(argv[1]);
    PhoneState faults;
    Lines &lines = faults["faults"];
    lines = is_repeated(scenario) ? all_on_one_phone(scenario) : each_on_a_phone_of_its_own(scenario);
    const auto starts = [&](const char *mark) {
        return std::count_if(lines.begin(), lines.end(),
                             [=](const std::string &line) { return line.starts_with(mark); });
    };
    std::printf("%td calls failed once each\n", starts("=="));
    const int differing = compare_with_golden(faults, scenario.folder / "expected");
    return differing == 0 && starts("!!") == 0 ? 0 : 1;
} catch (const std::exception &failure) {
    std::fprintf(stderr, "zel-fault-loop: %s\n", failure.what());
    return 1;
}
