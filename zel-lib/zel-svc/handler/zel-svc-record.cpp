#include "handler/zel-svc-record.h"

#include "base/zel-svc-number.h"

#include <limits>
#include <string>

namespace {

bool wants_line(LineWhen when, std::string_view spec, std::string_view phone) {
    switch (when) {
    case LineWhen::Always:
        return true;
    case LineWhen::SpecGiven:
        return !spec.empty();
    case LineWhen::EitherGiven:
        return !spec.empty() || !phone.empty();
    }
    return true;
}

// The key of item `number`: the format's one "%d" replaced by it.
std::string key_of(const char *format, int number) {
    std::string key{format};
    if (const std::size_t at = key.find("%d"); at != std::string::npos) key.replace(at, 2, std::to_string(number));
    return key;
}

bool is_text(FieldForm form) { return form == FieldForm::Text || form == FieldForm::TextIfGiven; }

constexpr std::int32_t kAbsent = -1;

std::string shown(const FieldRules &rules, std::int32_t value) {
    if (rules.record.form == FieldForm::Word) return zel_svc_accepts_text(rules.accepts, value).value_or("");
    if (value == kAbsent) return {};
    return rules.record.shows ? rules.record.shows(value) : zel_svc_number_text(value);
}

} // namespace

std::optional<std::int32_t> zel_svc_field_number(const FieldRules &rules, std::string_view text) {
    if (rules.record.form == FieldForm::Word) {
        const auto value = zel_svc_accepts_value(rules.accepts, text);
        return value ? value : rules.record.otherwise;
    }
    if (text.empty()) return std::nullopt;
    return rules.record.reads ? rules.record.reads(text) : zel_svc_number_from_text(text);
}

bool zel_svc_field_save(ZelSvcDataGroup group, const char *section, const FieldRules &rules, int number,
                        std::string_view text) {
    const FieldRecord &record = rules.record;
    if (!record.key) return false;
    const char *where = record.section ? record.section : section;
    const std::string key = key_of(record.key, number);
    if (is_text(record.form)) {
        if (record.form == FieldForm::TextIfGiven && text.empty()) return false;
        zel_svc_data_set_str(group, where, key.c_str(), text);
        return true;
    }
    const std::optional<std::int32_t> value = zel_svc_field_number(rules, text);
    if (!value) return false;
    zel_svc_data_set_int(group, where, key.c_str(), *value);
    return true;
}

void zel_svc_field_load(ZelSvcDataGroup group, const char *section, const FieldRules &rules, int number,
                        FieldText text) {
    const FieldRecord &record = rules.record;
    if (!record.key) return;
    const char *where = record.section ? record.section : section;
    const std::string key = key_of(record.key, number);
    if (is_text(record.form)) return text.assign(zel_svc_data_get_text(group, where, key.c_str()));
    if (!zel_svc_data_find(group, where, key.c_str())) return text.assign({});
    text.assign(shown(rules, zel_svc_data_get_int(group, where, key.c_str(), kAbsent)));
}

int zel_svc_record_next_number(ZelSvcDataGroup group, const char *section) {
    const int held = zel_svc_data_get_int(group, section, "count", 0);
    return held < std::numeric_limits<int>::max() ? held + 1 : held;
}

int zel_svc_record_count_up(ZelSvcDataGroup group, const char *section) {
    const int number = zel_svc_record_next_number(group, section);
    zel_svc_data_set_int(group, section, "count", number);
    return number;
}

std::optional<bool> zel_svc_field_compare(std::string_view item, const FieldReport &report, std::string_view spec,
                                          std::string_view phone) {
    if (report.label.empty() || !wants_line(report.when, spec, phone)) return std::nullopt;
    std::string label{item};
    if (!item.empty()) label += '/';
    label += report.label;
    const bool passes = spec == phone || (report.passes && report.passes(spec, phone));
    zel_svc_verification_add_compared(label, spec, phone, passes);
    return passes;
}
