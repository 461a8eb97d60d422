#include "spec/zel-svc-xml-run.h"

namespace {

using TextCallback = std::int32_t (*)(std::uint32_t user, const char *text);

ZelSvcXmlResult read_text_item(ZelSvcXmlRun &run, std::string_view opening, std::string_view closing,
                               TextCallback callback) {
    const char *item = run.input.at;
    std::string_view bytes;
    if (const auto result = run.input.match(opening)) return result;
    if (const auto result = run.input.read_through(closing, bytes)) return result;
    if (!callback) return ZEL_SVC_XML_OK;
    const char *text = run.text.copy(zel_svc_xml_to_nul(bytes));
    if (!text) return ZEL_SVC_XML_ERR_SYNTAX;
    run.locate(item);
    callback(run.parser.user, text);
    return ZEL_SVC_XML_OK;
}

} // namespace

ZelSvcXmlResult zel_svc_xml_read_name(ZelSvcXmlInput &input, std::uint8_t ends, ZelSvcXmlName &name) {
    std::string_view bytes;
    if (const auto result = input.read_until(ends, bytes)) return result;
    if (bytes.size() >= ZEL_SVC_XML_NAME_SIZE) return ZEL_SVC_XML_ERR_SYNTAX;
    bytes = zel_svc_xml_to_nul(bytes);
    if (bytes.empty()) return ZEL_SVC_XML_ERR_SYNTAX;
    std::memcpy(name.text, bytes.data(), bytes.size());
    name.text[bytes.size()] = '\0';
    name.size = static_cast<std::int32_t>(bytes.size() + 1);
    return ZEL_SVC_XML_OK;
}

ZelSvcXmlResult zel_svc_xml_read_comment(ZelSvcXmlRun &run) {
    return read_text_item(run, "<!--", "-->", run.parser.callbacks->comment);
}

ZelSvcXmlResult zel_svc_xml_read_cdata(ZelSvcXmlRun &run) {
    return read_text_item(run, "<![CDATA[", "]]>", run.parser.callbacks->cdata);
}

ZelSvcXmlResult zel_svc_xml_read_instruction(ZelSvcXmlRun &run) {
    ZelSvcXmlInput &input = run.input;
    const char *item = input.at;
    ZelSvcXmlName target;
    std::string_view data;
    if (const auto result = input.match("<?")) return result;
    if (const auto result = input.skip_space()) return result;
    if (const auto result = zel_svc_xml_read_name(input, ZEL_SVC_XML_ENDS_TARGET, target)) return result;
    if (const auto result = input.skip_space()) return result;
    if (const auto result = input.read_through("?>", data)) return result;
    if (!run.parser.callbacks->instruction) return ZEL_SVC_XML_OK;
    const char *copy = data.empty() ? nullptr : run.text.copy(zel_svc_xml_to_nul(data));
    if (!data.empty() && !copy) return ZEL_SVC_XML_ERR_SYNTAX;
    run.locate(item);
    run.parser.callbacks->instruction(run.parser.user, target.text, copy);
    return ZEL_SVC_XML_OK;
}
