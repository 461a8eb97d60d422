#include "spec/zel-svc-xml-entities.h"
#include "spec/zel-svc-xml-run.h"

namespace {

enum class Tag { Open, Empty };

// A name that ends within the next 32 bytes, found and copied at once; false leaves it to the plain reader.
bool read_short_name(ZelSvcXmlInput &input, std::uint8_t ends, ZelSvcXmlName &name) {
    static_assert(sizeof name.text == ZEL_SVC_XML_BLOCK_SIZE);
    if (input.left() < ZEL_SVC_XML_BLOCK_SIZE) return false;
    const ZelSvcXmlBlock block{input.at};
    // Control bytes that are no delimiters stop here too, and are sorted out below.
    ZelSvcXmlFits fits = block.at_most(' ') | block.equal('>');
    if (ends == ZEL_SVC_XML_ENDS_ELEMENT) fits = fits | block.equal('/');
    const std::uint32_t stops = zel_svc_xml_mask(fits);
    if (stops == 0) return false;
    const int length = std::countr_zero(stops);
    const char *stop = input.at + length;
    if ((kZelSvcXmlByteClasses[static_cast<unsigned char>(*stop)] & ends) == 0) return false;
    block.store(name.text);
    name.text[length] = '\0';
    name.size = length + 1;
    input.at = stop;
    return length != 0;
}

ZelSvcXmlResult read_name(ZelSvcXmlInput &input, std::uint8_t ends, ZelSvcXmlName &name) {
    return read_short_name(input, ends, name) ? ZEL_SVC_XML_OK : zel_svc_xml_read_name(input, ends, name);
}

ZelSvcXmlResult read_attribute(ZelSvcXmlRun &run) {
    ZelSvcXmlInput &input = run.input;
    std::string_view name;
    std::string_view value;
    if (const auto result = input.read_until(ZEL_SVC_XML_ENDS_ATTRIBUTE, name)) return result;
    name = zel_svc_xml_to_nul(name);
    if (name.empty()) return ZEL_SVC_XML_ERR_SYNTAX;
    if (const auto result = input.skip_space()) return result;
    if (const auto result = input.match('=')) return result;
    if (const auto result = input.skip_space()) return result;
    if (const auto result = input.read_quoted(value)) return result;
    return run.attributes.append(name, zel_svc_xml_to_nul(value)) ? ZEL_SVC_XML_OK : ZEL_SVC_XML_ERR_SYNTAX;
}

// The attributes and the end of a start tag.
ZelSvcXmlResult read_rest_of_tag(ZelSvcXmlRun &run, Tag &tag) {
    run.attributes.clear();
    while (true) {
        if (const auto result = run.input.skip_space()) return result;
        if (*run.input.at == '/' || *run.input.at == '>') break;
        if (const auto result = read_attribute(run)) return result;
    }
    tag = *run.input.at == '/' ? Tag::Empty : Tag::Open;
    if (tag == Tag::Empty) ++run.input.at;
    return run.input.match('>');
}

ZelSvcXmlResult read_start_tag(ZelSvcXmlRun &run, Tag &tag) {
    const ZelSvcXmlCallbacks &callbacks = *run.parser.callbacks;
    const char *item = run.input.at++;
    ZelSvcXmlName name;
    if (const auto result = read_name(run.input, ZEL_SVC_XML_ENDS_ELEMENT, name)) return result;
    if (const auto result = read_rest_of_tag(run, tag)) return result;
    run.locate(item);
    if (callbacks.start_element) callbacks.start_element(run.parser.user, name.text, name.size, run.attributes.first());
    if (tag == Tag::Empty && callbacks.end_element) callbacks.end_element(run.parser.user, name.text);
    return ZEL_SVC_XML_OK;
}

// Spec files are written by hand: one stray byte after the name's white space is let pass, and the name is
// not compared with that of the start tag.
ZelSvcXmlResult read_end_tag(ZelSvcXmlRun &run) {
    ZelSvcXmlInput &input = run.input;
    const char *item = input.at;
    ZelSvcXmlName name;
    if (const auto result = input.match("</")) return result;
    if (const auto result = read_name(input, ZEL_SVC_XML_ENDS_END_TAG, name)) return result;
    if (const auto result = input.skip_space()) return result;
    if (*input.at != '>') ++input.at;
    if (const auto result = input.match('>')) return result;
    if (!run.parser.callbacks->end_element) return ZEL_SVC_XML_OK;
    run.locate(item);
    if (run.parser.callbacks->end_element(run.parser.user, name.text) != ZEL_SVC_XML_STOP) return ZEL_SVC_XML_OK;
    input.at = input.end;
    return ZEL_SVC_XML_STOP;
}

// A text that ends within the next 32 bytes and stands as it is: its length, 0 for any other.
std::size_t short_text(const ZelSvcXmlInput &input, char *copy) {
    if (input.left() < ZEL_SVC_XML_BLOCK_SIZE) return 0;
    const ZelSvcXmlBlock block{input.at};
    const std::uint32_t stops = zel_svc_xml_mask(block.equal('<') | block.equal('&') | block.equal('\0'));
    if (stops == 0) return 0;
    const auto length = static_cast<std::size_t>(std::countr_zero(stops));
    if (input.at[length] != '<') return 0;
    block.store(copy);
    return length;
}

ZelSvcXmlResult read_text(ZelSvcXmlRun &run) {
    const char *item = run.input.at;
    char *copy = run.text.reserve(ZEL_SVC_XML_BLOCK_SIZE);
    if (!copy) return ZEL_SVC_XML_ERR_SYNTAX;
    std::size_t length = short_text(run.input, copy);
    if (length != 0) {
        copy[length] = '\0';
        run.input.at += length;
    } else {
        const void *next = std::memchr(item, '<', run.input.left());
        if (!next) return run.input.to_end();
        run.input.at = static_cast<const char *>(next);
        const std::string_view raw = zel_svc_xml_to_nul({item, static_cast<std::size_t>(run.input.at - item)});
        if (raw.empty()) return ZEL_SVC_XML_OK;
        copy = run.text.copy(raw);
        if (!copy) return ZEL_SVC_XML_ERR_SYNTAX;
        length = zel_svc_xml_decode_in_place(copy, raw.size());
    }
    if (!run.parser.callbacks->text) return ZEL_SVC_XML_OK;
    run.locate(item);
    run.parser.callbacks->text(run.parser.user, copy, static_cast<std::int32_t>(length + 1));
    return ZEL_SVC_XML_OK;
}

// "<!" of a comment or a CDATA section; nothing else may follow it here.
ZelSvcXmlResult read_marked(ZelSvcXmlRun &run) {
    if (run.input.left() < 3) return run.input.to_end();
    if (run.input.at[2] == '-') return zel_svc_xml_read_comment(run);
    if (run.input.at[2] == '[') return zel_svc_xml_read_cdata(run);
    return ZEL_SVC_XML_ERR_SYNTAX;
}

// How deep elements nest is counted, not recursed into: a hostile file must not exhaust a caller's stack.
ZelSvcXmlResult read_item(ZelSvcXmlRun &run, std::size_t &depth) {
    if (const auto result = run.input.skip_space()) return result;
    if (*run.input.at != '<') return read_text(run);
    if (run.input.left() < 2) return run.input.to_end();
    switch (run.input.at[1]) {
    case '/':
        --depth;
        return read_end_tag(run);
    case '?':
        return zel_svc_xml_read_instruction(run);
    case '!':
        return read_marked(run);
    default:
        break;
    }
    Tag tag = Tag::Open;
    if (const auto result = read_start_tag(run, tag)) return result;
    if (tag == Tag::Open) ++depth;
    return ZEL_SVC_XML_OK;
}

} // namespace

ZelSvcXmlResult zel_svc_xml_read_element(ZelSvcXmlRun &run) {
    // An unfinished comment may still follow "<!", a declaration not.
    const bool is_declaration = run.input.left() > 1 && run.input.at[1] == '!';
    if (is_declaration) return run.input.left() > 2 ? ZEL_SVC_XML_ERR_SYNTAX : run.input.to_end();
    Tag tag = Tag::Open;
    if (const auto result = read_start_tag(run, tag)) return result;
    std::size_t depth = tag == Tag::Open ? 1 : 0;
    while (depth > 0)
        if (const auto result = read_item(run, depth)) return result;
    return ZEL_SVC_XML_OK;
}
