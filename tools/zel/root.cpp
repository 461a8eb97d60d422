#include "root.h"

#include "failure.h"

#include <unistd.h>

#include <climits>
#include <cstdlib>

namespace zel_command {
namespace {

std::string absolute(const std::string &path) {
    if (path.front() == '/') return path;
    char folder[PATH_MAX];
    if (getcwd(folder, sizeof folder) == nullptr) return path;
    return std::string{folder} + "/" + path;
}

} // namespace

std::string choose_root(const std::string &from_option) {
    const char *from_environment = std::getenv("ZEL_ROOT");
    std::string root = from_option;
    if (root.empty() && from_environment != nullptr) root = from_environment;
    if (root.empty())
        throw Failure{kNoRoot, "no phone is named: neither --root nor $ZEL_ROOT is set",
                      "Name the phone's folder with 'zel --root DIR ...' or 'export ZEL_ROOT=DIR'."};
    root = absolute(root);
    setenv("ZEL_ROOT", root.c_str(), 1);
    return root;
}

} // namespace zel_command
