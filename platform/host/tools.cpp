#include "tools.h"

#include "content.h"
#include "open-file.h"
#include "tool-behaviour.h"

#include <fcntl.h>
#include <optional>

namespace zel_host {
namespace {

constexpr const char *kBlanks = " \t\n";
constexpr mode_t kFileMode = 0644;

Words words_of(std::string_view command) {
    Words words;
    while (true) {
        const std::size_t start = command.find_first_not_of(kBlanks);
        if (start == std::string_view::npos) return words;
        command.remove_prefix(start);
        words.push_back(command.substr(0, command.find_first_of(kBlanks)));
        command.remove_prefix(words.back().size());
    }
}

Tool read(const Query &query) {
    return {.path = query.text(0),
            .exit_status = static_cast<int>(query.integer(1)),
            .file = query.text(2),
            .content = query.text(3),
            .does = query.text(4)};
}

std::optional<Tool> find_tool(Phone &phone, std::string_view path) {
    Query query = phone.store().query("SELECT path, status, file, content, does FROM tool WHERE path = ?");
    return query.bind(path).row() ? std::optional<Tool>(read(query)) : std::nullopt;
}

// The file that this call of the tool writes; "" for none.
std::string_view file_of(const Tool &tool, const Words &words) {
    if (tool.file.empty() || tool.file.front() == '/') return tool.file;
    return word_after(words, tool.file);
}

void write_file(Phone &phone, const Tool &tool, const Words &words) {
    const std::string_view path = file_of(tool, words);
    if (path.empty()) return;
    const Fd file(open_file(phone, path, O_WRONLY | O_CREAT | O_TRUNC, kFileMode));
    if (file) static_cast<void>(write_content(file.get(), tool.content));
}

} // namespace

int run_command(Phone &phone, std::string_view command) {
    const Words words = words_of(command);
    const std::optional<Tool> tool = words.empty() ? std::nullopt : find_tool(phone, words.front());
    if (!tool) return kNotFound;
    write_file(phone, *tool, words);
    const Behaviour *behaviour = find_behaviour(tool->does);
    // A tool that was told to fail has done nothing.
    const bool acts = behaviour != nullptr && tool->exit_status == 0;
    return (acts ? behaviour->run(phone, words) : tool->exit_status) << 8;
}

void add_tool(Phone &phone, const Tool &tool) {
    Query query =
        phone.store().query("INSERT OR REPLACE INTO tool (path, status, file, content, does) VALUES (?, ?, ?, ?, ?)");
    query.bind(tool.path).bind(tool.exit_status).bind(tool.file).bind(tool.content).bind(tool.does).run();
}

bool remove_tool(Phone &phone, std::string_view path) {
    Query query = phone.store().query("DELETE FROM tool WHERE path = ? RETURNING 1");
    const bool existed = query.bind(path).row();
    if (existed) query.run();
    return existed;
}

void each_tool(Phone &phone, const std::function<void(const Tool &tool)> &use) {
    Query query = phone.store().query("SELECT path, status, file, content, does FROM tool ORDER BY path");
    while (query.row())
        use(read(query));
}

} // namespace zel_host
