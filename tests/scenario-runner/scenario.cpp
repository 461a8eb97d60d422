#include "scenario.h"

#include <array>
#include <cstdio>
#include <fstream>
#include <iterator>
#include <sstream>
#include <stdexcept>
#include <sys/wait.h>

namespace zel_scenario {

namespace {

namespace fs = std::filesystem;

// The phone's clock stands still, so that laps and times are the same in every run.
constexpr const char *kFrozenTime = "2026-01-05T08:00:00";

Json create_arguments(const Scenario &scenario) {
    if (scenario.steps.empty() || scenario.steps.front().word != "create") return Json::object();
    return Json::parse(scenario.steps.front().rest);
}

std::pair<std::string, std::string> split(const std::string &text) {
    const std::size_t blank = text.find(' ');
    if (blank == std::string::npos) return {text, ""};
    return {text.substr(0, blank), text.substr(blank + 1)};
}

std::string unescaped(const std::string &text) {
    std::string bytes;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const bool escape = text[i] == '\\' && i + 1 < text.size();
        if (!escape) {
            bytes += text[i];
            continue;
        }
        const char next = text[++i];
        bytes += next == 'n' ? '\n' : next == '0' ? '\0' : next;
    }
    return bytes;
}

void write_outside(const fs::path &path, const std::string &bytes) {
    fs::create_directories(path.parent_path());
    std::ofstream file{path, std::ios::binary | std::ios::trunc};
    file << bytes;
    if (!file.flush()) throw std::runtime_error(path.string() + ": not written");
}

} // namespace

Scenario read_scenario(const fs::path &folder) {
    std::ifstream file{folder / "steps"};
    if (!file) throw std::runtime_error(folder.string() + ": no file `steps`");
    Scenario scenario{folder, {}};
    for (std::string line; std::getline(file, line);) {
        if (line.empty() || line.front() == '#') continue;
        const auto [word, rest] = split(line);
        scenario.steps.push_back({word, rest});
    }
    return scenario;
}

ScenarioRun::ScenarioRun(const Scenario &scenario) : scenario_{scenario}, phone_{create_arguments(scenario)} {
    phone_.call("clock", {{"stop", kFrozenTime}});
    const fs::path before = scenario.folder / "phone-before";
    if (fs::exists(before))
        fs::copy(before, phone_.root(), fs::copy_options::recursive | fs::copy_options::overwrite_existing);
}

void ScenarioRun::do_step(const ScenarioStep &step) {
    if (step.word == "create" || step.word == "fail" || step.word == "again") return;
    if (step.word == "package") {
        const fs::path package =
            step.rest == "example" ? fs::path{ZEL_SOURCE_DIR} / "examples/package" : scenario_.folder / step.rest;
        phone_.call("package", {{"folder", package.string()}});
    } else if (step.word == "call") {
        const auto [verb, arguments] = split(step.rest);
        phone_.call(verb, arguments.empty() ? Json::object() : Json::parse(arguments));
    } else if (step.word == "touch") {
        const auto [path, text] = split(step.rest);
        write_outside(phone_.outside(path), unescaped(text));
    } else if (step.word == "restart") {
        phone_.call("reboot");
    } else if (step.word == "run") {
        run_entry_point(step.rest);
    } else if (step.word == "show") {
        const auto [section, text] = split(step.rest);
        show(section, text);
    } else {
        throw std::runtime_error("unknown step: " + step.word);
    }
}

void ScenarioRun::show(const std::string &section, const std::string &text) {
    output_ += "# " + section + (text.empty() ? "" : " " + text) + "\n";
    const std::vector<std::string> lines = read_state(phone_)[section];
    for (const std::string &line : lines)
        if (line.find(text) != std::string::npos) output_ += line + "\n";
}

StepResult ScenarioRun::run_entry_point(const std::string &words) {
    const std::string command =
        "ZEL_ROOT='" + phone_.root() + "' TZ=UTC LC_ALL=C.UTF-8 '" ZEL_STEP "' " + words + " 2>&1";
    FILE *pipe = popen(command.c_str(), "r");
    if (!pipe) throw std::runtime_error("popen failed");
    StepResult result;
    std::array<char, 4096> chunk;
    while (const std::size_t got = fread(chunk.data(), 1, chunk.size(), pipe))
        result.output.append(chunk.data(), got);
    const int status = pclose(pipe);
    result.ended_normally = status == 0;
    result.how = WIFSIGNALED(status) ? "signal " + std::to_string(WTERMSIG(status))
                                     : "exit " + std::to_string(WEXITSTATUS(status));
    output_ += "$ " + words + "\n" + result.output;
    if (!result.ended_normally) output_ += "(" + result.how + ")\n";
    ended_normally_ = ended_normally_ && result.ended_normally;
    return result;
}

} // namespace zel_scenario
