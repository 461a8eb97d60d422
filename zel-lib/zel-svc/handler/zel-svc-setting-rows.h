#pragma once
// The row that most groups have most of: one key, one record in the section that the group's rows share,
// compared and exported as a text.
//
//     constexpr SettingSection kPush{ZEL_SVC_DATA_MESSAGE, "push_msg", "PushMsg"};
//
//     constexpr Setting kPushSettings[] = {
//         recorded(kPush, ZEL_SVC_ELEMENT_PUSH_LOADING, words(kLoadings), int_key("db/..."), "loading"),
//     };

#include "handler/zel-svc-setting.h"

// Where the rows of one table are recorded, and the label in front of their tags in result lines.
struct SettingSection {
    ZelSvcDataGroup group;
    const char *section;
    std::string_view label;
};

constexpr Store int_key(const char *key) { return {KeyType::Int, key}; }
constexpr Store bool_key(const char *key) { return {KeyType::Bool, key}; }

constexpr Setting recorded(const SettingSection &section, ZelSvcElementId element, Accepts accepts, Store store,
                           const char *record) {
    return {.element = element,
            .accepts = accepts,
            .stores = {store},
            .records = {{section.group, section.section, record}},
            .report = text_in(section.label),
            .exports = if_recorded()};
}

// A setting that other components read from the section store: no key of the phone holds it, so it is neither
// compared nor exported.
constexpr Setting only_recorded(const SettingSection &section, ZelSvcElementId element, Accepts accepts,
                                const char *record, RecordForm form = RecordForm::Number) {
    return {.element = element, .accepts = accepts, .records = {{section.group, section.section, record, form}}};
}
constexpr Setting only_recorded_text(const SettingSection &section, ZelSvcElementId element, Accepts accepts,
                                     const char *record) {
    return only_recorded(section, element, accepts, record, RecordForm::SpecText);
}

// A switch whose key is a boolean.
constexpr Setting recorded_switch(const SettingSection &section, ZelSvcElementId element, const char *key,
                                  const char *record) {
    return recorded(section, element, on_off(), bool_key(key), record);
}
