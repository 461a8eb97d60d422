#pragma once
// Everything that the command prints. Data goes to standard output, everything else to standard error.
// What a phone holds may be any bytes: on a terminal control bytes are shown, never obeyed, and JSON is
// valid whatever the bytes are.

#include <nlohmann/json.hpp>

#include <string>
#include <string_view>
#include <vector>

namespace zel_command {

using Json = nlohmann::ordered_json;

// Control bytes, C1 controls, characters that turn the writing direction and bytes that are no UTF-8 as
// \xNN or \u{NNNN}; line feeds and tabs stay.
std::string escaped(std::string_view text);
// The same on one line: line feeds and tabs are escaped as well.
std::string escaped_line(std::string_view text);

bool is_utf8(std::string_view text);

// object[name] with U+FFFD for each byte that is no UTF-8; object[name_hex] then holds the exact bytes, in
// the same way as the answers of the bench phone.
void put_text(Json &object, const std::string &name, std::string_view bytes);
// The exact bytes behind an answer's text.
std::string bytes_of(const Json &object, const std::string &name);
std::string to_hex(std::string_view bytes);

bool is_terminal(int fd);

// Standard output, escaped when it is a terminal.
void print(std::string_view text);
void print_line(std::string_view text);
void print_json(const Json &value);

// Columns set two blanks apart, each cell on one line. An empty heading list prints none.
void print_table(const std::vector<std::string> &headings, const std::vector<std::vector<std::string>> &rows);

// "zel: TEXT" on standard error, always escaped.
void report(std::string_view text);
// Standard error without the prefix.
void report_plain(std::string_view text);

// Flushes standard output; false when something could not be written.
bool flush_output();

} // namespace zel_command
