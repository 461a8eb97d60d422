#include "zel-host.h"

#include "export.h"
#include "verb.h"

#include <cstring>
#include <exception>

using namespace zel_host;

struct zel_host_phone {
    std::unique_ptr<Phone> phone;
};

namespace {

enum Outcome { kDone = 0, kFailed = 1, kUsage = 2 };

char *copy_of(const std::string &text) { return ::strdup(text.c_str()); }

Json parsed(const char *arguments) {
    if (arguments == nullptr) return Json::object();
    Json result = Json::parse(arguments, nullptr, false);
    if (result.is_discarded()) throw WrongArguments("the arguments are no JSON");
    return result;
}

Json run(zel_host_phone *phone, const char *name, const char *arguments) {
    const Verb *verb = name == nullptr ? nullptr : find_verb(name);
    if (verb == nullptr) throw WrongArguments(std::string("unknown verb '") + (name == nullptr ? "" : name) + "'");
    const Json values = parsed(arguments);
    check_arguments(*verb, values);
    if (verb->run == nullptr) return verb->run_without_phone(values);
    if (phone == nullptr) throw WrongArguments(std::string("the verb '") + name + "' needs a phone");
    return verb->run(*phone->phone, values);
}

Outcome run_caught(zel_host_phone *phone, const char *name, const char *arguments, Json &answer) {
    try {
        answer = run(phone, name, arguments);
        return kDone;
    } catch (const WrongArguments &error) {
        answer = {{"error", error.what()}};
        return kUsage;
    } catch (const std::exception &error) {
        answer = {{"error", error.what()}};
        return kFailed;
    }
}

} // namespace

ZEL_HOST_EXPORT zel_host_phone *zel_host_open(const char *root, char **error) {
    std::string reason = "no folder is named";
    try {
        if (error != nullptr) *error = nullptr;
        std::unique_ptr<Phone> phone = root == nullptr ? nullptr : Phone::open(root, reason);
        if (phone != nullptr) return new zel_host_phone{std::move(phone)};
        if (error != nullptr) *error = copy_of(reason);
    } catch (const std::exception &failure) {
        if (error != nullptr) *error = ::strdup(failure.what());
    }
    return nullptr;
}

ZEL_HOST_EXPORT void zel_host_close(zel_host_phone *phone) { delete phone; }

ZEL_HOST_EXPORT int zel_host_call(zel_host_phone *phone, const char *verb, const char *arguments, char **answer) {
    try {
        Json result;
        const Outcome outcome = run_caught(phone, verb, arguments, result);
        // Error texts may quote any bytes.
        if (answer != nullptr) *answer = copy_of(result.dump(-1, ' ', false, Json::error_handler_t::replace));
        return outcome;
    } catch (const std::exception &) {
        if (answer != nullptr) *answer = ::strdup("{\"error\":\"out of memory\"}");
        return kFailed;
    }
}

ZEL_HOST_EXPORT void zel_host_free(char *text) { ::free(text); }
