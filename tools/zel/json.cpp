#include "output.h"

#include "utf8.h"

#include <unistd.h>

#include <cstdio>

namespace zel_command {
namespace {

constexpr std::string_view kDigits = "0123456789abcdef";
constexpr std::string_view kReplacement = "\xEF\xBF\xBD";

std::string with_replacements(std::string_view text) {
    std::string result;
    while (!text.empty()) {
        const Character character = first_character(text);
        result += character.valid ? text.substr(0, character.bytes) : kReplacement;
        text.remove_prefix(character.bytes);
    }
    return result;
}

std::string from_hex(std::string_view text) {
    std::string result;
    for (std::size_t i = 0; i + 1 < text.size(); i += 2)
        result += static_cast<char>(kDigits.find(text[i]) * 16 + kDigits.find(text[i + 1]));
    return result;
}

} // namespace

bool is_utf8(std::string_view text) {
    while (!text.empty()) {
        const Character character = first_character(text);
        if (!character.valid) return false;
        text.remove_prefix(character.bytes);
    }
    return true;
}

std::string to_hex(std::string_view bytes) {
    std::string result;
    for (const char byte : bytes) {
        const auto value = static_cast<unsigned char>(byte);
        result += kDigits[value >> 4U];
        result += kDigits[value & 15U];
    }
    return result;
}

void put_text(Json &object, const std::string &name, std::string_view bytes) {
    object[name] = with_replacements(bytes);
    if (!is_utf8(bytes)) object[name + "_hex"] = to_hex(bytes);
}

std::string bytes_of(const Json &object, const std::string &name) {
    const auto hex = object.find(name + "_hex");
    if (hex != object.end() && hex->is_string()) return from_hex(hex->get<std::string>());
    const auto text = object.find(name);
    if (text == object.end()) return {};
    return text->is_string() ? text->get<std::string>() : text->dump();
}

// A terminal gets pure ASCII, so that no character in a value can steer it.
void print_json(const Json &value) {
    const std::string text = value.dump(2, ' ', is_terminal(STDOUT_FILENO), Json::error_handler_t::replace);
    std::fwrite(text.data(), 1, text.size(), stdout);
    std::fputc('\n', stdout);
}

} // namespace zel_command
