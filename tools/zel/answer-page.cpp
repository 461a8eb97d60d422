#include "answer-page.h"

#include "secrets.h"

#include <algorithm>

namespace zel_command {
namespace {

using Row = std::vector<std::string>;

// "text_hex" beside "text" holds the same bytes again.
bool repeats_another(const Json &object, const std::string &name) {
    return name.ends_with("_hex") && object.contains(name.substr(0, name.size() - 4));
}

bool names_secret(const Json &object, const char *member) {
    const auto found = object.find(member);
    return found != object.end() && found->is_string() && is_secret(bytes_of(object, member));
}

// A member such as "msin" is secret by its name, "value" by the key beside it, a call's arguments by its text.
bool is_secret_member(const Json &object, const std::string &name) {
    return is_secret(name) || (name == "value" && names_secret(object, "key")) ||
           (name == "arguments" && names_secret(object, "text"));
}

std::string cell(const Json &object, const std::string &name, bool reveal) {
    const auto found = object.find(name);
    if (found == object.end() || found->is_null()) return "-";
    const std::string text = bytes_of(object, name);
    return !reveal && is_secret_member(object, name) ? masked(text) : text;
}

bool is_list_of_objects(const Json &value) {
    return value.is_array() && !value.empty() &&
           std::all_of(value.begin(), value.end(), [](const Json &element) { return element.is_object(); });
}

void add_members(std::vector<Row> &rows, const Json &object, const std::string &prefix, bool reveal) {
    for (const auto &[name, value] : object.items()) {
        if (repeats_another(object, name) || is_list_of_objects(value)) continue;
        if (value.is_object())
            add_members(rows, value, prefix + name + " ", reveal);
        else
            rows.push_back({prefix + name, cell(object, name, reveal)});
    }
}

Row columns_of(const Json &list) {
    Row columns;
    for (const Json &element : list)
        for (const auto &[name, value] : element.items())
            if (!repeats_another(element, name) && std::find(columns.begin(), columns.end(), name) == columns.end())
                columns.push_back(name);
    // What an entry is comes first, what it is like behind it.
    std::stable_partition(columns.begin(), columns.end(), [](const std::string &name) {
        return name == "path" || name == "key" || name == "name" || name == "function";
    });
    return columns;
}

void print_list(const Json &list, bool reveal) {
    const Row columns = columns_of(list);
    std::vector<Row> rows;
    for (const Json &element : list) {
        Row &row = rows.emplace_back();
        for (const std::string &column : columns)
            row.push_back(cell(element, column, reveal));
    }
    print_table(columns, rows);
}

} // namespace

void print_answer(const Json &answer, bool reveal) {
    if (is_list_of_objects(answer)) return print_list(answer, reveal);
    if (!answer.is_object()) return print_line(answer.is_string() ? answer.get<std::string>() : answer.dump());
    // A file's content is printed as it is.
    if (answer.contains("content") && answer.contains("path")) return print(bytes_of(answer, "content"));
    std::vector<Row> rows;
    add_members(rows, answer, "", reveal);
    print_table({}, rows);
    for (const auto &[name, value] : answer.items())
        if (is_list_of_objects(value)) print_list(value, reveal);
}

} // namespace zel_command
