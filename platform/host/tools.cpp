#include "tools.h"

namespace zel_host {
namespace {

constexpr const char *kBlanks = " \t\n";

std::string_view first_word(std::string_view command) {
    const std::size_t start = command.find_first_not_of(kBlanks);
    if (start == std::string_view::npos) return {};
    command.remove_prefix(start);
    return command.substr(0, command.find_first_of(kBlanks));
}

} // namespace

int run_command(Phone &phone, std::string_view command) {
    Query query = phone.store().query("SELECT status FROM tool WHERE path = ?");
    if (!query.bind(first_word(command)).row()) return kNotFound;
    return static_cast<int>(query.integer(0)) << 8;
}

void add_tool(Phone &phone, std::string_view path, int exit_status) {
    Query query = phone.store().query("INSERT OR REPLACE INTO tool (path, status) VALUES (?, ?)");
    query.bind(path).bind(exit_status).run();
}

} // namespace zel_host
