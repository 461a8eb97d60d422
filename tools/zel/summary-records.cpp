#include "summary-parts.h"

#include <spec/zel-svc-data.h>

#include <optional>

namespace zel_command {
namespace {

struct ShownRecord {
    const char *name;
    ZelSvcDataGroup group;
    const char *section;
    std::string_view key; // a "%d" stands for the numbers of a list
};

// What a person asks for first of the options that other components read from the section store. Passwords of
// accounts are not among them.
constexpr ShownRecord kShownRecords[] = {
    {"SIM locks: networks", ZEL_SVC_DATA_SECURITY, "security", "net_lock_count"},
    {"SIM locks: service providers", ZEL_SVC_DATA_SECURITY, "security", "sp_lock_count"},
    {"SIM locks: attempts to unlock", ZEL_SVC_DATA_SECURITY, "security", "unlock_count"},
    {"Voicemail", ZEL_SVC_DATA_VOICE_MAIL, "voice_mail", "name_%d"},
    {"Voicemail number", ZEL_SVC_DATA_VOICE_MAIL, "voice_mail", "tel_num_%d"},
    {"Cell broadcast", ZEL_SVC_DATA_MESSAGE, "sms", "cb"},
    {"E-mail account", ZEL_SVC_DATA_EMAIL_ACCOUNT, "email_account", "name_%d"},
    {"E-mail address", ZEL_SVC_DATA_EMAIL_ACCOUNT, "email_account", "email_addr_%d"},
    {"E-mail signature", ZEL_SVC_DATA_EMAIL, "email", "send_signature"},
    {"E-mail poll time", ZEL_SVC_DATA_EMAIL, "email", "recv_poll_time"},
    {"ActiveSync over SSL", ZEL_SVC_DATA_ACTIVE_SYNC, "general", "use_ssl"},
    {"ActiveSync peak time, from", ZEL_SVC_DATA_ACTIVE_SYNC, "sync_schedule", "peak_time_start"},
    {"ActiveSync peak time, to", ZEL_SVC_DATA_ACTIVE_SYNC, "sync_schedule", "peak_time_end"},
    {"Bookmark", ZEL_SVC_DATA_BOOKMARK, "bookmark", "name_%d"},
    {"Bookmark address", ZEL_SVC_DATA_BOOKMARK, "bookmark", "url_%d"},
    {"Quick access", ZEL_SVC_DATA_QUICK_ACCESS, "quickaccess", "title_%d"},
    {"User manual", ZEL_SVC_DATA_BROWSER, "emanual", "url"},
    {"Data sync account", ZEL_SVC_DATA_SYNCML_DS, "ds", "account_name_%d"},
    {"Data sync server", ZEL_SVC_DATA_SYNCML_DS, "ds", "server_addr_%d"},
    {"IMS", ZEL_SVC_DATA_IMS, "attr", "enable_ims"},
    {"VoLTE", ZEL_SVC_DATA_IMS, "volte", "enable_volte"},
    {"SMS over IP", ZEL_SVC_DATA_IMS, "smsoip", "enable_smsoip"},
    {"RCS", ZEL_SVC_DATA_IMS, "rcs", "enable_rcs"},
};

std::string path_of(ZelSvcDataGroup group, unsigned variant) {
    char path[256] = {};
    zel_svc_data_get_path(group, variant, path, sizeof path);
    return path;
}

// One group as it is on the phone, for the time of this object.
class OpenGroup {
  public:
    OpenGroup(ZelSvcDataGroup group, unsigned variant) : group_{group} { zel_svc_data_load(group, variant, 0); }
    ~OpenGroup() { zel_svc_data_free(group_); }
    OpenGroup(const OpenGroup &) = delete;
    OpenGroup &operator=(const OpenGroup &) = delete;

    [[nodiscard]] std::optional<std::string> text(const char *section, const std::string &key) const {
        if (zel_svc_data_find(group_, section, key.c_str()) == 0) return std::nullopt;
        return std::string{zel_svc_data_get_text(group_, section, key.c_str())};
    }

    [[nodiscard]] bool is(ZelSvcDataGroup group) const { return group_ == group; }

  private:
    ZelSvcDataGroup group_;
};

void add_row(Json &result, const ShownRecord &shown, int sim, const std::string &name, const std::string &key,
             const std::string &value) {
    Json &row = result.emplace_back(Json::object());
    row["name"] = name;
    row["sim"] = sim;
    row["section"] = shown.section;
    row["key"] = key;
    put_text(row, "value", value);
}

// A list goes on as long as its entries do: the count beside it may say anything.
void add_list(Json &result, const OpenGroup &group, const ShownRecord &shown, int sim) {
    const std::string stem{shown.key.substr(0, shown.key.find("%d"))};
    for (int number = 1;; ++number) {
        const std::string digits = std::to_string(number);
        const auto value = group.text(shown.section, stem + digits);
        if (!value) return;
        add_row(result, shown, sim, std::string{shown.name} + " " + digits, stem + digits, *value);
    }
}

void add_record(Json &result, const OpenGroup &group, const ShownRecord &shown, int sim) {
    if (shown.key.find("%d") != std::string_view::npos) return add_list(result, group, shown, sim);
    const std::string key{shown.key};
    if (const auto value = group.text(shown.section, key)) add_row(result, shown, sim, shown.name, key, *value);
}

bool is_shared(ZelSvcDataGroup group) { return path_of(group, ZEL_SVC_DATA_SIM2) == path_of(group, ZEL_SVC_DATA_SIM1); }

// Rows of one group stand together, so that each file is read once.
void add_records(Json &result, int sim, unsigned variant) {
    std::optional<OpenGroup> open;
    for (const ShownRecord &shown : kShownRecords) {
        if (variant == ZEL_SVC_DATA_SIM2 && is_shared(shown.group)) continue;
        if (!open || !open->is(shown.group)) {
            open.reset();
            open.emplace(shown.group, variant);
        }
        add_record(result, *open, shown, sim);
    }
}

} // namespace

Json summary_records() {
    Json result = Json::array();
    add_records(result, 1, ZEL_SVC_DATA_SIM1);
    add_records(result, 2, ZEL_SVC_DATA_SIM2);
    return result;
}

} // namespace zel_command
