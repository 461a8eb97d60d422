#pragma once
// A record: what the children of one repeating element (a network, a profile, an account, a bookmark, ...)
// gather between its start and its end tag. The record is a struct of fixed-width texts, its fields are a
// table, one routine copies texts in and out, and the open record frees itself.
//
//     struct NetworkIdentity { FixedText<40> network_name; FixedText<10> mccmnc; ... };
//
//     constexpr Field<NetworkIdentity> kNetworkFields[] = {
//         field<&NetworkIdentity::network_name>(ZEL_SVC_ELEMENT_NETWORK_INFO_NETWORK_NAME, {.fills = kInstall}),
//         field<&NetworkIdentity::mccmnc>(ZEL_SVC_ELEMENT_MCCMNC, {.fills = kInstall}),
//     };
//     OpenRecord<NetworkIdentity> gNetwork;
//
//     void zel_svc_element_act_network_info_value(Occurrence &o) { gNetwork.copy(kNetworkFields, o); }
//
// A field without an open record is ignored: its start element was disabled or could not be served.

#include "handler/zel-svc-accepts.h"
#include "spec/zel-svc-data.h"
#include "spec/zel-svc-occurrence.h"
#include "spec/zel-svc-verification.h"

#include "base/zel-svc-observer.h"
#include "base/zel-svc-text.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <utility>

// Actions in which a field takes its text from the spec. In the export every field gives its text out.
enum class FieldFills { Install, InstallAndVerify };

// What becomes of a text that a field does not accept: it is ignored, or it is kept as it is and only its
// later use falls back ("Editable" of a bookmark: whatever is not "no" means yes).
enum class FieldOthers { Ignored, Kept };

// How the section store keeps a field: under `key`, a format with at most one "%d" for the item's number.
enum class FieldForm {
    Text,         // the text, an empty one included
    TextIfGiven,  // nothing for an empty text
    Word,         // the number that the accepted word stands for; for any other text `otherwise`
    NumberIfGiven // the number that `reads` finds in the text; nothing for an empty text
};

struct FieldRecord {
    const char *key = nullptr;
    FieldForm form = FieldForm::Text;
    const char *section = nullptr;              // where it is not the record's own
    std::optional<std::int32_t> otherwise = {}; // Word; without it other texts are not recorded
    // NumberIfGiven that is no plain decimal number: its reading and, for a load, the way back.
    std::int32_t (*reads)(std::string_view) = nullptr;
    std::string (*shows)(std::int32_t) = nullptr;
};

// When a field's result line is written and when it passes.
enum class LineWhen { Always, SpecGiven, EitherGiven };

struct FieldReport {
    std::string_view label = {}; // behind the item's own label, "[Bookmark3/URL]"; empty: no line
    LineWhen when = LineWhen::Always;
    // Passes what is not equal all the same; null for none.
    bool (*passes)(std::string_view spec, std::string_view phone) = nullptr;
};

struct FieldRules {
    Accepts accepts = any_text();
    FieldOthers others = FieldOthers::Ignored;
    FieldFills fills = FieldFills::InstallAndVerify;
    FieldRecord record = {};
    FieldReport report = {};
};

// A field's bytes, whatever its width.
struct FieldText {
    char *bytes;
    std::size_t width;

    [[nodiscard]] std::string_view view() const { return zel_svc_text_view(bytes, width); }
    void assign(std::string_view text) const { zel_svc_text_copy(bytes, width, text); }
};

template <class R> struct Field {
    ZelSvcElementId element;
    FieldText (*of)(R &record);
    FieldRules rules = {};
};

namespace detail {
template <class> struct MemberOf;
template <class R, std::size_t N> struct MemberOf<FixedText<N> R::*> {
    using Record = R;
    static constexpr std::size_t width = N;
};
} // namespace detail

// The row of one member.
template <auto Member> constexpr auto field(ZelSvcElementId element, FieldRules rules = {}) {
    using Of = detail::MemberOf<decltype(Member)>;
    using R = typename Of::Record;
    return Field<R>{element, [](R &record) { return FieldText{(record.*Member).data(), Of::width}; }, rules};
}

template <class R> const Field<R> *zel_svc_field_find(std::span<const Field<R>> fields, ZelSvcElementId element) {
    for (const Field<R> &field : fields)
        if (field.element == element) return &field;
    return nullptr;
}

