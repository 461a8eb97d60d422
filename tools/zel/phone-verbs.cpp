#include "phone-verbs.h"

#include "answer-page.h"
#include "commands.h"
#include "root.h"

#include <algorithm>
#include <array>
#include <cstdlib>

namespace zel_command {
namespace {

// Verbs that only look: they run beside a command that changes the phone. Any other takes the phone's lock.
constexpr std::array<std::string_view, 13> kLookingVerbs{
    "app-list",  "system",     "status",     "stat",      "tree",      "read",         "log",
    "vconf-get", "vconf-list", "fault-list", "tool-list", "bookmarks", "sync-accounts"};

Access access_of(const std::string &verb, bool needs_phone) {
    if (!needs_phone) return Access::kNone;
    const bool looks = std::find(kLookingVerbs.begin(), kLookingVerbs.end(), verb) != kLookingVerbs.end();
    return looks ? Access::kReads : Access::kWrites;
}

std::string upper_case(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(),
                   [](char byte) { return byte >= 'a' && byte <= 'z' ? static_cast<char>(byte - 'a' + 'A') : byte; });
    return text;
}

Parameter parameter_of(const Json &argument) {
    const std::string name = argument.value("name", "");
    const std::string type = argument.value("type", "text");
    Parameter result{.name = name, .help = argument.value("help", ""), .required = argument.value("required", false)};
    result.argument = name;
    result.integer = type == "integer";
    result.form = type == "boolean" ? Parameter::Form::kFlag : Parameter::Form::kOption;
    if (type != "boolean") result.value = result.integer ? "N" : name == "package" ? "DIR" : "TEXT";
    if (!result.required || type == "boolean") return result;
    result.form = Parameter::Form::kPositional;
    result.name = upper_case(name);
    return result;
}

// Every command names the phone's folder by --root, so "create" needs no argument for it.
Command command_of(const Json &row) {
    const std::string verb = row.value("name", "");
    Command command{.name = "phone " + verb,
                    .help = row.value("help", "") + ".",
                    .access = access_of(verb, row.value("needs_phone", true)),
                    .run = phone_verb,
                    .verb = verb};
    for (const Json &argument : row.value("arguments", Json::array()))
        if (argument.value("name", "") != "root")
            command.parameters.push_back(parameter_of(argument));
        else
            command.makes_root = true;
    return command;
}

Json value_of(const Parameter &parameter, const std::string &text) {
    if (parameter.form == Parameter::Form::kFlag) return true;
    if (parameter.integer) return std::strtoll(text.c_str(), nullptr, 10);
    return text;
}

} // namespace

std::vector<Command> phone_verb_commands() {
    std::vector<Command> result;
    const Json answer = Phone{}.call("verbs");
    for (const Json &row : answer.at("verbs"))
        result.push_back(command_of(row));
    return result;
}

int phone_verb(Invocation &invocation) {
    const Command &command = *invocation.command;
    Json arguments = Json::object();
    if (command.makes_root) arguments["root"] = choose_root(invocation.root_option);
    for (const Parameter &parameter : command.parameters)
        if (invocation.has(parameter.name))
            arguments[parameter.argument] = value_of(parameter, invocation.value(parameter.name));
    const Json answer = invocation.phone.call(command.verb, arguments);
    if (invocation.json)
        print_json(answer);
    else
        print_answer(answer, invocation.reveal);
    return kDone;
}

} // namespace zel_command
