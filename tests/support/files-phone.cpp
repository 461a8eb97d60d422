#include "support/files-phone.h"

#include <fcntl.h>
#include <filesystem>
#include <iterator>
#include <security-server.h>
#include <unistd.h>
#include <zel-platform.h>

namespace zel_test {

namespace fs = std::filesystem;

std::ostream &operator<<(std::ostream &out, const Attributes &of) {
    return out << std::oct << '0' << of.mode << std::dec << ' ' << of.uid << ':' << of.gid << " '" << of.label << "'";
}

Attributes FilesPhone::attributes(const std::string &path) {
    const nlohmann::json status = call("stat", {{"path", path}});
    Attributes found;
    found.mode = std::stoi(status.at("mode").get<std::string>(), nullptr, 8);
    found.uid = status.at("owner").get<int>();
    found.gid = status.at("group").get<int>();
    if (!status.at("label").is_null()) found.label = status.at("label").get<std::string>();
    return found;
}

void FilesPhone::give(const std::string &path, const Attributes &attributes) {
    const bool is_folder = fs::is_directory(on_disk(path));
    const int fd = zel_platform_open(path.c_str(), O_RDONLY | (is_folder ? O_DIRECTORY : 0), 0);
    ASSERT_GE(fd, 0) << path;
    EXPECT_EQ(security_server_label_access(path.c_str(), attributes.label.c_str()), 0);
    EXPECT_EQ(zel_platform_set_owner(fd, static_cast<uid_t>(attributes.uid), static_cast<gid_t>(attributes.gid)), 0);
    EXPECT_EQ(::fchmod(fd, static_cast<mode_t>(attributes.mode)), 0);
    ::close(fd);
}

struct stat FilesPhone::status_of(const std::string &path) const {
    struct stat status = {};
    EXPECT_EQ(::lstat(on_disk(path).c_str(), &status), 0) << path;
    return status;
}

void FilesPhone::add_folder(const std::string &path) { fs::create_directories(on_disk(path)); }

void FilesPhone::link_to(const std::string &target, const std::string &path) {
    ASSERT_EQ(::symlink(target.c_str(), on_disk(path).c_str()), 0) << path;
}

std::vector<std::string> FilesPhone::tree(const std::string &folder) const {
    const fs::path top = on_disk(folder);
    std::vector<std::string> found;
    for (const fs::directory_entry &entry : fs::recursive_directory_iterator(top))
        found.push_back(entry.path().lexically_relative(top).string());
    return found;
}

void FilesPhone::add_deep_tree(const std::string &folder, int depth) {
    int fd = ::open(on_disk(folder).c_str(), O_RDONLY | O_DIRECTORY);
    for (int i = 0; i < depth; ++i) {
        if (i == 8) ::close(::openat(fd, "file", O_WRONLY | O_CREAT, 0644));
        ASSERT_EQ(::mkdirat(fd, "d", 0755), 0);
        const int next = ::openat(fd, "d", O_RDONLY | O_DIRECTORY);
        ::close(fd);
        fd = next;
    }
    ::close(fd);
}

int FilesPhone::depth_of(const std::string &folder) const {
    int depth = 0;
    int fd = ::open(on_disk(folder).c_str(), O_RDONLY | O_DIRECTORY);
    for (int next = 0; (next = ::openat(fd, "d", O_RDONLY | O_DIRECTORY)) >= 0; ++depth) {
        ::close(fd);
        fd = next;
    }
    ::close(fd);
    return depth;
}

int FilesPhone::open_descriptors() {
    return static_cast<int>(std::distance(fs::directory_iterator("/proc/self/fd"), fs::directory_iterator{}));
}

} // namespace zel_test
