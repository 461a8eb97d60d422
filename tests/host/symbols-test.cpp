// The library exports the functions that its headers declare, and nothing else.

#include "support/source-dir.h"
#include <cstdio>
#include <dlfcn.h>
#include <fstream>
#include <gmock/gmock.h>
#include <regex>
#include <set>
#include <sstream>
#include <string>
#include <zel-host.h>

namespace {

std::string text_of(const std::string &file) {
    std::ostringstream text;
    text << std::ifstream(zel_test::source_dir() + file).rdbuf();
    return text.str();
}

// Names of functions in a header: a name before "(" at the start of a declaration.
void add_declared(const std::string &file, std::set<std::string> &names) {
    static const std::regex kDeclaration(R"(^[a-z][A-Za-z0-9_ ]*[ *]+([a-z_][a-z0-9_]*)\()", std::regex::multiline);
    const std::string text = text_of(file);
    for (std::sregex_iterator at(text.begin(), text.end(), kDeclaration), end; at != end; ++at)
        names.insert((*at)[1]);
}

std::set<std::string> exported() {
    Dl_info library{};
    EXPECT_NE(::dladdr(reinterpret_cast<void *>(&zel_host_open), &library), 0);
    const std::string command = std::string("nm -D --defined-only '") + library.dli_fname + "'";
    std::set<std::string> names;
    FILE *output = ::popen(command.c_str(), "r");
    char address[32], kind[8], name[512];
    while (output != nullptr && std::fscanf(output, "%31s %7s %511s", address, kind, name) == 3)
        names.insert(name);
    ::pclose(output);
    return names;
}

TEST(Symbols, AreTheDeclaredFunctions) {
    std::set<std::string> declared;
    for (const char *header :
         {"alarm-manager", "isf-control", "system-info", "bookmark", "db-util", "device-power", "dlog",
          "security-server", "smack", "sync-agent", "telephony", "theme", "vconf", "zel-platform"})
        add_declared(std::string("/platform/include/") + header + ".h", declared);
    add_declared("/platform/host/zel-host.h", declared);
    EXPECT_GE(declared.size(), 60U);
    EXPECT_EQ(exported(), declared);
}

} // namespace
