#include "journal.h"
#include "system-log.h"
#include "verb.h"

namespace zel_host {
namespace {

Json show_log(Phone &phone, const Json & /*arguments*/) {
    Json lines = Json::array();
    each_log_line(phone, [&lines](std::string_view line) {
        Json parsed = Json::parse(line, nullptr, false);
        if (!parsed.is_discarded()) lines.push_back(std::move(parsed));
    });
    return {{"lines", std::move(lines)}};
}

Json start(Phone &phone, const Json & /*arguments*/) {
    phone.page().journal_on.store(1);
    return Json::object();
}

Json stop(Phone &phone, const Json & /*arguments*/) {
    phone.page().journal_on.store(0);
    return Json::object();
}

Json list(Phone &phone, const Json & /*arguments*/) {
    Json calls = Json::array();
    each_call(phone, [&calls](std::string_view function, std::string_view arguments) {
        const Function *row = find_function(function);
        Json call{{"function", function}, {"arguments", Json::parse(arguments)}, {"text", nullptr}};
        if (row != nullptr && row->text >= 0) call["text"] = call["arguments"].at(static_cast<std::size_t>(row->text));
        calls.push_back(std::move(call));
    });
    return {{"calls", std::move(calls)}};
}

Json clear(Phone &phone, const Json & /*arguments*/) {
    clear_journal(phone);
    return Json::object();
}

constexpr Verb kVerbs[] = {
    {.name = "log", .help = "Show the system log", .run = show_log},
    {.name = "journal-start", .help = "Note all calls of the platform from now on", .run = start},
    {.name = "journal-stop", .help = "Stop noting calls", .run = stop},
    {.name = "journal-list", .help = "Show the calls noted, with arguments", .run = list},
    {.name = "journal-clear", .help = "Forget the calls noted", .run = clear},
};

} // namespace

std::span<const Verb> log_verbs() { return kVerbs; }

} // namespace zel_host
