#include "phone.h"

#include "support/temporary-folder.h"

#include <filesystem>
#include <stdexcept>

namespace zel_scenario {

namespace {

Json called(zel_host_phone *phone, const std::string &verb, const Json &arguments) {
    char *text = nullptr;
    const int result = zel_host_call(phone, verb.c_str(), arguments.dump().c_str(), &text);
    const std::string answer = text ? text : "";
    zel_host_free(text);
    if (result != 0) throw std::runtime_error(verb + " " + arguments.dump() + ": " + answer);
    return answer.empty() ? Json::object() : Json::parse(answer);
}

} // namespace

Phone::Phone(const Json &create_arguments) {
    root_ = zel_test::make_temporary_folder();
    Json arguments = create_arguments;
    arguments["root"] = root_;
    called(nullptr, "create", arguments);
    char *error = nullptr;
    phone_ = zel_host_open(root_.c_str(), &error);
    const std::string why = error ? error : "";
    zel_host_free(error);
    if (!phone_) throw std::runtime_error(root_ + ": " + why);
}

Phone::~Phone() {
    zel_host_close(phone_);
    std::error_code ignored;
    std::filesystem::remove_all(root_, ignored);
}

Json Phone::call(const std::string &verb, const Json &arguments) { return called(phone_, verb, arguments); }

} // namespace zel_scenario
