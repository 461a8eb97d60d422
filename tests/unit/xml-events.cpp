#include "unit/xml-events.h"

#include <cstring>
#include <memory>
#include <stdexcept>

namespace zel_test {
namespace {

constexpr std::uint32_t kUser = 77;
std::vector<std::string> gEvents;
std::string gStop;

std::int32_t record(std::uint32_t user, const std::string &event) {
    if (user != kUser) throw std::logic_error("the user value was changed");
    gEvents.push_back(event);
    // Any result but that of an end tag is ignored, so a stop is no stop here.
    return ZEL_SVC_XML_STOP;
}

std::string or_null(const char *text) { return text ? text : "(null)"; }

std::int32_t on_start(std::uint32_t user, const char *name, std::int32_t size, const ZelSvcXmlAttribute *attributes) {
    std::string event = std::string("start ") + name;
    if (static_cast<std::size_t>(size) != std::strlen(name) + 1) event += " wrong size";
    for (; attributes; attributes = attributes->next)
        event += std::string(" ") + attributes->name + "=" + attributes->value;
    return record(user, event);
}

std::int32_t on_end(std::uint32_t user, const char *name) {
    record(user, std::string("end ") + name);
    return gStop == name ? ZEL_SVC_XML_STOP : 5;
}

std::int32_t on_text(std::uint32_t user, const char *text, std::int32_t size) {
    const bool is_terminated = static_cast<std::size_t>(size) == std::strlen(text) + 1;
    return record(user, std::string("text ") + text + (is_terminated ? "" : " wrong size"));
}

} // namespace

const ZelSvcXmlCallbacks &recording_callbacks() {
    static const ZelSvcXmlCallbacks callbacks{
        .start_document = [](std::uint32_t user, const char *, std::int32_t) { return record(user, "begin"); },
        .end_document = [](std::uint32_t user) { return record(user, "finish"); },
        .declaration =
            [](std::uint32_t user, const char *version, const char *encoding, const char *standalone) {
                return record(user, std::string("xml ") + version + "," + encoding + "," + standalone);
            },
        .document_type =
            [](std::uint32_t user, const char *name, const char *rest) {
                return record(user, std::string("type ") + name + " " + or_null(rest));
            },
        .instruction = [](std::uint32_t user, const char *target,
                          const char *data) { return record(user, std::string("pi ") + target + " " + or_null(data)); },
        .start_element = on_start,
        .end_element = on_end,
        .text = on_text,
        .cdata = [](std::uint32_t user, const char *text) { return record(user, std::string("cdata ") + text); },
        .comment = [](std::uint32_t user, const char *text) { return record(user, std::string("comment ") + text); },
    };
    return callbacks;
}

std::vector<std::string> &recorded_events() { return gEvents; }

XmlParse parse_xml(std::string_view bytes, std::string_view stop) {
    gEvents.clear();
    gStop = stop;
    const std::unique_ptr<char[]> copy{new char[bytes.size()]};
    if (!bytes.empty()) std::memcpy(copy.get(), bytes.data(), bytes.size());
    ZelSvcXmlParser *parser = zel_svc_xml_parser_create(&recording_callbacks(), kUser);
    const ZelSvcXmlResult result = zel_svc_xml_parse(parser, copy.get(), static_cast<std::int32_t>(bytes.size()));
    const std::int32_t position = parser->cursor->position;
    zel_svc_xml_parser_destroy(parser);
    return {result, position, gEvents};
}

} // namespace zel_test
