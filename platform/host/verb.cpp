#include "verb.h"

#include <algorithm>

namespace zel_host {
namespace {

bool fits(const Json &value, ArgumentType type) {
    switch (type) {
    case ArgumentType::Text:
        return value.is_string();
    case ArgumentType::Integer:
        return value.is_number_integer();
    case ArgumentType::Boolean:
        return value.is_boolean();
    }
    return false;
}

const char *word_for(ArgumentType type) {
    switch (type) {
    case ArgumentType::Text:
        return "text";
    case ArgumentType::Integer:
        return "integer";
    case ArgumentType::Boolean:
        return "boolean";
    }
    return "";
}

Json described(const Verb &verb) {
    Json arguments = Json::array();
    for (const Argument &argument : verb.arguments)
        arguments.push_back({{"name", argument.name},
                             {"type", word_for(argument.type)},
                             {"required", argument.required},
                             {"help", argument.help}});
    return {{"name", verb.name}, {"help", verb.help}, {"arguments", arguments}, {"needs_phone", verb.run != nullptr}};
}

Json list_verbs(const Json & /*arguments*/) {
    Json list = Json::array();
    for (const std::span<const Verb> &group : all_verbs())
        for (const Verb &verb : group)
            list.push_back(described(verb));
    return {{"verbs", list}};
}

constexpr Verb kOwnVerbs[] = {
    {.name = "verbs", .help = "List these verbs with their arguments", .run_without_phone = list_verbs},
};

} // namespace

std::span<const std::span<const Verb>> all_verbs() {
    static const std::span<const Verb> groups[] = {phone_verbs(),   file_verbs(),        key_verbs(),  clock_verbs(),
                                                   log_verbs(),     fault_verbs(),       tool_verbs(), sim_verbs(),
                                                   service_verbs(), application_verbs(), kOwnVerbs};
    return groups;
}

const Verb *find_verb(std::string_view name) {
    for (const std::span<const Verb> &group : all_verbs())
        for (const Verb &verb : group)
            if (verb.name == name) return &verb;
    return nullptr;
}

void check_arguments(const Verb &verb, const Json &arguments) {
    if (!arguments.is_object()) throw WrongArguments("the arguments are no JSON object");
    for (const Argument &argument : verb.arguments) {
        const auto found = arguments.find(argument.name);
        if (found == arguments.end() && !argument.required) continue;
        if (found == arguments.end()) throw WrongArguments(std::string("missing argument '") + argument.name + "'");
        if (!fits(*found, argument.type))
            throw WrongArguments(std::string("argument '") + argument.name + "' is no " + word_for(argument.type));
    }
    for (const auto &[name, value] : arguments.items()) {
        const bool known = std::any_of(verb.arguments.begin(), verb.arguments.end(),
                                       [&name = name](const Argument &argument) { return name == argument.name; });
        if (!known) throw WrongArguments("unknown argument '" + name + "'");
    }
}

std::string text_of(const Json &arguments, const char *name, const std::string &otherwise) {
    return arguments.value(name, otherwise);
}

std::int64_t number_of(const Json &arguments, const char *name, std::int64_t otherwise) {
    return arguments.value(name, otherwise);
}

bool flag_of(const Json &arguments, const char *name) { return arguments.value(name, false); }

} // namespace zel_host
