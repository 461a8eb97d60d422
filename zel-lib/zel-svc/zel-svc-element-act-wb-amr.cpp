#include "zel-svc-element-act-wb-amr.h"

#include "handler/zel-svc-applies.h"
#include "handler/zel-svc-record.h"
#include "handler/zel-svc-setting-rows.h"

namespace {

constexpr Store kCodecSwitch = int_key("db/zel/network/wb_amr_codec");

// Whatever the count says, the codec is off until an operator turns it on.
constexpr Setting kCount{.element = ZEL_SVC_ELEMENT_NB_WB_AMR, .accepts = any_text(), .stores = {kCodecSwitch}};

constexpr Setting kCodec{.element = ZEL_SVC_ELEMENT_WB_AMR_CODEC,
                         .auto_flag = ZEL_SVC_AUTO_WB_AMR,
                         .accepts = on_off(),
                         .stores = {kCodecSwitch},
                         .records = {{ZEL_SVC_DATA_WB_AMR, "wb_amr", "codec"}},
                         .report = text_in("Network"),
                         .exports = if_recorded()};

constexpr Setting kWbAmrSettings[] = {kCount, kCodec};

struct WbAmr {
    FixedText<40> network_name;
    FixedText<200> codec;
};

// A codec that is neither on nor off is kept all the same: it takes the place of an earlier one.
constexpr Field<WbAmr> kFields[] = {
    field<&WbAmr::network_name>(ZEL_SVC_ELEMENT_WB_AMR_NETWORK_NAME),
    field<&WbAmr::codec>(ZEL_SVC_ELEMENT_WB_AMR_CODEC, {.accepts = on_off(), .others = FieldOthers::Kept}),
};

OpenRecord<WbAmr> gWbAmr;

} // namespace

std::span<const Setting> zel_svc_wb_amr_settings() { return kWbAmrSettings; }

void zel_svc_element_act_wb_amr_start(Occurrence &occurrence) {
    if (occurrence.element == ZEL_SVC_ELEMENT_WB_AMR && occurrence.installs()) gWbAmr.open();
}

// An install gathers the codec with its network and decides at the end; verification and export look at the
// switch at once.
void zel_svc_element_act_wb_amr_value(Occurrence &occurrence) {
    if (occurrence.installs() && zel_svc_field_find<WbAmr>(kFields, occurrence.element))
        gWbAmr.copy(kFields, occurrence);
    else
        zel_svc_setting_handle(kWbAmrSettings, occurrence);
}

void zel_svc_element_act_wb_amr_end(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_WB_AMR || !occurrence.installs()) return;
    const auto wb_amr = gWbAmr.take();
    if (!wb_amr) return;
    if (!zel_svc_item_applies(occurrence, ZEL_SVC_AUTO_WB_AMR, wb_amr->network_name.view())) return;
    zel_svc_setting_install(kCodec, wb_amr->codec.view());
}
