#include "spec/zel-svc-xml-input.h"

ZelSvcXmlResult ZelSvcXmlInput::read_quoted(std::string_view &value) {
    if (at == end) return ZEL_SVC_XML_ERR_EOF;
    if (!zel_svc_xml_is_quote(*at++)) return ZEL_SVC_XML_ERR_SYNTAX;
    const char *first = at;
    const void *quote = left() != 0 ? std::memchr(first, '"', left()) : nullptr;
    if (quote) {
        const char *last = static_cast<const char *>(quote);
        value = {first, static_cast<std::size_t>(last - first)};
        at = last + 1;
        return ZEL_SVC_XML_OK;
    }
    at = end;
    if (!zel_svc_xml_is_quote(end[-1])) return ZEL_SVC_XML_ERR_EOF;
    value = first < end ? std::string_view{first, static_cast<std::size_t>(end - 1 - first)} : std::string_view{};
    return ZEL_SVC_XML_OK;
}
