#pragma once
// Items that serve one network each and that only the section store keeps, numbered from 1 on behind those
// that are there already. The record of an item has a member `network_name`, which chooses the items.
//
//     RecordedItems<Voicemail> gVoicemails{ZEL_SVC_ELEMENT_VOICEMAIL, ZEL_SVC_AUTO_VOICEMAIL,
//                                          ZEL_SVC_DATA_VOICE_MAIL, "voice_mail", kFields};
//
//     void zel_svc_element_act_voicemail_start(Occurrence &o) { gVoicemails.start(o); }

#include "handler/zel-svc-applies.h"
#include "handler/zel-svc-record.h"

template <class R> class RecordedItems {
  public:
    constexpr RecordedItems(ZelSvcElementId element, ZelSvcAutoFlag flag, ZelSvcDataGroup group, const char *section,
                            std::span<const Field<R>> fields)
        : element_{element}, flag_{flag}, group_{group}, section_{section}, fields_{fields} {}

    void start(const Occurrence &occurrence) {
        if (is_item(occurrence)) open_.open();
    }

    void value(Occurrence &occurrence) {
        if (occurrence.installs()) open_.copy(fields_, occurrence);
    }

    void end(const Occurrence &occurrence) {
        if (!is_item(occurrence)) return;
        const auto item = open_.take();
        if (!item || !zel_svc_item_applies(occurrence, flag_, item->network_name.view())) return;
        zel_svc_record_save<R>(group_, section_, fields_, *item, zel_svc_record_count_up(group_, section_));
    }

  private:
    [[nodiscard]] bool is_item(const Occurrence &occurrence) const {
        return occurrence.element == element_ && occurrence.installs();
    }

    ZelSvcElementId element_;
    ZelSvcAutoFlag flag_;
    ZelSvcDataGroup group_;
    const char *section_;
    std::span<const Field<R>> fields_;
    OpenRecord<R> open_;
};
