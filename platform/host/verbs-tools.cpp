#include "text.h"
#include "tool-behaviour.h"
#include "tools.h"
#include "verb.h"

namespace zel_host {
namespace {

constexpr std::int64_t kLargestStatus = 255;

Json shown(const Tool &tool) {
    Json result{{"status", tool.exit_status}};
    put_text(result, "path", tool.path);
    put_text(result, "file", tool.file);
    put_text(result, "content", tool.content);
    put_text(result, "does", tool.does);
    return result;
}

Json add(Phone &phone, const Json &arguments) {
    const std::int64_t status = number_of(arguments, "status");
    if (status < 0 || status > kLargestStatus) throw WrongArguments("an exit status is 0 to 255");
    const Tool tool{.path = text_of(arguments, "path"),
                    .exit_status = static_cast<int>(status),
                    .file = text_of(arguments, "file"),
                    .content = text_of(arguments, "content"),
                    .does = text_of(arguments, "does")};
    if (tool.path.empty()) throw WrongArguments("a tool has a path");
    if (!tool.does.empty() && find_behaviour(tool.does) == nullptr)
        throw WrongArguments("no tool does '" + tool.does + "'");
    add_tool(phone, tool);
    return shown(tool);
}

Json list(Phone &phone, const Json & /*arguments*/) {
    Json tools = Json::array();
    each_tool(phone, [&tools](const Tool &tool) { tools.push_back(shown(tool)); });
    return {{"tools", std::move(tools)}};
}

Json remove(Phone &phone, const Json &arguments) {
    const std::string path = text_of(arguments, "path");
    Json result{{"existed", remove_tool(phone, path)}};
    put_text(result, "path", path);
    return result;
}

constexpr Argument kAddArguments[] = {
    {.name = "path", .required = true, .help = "First word of the commands that it answers"},
    {.name = "status", .type = ArgumentType::Integer, .help = "Its exit status, 0 without it"},
    {.name = "file", .help = "Phone path that it writes, or the option before that path"},
    {.name = "content", .help = "What it writes there"},
    {.name = "does", .help = "What else it does: install-list, disable or uninstall"},
};
constexpr Argument kRemoveArguments[] = {{.name = "path", .required = true, .help = "Path of the tool"}};

constexpr Verb kVerbs[] = {
    {.name = "tool-add", .help = "Register a tool that answers commands", .arguments = kAddArguments, .run = add},
    {.name = "tool-list", .help = "Show the registered tools", .run = list},
    {.name = "tool-remove", .help = "Forget a tool", .arguments = kRemoveArguments, .run = remove},
};

} // namespace

std::span<const Verb> tool_verbs() { return kVerbs; }

} // namespace zel_host
