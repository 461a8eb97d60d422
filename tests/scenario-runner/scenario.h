#pragma once
// A scenario: a folder that tells what a phone is like before, what is done with it, and what it holds then.
//
//     NAME/steps          one step a line:
//         create {"sims": 2}             arguments of the phone's creation (first line; optional)
//         package example                the example package, or the folder `package/` of this scenario
//         call vconf-set {"key": ...}    any verb of the bench phone
//         touch PATH TEXT                a file of the phone, written from outside ("\n" and "\0" are escapes)
//         run config XFV                 an entry point, in a process of its own; what it prints is kept
//         show keys /zel/sim             a section of the phone's state as it is now, or its lines with a text,
//                                        kept with what is printed
//         restart                        the phone restarts
//         fail bookmark_zel_ sync_       a fault loop fails only functions that begin so; all without it
//         again                          a fault loop does what follows for each fault, all on one phone
//     NAME/phone-before/  files laid into the phone's root before the first step
//     NAME/package/       a package of the scenario's own
//     NAME/expected/      golden files, one a section of the phone's state, plus `output`
//
// Sections without a golden file are not compared; ZEL_GOLDEN=update writes those that the folder has and
// shows what changed (ZEL_GOLDEN=all writes every section).

#include "phone-state.h"

#include <filesystem>
#include <string>
#include <vector>

namespace zel_scenario {

struct ScenarioStep {
    std::string word;
    std::string rest;
};

struct Scenario {
    std::filesystem::path folder;
    std::vector<ScenarioStep> steps;
};

Scenario read_scenario(const std::filesystem::path &folder);

struct StepResult {
    bool ended_normally = true; // not by a signal, and with exit status 0
    std::string how;            // "exit 1", "signal 11"
    std::string output;
};

// A phone as the scenario wants it, before any step that runs an entry point.
class ScenarioRun {
  public:
    explicit ScenarioRun(const Scenario &scenario);

    void do_step(const ScenarioStep &step);
    StepResult run_entry_point(const std::string &words);
    void show(const std::string &section, const std::string &text);

    Phone &phone() { return phone_; }
    // What the entry points printed, each behind a line "$ WORDS".
    [[nodiscard]] const std::string &output() const { return output_; }
    [[nodiscard]] bool ended_normally() const { return ended_normally_; }

  private:
    const Scenario &scenario_;
    Phone phone_;
    std::string output_;
    bool ended_normally_ = true;
};

} // namespace zel_scenario
