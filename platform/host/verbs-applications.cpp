#include "applications.h"
#include "system-information.h"
#include "text.h"
#include "verb.h"

namespace zel_host {
namespace {

Json shown(const Application &application) {
    Json result;
    put_text(result, "name", application.name);
    put_text(result, "type", application.type);
    put_text(result, "state", application.state);
    put_text(result, "refusal", application.refusal);
    return result;
}

Json list(Phone &phone, const Json & /*arguments*/) {
    Json applications = Json::array();
    each_application(phone, [&applications](const Application &one) { applications.push_back(shown(one)); });
    return {{"applications", std::move(applications)}};
}

Json refuse(Phone &phone, const Json &arguments) {
    Application found = application(phone, text_of(arguments, "name"));
    if (found.name.empty()) throw WrongArguments("an application has a name");
    found.refusal = text_of(arguments, "answer");
    if (found.refusal.find_first_of("\"\n") != std::string::npos)
        throw WrongArguments("an answer is one line without quotes");
    if (found.refusal.size() > kLongestInResult) throw WrongArguments("an answer has at most 900 bytes");
    keep_application(phone, found);
    return shown(found);
}

Json information_of(Phone &phone) {
    Json result = Json::object();
    for (const InformationRow &row : kInformation) {
        const std::string name{row.name};
        const std::optional<std::string> text = information(phone, row);
        result[name] = nullptr;
        if (text) put_text(result, name, *text);
    }
    return result;
}

const InformationRow &information_row(const std::string &name) {
    for (const InformationRow &row : kInformation)
        if (row.name == name) return row;
    throw WrongArguments("a phone tells its model, platform-version and build-version");
}

Json set_system(Phone &phone, const Json &arguments) {
    const InformationRow &row = information_row(text_of(arguments, "name"));
    if (arguments.contains("text"))
        set_information(phone, row, text_of(arguments, "text"));
    else
        withhold_information(phone, row);
    return information_of(phone);
}

Json system(Phone &phone, const Json & /*arguments*/) { return information_of(phone); }

constexpr Argument kRefuseArguments[] = {
    {.name = "name", .required = true, .help = "Name of the application"},
    {.name = "answer", .help = "What the tools answer instead (\"fail\"); without it they obey again"},
};
constexpr Argument kSystemArguments[] = {
    {.name = "name", .required = true, .help = "model, platform-version or build-version"},
    {.name = "text", .help = "The new text; without it the phone does not tell"},
};

constexpr Verb kVerbs[] = {
    {.name = "app-list", .help = "Show the applications that the tools handled", .run = list},
    {.name = "app-refuse",
     .help = "Let the package tools refuse an application",
     .arguments = kRefuseArguments,
     .run = refuse},
    {.name = "system", .help = "Show model, platform version, build version", .run = system},
    {.name = "system-set",
     .help = "Change what the phone tells of itself",
     .arguments = kSystemArguments,
     .run = set_system},
};

} // namespace

std::span<const Verb> application_verbs() { return kVerbs; }

} // namespace zel_host
