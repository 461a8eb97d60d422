#pragma once
// What the phone's own tools do besides answering: the package tools keep the phone's applications. They
// know names and states only; nothing of an application is ever executed.

#include "phone.h"

#include <string_view>
#include <vector>

namespace zel_host {

using Words = std::vector<std::string_view>; // of a command

// The word behind an option ("-p"); "" without it.
std::string_view word_after(const Words &words, std::string_view option);

struct Behaviour {
    std::string_view name;
    int (*run)(Phone &phone, const Words &words); // gives the exit status
};

const Behaviour *find_behaviour(std::string_view name);

} // namespace zel_host
