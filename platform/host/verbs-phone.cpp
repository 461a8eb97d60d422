#include "attributes.h"
#include "clock.h"
#include "create.h"
#include "record.h"
#include "system-log.h"
#include "text.h"
#include "verb.h"

#include <array>
#include <cstring>
#include <sys/stat.h>

namespace zel_host {
namespace {

constexpr std::int64_t kMostSlots = 2;

Json create(const Json &arguments) {
    const std::int64_t slots = number_of(arguments, "sims", 1);
    if (slots < 0 || slots > kMostSlots) throw WrongArguments("a phone has 0 to 2 SIM slots");
    NewPhone wanted{.root = text_of(arguments, "root"), .slots = static_cast<int>(slots), .product_code = {}};
    if (arguments.contains("product-code")) wanted.product_code = text_of(arguments, "product-code");
    const std::unique_ptr<Phone> phone = create_phone(wanted);
    return {{"root", printable(phone->path())}};
}

const char *word_for(ClockMode mode) {
    switch (mode) {
    case ClockMode::Runs:
        return "runs";
    case ClockMode::Shifted:
        return "set";
    case ClockMode::Stands:
        return "stands";
    }
    return "";
}

Json status(Phone &phone, const Json & /*arguments*/) {
    Json result{{"slots", recorded_number(phone, "slots", 1)},
                {"sim_states", Json::array()},
                {"clock", {{"mode", word_for(phone.page().clock_mode.load())}, {"us", now_us(phone)}}},
                {"display_locked", recorded_number(phone, "display_lock_1") != 0},
                {"toolkit_users", recorded_number(phone, "toolkit_users")},
                {"restarts", recorded_number(phone, "restarts")},
                {"restart_command", recorded_number(phone, "restart_command")},
                {"theme_kind", recorded_number(phone, "theme_kind")}};
    put_text(result, "root", phone.path());
    put_text(result, "theme_picture", recorded_text(phone, "theme_picture"));
    for (std::int64_t slot = 1; slot <= recorded_number(phone, "slots", 1); ++slot)
        result["sim_states"].push_back(recorded_number(phone, "sim_state_" + std::to_string(slot)));
    return result;
}

const char *kind_of(mode_t mode) {
    if (S_ISREG(mode)) return "file";
    if (S_ISDIR(mode)) return "folder";
    if (S_ISLNK(mode)) return "link";
    return "special";
}

Json stat_path(Phone &phone, const Json &arguments) {
    const std::string path = text_of(arguments, "path");
    const Place place = resolve(phone.folder(), path, Follow::NotLast);
    struct stat status {};
    if (!place.file || ::fstat(place.file.get(), &status) != 0)
        throw VerbFailed("'" + path + "': " + std::strerror(place.error));
    std::array<char, 5> mode{};
    std::snprintf(mode.data(), mode.size(), "%04o", status.st_mode & 07777U);
    const std::optional<Owner> owner = get_owner(phone, place.file.get());
    const std::optional<std::string> label = get_label(phone, place.file.get());
    Json result{{"kind", kind_of(status.st_mode)},
                {"mode", mode.data()},
                {"size", status.st_size},
                {"mtime", status.st_mtime},
                {"owner", owner ? Json(owner->user) : Json()},
                {"group", owner ? Json(owner->group) : Json()},
                {"label", nullptr}};
    put_text(result, "path", path);
    if (label) put_text(result, "label", *label);
    return result;
}

Json show_log(Phone &phone, const Json & /*arguments*/) {
    Json lines = Json::array();
    each_log_line(phone, [&lines](std::string_view line) {
        Json parsed = Json::parse(line, nullptr, false);
        if (!parsed.is_discarded()) lines.push_back(std::move(parsed));
    });
    return {{"lines", lines}};
}

constexpr Argument kCreateArguments[] = {
    {.name = "root", .required = true, .help = "The folder, empty or not there yet"},
    {.name = "sims", .type = ArgumentType::Integer, .help = "Number of SIM slots: 0, 1 (the default) or 2"},
    {.name = "product-code", .help = "Text of the product code file; none without it"},
};
constexpr Argument kPathArguments[] = {{.name = "path", .required = true, .help = "Path on the phone"}};

constexpr Verb kVerbs[] = {
    {.name = "create", .help = "Make a phone", .arguments = kCreateArguments, .run_without_phone = create},
    {.name = "status", .help = "Show slots, clock, display lock, theme and restarts", .run = status},
    {.name = "stat",
     .help = "Show one file's kind, mode, owner and label",
     .arguments = kPathArguments,
     .run = stat_path},
    {.name = "log", .help = "Show the system log", .run = show_log},
};

} // namespace

std::span<const Verb> phone_verbs() { return kVerbs; }

} // namespace zel_host
