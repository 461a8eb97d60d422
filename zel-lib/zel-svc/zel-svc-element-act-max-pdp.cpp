#include "zel-svc-element-act-max-pdp.h"

#include "base/zel-svc-number.h"
#include "handler/zel-svc-record.h"
#include "zel-svc-network-items.h"

namespace {

constexpr ZelSvcDataGroup kGroup = ZEL_SVC_DATA_MAX_PDP;
constexpr const char *kSection = "max_pdp";

struct MaxPdp {
    FixedText<40> network_name;
    char unused[10]; // the name's field has 50 bytes
    FixedText<20> limit_2g;
    FixedText<20> limit_3g;
};
static_assert(sizeof(MaxPdp) == 90);

constexpr FieldRules limit_rules(const char *key, std::string_view label) {
    return {.record = {key, FieldForm::NumberIfGiven}, .report = {label, LineWhen::EitherGiven}};
}

constexpr Field<MaxPdp> kFields[] = {
    field<&MaxPdp::network_name>(ZEL_SVC_ELEMENT_MAX_PDP_NETWORK_NAME,
                                 {.fills = FieldFills::Install, .record = {"network_name_%d"}}),
    field<&MaxPdp::limit_2g>(ZEL_SVC_ELEMENT_MAX_PDP_2G, limit_rules("max_pdp_2g_%d", "MaxPDP2G")),
    field<&MaxPdp::limit_3g>(ZEL_SVC_ELEMENT_MAX_PDP_3G, limit_rules("max_pdp_3g_%d", "MaxPDP3G")),
};

// The 3G limit is recorded last, once it is in the database.
constexpr std::span<const Field<MaxPdp>> kRecordedAtOnce = std::span{kFields}.first<2>();
constexpr const FieldRules &kLimit3g = kFields[2].rules;

OpenRecord<MaxPdp> gMaxPdp;
int gIndex = 0; // of the recorded item that verification and export are at

constexpr const char *kDelete =
    "delete from max_pdp where network_info_id in (select network_info_id from network_info where mccmnc=?)";
constexpr const char *kCount = "select count(*) from max_pdp where network_info_id=?";
constexpr const char *kMaximum = "select count(*), max(max_id) from max_pdp";
constexpr const char *kInsert = "insert into max_pdp( max_id, network_info_id, max_pdp_3g ) values( ?, ?, ? )";

bool delete_limits(std::string_view mccmnc) { return NetworkDatabase{}.run(kDelete, mccmnc); }

std::optional<std::int32_t> limits_of(NetworkDatabase &database, std::int32_t network_id) {
    NetworkStatement select = database.prepare(kCount);
    if (!select || !select.bind(1, network_id) || select.step() != NetworkStep::Row) return std::nullopt;
    return select.integer(0);
}

// The first limit of a network stays.
bool insert_limit(std::int32_t network_id, std::int32_t limit) {
    NetworkDatabase database;
    const auto held = limits_of(database, network_id);
    if (!held) return false;
    if (*held > 0) return true;
    const auto id = zel_svc_network_next_id(database, kMaximum, 1);
    return id && database.run(kInsert, *id, network_id, limit);
}

bool insert_for_networks(std::string_view network_name, std::int32_t limit) {
    return zel_svc_every_network(
        network_name, [&](const ZelSvcNetworkEntry &network) { return insert_limit(network.network_id, limit); });
}

// `network_id` is the operator's; without one the item serves the networks of its name.
void install_limits(MaxPdp &item, std::optional<std::int32_t> network_id) {
    const int number = zel_svc_record_count_up(kGroup, kSection);
    zel_svc_record_save<MaxPdp>(kGroup, kSection, kRecordedAtOnce, item, number);
    if (item.limit_3g.empty()) return;
    const std::int32_t limit = zel_svc_number_from_text(item.limit_3g.view());
    const bool inserted =
        network_id ? insert_limit(*network_id, limit) : insert_for_networks(item.network_name.view(), limit);
    if (inserted) zel_svc_field_save(kGroup, kSection, kLimit3g, number, item.limit_3g.view());
}

void install(const Occurrence &occurrence, MaxPdp &item) {
    if (!zel_svc_item_applies(occurrence, ZEL_SVC_AUTO_MAX_PDP, item.network_name.view())) return;
    if (occurrence.mode == ZEL_SVC_PARSE_MODE_FULL) return install_limits(item, std::nullopt);
    const auto network_id = zel_svc_current_operators_network_id();
    if (network_id) install_limits(item, network_id);
}

void load(int index, MaxPdp &item) { zel_svc_record_load<MaxPdp>(kGroup, kSection, kFields, item, index + 1); }

void verify(int index, MaxPdp &spec) {
    MaxPdp phone{};
    load(index, phone);
    zel_svc_record_compare<MaxPdp>("MaxPDP" + zel_svc_number_text(index + 1), kFields, spec, phone);
}

// The count's export says nothing, though items may follow.
void count(const Occurrence &occurrence) {
    zel_svc_for_each_mccmnc(occurrence, ZEL_SVC_AUTO_MAX_PDP, delete_limits);
    if (!occurrence.installs()) gIndex = 0;
    if (occurrence.out) occurrence.out->clear();
}

} // namespace

void zel_svc_element_act_max_pdp_start(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_MAX_PDP) return;
    gMaxPdp.open();
    if (occurrence.exports() && gMaxPdp) load(gIndex, *gMaxPdp);
}

void zel_svc_element_act_max_pdp_value(Occurrence &occurrence) {
    if (occurrence.element == ZEL_SVC_ELEMENT_NB_MAX_PDP) return count(occurrence);
    gMaxPdp.copy(kFields, occurrence);
}

void zel_svc_element_act_max_pdp_end(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_MAX_PDP) return;
    const auto item = gMaxPdp.take();
    if (!item) return;
    if (occurrence.installs()) return install(occurrence, *item);
    const bool verifies = zel_svc_group_applies(occurrence, ZEL_SVC_AUTO_MAX_PDP);
    if (verifies) verify(gIndex, *item);
    if (verifies || occurrence.exports()) ++gIndex;
}
