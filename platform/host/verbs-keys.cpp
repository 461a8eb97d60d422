#include "keys.h"
#include "text.h"
#include "verb.h"

#include <climits>

namespace zel_host {
namespace {

const char *word_for(KeyType type) {
    switch (type) {
    case KeyType::Integer:
        return "int";
    case KeyType::Boolean:
        return "bool";
    case KeyType::Text:
        return "string";
    }
    return "";
}

Json shown(std::string_view key, const KeyValue &value) {
    Json result{{"type", word_for(value.type)}};
    put_text(result, "key", key);
    if (value.type == KeyType::Text) put_text(result, "value", value.text);
    if (value.type == KeyType::Integer) result["value"] = value.number;
    if (value.type == KeyType::Boolean) result["value"] = value.number != 0;
    return result;
}

Json get(Phone &phone, const Json &arguments) {
    const std::string key = text_of(arguments, "key");
    const std::optional<KeyValue> value = get_key(phone, key);
    if (!value) throw VerbFailed("the phone has no key '" + key + "'");
    return shown(key, *value);
}

std::int64_t number_in(const std::string &text) {
    std::size_t used = 0;
    try {
        const long long number = std::stoll(text, &used);
        if (used == text.size() && number >= INT_MIN && number <= INT_MAX) return number;
    } catch (const std::logic_error &) {
        used = 0;
    }
    throw WrongArguments("'" + text + "' is no number of 32 bits");
}

std::int64_t truth_in(const std::string &text) {
    if (text == "true" || text == "1") return 1;
    if (text == "false" || text == "0") return 0;
    throw WrongArguments("'" + text + "' is none of true, false, 1, 0");
}

Json set(Phone &phone, const Json &arguments) {
    const std::string key = text_of(arguments, "key");
    const std::string type = text_of(arguments, "type", "string");
    std::string value = text_of(arguments, "value");
    if (arguments.contains("value-hex") && !from_hex(text_of(arguments, "value-hex"), value))
        throw WrongArguments("'value-hex' is no text of hexadecimal digit pairs");
    if (key.empty()) throw WrongArguments("a key is not empty");
    if (value.find('\0') != std::string::npos) throw WrongArguments("a value holds no zero byte");
    if (type == "int")
        set_key(phone, key, KeyType::Integer, number_in(value));
    else if (type == "bool")
        set_key(phone, key, KeyType::Boolean, truth_in(value));
    else if (type == "string")
        set_key(phone, key, value);
    else
        throw WrongArguments("'" + type + "' is none of int, bool, string");
    return shown(key, *get_key(phone, key));
}

Json unset(Phone &phone, const Json &arguments) {
    const std::string key = text_of(arguments, "key");
    Json result{{"existed", unset_key(phone, key)}};
    put_text(result, "key", key);
    return result;
}

Json list(Phone &phone, const Json &arguments) {
    Json keys = Json::array();
    each_key(phone, text_of(arguments, "prefix"),
             [&keys](std::string_view key, const KeyValue &value) { keys.push_back(shown(key, value)); });
    return {{"keys", keys}};
}

constexpr Argument kKeyArguments[] = {{.name = "key", .required = true, .help = "The key"}};
constexpr Argument kSetArguments[] = {
    {.name = "key", .required = true, .help = "The key"},
    {.name = "type", .help = "int, bool or string (the default)"},
    {.name = "value", .help = "The value; for bool true, false, 1 or 0"},
    {.name = "value-hex", .help = "The bytes of the value instead, two digits each"},
};
constexpr Argument kListArguments[] = {{.name = "prefix", .help = "Only keys that begin so"}};

constexpr Verb kVerbs[] = {
    {.name = "vconf-get", .help = "Show one key", .arguments = kKeyArguments, .run = get},
    {.name = "vconf-set", .help = "Set one key", .arguments = kSetArguments, .run = set},
    {.name = "vconf-unset", .help = "Remove one key", .arguments = kKeyArguments, .run = unset},
    {.name = "vconf-list", .help = "Show all keys, in order", .arguments = kListArguments, .run = list},
};

} // namespace

std::span<const Verb> key_verbs() { return kVerbs; }

} // namespace zel_host
