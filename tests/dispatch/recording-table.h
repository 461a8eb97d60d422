#pragma once
// An element table with the rows of the vocabulary, every one with all three handlers. Each writes down that
// it was called: "start GPS", "value GPS off", "end GPS", with " in TAG" when another element is on top.

#include "spec/zel-svc-occurrence.h"

#include <map>
#include <string>
#include <vector>

namespace zel_test {

struct Call {
    std::string text;
    Occurrence occurrence;
};

std::vector<Call> &calls();
std::vector<std::string> call_texts();

// What a handler gives out in an export: of "start Wallpaper" an attribute text, of "value GPS" a value.
// For "no memory" it throws, as for a text of a parse that says so.
std::map<std::string, std::string> &export_texts();

// How often a parse began.
int begun_parses();

} // namespace zel_test
