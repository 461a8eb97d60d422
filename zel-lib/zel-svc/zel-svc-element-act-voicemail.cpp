#include "zel-svc-element-act-voicemail.h"

#include "handler/zel-svc-recorded-items.h"

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

RecordedItems<Voicemail> gVoicemails{ZEL_SVC_ELEMENT_VOICEMAIL, ZEL_SVC_AUTO_VOICEMAIL, ZEL_SVC_DATA_VOICE_MAIL,
                                     "voice_mail", kFields};

} // namespace

void zel_svc_element_act_voicemail_start(Occurrence &occurrence) { gVoicemails.start(occurrence); }
void zel_svc_element_act_voicemail_value(Occurrence &occurrence) { gVoicemails.value(occurrence); }
void zel_svc_element_act_voicemail_end(Occurrence &occurrence) { gVoicemails.end(occurrence); }
