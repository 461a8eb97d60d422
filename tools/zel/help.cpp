#include "help.h"

#include "command-table.h"

#include <algorithm>
#include <sstream>

namespace zel_command {
namespace {

constexpr std::size_t kIndent = 2;
constexpr std::size_t kLeftColumn = 26; // names, before the text that explains them

// Breaks a text at blanks so that lines end before the help's width, all but the first behind `indent` blanks.
std::string wrapped(const std::string &text, std::size_t indent, std::size_t used) {
    std::string result;
    std::size_t column = used;
    std::istringstream words{text};
    for (std::string word; words >> word;) {
        const bool first = column == indent || column == 0;
        if (!first && column + 1 + word.size() > kHelpWidth) {
            result += "\n" + std::string(indent, ' ');
            column = indent;
        } else if (!first) {
            result += ' ';
            ++column;
        }
        result += word;
        column += word.size();
    }
    return result;
}

std::string paragraphs(const std::string &text) {
    std::string result;
    std::istringstream lines{text};
    for (std::string line; std::getline(lines, line);)
        result += (line.empty() || line[0] != ' ' ? wrapped(line, 0, 0) : line) + "\n";
    return result;
}

// A name on the left, its text in a column on the right, or below it when the name is too long.
std::string entry(const std::string &name, const std::string &text) {
    std::string line = std::string(kIndent, ' ') + name;
    if (line.size() + 2 > kLeftColumn)
        line += "\n" + std::string(kLeftColumn, ' ');
    else
        line.append(kLeftColumn - line.size(), ' ');
    return line + wrapped(text, kLeftColumn, kLeftColumn) + "\n";
}

std::string word_of(const Parameter &parameter) {
    if (parameter.form == Parameter::Form::kPositional)
        return parameter.required ? parameter.name : "[" + parameter.name + "]";
    const std::string value = parameter.value.empty() ? "" : " " + parameter.value;
    return parameter.required ? "--" + parameter.name + value : "[--" + parameter.name + value + "]";
}

// "[--package DIR]" is not broken at its blank.
std::string wrapped_usage(const Command &command) {
    const std::string start = "zel " + command.name;
    std::string result = start;
    std::size_t column = 7 + start.size();
    for (const Parameter &parameter : command.parameters) {
        const std::string word = word_of(parameter);
        if (column + 1 + word.size() > kHelpWidth) {
            result += "\n" + std::string(10, ' ');
            column = 10;
        }
        result += " " + word;
        column += 1 + word.size();
    }
    return result;
}

std::string list_of(const std::vector<Parameter> &parameters, bool positionals) {
    std::string result;
    for (const Parameter &parameter : parameters) {
        const bool is_positional = parameter.form == Parameter::Form::kPositional;
        if (is_positional != positionals) continue;
        result += entry(is_positional ? parameter.name : typed_option(parameter), parameter.help);
    }
    return result;
}

std::string titled(const std::string &title, const std::string &list) {
    return list.empty() ? "" : "\n" + title + ":\n" + list;
}

std::string short_usage(const Command &command) {
    std::string result = command.name;
    for (const Parameter &parameter : command.parameters)
        if (parameter.form == Parameter::Form::kPositional) result += " " + word_of(parameter);
    return result;
}

std::vector<std::string> groups() {
    std::vector<std::string> result;
    for (const Command &command : command_table()) {
        std::string group{command.group()};
        if (command.is_grouped() && std::find(result.begin(), result.end(), group) == result.end())
            result.push_back(std::move(group));
    }
    return result;
}

} // namespace

std::string typed_option(const Parameter &parameter) {
    const std::string dashed = "--" + parameter.name + (parameter.value.empty() ? "" : " " + parameter.value);
    return parameter.letter.empty() ? dashed : "-" + parameter.letter + ", " + dashed;
}

std::string usage_of(const Command &command) {
    std::string result = "zel " + command.name;
    for (const Parameter &parameter : command.parameters)
        result += " " + word_of(parameter);
    return result;
}

std::string help_of(const Command &command) {
    std::string result = "usage: " + wrapped_usage(command) + "\n\n" + wrapped(command.help, 0, 0) + "\n";
    if (!command.more.empty()) result += "\n" + paragraphs(command.more);
    result += titled("arguments", list_of(command.parameters, true));
    result += titled("options", list_of(command.parameters, false));
    return result + titled("options of every command", list_of(common_options(), false));
}

std::string help_of_group(std::string_view group) {
    std::string list;
    for (const Command &command : command_table())
        if (command.is_grouped() && command.group() == group) list += entry(short_usage(command), command.help);
    const std::string name{group};
    return "usage: zel " + name + " VERB ...\n" + titled("verbs", list) + "\n" +
           wrapped("'zel " + name + " VERB --help' tells more about one verb.", 0, 0) + "\n";
}

std::string help_of_all() {
    std::string single;
    std::string grouped;
    for (const Command &command : command_table())
        if (!command.is_grouped()) single += entry(short_usage(command), command.help);
    for (const std::string &group : groups()) {
        std::string verbs;
        for (const Command &command : command_table())
            if (command.is_grouped() && command.group() == group)
                verbs += (verbs.empty() ? "" : ", ") + std::string{command.last_word()};
        grouped += entry(group + " VERB", verbs);
    }
    return "usage: zel [--root DIR] COMMAND ...\n\n" +
           wrapped("Turns a blank phone into the phone of one mobile operator. The phone lives in a folder of this "
                   "workstation; nothing outside that folder is touched.",
                   0, 0) +
           "\n" + titled("commands", single) + titled("commands with verbs", grouped) +
           titled("options of every command", list_of(common_options(), false)) +
           "\nexit codes:\n  0 done, 1 failed, 2 wrong usage, 3 no phone, 4 verification found differences\n\n" +
           "'zel COMMAND --help' tells more about one command.\n";
}

} // namespace zel_command
