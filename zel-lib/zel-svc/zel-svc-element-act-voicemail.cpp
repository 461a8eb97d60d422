#include "zel-svc-element-act-voicemail.h"

#include "handler/zel-svc-applies.h"
#include "handler/zel-svc-record.h"

namespace {

struct Voicemail {
    FixedText<40> network_name;
    FixedText<200> name;
    FixedText<200> number;
};

// The network name chooses the entry and is not recorded.
constexpr Field<Voicemail> kFields[] = {
    field<&Voicemail::network_name>(ZEL_SVC_ELEMENT_VOICEMAIL_NETWORK_NAME),
    field<&Voicemail::name>(ZEL_SVC_ELEMENT_VOICEMAIL_NAME, {.record = {"name_%d"}}),
    field<&Voicemail::number>(ZEL_SVC_ELEMENT_VOICEMAIL_TEL_NUM, {.record = {"tel_num_%d"}}),
};

constexpr const char *kSection = "voice_mail";

OpenRecord<Voicemail> gVoicemail;

} // namespace

void zel_svc_element_act_voicemail_start(Occurrence &occurrence) {
    if (occurrence.element == ZEL_SVC_ELEMENT_VOICEMAIL && occurrence.installs()) gVoicemail.open();
}

void zel_svc_element_act_voicemail_value(Occurrence &occurrence) {
    if (occurrence.installs()) gVoicemail.copy(kFields, occurrence);
}

void zel_svc_element_act_voicemail_end(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_VOICEMAIL || !occurrence.installs()) return;
    const auto voicemail = gVoicemail.take();
    if (!voicemail) return;
    if (!zel_svc_item_applies(occurrence, ZEL_SVC_AUTO_VOICEMAIL, voicemail->network_name.view())) return;
    const int number = zel_svc_record_count_up(ZEL_SVC_DATA_VOICE_MAIL, kSection);
    zel_svc_record_save<Voicemail>(ZEL_SVC_DATA_VOICE_MAIL, kSection, kFields, *voicemail, number);
}
