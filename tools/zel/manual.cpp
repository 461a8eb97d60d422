// The manual page, zel.1, made from the command table. docs/man/zel.1 is this command's output.

#include "command-table.h"
#include "commands.h"
#include "help.h"
#include "output.h"

#include <sstream>

namespace zel_command {
namespace {

// Text for a line of its own: dashes as typed, no line taken for a request.
std::string roff(const std::string &text) {
    std::string result;
    for (const char byte : text) {
        if (byte == '\\') result += "\\e";
        if (byte == '-') result += '\\';
        if (byte != '\\') result += byte;
    }
    return (!result.empty() && (result[0] == '.' || result[0] == '\'') ? "\\&" : "") + result;
}

std::string roff_paragraphs(const std::string &text) {
    std::string result;
    std::istringstream lines{text};
    for (std::string line; std::getline(lines, line);)
        result += ".PP\n" + roff(line) + "\n";
    return result;
}

std::string definition(const std::string &term, const std::string &text) {
    return ".TP\n.B " + roff(term) + "\n" + roff(text) + "\n";
}

std::string parameters_section(const std::vector<Parameter> &parameters) {
    std::string result;
    for (const Parameter &parameter : parameters) {
        const bool is_positional = parameter.form == Parameter::Form::kPositional;
        result += definition(is_positional ? parameter.name : typed_option(parameter), parameter.help);
    }
    return result;
}

std::string command_section(const Command &command) {
    return ".SS " + roff(usage_of(command)) + "\n" + roff(command.help) + "\n" + roff_paragraphs(command.more) +
           parameters_section(command.parameters);
}

constexpr const char *kHead = R"(.TH ZEL 1
.SH NAME
zel \- turn a blank phone into the phone of one mobile operator
.SH SYNOPSIS
.B zel
[\-\-root DIR] COMMAND ...
.SH DESCRIPTION
Installs an operator's customisation package on a phone and looks at the result.
The phone is a folder of this workstation, made by
.BR "zel phone create" ;
nothing outside that folder is touched, and nothing that came with a package is executed.
.PP
Data goes to standard output, everything else to standard error.
Bytes that are no UTF\-8 show in JSON as U+FFFD; a second member NAME_hex then holds the exact bytes.
On terminals control bytes are escaped.
Lists, pages and terminals mask subscriber numbers (MSIN) and passwords: values of keys whose last part
contains "msin", "pwd" or "password".
.PP
A command that changes a phone locks it; a second one fails and says who holds it.
.SH OPTIONS OF EVERY COMMAND
)";

constexpr const char *kTail = R"(.SH EXIT STATUS
These numbers never change.
.TP
.B 0
Done.
.TP
.B 1
Failed. Of install, upgrade and boot also: the customer is not listed in the package, or its file is missing,
has no byte\-order mark, or ends in a syntax error.
.TP
.B 2
Wrong usage.
.TP
.B 3
No phone: none is named, or the folder holds none.
.TP
.B 4
A verification found differences.
.SH ENVIRONMENT
.TP
.B ZEL_ROOT
The phone's folder, unless \-\-root names one.
.SH EXAMPLES
.nf
zel \-\-root /tmp/phone phone create \-\-package my\-package
export ZEL_ROOT=/tmp/phone
zel install XFV
zel summary
zel vconf get db/zel/salescode
.fi
)";

} // namespace

int manual(Invocation &) {
    std::string page = kHead + parameters_section(common_options()) + ".SH COMMANDS\n";
    for (const Command &command : command_table())
        page += command_section(command);
    print(page + kTail);
    return kDone;
}

} // namespace zel_command
