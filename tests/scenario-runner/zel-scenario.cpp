// Plays one scenario folder and compares the phone with its golden files.

#include "golden.h"
#include "scenario.h"

#include <cstdio>
#include <exception>

int main(int argc, char **argv) try {
    using namespace zel_scenario;
    if (argc != 2) {
        std::fprintf(stderr, "usage: zel-scenario FOLDER\n");
        return 2;
    }
    const Scenario scenario = read_scenario(argv[1]);
    ScenarioRun run{scenario};
    for (const ScenarioStep &step : scenario.steps)
        run.do_step(step);
    PhoneState state = read_state(run.phone());
    state["output"] = lines_of(run.output());
    if (!run.ended_normally()) std::printf("an entry point did not end normally:\n%s", run.output().c_str());
    const int differing = compare_with_golden(state, scenario.folder / "expected");
    return differing == 0 && run.ended_normally() ? 0 : 1;
} catch (const std::exception &failure) {
    std::fprintf(stderr, "zel-scenario: %s\n", failure.what());
    return 1;
}
