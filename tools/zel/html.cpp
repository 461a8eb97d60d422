#include "html.h"

#include "output.h"

namespace zel_command {
namespace {

std::string_view reference_of(char byte) {
    switch (byte) {
    case '&':
        return "&amp;";
    case '<':
        return "&lt;";
    case '>':
        return "&gt;";
    case '"':
        return "&quot;";
    case '\'':
        return "&#39;";
    default:
        return {};
    }
}

} // namespace

std::string html_text(std::string_view text) {
    std::string result;
    for (const char byte : escaped_line(text)) {
        const std::string_view reference = reference_of(byte);
        if (reference.empty())
            result += byte;
        else
            result += reference;
    }
    return result;
}

} // namespace zel_command
