#include "command-line.h"

#include "command-table.h"
#include "help.h"
#include "output.h"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <deque>

namespace zel_command {
namespace {

// Where the parser puts what it reads: the values of one parameter of one row.
struct Slot {
    const Command *command;
    const Parameter *parameter;
    CLI::Option *option;
    std::string text;
};

// An option may have a letter. A required argument of a bench phone's verb may also be typed as the option that the
// verb's table calls it.
std::string spelling_of(const Parameter &parameter) {
    const std::string letter = parameter.letter.empty() ? "" : "-" + parameter.letter + ",";
    if (parameter.form == Parameter::Form::kOption) return letter + "--" + parameter.name;
    return parameter.argument.empty() ? parameter.name : parameter.name + ",--" + parameter.argument;
}

// The parser only says that a command is required; the user wants to know which word was none.
std::string unknown_word(const std::string &group, const CLI::App &top) {
    const std::vector<std::string> rest = top.remaining(true);
    const auto word = std::find_if(rest.begin(), rest.end(),
                                   [](const std::string &text) { return !text.empty() && text.front() != '-'; });
    if (word != rest.end()) return "there is no command '" + group + *word + "'";
    return group.empty() ? "no command is given" : "'" + group.substr(0, group.size() - 1) + "' needs a verb";
}

class Grammar {
  public:
    explicit Grammar(Invocation &invocation);
    int parse(int argc, char **argv, Invocation &invocation);

  private:
    CLI::App *group_app(const std::string &group);
    void add_command(const Command &command);
    void add_parameter(CLI::App &app, const Command &command, const Parameter &parameter);
    [[nodiscard]] int usage_error(const CLI::ParseError &error);

    CLI::App app_;
    std::map<std::string, CLI::App *> groups_;
    std::vector<std::pair<CLI::App *, const Command *>> rows_;
    std::deque<Slot> slots_; // the parser keeps references to the texts
};

Grammar::Grammar(Invocation &invocation) {
    app_.name("zel");
    app_.set_help_flag("-h,--help");
    app_.set_version_flag("--version", std::string{"zel "} + ZEL_VERSION);
    app_.require_subcommand(1);
    app_.fallthrough();
    app_.formatter_fn([](const CLI::App *, const std::string &, CLI::AppFormatMode) { return help_of_all(); });
    app_.add_option("--root", invocation.root_option);
    app_.add_flag("--json", invocation.json);
    app_.add_flag("--reveal", invocation.reveal);
    app_.add_flag("-v,--verbose", invocation.verbose);
    for (const Command &command : command_table())
        add_command(command);
}

CLI::App *Grammar::group_app(const std::string &group) {
    CLI::App *&app = groups_[group];
    if (app != nullptr) return app;
    app = app_.add_subcommand(group);
    app->require_subcommand(1);
    app->fallthrough();
    app->formatter_fn(
        [group](const CLI::App *, const std::string &, CLI::AppFormatMode) { return help_of_group(group); });
    return app;
}

void Grammar::add_command(const Command &command) {
    CLI::App *parent = command.is_grouped() ? group_app(std::string{command.group()}) : &app_;
    CLI::App *app = parent->add_subcommand(std::string{command.last_word()});
    app->fallthrough();
    app->formatter_fn(
        [&command](const CLI::App *, const std::string &, CLI::AppFormatMode) { return help_of(command); });
    rows_.emplace_back(app, &command);
    for (const Parameter &parameter : command.parameters)
        add_parameter(*app, command, parameter);
}

void Grammar::add_parameter(CLI::App &app, const Command &command, const Parameter &parameter) {
    Slot &slot = slots_.emplace_back(Slot{&command, &parameter, nullptr, {}});
    if (parameter.form == Parameter::Form::kFlag) {
        slot.option = app.add_flag("--" + parameter.name);
        return;
    }
    slot.option = app.add_option(spelling_of(parameter), slot.text);
    slot.option->required(parameter.required);
    if (parameter.integer) slot.option->check(CLI::Validator{CLI::TypeValidator<long long>{"NUMBER"}});
}

int Grammar::usage_error(const CLI::ParseError &error) {
    std::string place = "zel";
    std::string message = app_.get_subcommands().empty() ? unknown_word({}, app_) : error.what();
    for (const auto &[group, app] : groups_) {
        if (!app->parsed()) continue;
        place = "zel " + group;
        if (app->get_subcommands().empty()) message = unknown_word(group + " ", app_);
    }
    for (const auto &[app, row] : rows_)
        if (app->parsed()) place = "zel " + row->name;
    report(escaped_line(message));
    report_plain("See '" + place + " --help'.");
    return kUsage;
}

int Grammar::parse(int argc, char **argv, Invocation &invocation) {
    try {
        app_.parse(argc, argv);
    } catch (const CLI::ParseError &error) {
        if (error.get_exit_code() != 0) return usage_error(error);
        app_.exit(error); // help or version, on standard output
        return kDone;
    }
    for (const auto &[app, row] : rows_)
        if (app->parsed()) invocation.command = row;
    for (const Slot &slot : slots_)
        if (slot.command == invocation.command && slot.option->count() > 0)
            invocation.values[slot.parameter->name] =
                slot.parameter->form == Parameter::Form::kFlag ? "true" : slot.text;
    return -1;
}

} // namespace

int parse_command_line(int argc, char **argv, Invocation &invocation) {
    if (argc > 1) return Grammar{invocation}.parse(argc, argv, invocation);
    report_plain(help_of_all());
    return kUsage;
}

} // namespace zel_command
