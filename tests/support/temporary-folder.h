#pragma once
// A new folder for one test. In memory where the machine has a folder for that: a phone is some forty folders and
// files, and the suite makes and removes thousands of phones. The name is short, because paths of sockets below
// it must fit 108 bytes.

#include <cstdlib>
#include <stdexcept>
#include <string>
#include <unistd.h>

namespace zel_test {

inline std::string make_temporary_folder() {
    std::string name = ::access("/dev/shm", W_OK | X_OK) == 0 ? "/dev/shm/zelXXXXXX" : "/tmp/zelXXXXXX";
    if (::mkdtemp(name.data()) == nullptr) throw std::runtime_error("cannot make a temporary folder");
    return name;
}

} // namespace zel_test
