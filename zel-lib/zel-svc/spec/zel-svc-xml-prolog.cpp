#include "base/zel-svc-text.h"
#include "spec/zel-svc-xml-run.h"

namespace {

// Values of the XML declaration have at most 9 bytes.
using DeclarationValue = FixedText<10>;

struct Declaration {
    DeclarationValue version;
    DeclarationValue encoding;
    DeclarationValue standalone;
};

// NAME = "value", with the white space that follows.
ZelSvcXmlResult read_assignment(ZelSvcXmlInput &input, std::string_view name, DeclarationValue &value) {
    std::string_view bytes;
    if (const auto result = input.match(name)) return result;
    if (const auto result = input.skip_space()) return result;
    if (const auto result = input.match('=')) return result;
    if (const auto result = input.skip_space()) return result;
    if (const auto result = input.read_quoted(bytes)) return result;
    if (bytes.size() >= DeclarationValue::width) return ZEL_SVC_XML_ERR_SYNTAX;
    value.assign(bytes);
    return input.skip_space();
}

// "?>" or one more assignment.
ZelSvcXmlResult read_rest_of_declaration(ZelSvcXmlInput &input, Declaration &declaration) {
    while (*input.at != '?') {
        if (*input.at != 'e' && *input.at != 's') return ZEL_SVC_XML_ERR_SYNTAX;
        const auto result = *input.at == 'e' ? read_assignment(input, "encoding", declaration.encoding)
                                             : read_assignment(input, "standalone", declaration.standalone);
        if (result) return result;
    }
    return input.match("?>");
}

ZelSvcXmlResult read_declaration(ZelSvcXmlRun &run) {
    const char *item = run.input.at;
    Declaration declaration;
    if (const auto result = run.input.match("<?xml")) return result;
    if (const auto result = run.input.skip_space()) return result;
    if (const auto result = read_assignment(run.input, "version", declaration.version)) return result;
    if (const auto result = read_rest_of_declaration(run.input, declaration)) return result;
    run.locate(item);
    if (run.parser.callbacks->declaration)
        run.parser.callbacks->declaration(run.parser.user, declaration.version.c_str(), declaration.encoding.c_str(),
                                          declaration.standalone.c_str());
    return ZEL_SVC_XML_OK;
}

// Declarations inside a document type are not known: it ends at its first ">".
ZelSvcXmlResult read_document_type(ZelSvcXmlRun &run) {
    ZelSvcXmlInput &input = run.input;
    const char *item = input.at;
    ZelSvcXmlName name;
    std::string_view rest;
    if (const auto result = input.match("<!DOCTYPE")) return result;
    if (const auto result = input.skip_space()) return result;
    if (const auto result = zel_svc_xml_read_name(input, ZEL_SVC_XML_SPACE, name)) return result;
    if (const auto result = input.skip_space()) return result;
    if (const auto result = input.read_through(">", rest)) return result;
    if (!run.parser.callbacks->document_type) return ZEL_SVC_XML_OK;
    const char *copy = rest.empty() ? nullptr : run.text.copy(zel_svc_xml_to_nul(rest));
    if (!rest.empty() && !copy) return ZEL_SVC_XML_ERR_SYNTAX;
    run.locate(item);
    run.parser.callbacks->document_type(run.parser.user, name.text, copy);
    return ZEL_SVC_XML_OK;
}

enum class PrologItem { Comment, DocumentType, Declaration, Instruction, None };

// What the two bytes after "<" announce. A missing byte is one that fits nothing.
PrologItem prolog_item(const ZelSvcXmlInput &input) {
    const char first = input.left() > 1 ? input.at[1] : '\0';
    const char second = input.left() > 2 ? input.at[2] : '\0';
    if (first == '?') return second == 'x' ? PrologItem::Declaration : PrologItem::Instruction;
    if (first == '!' && second == '-') return PrologItem::Comment;
    if (first == '!' && second == 'D') return PrologItem::DocumentType;
    return PrologItem::None;
}

ZelSvcXmlResult read_item(ZelSvcXmlRun &run, PrologItem item) {
    if (item == PrologItem::Comment) return zel_svc_xml_read_comment(run);
    if (item == PrologItem::DocumentType) return read_document_type(run);
    if (item == PrologItem::Declaration) return read_declaration(run);
    return zel_svc_xml_read_instruction(run);
}

} // namespace

ZelSvcXmlResult zel_svc_xml_read_prolog(ZelSvcXmlRun &run) {
    while (true) {
        if (const auto result = run.input.skip_space()) return result;
        if (*run.input.at != '<') return ZEL_SVC_XML_ERR_SYNTAX;
        const PrologItem item = prolog_item(run.input);
        if (item == PrologItem::None) return ZEL_SVC_XML_OK;
        if (const auto result = read_item(run, item)) return result;
    }
}
