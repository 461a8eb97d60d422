// zel: a phone in a folder, and the operator's settings on it. One process does one command.

#include "command-line.h"
#include "failure.h"
#include "output.h"
#include "root.h"

#include <exception>

namespace {

using namespace zel_command;

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
    const int code = run_and_report(argc, argv);
    if (flush_output()) return code;
    report("cannot write to standard output; the output is incomplete");
    return code == kDone ? kFailed : code;
}
