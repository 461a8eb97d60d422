#include "program.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <regex>
#include <sstream>

extern char **environ;

namespace zel_test {
namespace {

std::string content_of(const std::string &path) {
    std::ifstream file{path, std::ios::binary};
    return {std::istreambuf_iterator<char>{file}, {}};
}

int spawned(const std::vector<std::string> &arguments, const posix_spawn_file_actions_t &actions) {
    std::vector<std::string> words{ZEL_PROGRAM};
    words.insert(words.end(), arguments.begin(), arguments.end());
    std::vector<char *> pointers;
    for (std::string &word : words)
        pointers.push_back(word.data());
    pointers.push_back(nullptr);
    pid_t process = 0;
    return posix_spawn(&process, ZEL_PROGRAM, &actions, nullptr, pointers.data(), environ) == 0 ? process : -1;
}

int exit_code_of(pid_t process) {
    int status = 0;
    if (process < 0 || waitpid(process, &status, 0) != process) return -1;
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

std::string all_from(int terminal) {
    std::string result;
    std::array<char, 4096> buffer{};
    for (ssize_t size = 0; (size = read(terminal, buffer.data(), buffer.size())) > 0;)
        result.append(buffer.data(), static_cast<std::size_t>(size));
    return result;
}

} // namespace

Outcome run_zel(const std::vector<std::string> &arguments) {
    const std::string folder = make_folder();
    const std::string out = folder + "/out";
    const std::string err = folder + "/err";
    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    posix_spawn_file_actions_addopen(&actions, STDOUT_FILENO, out.c_str(), O_WRONLY | O_CREAT, 0600);
    posix_spawn_file_actions_addopen(&actions, STDERR_FILENO, err.c_str(), O_WRONLY | O_CREAT, 0600);
    const int code = exit_code_of(spawned(arguments, actions));
    posix_spawn_file_actions_destroy(&actions);
    Outcome outcome{code, content_of(out), content_of(err)};
    remove_folder(folder);
    return outcome;
}

// A terminal is read until its other end closes, which gives an error.
Outcome run_zel_on_terminal(const std::vector<std::string> &arguments) {
    const int terminal = posix_openpt(O_RDWR | O_NOCTTY | O_CLOEXEC);
    if (terminal < 0 || grantpt(terminal) != 0 || unlockpt(terminal) != 0) return {};
    std::array<char, 128> name{};
    if (ptsname_r(terminal, name.data(), name.size()) != 0) return {};
    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    posix_spawn_file_actions_addopen(&actions, STDOUT_FILENO, name.data(), O_RDWR | O_NOCTTY, 0);
    const pid_t process = spawned(arguments, actions);
    posix_spawn_file_actions_destroy(&actions);
    Outcome outcome;
    outcome.out = all_from(terminal);
    outcome.code = exit_code_of(process);
    close(terminal);
    return outcome;
}

nlohmann::json ZelCommand::json_of(std::vector<std::string> arguments) {
    arguments.emplace_back("--json");
    const Outcome outcome = run_zel(arguments);
    EXPECT_EQ(outcome.code, 0) << outcome.err;
    EXPECT_EQ(outcome.err, "");
    nlohmann::json answer = nlohmann::json::parse(outcome.out, nullptr, false);
    EXPECT_FALSE(answer.is_discarded()) << outcome.out;
    return answer;
}

std::vector<KnownCommand> known_commands() {
    std::vector<KnownCommand> result;
    std::istringstream script{run_zel({"completion", "bash"}).out};
    const std::regex row{R"re( *"([a-z -]+)"\|"[a-z -]+ "\*\) words="(.*)" ;;)re"};
    for (std::string line; std::getline(script, line);) {
        std::smatch parts;
        if (!std::regex_match(line, parts, row)) continue;
        std::istringstream words{parts[2].str()};
        result.push_back({parts[1].str(), {std::istream_iterator<std::string>{words}, {}}});
    }
    return result;
}

} // namespace zel_test
