// The phone's logs.

#include "commands.h"
#include "failure.h"
#include "output.h"

#include <base/zel-svc-run-log.h>

#include <sstream>

namespace zel_command {
namespace {

void print_run_log_json(const std::string &text) {
    Json lines = Json::array();
    std::istringstream stream{text};
    for (std::string line; std::getline(stream, line);)
        put_text(lines.emplace_back(Json::object()), "line", line);
    print_json(lines);
}

int run_log(const Invocation &invocation) {
    Json answer;
    if (invocation.phone.try_call("read", {{"path", ZEL_SVC_RUN_LOG_PATH}}, answer) != 0)
        throw Failure{kFailed,
                      std::string{"cannot read "} + ZEL_SVC_RUN_LOG_PATH + " of the phone in '" + invocation.root +
                          "': " + bytes_of(answer, "error"),
                      "Nothing was installed on this phone yet; 'zel install CUSTOMER' writes this log."};
    const std::string text = bytes_of(answer, "content");
    if (invocation.json)
        print_run_log_json(text);
    else
        print(text);
    return kDone;
}

int system_log(const Invocation &invocation) {
    const Json messages = invocation.phone.call("log").at("lines");
    if (invocation.json) print_json(messages);
    if (invocation.json) return kDone;
    for (const Json &message : messages) {
        std::string text = bytes_of(message, "message");
        if (!text.ends_with('\n')) text += '\n';
        print(text);
    }
    return kDone;
}

} // namespace

int log(Invocation &invocation) { return invocation.has("system") ? system_log(invocation) : run_log(invocation); }

} // namespace zel_command
