#pragma once
// Commands of the phone. A command is split into words at blanks, and its first word names a registered
// tool, which answers in this process. No program of the phone or of the workstation is ever executed.

#include "phone.h"

#include <functional>
#include <string>
#include <string_view>

namespace zel_host {

inline constexpr int kNotFound = 32512; // the raw status of a shell that found no program

struct Tool {
    std::string path;    // the command's first word
    int exit_status = 0; // 0 to 255
    std::string file;    // what it writes: a phone path, or an option ("-p") whose next word is the path; or ""
    std::string content; // of that file
    std::string does;    // what else it does on the phone, a row of tool-behaviour.cpp; or ""
};

// Raw wait status.
int run_command(Phone &phone, std::string_view command);

void add_tool(Phone &phone, const Tool &tool);
bool remove_tool(Phone &phone, std::string_view path);
void each_tool(Phone &phone, const std::function<void(const Tool &tool)> &use);

} // namespace zel_host
