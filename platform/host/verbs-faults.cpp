#include "fault.h"
#include "text.h"
#include "verb.h"

namespace zel_host {
namespace {

Json shown(const Fault &fault, std::int64_t seen) {
    Json result{{"id", fault.id},         {"function", fault.function}, {"from", fault.from}, {"times", fault.times},
                {"result", fault.result}, {"errno", fault.error},       {"seen", seen}};
    put_text(result, "text", fault.text);
    return result;
}

Json add(Phone &phone, const Json &arguments) {
    const std::string name = text_of(arguments, "function");
    const Function *row = find_function(name);
    if (row == nullptr) throw WrongArguments("the platform has no function '" + name + "'");
    Fault fault{.function = name,
                .text = text_of(arguments, "text"),
                .from = static_cast<int>(number_of(arguments, "from", 1)),
                .times = static_cast<int>(number_of(arguments, "times", -1)),
                .result = static_cast<int>(number_of(arguments, "result", row->result)),
                .error = static_cast<int>(number_of(arguments, "errno", EIO))};
    fault.id = add_fault(phone, fault);
    return shown(fault, 0);
}

Json list(Phone &phone, const Json & /*arguments*/) {
    Json faults = Json::array();
    each_fault(phone, [&faults](const Fault &fault, std::int64_t seen) { faults.push_back(shown(fault, seen)); });
    return {{"faults", faults}};
}

Json clear(Phone &phone, const Json & /*arguments*/) {
    clear_faults(phone);
    return Json::object();
}

constexpr Argument kAddArguments[] = {
    {.name = "function", .required = true, .help = "Name of the platform function"},
    {.name = "text", .help = "Only calls with this text argument (key, path, command); any without it"},
    {.name = "from", .type = ArgumentType::Integer, .help = "The first matching call that fails, from 1"},
    {.name = "times", .type = ArgumentType::Integer, .help = "How many calls fail; -1, the default: all"},
    {.name = "result", .type = ArgumentType::Integer, .help = "What a failed call returns"},
    {.name = "errno", .type = ArgumentType::Integer, .help = "errno after a failed call (default: EIO)"},
};

constexpr Verb kVerbs[] = {
    {.name = "fault-add", .help = "Make calls of a platform function fail", .arguments = kAddArguments, .run = add},
    {.name = "fault-list", .help = "Show the faults and how many calls matched each", .run = list},
    {.name = "fault-clear", .help = "Remove all faults", .run = clear},
};

} // namespace

std::span<const Verb> fault_verbs() { return kVerbs; }

} // namespace zel_host
