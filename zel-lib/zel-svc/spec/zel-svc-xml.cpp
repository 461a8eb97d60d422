#include "spec/zel-svc-xml.h"

#include "spec/zel-svc-xml-run.h"

#include <new>

namespace {

ZelSvcXmlResult read_document(ZelSvcXmlRun &run) {
    const ZelSvcXmlCallbacks &callbacks = *run.parser.callbacks;
    if (const auto result = zel_svc_xml_read_prolog(run)) return result;
    if (const auto result = zel_svc_xml_read_element(run)) return result;
    run.locate(run.input.at);
    if (callbacks.end_document) callbacks.end_document(run.parser.user);
    return ZEL_SVC_XML_OK;
}

} // namespace

ZelSvcXmlParser *zel_svc_xml_parser_create(const ZelSvcXmlCallbacks *callbacks, std::uint32_t user) {
    auto *cursor = new (std::nothrow) ZelSvcXmlCursor{};
    auto *parser = new (std::nothrow) ZelSvcXmlParser{cursor, callbacks, user, 0};
    if (!parser) delete cursor;
    return parser;
}

void zel_svc_xml_parser_destroy(ZelSvcXmlParser *parser) {
    if (!parser) return;
    delete parser->cursor;
    delete parser;
}

ZelSvcXmlResult zel_svc_xml_parse(ZelSvcXmlParser *parser, const char *buffer, std::int32_t length) {
    if (!parser || !parser->callbacks || !parser->cursor) return ZEL_SVC_XML_ERR_SYNTAX;
    // An empty input still has a first byte to point at.
    const bool is_empty = !buffer || length <= 0;
    *parser->cursor = is_empty ? ZelSvcXmlCursor{"", 0, 0} : ZelSvcXmlCursor{buffer, length, 0};
    parser->item = 0;
    const char *first = parser->cursor->buffer;
    ZelSvcXmlRun run{*parser, {first, first + parser->cursor->length}, {}, {}};
    if (parser->callbacks->start_document) parser->callbacks->start_document(parser->user, buffer, length);
    const ZelSvcXmlResult result = read_document(run);
    parser->cursor->position = static_cast<std::int32_t>(run.input.at - first);
    return result;
}
