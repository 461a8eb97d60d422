#pragma once
// A phone whose files are looked at and prepared from outside: attributes, links, folders, trees.

#include "support/bench-phone.h"

#include <gmock/gmock.h>
#include <ostream>
#include <string>
#include <sys/stat.h>
#include <vector>

namespace zel_test {

// What belongs to a file besides its content. An empty label: none.
struct Attributes {
    int mode = 0;
    int uid = 0;
    int gid = 0;
    std::string label;

    friend bool operator==(const Attributes &, const Attributes &) = default;
    friend std::ostream &operator<<(std::ostream &out, const Attributes &of);
};

class FilesPhone : public BenchPhone {
  protected:
    [[nodiscard]] std::string on_disk(const std::string &path) const { return root() + path; }

    Attributes attributes(const std::string &path);
    // Gives a file or folder all its attributes, through the platform.
    void give(const std::string &path, const Attributes &attributes);

    [[nodiscard]] struct stat status_of(const std::string &path) const; // of a link itself
    void add_folder(const std::string &path);
    // The target stands in the link as it is: an absolute one is the phone's own path.
    void link_to(const std::string &target, const std::string &path);

    // Everything below a folder, as paths from there; links are not followed.
    [[nodiscard]] std::vector<std::string> tree(const std::string &folder) const;
    // Folders named "d", one in the other, with a "file" beside the ninth.
    void add_deep_tree(const std::string &folder, int depth);
    // How many folders named "d" lie one in the other.
    [[nodiscard]] int depth_of(const std::string &folder) const;

    [[nodiscard]] static int open_descriptors();
};

} // namespace zel_test
