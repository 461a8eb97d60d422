#pragma once
// One parse, as the readers of the tokenizer's files share it.

#include "spec/zel-svc-xml-buffer.h"
#include "spec/zel-svc-xml-input.h"

#include <cstdint>

// Names are handed on in buffers of this size; one that does not fit is a syntax error.
inline constexpr std::size_t ZEL_SVC_XML_NAME_SIZE = 32;

struct ZelSvcXmlName {
    char text[ZEL_SVC_XML_NAME_SIZE];
    std::int32_t size; // with the terminator
};

struct ZelSvcXmlRun {
    ZelSvcXmlParser &parser;
    ZelSvcXmlInput input;
    ZelSvcXmlBuffer text;
    ZelSvcXmlAttributes attributes;

    // Tells callbacks where their item begins and where reading stands.
    void locate(const char *item) const {
        parser.item = static_cast<std::int32_t>(item - parser.cursor->buffer);
        parser.cursor->position = static_cast<std::int32_t>(input.at - parser.cursor->buffer);
    }
};

// A name up to a byte of the class. No byte, or 32 and more, are a syntax error.
ZelSvcXmlResult zel_svc_xml_read_name(ZelSvcXmlInput &input, std::uint8_t ends, ZelSvcXmlName &name);

// What stands in front of the root element, up to its "<".
ZelSvcXmlResult zel_svc_xml_read_prolog(ZelSvcXmlRun &run);

// One element and all that is in it.
ZelSvcXmlResult zel_svc_xml_read_element(ZelSvcXmlRun &run);

// Items of prolog and content, read from their "<".
ZelSvcXmlResult zel_svc_xml_read_comment(ZelSvcXmlRun &run);
ZelSvcXmlResult zel_svc_xml_read_cdata(ZelSvcXmlRun &run);
ZelSvcXmlResult zel_svc_xml_read_instruction(ZelSvcXmlRun &run);
