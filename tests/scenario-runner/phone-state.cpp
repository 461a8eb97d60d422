#include "phone-state.h"

#include <sqlite3.h>
#include <unistd.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <memory>
#include <regex>

namespace zel_scenario {

namespace {

namespace fs = std::filesystem;

constexpr const char *kDefault = "/opt/system/zel-default";
constexpr const char *kOutput = "/opt/system/zel-default/output";
constexpr const char *kData = "/opt/system/zel-default/data";

// Folders whose files belong to the result of a run.
constexpr const char *kListedFolders[] = {
    "/opt/system/zel-default",
    "/opt/usr",
    "/csa",
    "/opt/dbspace",
};

std::string content(const fs::path &path) {
    std::ifstream file{path, std::ios::binary};
    return {std::istreambuf_iterator<char>{file}, {}};
}

std::string shown(const Json &value) { return value.is_string() ? value.get<std::string>() : value.dump(); }

std::vector<std::string> keys(Phone &phone) {
    std::vector<std::string> lines;
    const Json list = phone.call("vconf-list");
    for (const Json &key : list.at("keys"))
        lines.push_back(key.at("type").get<std::string>() + " " + key.at("key").get<std::string>() + " = " +
                        shown(key.at("value")));
    std::sort(lines.begin(), lines.end());
    return lines;
}

// The system log without what changes with every edit of the sources: "install.cpp: run(123) > " keeps its
// file and function.
std::vector<std::string> system_log(Phone &phone) {
    static const std::regex line_number{R"(^([^ ]+: [^ ]+\()\d+(\) > ))"};
    std::vector<std::string> lines;
    const Json log = phone.call("log");
    for (const Json &entry : log.at("lines")) {
        std::string message = entry.at("message").get<std::string>();
        message = std::regex_replace(message, line_number, "$1N$2");
        std::replace(message.begin(), message.end(), '\n', '|');
        lines.push_back(message);
    }
    return lines;
}

std::vector<std::string> file_lines(Phone &phone, const std::string &path) {
    return lines_of(content(phone.outside(path)));
}

// Sizes of folders differ between file systems; whether a figure passed stays.
std::vector<std::string> report(Phone &phone, const std::string &path) {
    static const std::regex size{R"((\[FS\] media/\w+ size )\d+=>\d+)"};
    return lines_of(std::regex_replace(content(phone.outside(path)), size, "$1N=>N"));
}

std::vector<std::string> media_status(Phone &phone, const std::string &path) {
    static const std::regex size{R"((_size\s*=\s*)\d+)"};
    return lines_of(std::regex_replace(content(phone.outside(path)), size, "$1N"));
}

// A file that no run gave to anyone belongs to who made the phone: the same owner in a golden file, whether the
// tests run as root or as a user.
void mask_own(Json &stat, const char *field, unsigned own) {
    if (stat.contains(field) && stat[field] == own) stat[field] = 0;
}

std::string described(Phone &phone, const std::string &path) {
    Json stat = phone.call("stat", {{"path", path}});
    mask_own(stat, "owner", geteuid());
    mask_own(stat, "group", getegid());
    std::string line = path;
    for (const char *field : {"kind", "mode", "owner", "group", "label"})
        if (stat.contains(field) && !stat[field].is_null()) line += std::string{" "} + field + "=" + shown(stat[field]);
    return line;
}

std::vector<std::string> files(Phone &phone) {
    std::vector<std::string> lines;
    for (const char *folder : kListedFolders) {
        const std::string outside = phone.outside(folder);
        if (!fs::exists(outside)) continue;
        for (const auto &entry : fs::recursive_directory_iterator{outside})
            lines.push_back(described(phone, entry.path().string().substr(phone.root().size())));
    }
    std::sort(lines.begin(), lines.end());
    return lines;
}

struct CloseDatabase {
    void operator()(sqlite3 *database) const { sqlite3_close(database); }
};

std::vector<std::string> rows(const std::string &path, const std::string &table) {
    sqlite3 *raw = nullptr;
    const int opened = sqlite3_open_v2(path.c_str(), &raw, SQLITE_OPEN_READONLY, nullptr);
    const std::unique_ptr<sqlite3, CloseDatabase> database{raw};
    std::vector<std::string> lines;
    if (opened != SQLITE_OK) return lines;
    const auto add_row = [](void *to, int columns, char **values, char **names) {
        std::string line;
        for (int i = 0; i < columns; ++i)
            line += std::string{i ? " " : ""} + names[i] + "=" + (values[i] ? values[i] : "NULL");
        static_cast<std::vector<std::string> *>(to)->push_back(line);
        return 0;
    };
    sqlite3_exec(database.get(), ("select * from " + table).c_str(), add_row, &lines, nullptr);
    return lines;
}

// One line an entry of a list that a verb answers, its members in the order of their names.
std::vector<std::string> entries(Phone &phone, const char *verb, const char *list) {
    std::vector<std::string> lines;
    const Json answer = phone.call(verb);
    for (const Json &entry : answer.at(list)) {
        std::string line;
        for (const auto &[name, value] : entry.items())
            if (!value.is_null()) line += (line.empty() ? "" : " ") + name + "=" + shown(value);
        lines.push_back(line);
    }
    return lines;
}

std::vector<std::string> manual(Phone &phone) {
    const std::string url = phone.call("bookmarks").at("manual_url");
    return url.empty() ? std::vector<std::string>{} : std::vector<std::string>{url};
}

void add(PhoneState &state, const std::string &section, std::vector<std::string> lines) {
    if (!lines.empty()) state[section] = std::move(lines);
}

void add_databases(Phone &phone, PhoneState &state) {
    for (const auto &[name, path] : {std::pair{"sim1", "/opt/dbspace/.dnet.db"}, {"sim2", "/opt/dbspace/.dnet2.db"}})
        for (const char *table : {"network_info", "pdp_profile", "fast_dormancy", "max_pdp"})
            add(state, std::string{"networks-"} + name + "/" + table, rows(phone.outside(path), table));
}

void add_section_store(Phone &phone, PhoneState &state) {
    const std::string folder = phone.outside(kData);
    if (!fs::exists(folder)) return;
    for (const auto &file : fs::directory_iterator{folder})
        add(state, "data/" + file.path().filename().string(), lines_of(content(file.path())));
}

// What install runs write beside the section store: merged presets, versions, application lists and results.
void add_preconfiguration(Phone &phone, PhoneState &state) {
    const std::string base = kDefault;
    add(state, "preset", file_lines(phone, base + "/preset/zel-default-preset.ini"));
    add(state, "fs-update", file_lines(phone, base + "/fsupdate/zel-fsupdate-info.ini"));
    for (const char *name : {"appresult_def.ini", "appresult.ini"})
        add(state, std::string{"app/"} + name, file_lines(phone, base + "/app/" + name));
}

// What services of the phone were told.
std::vector<std::string> services(Phone &phone) {
    std::vector<std::string> lines;
    const Json status = phone.call("status");
    for (const char *name : {"theme_picture", "initial_keyboard", "active_keyboard", "time_zone"})
        lines.push_back(std::string{name} + " = " + shown(status.at(name)));
    const Json list = phone.call("app-list");
    for (const Json &one : list.at("applications"))
        lines.push_back("application " + shown(one.at("name")) + " " + shown(one.at("state")));
    return lines;
}

} // namespace

std::vector<std::string> lines_of(const std::string &text) {
    std::vector<std::string> lines;
    std::size_t at = 0;
    while (at < text.size()) {
        const std::size_t end = std::min(text.find('\n', at), text.size());
        lines.push_back(text.substr(at, end - at));
        at = end + 1;
    }
    return lines;
}

std::string text_of(const std::vector<std::string> &lines) {
    std::string text;
    for (const std::string &line : lines)
        text.append(line).append("\n");
    return text;
}

PhoneState read_state(Phone &phone) {
    const std::string output = kOutput;
    PhoneState state;
    add(state, "keys", keys(phone));
    add(state, "system-log", system_log(phone));
    add(state, "run-log", file_lines(phone, output + "/zel-config.log"));
    add(state, "time-laps", file_lines(phone, output + "/zel-time-lap.log"));
    for (const char *log : {"sim-check", "sim-setting", "sim2-check", "sim2-setting"})
        add(state, log, file_lines(phone, output + "/zel-" + log + ".log"));
    add(state, "fs-status-config", media_status(phone, output + "/zel-fs-status-config.ini"));
    add(state, "fs-status-verify", media_status(phone, output + "/zel-fs-status-verify.ini"));
    add(state, "bookmarks", entries(phone, "bookmarks", "bookmarks"));
    add(state, "user-manual", manual(phone));
    add(state, "sync-accounts", entries(phone, "sync-accounts", "accounts"));
    add(state, "report", report(phone, output + "/zel-verification-report.log"));
    add(state, "document", file_lines(phone, output + "/customer-phone.xml"));
    add(state, "files", files(phone));
    add(state, "services", services(phone));
    add_preconfiguration(phone, state);
    add_section_store(phone, state);
    add_databases(phone, state);
    return state;
}

} // namespace zel_scenario
