// zel: a phone in a folder, and the operator's settings on it. One process does one command.

#include "command-line.h"
#include "failure.h"
#include "output.h"
#include "root.h"

#include <iniparser/iniparser.h>

#include <array>
#include <cstdarg>
#include <cstdio>
#include <exception>

namespace {

using namespace zel_command;

// The INI library shows the lines that it cannot read as they stand, and they may hold any bytes.
__attribute__((format(printf, 1, 2))) int report_ini_problem(const char *format, ...) {
    std::array<char, 1200> text{};
    va_list values;
    va_start(values, format);
    const int length = std::vsnprintf(text.data(), text.size(), format, values);
    va_end(values);
    std::string_view shown{text.data()};
    if (shown.ends_with('\n')) shown.remove_suffix(1);
    report_plain(shown);
    return length;
}

int run(int argc, char **argv) {
    Invocation invocation;
    const int parsed = parse_command_line(argc, argv, invocation);
    if (parsed >= 0) return parsed;

    const Command &command = *invocation.command;
    if (command.access != Access::kNone) {
        invocation.root = choose_root(invocation.root_option);
        invocation.phone = Phone::open(invocation.root);
    }
    if (command.access == Access::kWrites) invocation.phone.lock(command.name);
    return command.run(invocation);
}

int reported(const Failure &failure) {
    report(failure.what());
    if (!failure.next().empty()) report_plain(failure.next());
    return failure.code();
}

int run_and_report(int argc, char **argv) {
    try {
        return run(argc, argv);
    } catch (const Failure &failure) {
        return reported(failure);
    } catch (const std::exception &error) {
        report(error.what());
        return kFailed;
    }
}

} // namespace

int main(int argc, char **argv) {
    iniparser_set_error_callback(report_ini_problem);
    const int code = run_and_report(argc, argv);
    if (flush_output()) return code;
    report("cannot write to standard output; the output is incomplete");
    return code == kDone ? kFailed : code;
}
