#include "create.h"
#include "fault.h"
#include "keys.h"
#include "modem.h"
#include "package.h"
#include "phone-lock.h"
#include "record.h"
#include "text.h"
#include "verb.h"

namespace zel_host {
namespace {

constexpr const char *kForgotten[] = {"display_lock_1", "toolkit_users", "restart_command"};

Json shown(const Copied &copied) {
    return {{"files", copied.files}, {"folders", copied.folders}, {"links", copied.links}, {"skipped", copied.skipped}};
}

Json create(const Json &arguments) {
    const std::int64_t slots = number_of(arguments, "sims", 1);
    if (slots < 0 || slots > kMostModems) throw WrongArguments("a phone has 0 to 2 SIM slots");
    NewPhone wanted{.root = text_of(arguments, "root"), .slots = static_cast<int>(slots), .product_code = {}};
    if (arguments.contains("product-code")) wanted.product_code = text_of(arguments, "product-code");
    const std::unique_ptr<Phone> phone = create_phone(wanted);
    Json result{{"slots", slots}};
    put_text(result, "root", phone->path());
    if (arguments.contains("package"))
        result["package"] = shown(replace_package(*phone, text_of(arguments, "package")));
    return result;
}

Json package(Phone &phone, const Json &arguments) {
    return shown(replace_package(phone, text_of(arguments, "folder")));
}

Json status(Phone &phone, const Json & /*arguments*/) {
    Json result{{"slots", slot_count(phone)},
                {"sim_states", Json::array()},
                {"display_locked", recorded_number(phone, "display_lock_1") != 0},
                {"toolkit_users", recorded_number(phone, "toolkit_users")},
                {"boots", recorded_number(phone, "boots")},
                {"restarts_asked", recorded_number(phone, "restarts")},
                {"restart_command", recorded_number(phone, "restart_command")},
                {"theme_kind", recorded_number(phone, "theme_kind")},
                {"faults", any_faults(phone)},
                {"journal", phone.page().journal_on.load() != 0}};
    put_text(result, "root", phone.path());
    for (const char *name : {"theme_picture", "initial_keyboard", "active_keyboard", "time_zone"})
        put_text(result, name, recorded_text(phone, name));
    for (const Modem &modem : modems(phone))
        result["sim_states"].push_back(modem.state);
    return result;
}

Json restart(Phone &phone, const Json & /*arguments*/) {
    Transaction transaction(phone.store());
    unset_keys(phone, kMemoryKeys);
    for (const char *name : kForgotten)
        record(phone, name, 0);
    announce_slots(phone);
    const std::int64_t boots = recorded_number(phone, "boots") + 1;
    record(phone, "boots", boots);
    transaction.commit();
    return {{"boots", boots}};
}

Json reset(Phone &phone, const Json & /*arguments*/) {
    reset_phone(phone);
    return Json::object();
}

Json lock(Phone &phone, const Json &arguments) {
    take_lock(phone, text_of(arguments, "holder"));
    return Json::object();
}

constexpr Argument kCreateArguments[] = {
    {.name = "root", .required = true, .help = "The folder, empty or not there yet"},
    {.name = "package", .help = "Folder of a customisation package to put on the phone"},
    {.name = "sims", .type = ArgumentType::Integer, .help = "Number of SIM slots: 0, 1 (the default) or 2"},
    {.name = "product-code", .help = "Text of the product code file; none without it"},
};
constexpr Argument kPackageArguments[] = {{.name = "folder", .required = true, .help = "Folder of the package"}};
constexpr Argument kLockArguments[] = {
    {.name = "holder", .required = true, .help = "Who takes the lock, as others are told"}};

constexpr Verb kVerbs[] = {
    {.name = "create", .help = "Make a phone", .arguments = kCreateArguments, .run_without_phone = create},
    {.name = "package", .help = "Replace the phone's package", .arguments = kPackageArguments, .run = package},
    {.name = "status", .help = "Show slots, display lock, theme and restarts", .run = status},
    {.name = "reboot", .help = "Restart: \"memory/\" keys vanish, the slots are announced", .run = restart},
    {.name = "reset", .help = "Make the phone as new; package, product code, slots stay", .run = reset},
    {.name = "lock", .help = "Hold the phone for this program alone", .arguments = kLockArguments, .run = lock},
};

} // namespace

std::span<const Verb> phone_verbs() { return kVerbs; }

} // namespace zel_host
