#include "output.h"

#include "utf8.h"

#include <unistd.h>

#include <algorithm>
#include <cstdint>
#include <cstdio>

namespace zel_command {
namespace {

// A direction mark from a package could make a terminal show an address as another one.
bool turns_direction(std::uint32_t code) {
    return code == 0x061C || code == 0x200E || code == 0x200F || (code >= 0x202A && code <= 0x202E) ||
           (code >= 0x2066 && code <= 0x2069);
}

bool is_control(std::uint32_t code) { return code < 0x20 || (code >= 0x7F && code < 0xA0); }

bool is_harmless(const Character &character) {
    return character.valid && !is_control(character.code) && !turns_direction(character.code);
}

std::string byte_text(char byte) {
    char buffer[8];
    std::snprintf(buffer, sizeof buffer, "\\x%02X", static_cast<unsigned>(static_cast<unsigned char>(byte)));
    return buffer;
}

std::string code_text(std::uint32_t code) {
    char buffer[16];
    std::snprintf(buffer, sizeof buffer, "\\u{%04X}", code);
    return buffer;
}

std::string escape(std::string_view text, std::string_view kept) {
    std::string result;
    result.reserve(text.size());
    while (!text.empty()) {
        const Character character = first_character(text);
        const std::string_view bytes = text.substr(0, character.bytes);
        text.remove_prefix(character.bytes);
        const bool keep = bytes.size() == 1 && kept.find(bytes[0]) != std::string_view::npos;
        if (keep || is_harmless(character))
            result += bytes;
        else
            result += bytes.size() == 1 ? byte_text(bytes[0]) : code_text(character.code);
    }
    return result;
}

std::size_t displayed_width(std::string_view text) {
    return static_cast<std::size_t>(
        std::count_if(text.begin(), text.end(), [](char byte) { return (byte & '\xC0') != '\x80'; }));
}

} // namespace

std::string escaped(std::string_view text) { return escape(text, "\n\t"); }

std::string escaped_line(std::string_view text) { return escape(text, ""); }

bool is_terminal(int fd) { return isatty(fd) == 1; }

void print(std::string_view text) {
    const std::string shown = is_terminal(STDOUT_FILENO) ? escaped(text) : std::string{text};
    std::fwrite(shown.data(), 1, shown.size(), stdout);
}

void print_line(std::string_view text) {
    print(text);
    std::fputc('\n', stdout);
}

void print_table(const std::vector<std::string> &headings, const std::vector<std::vector<std::string>> &rows) {
    std::vector<std::vector<std::string>> cells;
    if (!headings.empty()) cells.push_back(headings);
    for (const auto &row : rows) {
        auto &line = cells.emplace_back();
        for (const auto &cell : row)
            line.push_back(escaped_line(cell));
    }
    std::vector<std::size_t> widths;
    for (const auto &line : cells) {
        widths.resize(std::max(widths.size(), line.size()));
        for (std::size_t i = 0; i < line.size(); ++i)
            widths[i] = std::max(widths[i], displayed_width(line[i]));
    }
    for (const auto &line : cells) {
        std::string text;
        for (std::size_t i = 0; i < line.size(); ++i) {
            text += line[i];
            if (i + 1 < line.size()) text.append(widths[i] - displayed_width(line[i]) + 2, ' ');
        }
        text.erase(text.find_last_not_of(' ') + 1);
        print_line(text);
    }
}

void report(std::string_view text) { report_plain("zel: " + std::string{text}); }

void report_plain(std::string_view text) {
    const std::string shown = escaped(text) + "\n";
    std::fwrite(shown.data(), 1, shown.size(), stderr);
}

bool flush_output() { return std::fflush(stdout) == 0 && std::ferror(stdout) == 0; }

} // namespace zel_command
