#include "install/phone.h"

#include <sqlite3.h>
#include <unistd.h>
#include <zel-host.h>

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>

namespace zel_bench {
namespace {

namespace fs = std::filesystem;

constexpr const char *kTables[] = {"network_info", "pdp_profile", "fast_dormancy", "max_pdp"};

[[noreturn]] void give_up(const std::string &why) {
    std::fprintf(stderr, "zel-bench-install: %s\n", why.c_str());
    std::exit(1);
}

std::string new_folder() {
    const char *parent = ::access("/dev/shm", W_OK) == 0 ? "/dev/shm" : "/tmp";
    std::string folder = std::string(parent) + "/zel-bench-XXXXXX";
    if (::mkdtemp(folder.data()) == nullptr) give_up("no temporary folder");
    return folder;
}

void write_file(const std::string &path, const std::string &bytes) {
    std::ofstream file(path, std::ios::binary | std::ios::trunc);
    file << bytes;
    if (!file) give_up("cannot write " + path);
}

int add_row(void *text, int count, char **values, char ** /*names*/) {
    std::string &all = *static_cast<std::string *>(text);
    for (int i = 0; i < count; ++i)
        all.append(values[i] ? values[i] : "NULL").append("|");
    all += '\n';
    return 0;
}

std::string rows_of(const std::string &file, const char *select) {
    sqlite3 *database = nullptr;
    std::string all;
    if (sqlite3_open_v2(file.c_str(), &database, SQLITE_OPEN_READONLY, nullptr) != SQLITE_OK)
        give_up("cannot open " + file);
    for (const char *table : kTables)
        sqlite3_exec(database, (std::string(select) + table).c_str(), add_row, &all, nullptr);
    sqlite3_close(database);
    return all;
}

} // namespace

std::string read_file(const std::string &path) {
    std::ifstream file(path, std::ios::binary);
    if (!file) give_up("cannot read " + path);
    return {std::istreambuf_iterator<char>(file), {}};
}

Phone::Phone() : root_(new_folder()) {
    char *answer = nullptr;
    const std::string arguments = R"({"root": ")" + root_ + R"("})";
    if (zel_host_call(nullptr, "create", arguments.c_str(), &answer) != 0) give_up("no phone can be made");
    zel_host_free(answer);
    ::setenv("ZEL_ROOT", root_.c_str(), 1);
    new_database_ = read_file(database_file());
}

Phone::~Phone() {
    std::error_code ignored;
    fs::remove_all(root_, ignored);
}

void Phone::write_customer(const std::string &bytes) const {
    const std::string path = root_ + kCustomerFile;
    fs::create_directories(fs::path(path).parent_path());
    write_file(path, bytes);
}

void Phone::reset_database() const { write_file(database_file(), new_database_); }

std::string Phone::database_content() const { return rows_of(database_file(), "select * from "); }

long Phone::database_rows() const {
    long rows = 0;
    const std::string counts = rows_of(database_file(), "select count(*) from ");
    for (std::size_t at = 0; at < counts.size(); at = counts.find('\n', at) + 1)
        rows += std::strtol(counts.c_str() + at, nullptr, 10);
    return rows;
}

} // namespace zel_bench
