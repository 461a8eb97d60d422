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

void each_call(Phone &phone, const std::function<void(std::string_view function, std::string_view arguments)> &use) {
    Query query = phone.store().query("SELECT function, arguments FROM journal ORDER BY id");
    while (query.row())
        use(query.view(0), query.view(1));
}

void clear_journal(Phone &phone) { phone.store().query("DELETE FROM journal").run(); }

} // namespace zel_host
