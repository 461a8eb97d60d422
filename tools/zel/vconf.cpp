// The phone's settings store, key by key.

#include "commands.h"
#include "failure.h"
#include "output.h"
#include "secrets.h"

#include <unistd.h>

#include <algorithm>
#include <charconv>

namespace zel_command {
namespace {

std::string shown(const Json &entry, bool hide) {
    const std::string value = bytes_of(entry, "value");
    return hide ? masked(value) : value;
}

// The answer with the value replaced when it must not be seen.
Json hidden(Json entry) {
    entry["value"] = "********";
    entry.erase("value_hex");
    entry["masked"] = true;
    return entry;
}

Failure no_such_key(const Invocation &invocation, const std::string &key) {
    return {kFailed, "the phone in '" + invocation.root + "' has no key '" + key + "'",
            "'zel vconf list' lists the keys that exist."};
}

Json entry_of(const Invocation &invocation, const std::string &key) {
    Json entry;
    if (invocation.phone.try_call("vconf-get", {{"key", key}}, entry) == 0) return entry;
    throw no_such_key(invocation, key);
}

// A new key is a string unless the user says otherwise; a known one keeps its type.
std::string type_for(const Invocation &invocation, const std::string &key) {
    if (invocation.has("type")) return invocation.value("type");
    Json entry;
    if (invocation.phone.try_call("vconf-get", {{"key", key}}, entry) != 0) return "string";
    return entry.value("type", "string");
}

[[noreturn]] void refuse(const std::string &key, const std::string &text, const std::string &type) {
    throw Failure{kUsage, "vconf set: '" + text + "' is no value for the key '" + key + "' of type " + type,
                  "An int is a number of 32 bits, a bool is true, false, 1 or 0; --type chooses another type."};
}

// The bench phone says the same, but does not know which option would help.
void check_value(const std::string &key, const std::string &text, const std::string &type) {
    if (type == "bool" && text != "true" && text != "false" && text != "1" && text != "0") refuse(key, text, type);
    if (type != "int") return;
    std::int32_t number = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (error != std::errc{} || end != text.data() + text.size()) refuse(key, text, type);
}

} // namespace

int vconf_get(Invocation &invocation) {
    const std::string key = invocation.value("KEY");
    const Json entry = entry_of(invocation, key);
    const bool hide = is_secret(key) && !invocation.reveal && is_terminal(STDOUT_FILENO);
    if (invocation.json)
        print_json(hide ? hidden(entry) : entry);
    else
        print_line(shown(entry, hide));
    return kDone;
}

int vconf_set(Invocation &invocation) {
    const std::string key = invocation.value("KEY");
    const std::string text = invocation.value("VALUE");
    const std::string type = type_for(invocation, key);
    check_value(key, text, type);
    Json arguments{{"key", key}, {"type", type}, {"value", text}};
    if (!is_utf8(text)) arguments["value-hex"] = to_hex(text);
    const Json answer = invocation.phone.call("vconf-set", arguments);
    if (invocation.json) print_json(answer);
    return kDone;
}

int vconf_unset(Invocation &invocation) {
    const std::string key = invocation.value("KEY");
    entry_of(invocation, key);
    const Json answer = invocation.phone.call("vconf-unset", {{"key", key}});
    if (invocation.json) print_json(answer);
    return kDone;
}

int vconf_list(Invocation &invocation) {
    const Json keys = invocation.phone.call("vconf-list", {{"prefix", invocation.value("PREFIX")}}).at("keys");
    Json shown_keys = Json::array();
    std::vector<std::vector<std::string>> rows;
    for (const Json &entry : keys) {
        const std::string key = bytes_of(entry, "key");
        const bool hide = is_secret(key) && !invocation.reveal && !bytes_of(entry, "value").empty();
        shown_keys.push_back(hide ? hidden(entry) : entry);
        rows.push_back({key, entry.value("type", ""), shown(entry, hide)});
    }
    if (invocation.json)
        print_json(shown_keys);
    else
        print_table({"KEY", "TYPE", "VALUE"}, rows);
    return kDone;
}

} // namespace zel_command
