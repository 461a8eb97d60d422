#include "spec/zel-svc-encode-sequence.h"

#include "base/zel-svc-number.h"
#include "spec/zel-svc-data.h"
#include "spec/zel-svc-encode-writer.h"

namespace {

using Kind = ZelSvcEncodeStep::Kind;

// A recorded count comes from a file that anybody may have changed: one that no customer has is none.
constexpr int kMostRecorded = 10'000;

int believable(int count) { return count >= 0 && count <= kMostRecorded ? count : 0; }

int recorded_count(ZelSvcDataGroup group, const char *section) {
    return believable(zel_svc_data_get_int(group, section, "count", 0));
}

int recorded_max_pdps() { return recorded_count(ZEL_SVC_DATA_MAX_PDP, "max_pdp"); }
int recorded_fast_dormancies() { return recorded_count(ZEL_SVC_DATA_FAST_DORMANCY, "spec"); }

// The number that a count element gives out; 0 for "??" and other words.
template <ZelSvcElementId count> int served() { return zel_svc_number_from_text(zel_svc_encode_query(count).view()); }

template <ZelSvcElementId count> int recorded() { return believable(served<count>()); }

int is_recorded(const char *key) { return zel_svc_data_find(ZEL_SVC_DATA_MAIN, "phone", key); }
int language_is_recorded() { return is_recorded("lang_automatic"); }
int language_without_sim_is_recorded() { return is_recorded("lang_no_sim"); }

constexpr ZelSvcEncodeStep open(ZelSvcElementId id, int (*times)() = nullptr) { return {Kind::Open, id, times}; }
constexpr ZelSvcEncodeStep close(ZelSvcElementId id) { return {Kind::Close, id, nullptr}; }
constexpr ZelSvcEncodeStep leaf(ZelSvcElementId id, int (*times)() = nullptr) { return {Kind::Leaf, id, times}; }
constexpr ZelSvcEncodeStep empty_leaf(ZelSvcElementId id) { return {Kind::EmptyLeaf, id, nullptr}; }

// clang-format off
constexpr ZelSvcEncodeStep kSequence[] = {
    open(ZEL_SVC_ELEMENT_CUSTOMER_DATA),
        open(ZEL_SVC_ELEMENT_GENERAL_INFO),
            leaf(ZEL_SVC_ELEMENT_SALES_CODE),
            leaf(ZEL_SVC_ELEMENT_COUNTRY_ISO),
        close(ZEL_SVC_ELEMENT_GENERAL_INFO),

        open(ZEL_SVC_ELEMENT_SETTINGS),
            open(ZEL_SVC_ELEMENT_MAIN),
                open(ZEL_SVC_ELEMENT_NETWORK),
                    leaf(ZEL_SVC_ELEMENT_NB_MAX_PDP),
                    open(ZEL_SVC_ELEMENT_MAX_PDP, recorded_max_pdps),
                        leaf(ZEL_SVC_ELEMENT_MAX_PDP_NETWORK_NAME),
                        leaf(ZEL_SVC_ELEMENT_MAX_PDP_2G),
                        leaf(ZEL_SVC_ELEMENT_MAX_PDP_3G),
                    close(ZEL_SVC_ELEMENT_MAX_PDP),
                    leaf(ZEL_SVC_ELEMENT_NB_FAST_DORMANCY),
                    open(ZEL_SVC_ELEMENT_FAST_DORMANCY, recorded_fast_dormancies),
                        leaf(ZEL_SVC_ELEMENT_FAST_DORMANCY_NETWORK_NAME),
                        leaf(ZEL_SVC_ELEMENT_FAST_DORMANCY_ENABLE_STATUS),
                        leaf(ZEL_SVC_ELEMENT_TIMEOUT_VALUE),
                        leaf(ZEL_SVC_ELEMENT_LCD_STATUS),
                        leaf(ZEL_SVC_ELEMENT_FAST_DORMANCY_VERSION),
                    close(ZEL_SVC_ELEMENT_FAST_DORMANCY),
                    open(ZEL_SVC_ELEMENT_WB_AMR),
                        leaf(ZEL_SVC_ELEMENT_WB_AMR_CODEC),
                    close(ZEL_SVC_ELEMENT_WB_AMR),
                close(ZEL_SVC_ELEMENT_NETWORK),

                open(ZEL_SVC_ELEMENT_DISPLAY),
                close(ZEL_SVC_ELEMENT_DISPLAY),
                open(ZEL_SVC_ELEMENT_SOUND),
                    leaf(ZEL_SVC_ELEMENT_RNG_VOLUME),
                    leaf(ZEL_SVC_ELEMENT_MSG_TONE_VOLUME),
                    empty_leaf(ZEL_SVC_ELEMENT_ALARM_TONE),
                    open(ZEL_SVC_ELEMENT_KEY_TONE),
                        leaf(ZEL_SVC_ELEMENT_KEY_VOLUME),
                    close(ZEL_SVC_ELEMENT_KEY_TONE),
                    leaf(ZEL_SVC_ELEMENT_TOUCH_TONE),
                    open(ZEL_SVC_ELEMENT_EXTRA_SOUND),
                        leaf(ZEL_SVC_ELEMENT_CONNECT_TONE),
                        leaf(ZEL_SVC_ELEMENT_MINUTE_MIND),
                        leaf(ZEL_SVC_ELEMENT_CALL_END_TONE),
                    close(ZEL_SVC_ELEMENT_EXTRA_SOUND),
                close(ZEL_SVC_ELEMENT_SOUND),
                open(ZEL_SVC_ELEMENT_PHONE),
                    leaf(ZEL_SVC_ELEMENT_DEF_LANGUAGE, language_is_recorded),
                    leaf(ZEL_SVC_ELEMENT_DEF_LANGUAGE_NO_SIM, language_without_sim_is_recorded),
                    leaf(ZEL_SVC_ELEMENT_T9_ENABLING),
                    open(ZEL_SVC_ELEMENT_DATE_TIME_FORMAT),
                        leaf(ZEL_SVC_ELEMENT_DATE_FORMAT),
                        leaf(ZEL_SVC_ELEMENT_TIME_FORMAT),
                        leaf(ZEL_SVC_ELEMENT_TIMEZONE_UPDATE),
                    close(ZEL_SVC_ELEMENT_DATE_TIME_FORMAT),
                    leaf(ZEL_SVC_ELEMENT_CALL_NOISE_REDUCTION),
                close(ZEL_SVC_ELEMENT_PHONE),
            close(ZEL_SVC_ELEMENT_MAIN),

            open(ZEL_SVC_ELEMENT_CONTACT),
                leaf(ZEL_SVC_ELEMENT_CONTACT_SORT),
                leaf(ZEL_SVC_ELEMENT_CLI_DIGITS),
            close(ZEL_SVC_ELEMENT_CONTACT),
            open(ZEL_SVC_ELEMENT_CALENDAR),
                leaf(ZEL_SVC_ELEMENT_START_DAY),
            close(ZEL_SVC_ELEMENT_CALENDAR),
            open(ZEL_SVC_ELEMENT_MULTIMEDIA),
                open(ZEL_SVC_ELEMENT_CAMERA),
                    leaf(ZEL_SVC_ELEMENT_SHUTTER_SOUND),
                close(ZEL_SVC_ELEMENT_CAMERA),
            close(ZEL_SVC_ELEMENT_MULTIMEDIA),
            open(ZEL_SVC_ELEMENT_BT),
                leaf(ZEL_SVC_ELEMENT_BT_ACTIVATION),
                leaf(ZEL_SVC_ELEMENT_BT_VISIBILITY),
            close(ZEL_SVC_ELEMENT_BT),
            open(ZEL_SVC_ELEMENT_WIFI),
                leaf(ZEL_SVC_ELEMENT_SLEEP_POLICY),
            close(ZEL_SVC_ELEMENT_WIFI),

            open(ZEL_SVC_ELEMENT_MESSAGES),
                open(ZEL_SVC_ELEMENT_SMS),
                    leaf(ZEL_SVC_ELEMENT_SMS_BEARER),
                    leaf(ZEL_SVC_ELEMENT_REPLY_PATH),
                    leaf(ZEL_SVC_ELEMENT_DELIVERY_REPORT),
                    leaf(ZEL_SVC_ELEMENT_PAGE_LIMIT),
                    open(ZEL_SVC_ELEMENT_MSG_TYPE_THRESHOLD),
                        leaf(ZEL_SVC_ELEMENT_THRESHOLD_TYPE),
                        leaf(ZEL_SVC_ELEMENT_THRESHOLD_VALUE),
                    close(ZEL_SVC_ELEMENT_MSG_TYPE_THRESHOLD),
                    leaf(ZEL_SVC_ELEMENT_MAX_RECIPIENT),
                    leaf(ZEL_SVC_ELEMENT_SMS_KEEP_COPY),
                    leaf(ZEL_SVC_ELEMENT_CHAR_SUPPORT),
                    leaf(ZEL_SVC_ELEMENT_FONT_SIZE_BY_VOLUME_KEY),
                    leaf(ZEL_SVC_ELEMENT_VALIDITY_PERIOD),
                    leaf(ZEL_SVC_ELEMENT_SSMS),
                    leaf(ZEL_SVC_ELEMENT_IMEI_TRACKER),
                close(ZEL_SVC_ELEMENT_SMS),
                open(ZEL_SVC_ELEMENT_PUSH_MSG),
                    leaf(ZEL_SVC_ELEMENT_PUSH_MSG_REC_OPTION),
                    leaf(ZEL_SVC_ELEMENT_PUSH_LOADING),
                close(ZEL_SVC_ELEMENT_PUSH_MSG),
                open(ZEL_SVC_ELEMENT_MMS),
                    open(ZEL_SVC_ELEMENT_MMS_SENDING),
                        leaf(ZEL_SVC_ELEMENT_MMS_SENDING_REQ_DELIVERY_REP),
                        leaf(ZEL_SVC_ELEMENT_HIDE_ADDRESS),
                        leaf(ZEL_SVC_ELEMENT_MMS_SENDING_REQ_READ_REP),
                        leaf(ZEL_SVC_ELEMENT_MMS_SENDING_PRIORITY),
                        leaf(ZEL_SVC_ELEMENT_MMS_SENDING_EXPIRY),
                        leaf(ZEL_SVC_ELEMENT_DELIVERY_TIME),
                        leaf(ZEL_SVC_ELEMENT_DELIVERY_CUST_TIME),
                        leaf(ZEL_SVC_ELEMENT_CREATION_MODE),
                        leaf(ZEL_SVC_ELEMENT_MMS_SENDING_KEEP_COPY),
                        leaf(ZEL_SVC_ELEMENT_MAX_RECIPIENT_MMS),
                    close(ZEL_SVC_ELEMENT_MMS_SENDING),
                    open(ZEL_SVC_ELEMENT_MMS_RECEIVING),
                        leaf(ZEL_SVC_ELEMENT_MMS_RECEIVING_HOME),
                        leaf(ZEL_SVC_ELEMENT_MMS_RECEIVING_ROAMING),
                        leaf(ZEL_SVC_ELEMENT_SEND_READ_REP),
                        leaf(ZEL_SVC_ELEMENT_SEND_DELIVERY_REP),
                        leaf(ZEL_SVC_ELEMENT_ANONYM_REC),
                        leaf(ZEL_SVC_ELEMENT_ADVERT_REC),
                    close(ZEL_SVC_ELEMENT_MMS_RECEIVING),
                close(ZEL_SVC_ELEMENT_MMS),
            close(ZEL_SVC_ELEMENT_MESSAGES),

            open(ZEL_SVC_ELEMENT_BROWSER),
                leaf(ZEL_SVC_ELEMENT_COOKIE_OPTION),
                leaf(ZEL_SVC_ELEMENT_NB_BOOKMARK),
                open(ZEL_SVC_ELEMENT_BOOKMARK, served<ZEL_SVC_ELEMENT_NB_BOOKMARK>),
                    leaf(ZEL_SVC_ELEMENT_BOOKMARK_EDITABLE),
                    leaf(ZEL_SVC_ELEMENT_BOOKMARK_FOLDER),
                    leaf(ZEL_SVC_ELEMENT_BOOKMARK_NAME),
                    leaf(ZEL_SVC_ELEMENT_BOOKMARK_URL),
                close(ZEL_SVC_ELEMENT_BOOKMARK),
                leaf(ZEL_SVC_ELEMENT_NB_QUICK_ACCESS),
                open(ZEL_SVC_ELEMENT_QUICK_ACCESS, recorded<ZEL_SVC_ELEMENT_NB_QUICK_ACCESS>),
                    leaf(ZEL_SVC_ELEMENT_QUICK_ACCESS_EDITABLE),
                    leaf(ZEL_SVC_ELEMENT_QA_TITLE),
                    leaf(ZEL_SVC_ELEMENT_QA_URL),
                close(ZEL_SVC_ELEMENT_QUICK_ACCESS),
                open(ZEL_SVC_ELEMENT_E_MANUAL),
                    leaf(ZEL_SVC_ELEMENT_E_MANUAL_URL),
                close(ZEL_SVC_ELEMENT_E_MANUAL),
            close(ZEL_SVC_ELEMENT_BROWSER),

            open(ZEL_SVC_ELEMENT_CONNECTIONS),
                leaf(ZEL_SVC_ELEMENT_NB_PROFILE),
                open(ZEL_SVC_ELEMENT_PROFILE, recorded<ZEL_SVC_ELEMENT_NB_PROFILE>),
                    leaf(ZEL_SVC_ELEMENT_PROFILE_NETWORK_NAME),
                    leaf(ZEL_SVC_ELEMENT_PROFILE_NAME),
                    leaf(ZEL_SVC_ELEMENT_PROFILE_EDITABLE),
                    leaf(ZEL_SVC_ELEMENT_PROFILE_ENABLE_STATUS),
                    leaf(ZEL_SVC_ELEMENT_PROFILE_HIDDEN_STATUS),
                    leaf(ZEL_SVC_ELEMENT_PROFILE_ROAMING_ENABLE_STATUS),
                    leaf(ZEL_SVC_ELEMENT_IP_VERSION),
                    leaf(ZEL_SVC_ELEMENT_ROAMING_IP_VERSION),
                    leaf(ZEL_SVC_ELEMENT_AUTH),
                    open(ZEL_SVC_ELEMENT_PS_PARAM),
                        leaf(ZEL_SVC_ELEMENT_APN),
                        leaf(ZEL_SVC_ELEMENT_PS_PARAM_USER_ID),
                        leaf(ZEL_SVC_ELEMENT_PS_PARAM_PASSWORD),
                    close(ZEL_SVC_ELEMENT_PS_PARAM),
                    leaf(ZEL_SVC_ELEMENT_PROFILE_URL),
                    open(ZEL_SVC_ELEMENT_PROXY),
                        leaf(ZEL_SVC_ELEMENT_PROXY_SERV_ADDR),
                        leaf(ZEL_SVC_ELEMENT_PROXY_PORT),
                    close(ZEL_SVC_ELEMENT_PROXY),
                    open(ZEL_SVC_ELEMENT_STATIC_IP),
                        leaf(ZEL_SVC_ELEMENT_STATIC_IP_ENABLE_FLAG),
                        leaf(ZEL_SVC_ELEMENT_STATIC_IP_ADDR),
                    close(ZEL_SVC_ELEMENT_STATIC_IP),
                    open(ZEL_SVC_ELEMENT_DNS),
                        leaf(ZEL_SVC_ELEMENT_DNS_ENABLE_FLAG),
                        leaf(ZEL_SVC_ELEMENT_DNS_IP_ADDR),
                        leaf(ZEL_SVC_ELEMENT_DNS_IP_ADDR),
                    close(ZEL_SVC_ELEMENT_DNS),
                close(ZEL_SVC_ELEMENT_PROFILE),
                leaf(ZEL_SVC_ELEMENT_NB_PROFILE_HANDLE),
                open(ZEL_SVC_ELEMENT_PROFILE_HANDLE, recorded<ZEL_SVC_ELEMENT_NB_PROFILE_HANDLE>),
                    leaf(ZEL_SVC_ELEMENT_PROFILE_HANDLE_NETWORK_NAME),
                    leaf(ZEL_SVC_ELEMENT_PROF_BROWSER),
                    leaf(ZEL_SVC_ELEMENT_PROF_MMS),
                    leaf(ZEL_SVC_ELEMENT_PROF_INT_SHARING),
                    leaf(ZEL_SVC_ELEMENT_PROF_IMS),
                    leaf(ZEL_SVC_ELEMENT_PROF_XCAP),
                    leaf(ZEL_SVC_ELEMENT_PROF_EMERGENCY_IMS_CALL),
                close(ZEL_SVC_ELEMENT_PROFILE_HANDLE),
            close(ZEL_SVC_ELEMENT_CONNECTIONS),

            open(ZEL_SVC_ELEMENT_SYNCML),
                leaf(ZEL_SVC_ELEMENT_NB_DATA_SYNC),
                open(ZEL_SVC_ELEMENT_DATA_SYNC, served<ZEL_SVC_ELEMENT_NB_DATA_SYNC>),
                    leaf(ZEL_SVC_ELEMENT_DATA_SYNC_ACC_NAME),
                    leaf(ZEL_SVC_ELEMENT_DATA_SYNC_SERV_ADDR),
                    leaf(ZEL_SVC_ELEMENT_DATA_SYNC_USER_ID),
                    leaf(ZEL_SVC_ELEMENT_DATA_SYNC_PASSWORD),
                    open(ZEL_SVC_ELEMENT_DB_LIST),
                        open(ZEL_SVC_ELEMENT_CONTACT_DB),
                            leaf(ZEL_SVC_ELEMENT_CONTACT_DB_ENABLE_FLAG),
                            leaf(ZEL_SVC_ELEMENT_CONTACT_DB_NAME),
                            leaf(ZEL_SVC_ELEMENT_CONTACT_DB_ID),
                            leaf(ZEL_SVC_ELEMENT_CONTACT_DB_PASSWORD),
                        close(ZEL_SVC_ELEMENT_CONTACT_DB),
                        open(ZEL_SVC_ELEMENT_CALENDAR_DB),
                            leaf(ZEL_SVC_ELEMENT_CALENDAR_DB_ENABLE_FLAG),
                            leaf(ZEL_SVC_ELEMENT_CALENDAR_DB_NAME),
                            leaf(ZEL_SVC_ELEMENT_CALENDAR_DB_ID),
                            leaf(ZEL_SVC_ELEMENT_CALENDAR_DB_PASSWORD),
                        close(ZEL_SVC_ELEMENT_CALENDAR_DB),
                    close(ZEL_SVC_ELEMENT_DB_LIST),
                close(ZEL_SVC_ELEMENT_DATA_SYNC),
            close(ZEL_SVC_ELEMENT_SYNCML),

            open(ZEL_SVC_ELEMENT_GPS),
                leaf(ZEL_SVC_ELEMENT_GPS_ACTIVATION),
            close(ZEL_SVC_ELEMENT_GPS),
        close(ZEL_SVC_ELEMENT_SETTINGS),
    close(ZEL_SVC_ELEMENT_CUSTOMER_DATA),
};
// clang-format on

constexpr std::size_t kDeepest = 16;

// Each Close names the container that was opened last, and all are closed at the end.
constexpr bool is_balanced() {
    ZelSvcElementId open_ones[kDeepest] = {};
    std::size_t depth = 0;
    for (const ZelSvcEncodeStep &step : kSequence) {
        if (step.kind == Kind::Open && depth == kDeepest) return false;
        if (step.kind == Kind::Open) open_ones[depth++] = step.id;
        if (step.kind == Kind::Close && (depth == 0 || open_ones[--depth] != step.id)) return false;
    }
    return depth == 0;
}
static_assert(is_balanced());

} // namespace

std::span<const ZelSvcEncodeStep> zel_svc_encode_sequence() { return kSequence; }

std::size_t zel_svc_encode_behind(std::span<const ZelSvcEncodeStep> steps, std::size_t open_step) {
    std::size_t at = open_step + 1;
    for (int depth = 1; depth > 0; ++at) {
        if (steps[at].kind == Kind::Open) ++depth;
        if (steps[at].kind == Kind::Close) --depth;
    }
    return at;
}
