#include "journal.h"

#include "text.h"

#include <nlohmann/json.hpp>

namespace zel_host {
namespace {

nlohmann::json shown(const Value &value) {
    switch (value.kind) {
    case Value::Kind::Text:
        return printable(value.text);
    case Value::Kind::Number:
        return value.number;
    case Value::Kind::Null:
        return nullptr;
    case Value::Kind::Hidden:
        break;
    }
    return nlohmann::json::object();
}

} // namespace

void journal(Phone &phone, const Function &row, std::initializer_list<Value> arguments) {
    nlohmann::json list = nlohmann::json::array();
    for (const Value &argument : arguments)
        if (argument.kind != Value::Kind::Hidden) list.push_back(shown(argument));
    const std::string text = list.dump();
    Query query = phone.store().query("INSERT INTO journal (function, arguments) VALUES (?, ?)");
    query.bind(row.name).bind(text).run();
}

} // namespace zel_host
