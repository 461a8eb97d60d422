#include "system-information.h"

#include "call.h"
#include "record.h"

#include <cstring>
#include <system-info.h>

namespace zel_host {
namespace {

std::string name_in_record(const InformationRow &row) { return "information_" + std::string(row.name); }

int tell(Phone &phone, int key, char **value) {
    if (value == nullptr) return -1;
    for (const InformationRow &row : kInformation) {
        if (row.key != key) continue;
        const std::optional<std::string> text = information(phone, row);
        if (!text) return -1;
        *value = ::strdup(text->c_str());
        return 0;
    }
    return -1;
}

} // namespace

std::optional<std::string> information(Phone &phone, const InformationRow &row) {
    const std::string name = name_in_record(row);
    Query query = phone.store().query("SELECT value FROM record WHERE name = ?");
    return query.bind(name).row() ? std::optional<std::string>(query.text(0)) : std::nullopt;
}

void set_information(Phone &phone, const InformationRow &row, std::string_view text) {
    record(phone, name_in_record(row), text);
}

void withhold_information(Phone &phone, const InformationRow &row) {
    const std::string name = name_in_record(row);
    Query query = phone.store().query("DELETE FROM record WHERE name = ?");
    query.bind(name).run();
}

} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT int system_info_get_value_string(int key, char **value) {
    return answer<function("system_info_get_value_string")>([=](Phone &phone) { return tell(phone, key, value); }, key);
}
