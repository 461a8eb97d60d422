#include "bookmarks.h"
#include "sync-accounts.h"
#include "text.h"
#include "verb.h"

namespace zel_host {
namespace {

Json shown(Phone &phone, const Bookmark &bookmark) {
    Json result{{"id", bookmark.id},
                {"parent", bookmark.parent},
                {"is_folder", bookmark.folder},
                {"editable", bookmark.editable},
                {"folder", nullptr}};
    put_text(result, "title", bookmark.title);
    put_text(result, "url", bookmark.url);
    const std::optional<Bookmark> parent = get_bookmark(phone, bookmark.parent);
    if (parent && parent->id != kRootFolder) put_text(result, "folder", parent->title);
    return result;
}

Json list_bookmarks(Phone &phone, const Json & /*arguments*/) {
    Json list = Json::array();
    each_bookmark(phone, [&](const Bookmark &bookmark) { list.push_back(shown(phone, bookmark)); });
    Json result{{"bookmarks", std::move(list)}};
    put_text(result, "manual_url", user_manual_url(phone));
    return result;
}

Json add_one_bookmark(Phone &phone, const Json &arguments) {
    Bookmark bookmark{.editable = !flag_of(arguments, "fixed"),
                      .title = text_of(arguments, "title"),
                      .url = text_of(arguments, "url")};
    if (arguments.contains("folder")) bookmark.parent = folder_titled(phone, text_of(arguments, "folder"));
    bookmark.id = add_bookmark(phone, bookmark).value_or(0);
    return shown(phone, bookmark);
}

Json forget_bookmarks(Phone &phone, const Json & /*arguments*/) {
    clear_bookmarks(phone);
    return Json::object();
}

Json set_manual(Phone &phone, const Json &arguments) {
    set_user_manual_url(phone, text_of(arguments, "url"));
    return list_bookmarks(phone, {});
}

void put_optional(Json &object, const std::string &name, const std::optional<std::string> &text) {
    object[name] = nullptr;
    if (text) put_text(object, name, *text);
}

// "contacts_enabled", "contacts_password" and so on; null for what is absent.
void put_service(Json &object, const std::string &kind, const SyncAccount &account, std::int64_t type) {
    SyncService service;
    object[kind + "_enabled"] = nullptr;
    object[kind + "_source"] = nullptr;
    for (const SyncService &held : account.services) {
        if (held.type != type) continue;
        service = held;
        object[kind + "_enabled"] = held.enabled;
        object[kind + "_source"] = held.source;
    }
    put_optional(object, kind + "_name", service.name);
    put_optional(object, kind + "_id", service.id);
    put_optional(object, kind + "_password", service.password);
}

Json shown(const SyncAccount &account) {
    Json result{{"id", account.id},
                {"attribute", account.attribute},
                {"sync_mode", account.sync_mode},
                {"sync_type", account.sync_type},
                {"sync_interval", account.sync_interval}};
    put_text(result, "name", account.name);
    put_text(result, "address", account.address);
    put_text(result, "user_id", account.user_id);
    put_text(result, "password", account.password);
    put_service(result, "contacts", account, kContacts);
    put_service(result, "calendar", account, kCalendar);
    return result;
}

Json list_accounts(Phone &phone, const Json & /*arguments*/) {
    Json list = Json::array();
    for (const SyncAccount &account : sync_accounts(phone))
        list.push_back(shown(account));
    return {{"accounts", std::move(list)}};
}

std::optional<std::string> given(const Json &arguments, const std::string &name) {
    if (!arguments.contains(name)) return std::nullopt;
    return text_of(arguments, name.c_str());
}

// A service that no argument speaks of is absent.
void add_service(SyncAccount &account, const Json &arguments, const std::string &kind, std::int64_t type) {
    const SyncService service{.type = type,
                              .enabled = flag_of(arguments, kind.c_str()),
                              .source = type,
                              .name = given(arguments, kind + "-name"),
                              .id = given(arguments, kind + "-id"),
                              .password = given(arguments, kind + "-password")};
    const bool spoken_of = arguments.contains(kind) || service.name || service.id || service.password;
    if (spoken_of) account.services.push_back(service);
}

Json add_account(Phone &phone, const Json &arguments) {
    SyncAccount account{.name = text_of(arguments, "name"),
                        .address = text_of(arguments, "address"),
                        .user_id = text_of(arguments, "user-id"),
                        .password = text_of(arguments, "password"),
                        .services = {}};
    add_service(account, arguments, "contacts", kContacts);
    add_service(account, arguments, "calendar", kCalendar);
    account.id = add_sync_account(phone, account);
    return shown(account);
}

Json forget_accounts(Phone &phone, const Json & /*arguments*/) {
    Transaction transaction(phone.store());
    clear_sync_accounts(phone);
    transaction.commit();
    return Json::object();
}

constexpr Argument kBookmarkArguments[] = {
    {.name = "title", .required = true, .help = "Its title"},
    {.name = "url", .required = true, .help = "Its address"},
    {.name = "folder", .help = "Title of the folder that it goes into, made when there is none"},
    {.name = "fixed", .type = ArgumentType::Boolean, .help = "The user cannot change it"},
};
constexpr Argument kManualArguments[] = {
    {.name = "url", .required = true, .help = "Address of the phone's user manual"},
};
constexpr Argument kAccountArguments[] = {
    {.name = "name", .required = true, .help = "Name of the account"},
    {.name = "address", .help = "Address of its server"},
    {.name = "user-id", .help = "User at the server"},
    {.name = "password", .help = "Password at the server"},
    {.name = "contacts", .type = ArgumentType::Boolean, .help = "Contacts take part"},
    {.name = "contacts-name", .help = "Name of the server's database of contacts"},
    {.name = "contacts-id", .help = "User of that database"},
    {.name = "contacts-password", .help = "Password of that database"},
    {.name = "calendar", .type = ArgumentType::Boolean, .help = "The calendar takes part"},
    {.name = "calendar-name", .help = "Name of the server's calendar"},
    {.name = "calendar-id", .help = "User of that calendar"},
    {.name = "calendar-password", .help = "Password of that calendar"},
};

constexpr Verb kVerbs[] = {
    {.name = "bookmarks", .help = "Show the browser's bookmarks and folders, and the manual", .run = list_bookmarks},
    {.name = "bookmarks-add", .help = "Add a bookmark", .arguments = kBookmarkArguments, .run = add_one_bookmark},
    {.name = "bookmarks-clear", .help = "Remove all bookmarks and folders", .run = forget_bookmarks},
    {.name = "bookmarks-manual",
     .help = "Set the user manual's address",
     .arguments = kManualArguments,
     .run = set_manual},
    {.name = "sync-accounts", .help = "Show the data-sync accounts", .run = list_accounts},
    {.name = "sync-accounts-add",
     .help = "Add a data-sync account",
     .arguments = kAccountArguments,
     .run = add_account},
    {.name = "sync-accounts-clear", .help = "Remove all data-sync accounts", .run = forget_accounts},
};

} // namespace

std::span<const Verb> service_verbs() { return kVerbs; }

} // namespace zel_host
