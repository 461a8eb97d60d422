#include "phone.h"

#include "failure.h"

#include <unistd.h>

namespace zel_command {
namespace {

struct FreeText {
    void operator()(char *text) const { zel_host_free(text); }
};
using HostText = std::unique_ptr<char, FreeText>;

std::string error_in(const Json &answer) {
    const auto error = answer.find("error");
    return error != answer.end() && error->is_string() ? error->get<std::string>() : "no reason given";
}

} // namespace

Phone Phone::open(const std::string &root) {
    char *error = nullptr;
    Phone phone;
    phone.phone_.reset(zel_host_open(root.c_str(), &error));
    const HostText owned{error};
    if (phone.phone_) return phone;
    throw Failure{kNoRoot, error != nullptr ? error : "cannot open the phone in '" + root + "'",
                  "Make one with 'zel --root DIR phone create', DIR being a new or empty folder."};
}

void Phone::lock(const std::string &command) const {
    Json answer;
    const std::string holder = "'zel " + command + "', process " + std::to_string(getpid());
    if (try_call("lock", {{"holder", holder}}, answer) == 0) return;
    throw Failure{kFailed, command + ": cannot lock the phone: " + error_in(answer),
                  "Wait until it has finished, or work on another phone."};
}

int Phone::try_call(const std::string &verb, const Json &arguments, Json &answer) const {
    const std::string text = arguments.dump(-1, ' ', false, Json::error_handler_t::replace);
    char *raw = nullptr;
    const int result = zel_host_call(phone_.get(), verb.c_str(), text.c_str(), &raw);
    const HostText owned{raw};
    answer = Json::parse(raw ? raw : "null", nullptr, false);
    return result;
}

Json Phone::call(const std::string &verb, const Json &arguments) const {
    Json answer;
    const int result = try_call(verb, arguments, answer);
    if (result == 0) return answer;
    throw Failure{result == 2 ? kUsage : kFailed, "phone " + verb + ": " + error_in(answer)};
}

} // namespace zel_command