// The one record of its kind that is open, if any.
template <class R> class OpenRecord {
  public:
    // Frees what was open and opens a zeroed record. Out of memory, which an exception tells, there is none, and
    // the element's values and end do nothing.
    void open() {
        record_.reset();
        record_ = std::make_unique<R>();
    }
    // Keeps a record that is already open.
    void open_unless_pending() {
        if (!record_) open();
    }
    void close() { record_.reset(); }

    // Hands the record over: it is freed when the owner goes, whatever happens on the way.
    [[nodiscard]] std::unique_ptr<R> take() { return std::move(record_); }

    explicit operator bool() const { return record_ != nullptr; }
    R *operator->() { return record_.get(); }
    R &operator*() { return *record_; }

    // The bytes of the element's field in the open record; nothing without either.
    std::optional<FieldText> text_of(std::span<const Field<R>> fields, ZelSvcElementId element) {
        const Field<R> *field = record_ ? zel_svc_field_find(fields, element) : nullptr;
        if (!field) return std::nullopt;
        return field->of(*record_);
    }

    // Copies a value's text into the field of its element, or out of it in an export. False when there is
    // no record, no such field, or the text is not accepted.
    bool copy(std::span<const Field<R>> fields, Occurrence &occurrence) {
        const Field<R> *field = record_ ? zel_svc_field_find(fields, occurrence.element) : nullptr;
        if (!field) return false;
        const FieldText text = field->of(*record_);
        if (occurrence.exports()) {
            if (occurrence.out) occurrence.out->assign(text.view());
            return occurrence.out != nullptr;
        }
        if (occurrence.verifies() && field->rules.fills == FieldFills::Install) return false;
        if (field->rules.others == FieldOthers::Ignored &&
            !zel_svc_accepts_value(field->rules.accepts, occurrence.text)) {
            zel_svc_observer().refused_text(occurrence.tag, occurrence.text, occurrence.offset);
            return false;
        }
        text.assign(occurrence.text);
        return true;
    }

  private:
    std::unique_ptr<R> record_;
};

// The number that a field of the form Word or NumberIfGiven records for a text; nothing when it records none.
std::optional<std::int32_t> zel_svc_field_number(const FieldRules &rules, std::string_view text);

// Writes one field of item number `number` to the section store in the form that its rules name. False when
// there was nothing to write.
bool zel_svc_field_save(ZelSvcDataGroup group, const char *section, const FieldRules &rules, int number,
                        std::string_view text);

// Writes every field that has a record key, in table order.
template <class R>
void zel_svc_record_save(ZelSvcDataGroup group, const char *section, std::span<const Field<R>> fields, R &record,
                         int number) {
    for (const Field<R> &field : fields)
        zel_svc_field_save(group, section, field.rules, number, field.of(record).view());
}

// Fills one field with what the section store keeps of item `number`, as the text of the spec: the word of a
// number, the number itself. What is absent, a number of -1 and one that no word stands for leave it empty.
void zel_svc_field_load(ZelSvcDataGroup group, const char *section, const FieldRules &rules, int number,
                        FieldText text);

// Loads every field that has a record key; the others stay as they are.
template <class R>
void zel_svc_record_load(ZelSvcDataGroup group, const char *section, std::span<const Field<R>> fields, R &record,
                         int number) {
    for (const Field<R> &field : fields)
        zel_svc_field_load(group, section, field.rules, number, field.of(record));
}

// The number of the item to be written: one above the section's "count". Behind the largest number comes the
// same again.
int zel_svc_record_next_number(ZelSvcDataGroup group, const char *section);

// Sets the section's "count" to that number and returns it.
int zel_svc_record_count_up(ZelSvcDataGroup group, const char *section);

// Adds the line "[item/label] Spec='...',Phone='...'" of one field, when its rules want one; an empty item
// leaves "[label]". Whether it passed; nothing without a line.
std::optional<bool> zel_svc_field_compare(std::string_view item, const FieldReport &report, std::string_view spec,
                                          std::string_view phone);

template <class R>
void zel_svc_record_compare(std::string_view item, std::span<const Field<R>> fields, R &spec, R &phone) {
    for (const Field<R> &field : fields)
        zel_svc_field_compare(item, field.rules.report, field.of(spec).view(), field.of(phone).view());
}
