#pragma once
// What the tokenizer told its callbacks, one text an event, to compare with a literal list:
//
//     EXPECT_THAT(parse_xml("<a>b</a>").events, ElementsAre("begin", "start a", "text b", "end a", "finish"));

#include "spec/zel-svc-xml.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace zel_test {

struct XmlParse {
    ZelSvcXmlResult result;
    std::int32_t position; // where reading ended
    std::vector<std::string> events;
};

// Parses a copy of the bytes that ends with its allocation, so that a byte read behind them is noticed. The
// parse stops after the end of the element named `stop`.
XmlParse parse_xml(std::string_view bytes, std::string_view stop = {});

// Writes one event: "start a x=1 y=2", "text t", "end a", "comment c", ...
const ZelSvcXmlCallbacks &recording_callbacks();
std::vector<std::string> &recorded_events();

} // namespace zel_test
