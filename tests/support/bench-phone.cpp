#include "support/bench-phone.h"

#include "support/temporary-folder.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <sstream>

namespace zel_test {

namespace fs = std::filesystem;
using nlohmann::json;

namespace {

constexpr const char *kRunLog = "/opt/system/zel-default/output/zel-config.log";

json taken(char *answer) {
    const json result = json::parse(answer == nullptr ? "null" : answer);
    zel_host_free(answer);
    return result;
}

} // namespace

std::string make_folder() { return make_temporary_folder(); }

void remove_folder(const std::string &folder) {
    std::error_code ignored;
    fs::remove_all(folder, ignored);
}

void BenchPhone::SetUp() {
    root_ = make_folder();
    create_arguments["root"] = root_;
    char *answer = nullptr;
    const int result = zel_host_call(nullptr, "create", create_arguments.dump().c_str(), &answer);
    const json created = taken(answer);
    ASSERT_EQ(result, 0) << created;
    char *error = nullptr;
    phone_ = zel_host_open(root_.c_str(), &error);
    ASSERT_NE(phone_, nullptr) << error;
    ::setenv("ZEL_ROOT", root_.c_str(), 1);
}

void BenchPhone::TearDown() {
    zel_host_close(phone_);
    remove_folder(root_);
}

int BenchPhone::try_call(const std::string &verb, const json &arguments, json &answer) {
    char *text = nullptr;
    const int result = zel_host_call(phone_, verb.c_str(), arguments.dump().c_str(), &text);
    answer = taken(text);
    return result;
}

json BenchPhone::call(const std::string &verb, const json &arguments) {
    json answer;
    const int result = try_call(verb, arguments, answer);
    EXPECT_EQ(result, 0) << verb << " " << arguments << ": " << answer;
    return answer;
}

void BenchPhone::write(const std::string &phone_path, std::string_view bytes, int mode) {
    const fs::path file = file_of(phone_path);
    fs::create_directories(file.parent_path());
    std::ofstream out(file, std::ios::binary | std::ios::trunc);
    out.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    out.close();
    ASSERT_TRUE(out) << "cannot write " << file;
    fs::permissions(file, static_cast<fs::perms>(mode));
}

std::string BenchPhone::read(const std::string &phone_path) {
    std::ifstream in(file_of(phone_path), std::ios::binary);
    EXPECT_TRUE(in) << "missing on the phone: " << phone_path;
    std::ostringstream bytes;
    bytes << in.rdbuf();
    return bytes.str();
}

bool BenchPhone::exists(const std::string &phone_path) { return fs::exists(fs::symlink_status(file_of(phone_path))); }

void BenchPhone::set_int(const std::string &key, int value) {
    call("vconf-set", {{"key", key}, {"type", "int"}, {"value", std::to_string(value)}});
}

void BenchPhone::set_bool(const std::string &key, bool value) {
    call("vconf-set", {{"key", key}, {"type", "bool"}, {"value", value ? "true" : "false"}});
}

void BenchPhone::set_string(const std::string &key, const std::string &value) {
    call("vconf-set", {{"key", key}, {"value", value}});
}

std::optional<json> BenchPhone::value_of(const std::string &key, const std::string &type) {
    json answer;
    if (try_call("vconf-get", {{"key", key}}, answer) != 0 || answer.at("type") != type) return std::nullopt;
    return answer.at("value");
}

std::optional<int> BenchPhone::get_int(const std::string &key) {
    const std::optional<json> value = value_of(key, "int");
    return value ? std::optional<int>(value->get<int>()) : std::nullopt;
}

std::optional<bool> BenchPhone::get_bool(const std::string &key) {
    const std::optional<json> value = value_of(key, "bool");
    return value ? std::optional<bool>(value->get<bool>()) : std::nullopt;
}

std::optional<std::string> BenchPhone::get_string(const std::string &key) {
    const std::optional<json> value = value_of(key, "string");
    return value ? std::optional<std::string>(value->get<std::string>()) : std::nullopt;
}

std::string BenchPhone::run_log() { return exists(kRunLog) ? read(kRunLog) : std::string(); }

std::vector<std::string> BenchPhone::system_log() {
    std::vector<std::string> messages;
    const json log = call("log"); // the loop needs it to the end
    for (const json &line : log.at("lines"))
        messages.push_back(line.at("message").get<std::string>());
    return messages;
}

void BenchPhone::fail(const std::string &function, const std::string &text, int from, int times, int result) {
    call("fault-add", {{"function", function}, {"text", text}, {"from", from}, {"times", times}, {"result", result}});
}

} // namespace zel_test
