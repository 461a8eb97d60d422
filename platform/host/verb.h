#pragma once
// The verbs of the bench phone: what zel_host_call() and `zel phone VERB` can do, a row each.

#include "phone.h"

#include <initializer_list>
#include <nlohmann/json.hpp>
#include <span>
#include <stdexcept>
#include <string>

namespace zel_host {

using Json = nlohmann::json;

enum class ArgumentType { Text, Integer, Boolean };

struct Argument {
    const char *name; // "product-code"; on the command line --product-code
    ArgumentType type = ArgumentType::Text;
    bool required = false;
    const char *help;
};

struct Verb {
    const char *name;
    const char *help;
    std::span<const Argument> arguments;
    Json (*run)(Phone &phone, const Json &arguments) = nullptr;
    Json (*run_without_phone)(const Json &arguments) = nullptr;
};

// A verb throws one of these; everything else that it throws counts as failed.
class VerbFailed : public std::runtime_error {
    using std::runtime_error::runtime_error;
};
class WrongArguments : public std::runtime_error {
    using std::runtime_error::runtime_error;
};

// All rows; each file of verbs has its own.
std::span<const Verb> phone_verbs();
std::span<const Verb> file_verbs();
std::span<const Verb> key_verbs();
std::span<const Verb> clock_verbs();
std::span<const Verb> log_verbs();
std::span<const Verb> fault_verbs();
std::span<const Verb> tool_verbs();
std::span<const Verb> sim_verbs();
std::span<const Verb> service_verbs();
std::span<const Verb> application_verbs();
std::span<const std::span<const Verb>> all_verbs();

const Verb *find_verb(std::string_view name);
// Throws WrongArguments unless the arguments are those of the row.
void check_arguments(const Verb &verb, const Json &arguments);

// A checked argument, or what stands for an absent one.
std::string text_of(const Json &arguments, const char *name, const std::string &otherwise = {});
std::int64_t number_of(const Json &arguments, const char *name, std::int64_t otherwise = 0);
bool flag_of(const Json &arguments, const char *name);

} // namespace zel_host
