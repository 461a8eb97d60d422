#include "spec/zel-svc-element-dispatcher.h"

#include "base/zel-svc-observer.h"
#include "spec/zel-svc-element-index.h"
#include "spec/zel-svc-element-state.h"
#include "spec/zel-svc-element-table.h"

#include <exception>

namespace {

const ZelSvcElementIndex gIndex;

// Where the events of the present parse come from.
const ZelSvcXmlParser *gpSource = nullptr;
std::int32_t gSourceOffset = 0;

std::int32_t offset() { return gpSource ? gSourceOffset + gpSource->item : -1; }

ZelSvcElementState &state() { return gZelSvcElementState; }

const ZelSvcElement &row_of(ZelSvcElementId id) { return kZelSvcElementTable[static_cast<std::size_t>(id)]; }

ZelSvcElementId find(std::string_view tag) { return gIndex.find(tag, state().current(), state().enclosing()); }

bool may_fire(ZelSvcElementId id) { return !state().disabled[static_cast<std::size_t>(id)] && row_of(id).enabled != 0; }

// The handler learns which element is on top, which is not the row's own where tags do not nest.
void call(Handler handler, OccurrenceKind kind, std::string_view text, const ZelSvcXmlAttribute *attributes) {
    const ZelSvcElementId current = state().current();
    Occurrence occurrence{
        .kind = kind,
        .element = current,
        .tag = current != ZEL_SVC_ELEMENT_NONE ? row_of(current).tag : std::string_view{},
        .action = geZelSvcParseAction,
        .mode = geZelSvcParseMode,
        .index = state().counts[static_cast<std::size_t>(current)],
        .offset = offset(),
        .text = text,
        .attributes = attributes,
        .out = nullptr,
    };
    try {
        handler(occurrence);
    } catch (const std::exception &) {
        // No memory for this one setting: the others are still applied.
        return;
    }
}

std::int32_t unknown(std::string_view tag) {
    zel_svc_observer().unknown_element(tag, offset());
    return ZEL_SVC_DISPATCH_UNKNOWN;
}

std::int32_t disabled(std::string_view tag) {
    zel_svc_observer().disabled_element(tag, offset());
    return ZEL_SVC_DISPATCH_DISABLED;
}

std::string_view text_of(const char *text, std::int32_t size) {
    return text && size > 0 ? std::string_view{text, static_cast<std::size_t>(size - 1)} : std::string_view{};
}

} // namespace

void zel_svc_element_table_init() {
    zel_svc_element_stack_reset();
    zel_svc_element_counts_reset();
}

void zel_svc_element_set_source(const ZelSvcXmlParser *parser, std::int32_t first_offset) {
    gpSource = parser;
    gSourceOffset = first_offset;
}

ZelSvcElementId zel_svc_element_find(const char *tag) { return find(zel_svc_text_view(tag)); }

std::int32_t zel_svc_element_on_start(std::uint32_t /*user*/, const char *name, std::int32_t size,
                                      const ZelSvcXmlAttribute *attributes) {
    const std::string_view tag = text_of(name, size);
    const ZelSvcElementId id = find(tag);
    if (id == ZEL_SVC_ELEMENT_NONE) return unknown(tag);
    if (!may_fire(id)) return disabled(tag);
    // Too deep a nesting stores nothing, and the handler is called all the same.
    state().push(id);
    if (row_of(id).start) call(row_of(id).start, OccurrenceKind::Start, {}, attributes);
    return ZEL_SVC_DISPATCH_OK;
}

std::int32_t zel_svc_element_on_value(std::uint32_t /*user*/, const char *text, std::int32_t size) {
    const ZelSvcElementId id = state().current();
    if (id == ZEL_SVC_ELEMENT_NONE) return ZEL_SVC_DISPATCH_NO_ELEMENT;
    if (!may_fire(id)) return ZEL_SVC_DISPATCH_DISABLED;
    if (row_of(id).value) call(row_of(id).value, OccurrenceKind::Value, text_of(text, size), nullptr);
    return ZEL_SVC_DISPATCH_OK;
}

std::int32_t zel_svc_element_on_end(std::uint32_t /*user*/, const char *name) {
    const ZelSvcElementId id = find(zel_svc_text_view(name));
    if (id == ZEL_SVC_ELEMENT_NONE) return ZEL_SVC_DISPATCH_UNKNOWN;
    if (!may_fire(id)) return ZEL_SVC_DISPATCH_DISABLED;
    if (row_of(id).end) call(row_of(id).end, OccurrenceKind::End, {}, nullptr);
    if (row_of(id).repeats) ++state().counts[static_cast<std::size_t>(id)];
    // An end tag that does not close the top element leaves it open.
    if (state().current() == id) state().pop();
    return state().is_stop(id) ? ZEL_SVC_DISPATCH_STOP : ZEL_SVC_DISPATCH_OK;
}

const ZelSvcXmlCallbacks kZelSvcElementCallbacks{
    .start_document = [](std::uint32_t, const char *, std::int32_t) { return 0; },
    .end_document = [](std::uint32_t) { return 0; },
    .declaration = [](std::uint32_t, const char *, const char *, const char *) { return 0; },
    .document_type = [](std::uint32_t, const char *, const char *) { return 0; },
    .instruction = [](std::uint32_t, const char *, const char *) { return 0; },
    .start_element = zel_svc_element_on_start,
    .end_element = zel_svc_element_on_end,
    .text = zel_svc_element_on_value,
    .cdata = [](std::uint32_t, const char *) { return 0; },
    .comment = [](std::uint32_t, const char *) { return 0; },
};
