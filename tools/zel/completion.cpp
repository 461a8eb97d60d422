// A completion script for bash, made from the command table.

#include "command-table.h"
#include "commands.h"
#include "output.h"

#include <map>

namespace zel_command {
namespace {

void append_word(std::string &words, std::string_view word) {
    if (!words.empty()) words += ' ';
    words += word;
}

std::string options_of(const std::vector<Parameter> &parameters) {
    std::string words;
    for (const Parameter &parameter : parameters)
        if (parameter.form != Parameter::Form::kPositional) append_word(words, "--" + parameter.name);
    return words;
}

std::string case_line(const std::string &pattern, const std::string &words) {
    return "        " + pattern + ") words=\"" + words + "\" ;;\n";
}

constexpr const char *kHead = R"(# bash completion of zel; load it with: source <(zel completion bash)
_zel() {
    local current=${COMP_WORDS[COMP_CWORD]} command= word skip= words
    for word in "${COMP_WORDS[@]:1:COMP_CWORD-1}"; do
        if [[ -n $skip ]]; then skip=; continue; fi
        case $word in
        --root) skip=1 ;;
        -*) ;;
        *) command="${command:+$command }$word" ;;
        esac
    done
    case $command in
)";

constexpr const char *kTail = R"(        *) words= ;;
    esac
    COMPREPLY=($(compgen -W "$words" -- "$current"))
    [[ ${#COMPREPLY[@]} -gt 0 ]] || compopt -o default
}
complete -F _zel zel
)";

} // namespace

int completion_bash(Invocation &) {
    std::string first;
    std::map<std::string, std::string> verbs;
    std::string rows;
    for (const Command &command : command_table()) {
        const std::string group{command.group()};
        if (!command.is_grouped() || verbs[group].empty()) append_word(first, group);
        if (command.is_grouped()) append_word(verbs[group], command.last_word());
        rows += case_line("\"" + command.name + "\"|\"" + command.name + " \"*",
                          options_of(command.parameters) + " " + options_of(common_options()) + " --help");
    }
    std::string script = kHead + case_line("\"\"", first + " --root --help --version");
    for (const auto &[group, words] : verbs)
        if (!words.empty()) script += case_line("\"" + group + "\"", words + " --help");
    print(script + rows + kTail);
    return kDone;
}

} // namespace zel_command
