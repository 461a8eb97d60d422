#include "zel-svc-element-act-fast-dormancy.h"

#include "base/zel-svc-decimal.h"
#include "base/zel-svc-number.h"
#include "handler/zel-svc-record.h"
#include "zel-svc-network-items.h"

namespace {

constexpr ZelSvcDataGroup kGroup = ZEL_SVC_DATA_FAST_DORMANCY;
constexpr const char *kSection = "spec";
constexpr std::int32_t kOff = -1; // a time-out that is off or not set

struct FastDormancy {
    FixedText<40> network_name;
    FixedText<20> lcd_status;
    FixedText<20> enable_status;
    FixedText<20> timeout;
    FixedText<20> version;
};
static_assert(sizeof(FastDormancy) == 120);

std::string seconds_text(std::int32_t milliseconds) {
    return milliseconds < 0 ? std::string{} : zel_svc_thousandths_text(milliseconds);
}

constexpr FieldRules switch_rules(const char *key, std::string_view label) {
    return {.accepts = on_off(),
            .others = FieldOthers::Kept,
            .record = {key, FieldForm::Word},
            .report = {label, LineWhen::Always}};
}

// In the order of the recorded keys and of the result lines.
constexpr Field<FastDormancy> kFields[] = {
    field<&FastDormancy::network_name>(ZEL_SVC_ELEMENT_FAST_DORMANCY_NETWORK_NAME,
                                       {.fills = FieldFills::Install, .record = {"network_name_%d"}}),
    field<&FastDormancy::enable_status>(ZEL_SVC_ELEMENT_FAST_DORMANCY_ENABLE_STATUS,
                                        switch_rules("enable_%d", "EnableStatus")),
    field<&FastDormancy::lcd_status>(ZEL_SVC_ELEMENT_LCD_STATUS, switch_rules("lcd_%d", "LCDStatus")),
    field<&FastDormancy::timeout>(ZEL_SVC_ELEMENT_TIMEOUT_VALUE, {.record = {.key = "time_out_%d",
                                                                             .form = FieldForm::NumberIfGiven,
                                                                             .reads = zel_svc_thousandths_from_text,
                                                                             .shows = seconds_text},
                                                                  .report = {"TimeOut", LineWhen::SpecGiven}}),
    field<&FastDormancy::version>(ZEL_SVC_ELEMENT_FAST_DORMANCY_VERSION,
                                  {.record = {"version_%d"}, .report = {"Version", LineWhen::EitherGiven}}),
};

OpenRecord<FastDormancy> gFastDormancy;
int gIndex = 0; // of the recorded item that verification and export are at

constexpr const char *kDelete = "delete from fast_dormancy where network_info_id in (select network_info_id from "
                                "network_info where mccmnc=?)";
constexpr const char *kFind = "select dormant_id from fast_dormancy where network_info_id=?";
constexpr const char *kMaximum = "select count(*), max(dormant_id) from fast_dormancy";
constexpr const char *kInsert =
    "insert into fast_dormancy( dormant_id, network_info_id, lcd_on_timeout, lcd_off_timeout, lcd_on_timeout_rel8, "
    "lcd_off_timeout_rel8 ) values( ?, ?, ?, ?, ?, ? )";

struct TimeoutColumn {
    std::string_view lcd_status;
    bool rel8;
    const char *update;
};

constexpr TimeoutColumn kTimeoutColumns[] = {
    {"on", false, "update fast_dormancy set lcd_on_timeout=? where dormant_id=?"},
    {"on", true, "update fast_dormancy set lcd_on_timeout_rel8=? where dormant_id=?"},
    {"off", false, "update fast_dormancy set lcd_off_timeout=? where dormant_id=?"},
    {"off", true, "update fast_dormancy set lcd_off_timeout_rel8=? where dormant_id=?"},
};

const char *update_of(const FastDormancy &item) {
    const bool rel8 = item.version == "rel8";
    for (const TimeoutColumn &column : kTimeoutColumns)
        if (item.lcd_status == column.lcd_status && rel8 == column.rel8) return column.update;
    return nullptr;
}

std::optional<std::int32_t> timeout_of(const FastDormancy &item) {
    if (item.enable_status == "on") return zel_svc_thousandths_from_text(item.timeout.view());
    if (item.enable_status == "off") return kOff;
    return std::nullopt;
}

// The network's row; it may have been written for the other screen status or radio version. A negative id is no
// row and is given back when there is no other; nothing when that cannot be told.
std::optional<std::int32_t> find_row(NetworkDatabase &database, std::int32_t network_id) {
    NetworkStatement select = database.prepare(kFind);
    if (!select || !select.bind(1, network_id)) return std::nullopt;
    while (true) {
        const NetworkStep step = select.step();
        if (step == NetworkStep::Failed) return std::nullopt;
        if (step == NetworkStep::Done) return kOff;
        if (select.integer(0) >= 0) return select.integer(0);
    }
}

std::optional<std::int32_t> find_or_insert_row(NetworkDatabase &database, std::int32_t network_id) {
    const auto found = find_row(database, network_id);
    if (!found || *found >= 0) return found;
    const auto id = zel_svc_network_next_id(database, kMaximum, 0);
    if (!id || !database.run(kInsert, *id, network_id, kOff, kOff, kOff, kOff)) return std::nullopt;
    return id;
}

bool __zel_svc_fast_dormancy_delete(std::string_view mccmnc) { return NetworkDatabase{}.run(kDelete, mccmnc); }

bool __zel_svc_fast_dormancy_set(const FastDormancy &item, std::int32_t network_id) {
    NetworkDatabase database;
    const auto row = find_or_insert_row(database, network_id);
    const auto timeout = timeout_of(item);
    const char *update = update_of(item);
    return row && timeout && update && database.run(update, *timeout, *row);
}

void __zel_svc_fast_dormancy_save(FastDormancy &item) {
    zel_svc_record_save<FastDormancy>(kGroup, kSection, kFields, item, zel_svc_record_count_up(kGroup, kSection));
}

void __zel_svc_fast_dormancy_load(int index, FastDormancy &item) {
    zel_svc_record_load<FastDormancy>(kGroup, kSection, kFields, item, index + 1);
}

void __zel_svc_fast_dormancy_verify(int index, FastDormancy &spec) {
    FastDormancy phone;
    __zel_svc_fast_dormancy_load(index, phone);
    zel_svc_record_compare<FastDormancy>("FastDormancy" + zel_svc_number_text(index + 1), kFields, spec, phone);
}

// A network that fails keeps no other from its row.
bool set_for_networks(const FastDormancy &item) {
    bool all = true;
    zel_svc_for_each_network(item.network_name.view(), [&](const ZelSvcNetworkEntry &network) {
        all = __zel_svc_fast_dormancy_set(item, network.network_id) && all;
    });
    return all;
}

bool set_for_operator(const FastDormancy &item) {
    const auto network_id = zel_svc_current_operators_network_id();
    return network_id && __zel_svc_fast_dormancy_set(item, *network_id);
}

void install(const Occurrence &occurrence, FastDormancy &item) {
    if (!zel_svc_item_applies(occurrence, ZEL_SVC_AUTO_FAST_DORMANCY, item.network_name.view())) return;
    const bool full = occurrence.mode == ZEL_SVC_PARSE_MODE_FULL;
    if (full ? set_for_networks(item) : set_for_operator(item)) __zel_svc_fast_dormancy_save(item);
}

std::string recorded_count() { return zel_svc_number_text(zel_svc_data_get_int(kGroup, kSection, "count", 0)); }

void verify_count(const Occurrence &occurrence) {
    if (!zel_svc_group_applies(occurrence, ZEL_SVC_AUTO_FAST_DORMANCY)) return;
    gIndex = 0;
    zel_svc_field_compare("FastDormancy", {.label = occurrence.tag}, occurrence.text, recorded_count());
}

void count(Occurrence &occurrence) {
    if (occurrence.verifies()) return verify_count(occurrence);
    zel_svc_for_each_mccmnc(occurrence, ZEL_SVC_AUTO_FAST_DORMANCY, __zel_svc_fast_dormancy_delete);
    if (!occurrence.exports()) return;
    gIndex = 0;
    if (occurrence.out) occurrence.out->assign(recorded_count());
}

} // namespace

void zel_svc_element_act_fast_dormancy_start(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_FAST_DORMANCY) return;
    gFastDormancy.open();
    if (occurrence.exports() && gFastDormancy) __zel_svc_fast_dormancy_load(gIndex, *gFastDormancy);
}

void zel_svc_element_act_fast_dormancy_value(Occurrence &occurrence) {
    if (occurrence.element == ZEL_SVC_ELEMENT_NB_FAST_DORMANCY) return count(occurrence);
    gFastDormancy.copy(kFields, occurrence);
}

void zel_svc_element_act_fast_dormancy_end(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_FAST_DORMANCY) return;
    const auto item = gFastDormancy.take();
    if (!item) return;
    if (occurrence.installs()) return install(occurrence, *item);
    const bool verifies = zel_svc_group_applies(occurrence, ZEL_SVC_AUTO_FAST_DORMANCY);
    if (verifies) __zel_svc_fast_dormancy_verify(gIndex, *item);
    if (verifies || occurrence.exports()) ++gIndex;
}
