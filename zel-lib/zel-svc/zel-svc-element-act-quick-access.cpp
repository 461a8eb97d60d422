#include "zel-svc-element-act-quick-access.h"

#include "base/zel-svc-number.h"
#include "handler/zel-svc-record.h"
#include "handler/zel-svc-setting.h"

namespace {

struct QuickAccess {
    FixedText<20> editable;
    FixedText<200> title;
    FixedText<200> url;
};
static_assert(sizeof(QuickAccess) == 420);

constexpr const char *kSection = "quickaccess";

// Only the two words are recorded: the browser decides about anything else.
constexpr Field<QuickAccess> kFields[] = {
    field<&QuickAccess::editable>(
        ZEL_SVC_ELEMENT_QUICK_ACCESS_EDITABLE,
        {.accepts = yes_no(), .others = FieldOthers::Kept, .record = {.key = "editable_%d", .form = FieldForm::Word}}),
    field<&QuickAccess::title>(ZEL_SVC_ELEMENT_QA_TITLE, {.record = {.key = "title_%d"}}),
    field<&QuickAccess::url>(ZEL_SVC_ELEMENT_QA_URL, {.record = {.key = "url_%d"}}),
};

OpenRecord<QuickAccess> gEntry;
int gNumber = 1; // of the recorded entry, for verification and export

void compare(const Occurrence &occurrence, std::string_view spec, std::string_view phone) {
    zel_svc_setting_add_result("QuickAccess", occurrence.tag, spec, phone, spec == phone);
}

} // namespace

void zel_svc_element_act_quick_access_begin_parse() { gEntry.close(); }

void zel_svc_element_act_quick_access_count(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_NB_QUICK_ACCESS || occurrence.installs()) return;
    gNumber = 1;
    const std::string count =
        zel_svc_number_text(zel_svc_data_get_int(ZEL_SVC_DATA_QUICK_ACCESS, kSection, "count", 0));
    if (occurrence.verifies()) return compare(occurrence, occurrence.text, count);
    if (occurrence.out) occurrence.out->assign(count);
}

void zel_svc_element_act_quick_access_start(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_QUICK_ACCESS) return;
    gEntry.open();
    if (occurrence.installs() || !gEntry) return;
    zel_svc_record_load<QuickAccess>(ZEL_SVC_DATA_QUICK_ACCESS, kSection, kFields, *gEntry, gNumber);
}

// A verification compares each text as it comes, cut as the record would have cut it.
void zel_svc_element_act_quick_access_value(Occurrence &occurrence) {
    if (!occurrence.verifies()) {
        gEntry.copy(kFields, occurrence);
        return;
    }
    const auto recorded = gEntry.text_of(kFields, occurrence.element);
    if (!recorded) return;
    const std::string_view spec = occurrence.text.substr(0, zel_svc_text_cut(occurrence.text, recorded->width - 1));
    compare(occurrence, spec, recorded->view());
}

void zel_svc_element_act_quick_access_end(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_QUICK_ACCESS) return;
    const auto entry = gEntry.take();
    if (!occurrence.installs()) {
        ++gNumber;
        return;
    }
    if (!entry) return;
    const int number = zel_svc_record_count_up(ZEL_SVC_DATA_QUICK_ACCESS, kSection);
    zel_svc_record_save<QuickAccess>(ZEL_SVC_DATA_QUICK_ACCESS, kSection, kFields, *entry, number);
}
