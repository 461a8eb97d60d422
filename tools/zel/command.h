#pragma once
// What a command is. The command line, help, completion and the manual page's test all read these rows.
//
//     {.name = "vconf get", .parameters = {positional("KEY", "the key")}, .help = "Print one key's value.",
//      .access = Access::kReads, .run = vconf_get},

#include <string>
#include <string_view>
#include <vector>

namespace zel_command {

// Scripts rely on these: they are in the manual page and never change.
enum ExitCode : int { kDone = 0, kFailed = 1, kUsage = 2, kNoRoot = 3, kDifferences = 4 };

// Whether a command needs a phone, and whether it changes it: one command at a time does.
enum class Access { kNone, kReads, kWrites };

struct Parameter {
    enum class Form { kPositional, kOption, kFlag };

    std::string name; // "CUSTOMER", or an option's name without its dashes
    std::string help;
    Form form = Form::kPositional;
    std::string value = {}; // what stands for an option's value in the help: "DIR"
    bool required = true;
    bool integer = false;      // the value must be a number
    std::string argument = {}; // of a bench phone's verb: the argument's own name
    std::string letter = {};   // an option's short name: "o"
};

inline Parameter positional(std::string name, std::string help) { return {std::move(name), std::move(help)}; }
inline Parameter optional_positional(std::string name, std::string help) {
    return {.name = std::move(name), .help = std::move(help), .required = false};
}
inline Parameter option(std::string name, std::string value, std::string help) {
    return {std::move(name), std::move(help), Parameter::Form::kOption, std::move(value), false};
}
inline Parameter flag(std::string name, std::string help) {
    return {.name = std::move(name), .help = std::move(help), .form = Parameter::Form::kFlag, .required = false};
}

inline Parameter with_letter(std::string letter, Parameter parameter) {
    parameter.letter = std::move(letter);
    return parameter;
}

class Invocation;

struct Command {
    std::string name; // one word or two: "install", "vconf get"
    std::vector<Parameter> parameters = {};
    std::string help;      // one line
    std::string more = {}; // further paragraphs of --help, separated by "\n"
    Access access = Access::kNone;
    int (*run)(Invocation &) = nullptr;
    std::string verb = {};   // of a row that stands for one verb of the bench phone
    bool makes_root = false; // the verb makes the folder that --root names

    [[nodiscard]] std::string_view group() const { return std::string_view{name}.substr(0, name.find(' ')); }
    [[nodiscard]] std::string_view last_word() const {
        const std::size_t space = name.find(' ');
        return space == std::string::npos ? std::string_view{name} : std::string_view{name}.substr(space + 1);
    }
    [[nodiscard]] bool is_grouped() const { return name.find(' ') != std::string::npos; }
};

// The options that every command takes.
const std::vector<Parameter> &common_options();

} // namespace zel_command
