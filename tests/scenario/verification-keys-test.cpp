// Every key that a verification looks at, changed alone: its own lines fail and no other.

#include "service-phone.h"

#include <gmock/gmock.h>

#include <map>
#include <set>
#include <variant>

namespace {

using ::testing::ElementsAreArray;
using ::testing::IsEmpty;

using Value = std::variant<int, bool, std::string>;

struct KeyLines {
    const char *key;
    Value another;
    std::vector<std::string> lines;
};

// A file that states every setting which is compared with a key of the phone.
constexpr const char *kFile = R"(
<GeneralInfo><SalesCode>BTU</SalesCode><CountryISO>GB</CountryISO></GeneralInfo>
<Settings>
  <Main>
    <Network>
      <AutoAttach>on</AutoAttach><AutoDetach>off</AutoDetach>
      <WbAmr><NetworkName>First</NetworkName><WbAmrCodec>on</WbAmrCodec></WbAmr>
    </Network>
    <Display><Wallpaper src="/media/Home.png"></Wallpaper></Display>
    <Sound>
      <RngVolume>11</RngVolume><RingTone src="/media/ring.wav"></RingTone>
      <MsgToneVolume>9</MsgToneVolume><MessageTone src="/media/alert.wav"></MessageTone>
      <AlarmTone src="/media/alarm.wav"></AlarmTone>
      <KeyTone><KeyVolume>5</KeyVolume></KeyTone><TouchTone>on</TouchTone>
      <ExtraSound>
        <ConnectTone>on</ConnectTone><MinuteMind>off</MinuteMind><CallEndTone>on</CallEndTone>
      </ExtraSound>
    </Sound>
    <Phone>
      <DefLanguage>english_us</DefLanguage><DefLanguageNoSIM>english_us</DefLanguageNoSIM>
      <T9Enabling>enable</T9Enabling>
      <DateTimeFormat>
        <DateFormat>ddmmyyyy</DateFormat><TimeFormat>12h</TimeFormat><TimezoneUpdate>on</TimezoneUpdate>
      </DateTimeFormat>
      <CallNoiseReduction>on</CallNoiseReduction>
    </Phone>
  </Main>
  <Contact><ContactSort>firstname</ContactSort><CLIDigits>8</CLIDigits></Contact>
  <Calendar><StartDay>sunday</StartDay></Calendar>
  <Multimedia><Camera><ShutterSound>on</ShutterSound></Camera></Multimedia>
  <BT><Activation>off</Activation><Visibility>off</Visibility></BT>
  <Wifi><SleepPolicy>always</SleepPolicy></Wifi>
  <Messages>
    <SMS>
      <Bearer>psfirst</Bearer><ReplyPath>off</ReplyPath><DeliveryReport>off</DeliveryReport><PageLimit>10</PageLimit>
      <MsgTypeThreshold>
        <ThresholdType>pagecount</ThresholdType><ThresholdValue>4</ThresholdValue>
      </MsgTypeThreshold>
      <MaxRecipient>20</MaxRecipient><KeepCopy>on</KeepCopy><CharSupport>automatic</CharSupport>
      <FontSizeByVolumeKey>on</FontSizeByVolumeKey><ValidityPeriod>readfromsim</ValidityPeriod><SSMS>off</SSMS>
      <ImeiTracker>on</ImeiTracker>
    </SMS>
    <PushMsg><RecOption>on</RecOption><PushLoading>prompt</PushLoading></PushMsg>
    <MMS>
      <MmsSending>
        <ReqDeliveryRep>off</ReqDeliveryRep><HideAddress>off</HideAddress><ReqReadRep>off</ReqReadRep>
        <Priority>normal</Priority><Expiry>max</Expiry><DeliveryTime>imm</DeliveryTime>
        <DeliveryCustTime>0</DeliveryCustTime><CreationMode>free</CreationMode><KeepCopy>on</KeepCopy>
        <MaxRecipientMMS>10</MaxRecipientMMS>
      </MmsSending>
      <MmsReceiving>
        <Home>auto</Home><Roaming>manual</Roaming><SendReadRep>on</SendReadRep><SendDeliveryRep>on</SendDeliveryRep>
        <AnonymRec>off</AnonymRec><AdvertRec>off</AdvertRec>
      </MmsReceiving>
    </MMS>
  </Messages>
  <Browser><CookieOption>accept</CookieOption></Browser>
  <GPS><GPSActivation>on</GPSActivation></GPS>
</Settings>
)";

const std::vector<KeyLines> &key_lines() {
    const std::string text = "zz";
    static const std::vector<KeyLines> all = {
        {"db/zel/country_iso", text, {"[CountryISO] Spec='GB',Phone='zz'"}},
        {"db/zel/network/ps_auto_attach", 7, {"[Network/AutoAttach] Spec='on',Phone='?\?'"}},
        {"db/zel/network/ps_auto_detach", 1, {"[Network/AutoDetach] Spec='off',Phone='on'"}},
        {"db/zel/network/wb_amr_codec", 0, {"[Network/WbAmrCodec] Spec='on',Phone='off'"}},
        {"db/menu_widget/bgset", text, {"[Wallpaper] Spec='Home.png',Phone='zz'"}},
        {"db/private/sound/volume/ringtone", 0x030B, {"[RngVolume] Spec='11',Phone='(Speaker)11,(Earphone)3'"}},
        {"db/setting/sound/call/ringtone_default_path", text, {"[RingTone] Spec='ring.wav',Phone='zz'"}},
        {"db/setting/sound/call/ringtone_path", text, {}},
        {"db/private/sound/volume/notification", 0x0901, {"[MsgToneVolume] Spec='9',Phone='(Speaker)1,(Earphone)9'"}},
        {"db/setting/sound/noti/msg_ringtone_path", text, {"[MessageTone/MessageAlert] Spec='alert.wav',Phone='zz'"}},
        {"db/setting/sound/noti/email_ringtone_path", text, {"[MessageTone/EmailAlert] Spec='alert.wav',Phone='zz'"}},
        {"db/private/com.quorvex.clock/alarm_app/default_alarm_tone",
         text,
         {"[AlarmTone] Spec='alarm.wav',Phone='zz'"}},
        {"db/private/sound/volume/system", 0, {"[KeyVolume] Spec='5',Phone='(Speaker)0,(Earphone)0'"}},
        {"db/setting/sound/touch_sounds", false, {"[Sound/TouchTone] Spec='on',Phone='off'"}},
        {"db/setting/sound/button_sounds", false, {}},
        {"db/ciss/call_connect_tone", false, {"[ConnectTone] Spec='on',Phone='off'"}},
        {"db/ciss/minute_minder", true, {"[MinuteMind] Spec='off',Phone='on'"}},
        {"db/ciss/call_end_tone", false, {"[CallEndTone] Spec='on',Phone='off'"}},
        {"db/menu_widget/language",
         text,
         {"[Phone/DefLanguage] Spec='english_us',Phone='zz'", "[Phone/DefLanguageNoSIM] Spec='english_us',Phone='zz'"}},
        {"db/menu_widget/regionformat", text, {}},
        {"db/setting/lang_automatic", true, {"[Phone/DefLanguage] Spec='english_us',Phone='automatic'"}},
        {"db/ise/swiftkey/prediction_val", false, {"[Phone/T9Enabling] Spec='enable',Phone='disable'"}},
        {"db/setting/date_format", 2, {"[Phone/DateFormat] Spec='ddmmyyyy',Phone='yyyymmdd'"}},
        {"db/menu_widget/regionformat_time1224", 2, {"[Phone/TimeFormat] Spec='12h',Phone='24h'"}},
        {"db/setting/automatic_time_update", false, {"[Phone/TimezoneUpdate] Spec='on',Phone='off'"}},
        {"db/ciss/noise_reduction", false, {"[CallNoiseReduction] Spec='on',Phone='off'"}},
        {"db/contacts-svc/name_sorting_order", 1, {"[Contact/ContactSort] Spec='firstname',Phone='lastname'"}},
        {"db/contacts-svc/name_display_order", 1, {}},
        {"db/contacts-svc/phonenumber_min_match_digit", 12, {"[Contact/CLIDigits] Spec='8',Phone='12'"}},
        {"db/private/com.quorvex.calendar-lite/first_day_of_week",
         6,
         {"[Calendar/StartDay] Spec='sunday',Phone='saturday'"}},
        {"db/private/com.quorvex.clock/alarm/start_of_weekday", 6, {}},
        {"file/camera/shutter_sound_policy", 0, {"[Camera/ShutterSound] Spec='on',Phone='off'"}},
        {"db/bluetooth/status", 1, {"[Bluetooth/Activation] Spec='off',Phone='on'"}},
        {"file/private/libug-setting-bluetooth-efl/visibility_time",
         -1,
         {"[Bluetooth/Visibility] Spec='off',Phone='on'"}},
        {"file/private/wifi/sleep_policy", 2, {"[WiFi/SleepPolicy] Spec='always',Phone='never'"}},
        {"db/msg/network_mode", 2, {"[SMS/Bearer] Spec='psfirst',Phone='cs'"}},
        {"db/private/msg-service/sms_send/reply_path", true, {"[SMS/ReplyPath] Spec='off',Phone='on'"}},
        {"db/private/msg-service/sms_send/delivery_report", true, {"[SMS/DeliveryReport] Spec='off',Phone='on'"}},
        {"db/private/com.quorvex.message-lite/sms_page_limit", 11, {"[SMS/PageLimit] Spec='10',Phone='11'"}},
        {"db/private/com.quorvex.message-lite/sms_mms_threshold_type",
         1,
         {"[SMS/ThresholdType] Spec='pagecount',Phone='charcount'"}},
        {"db/private/com.quorvex.message-lite/sms_mms_threshold", 5, {"[SMS/ThresholdValue] Spec='4',Phone='5'"}},
        {"db/private/com.quorvex.message-lite/sms_recipient_count_limit",
         -1,
         {"[SMS/MaxRecipient] Spec='20',Phone='-1'"}},
        {"db/private/msg-service/general/keep_copy", false, {"[SMS/KeepCopy] Spec='on',Phone='off'"}},
        {"db/private/msg-service/sms_send/dcs", 2, {"[SMS/CharSupport] Spec='automatic',Phone='unicode'"}},
        {"db/private/com.quorvex.message-lite/use_volume_key",
         false,
         {"[SMS/FontSizeByVolumeKey] Spec='on',Phone='off'"}},
        {"db/msg/validity_period", 255, {"[SMS/ValidityPeriod] Spec='readfromsim',Phone='maximum'"}},
        {"db/msg/ssms", true, {"[SMS/SSMS] Spec='off',Phone='on'"}},
        {"db/private/msg-service/imei_tracker/enable", false, {"[SMS/ImeiTracker] Spec='on',Phone='off'"}},
        {"db/private/msg-service/push_msg/recv_option", false, {"[PushMsg/RecOption] Spec='on',Phone='off'"}},
        {"db/private/msg-service/push_msg/service_load", 0, {"[PushMsg/PushLoading] Spec='prompt',Phone='always'"}},
        {"db/private/msg-service/mms_send/delivery_report", true, {"[MMS/ReqDeliveryRep] Spec='off',Phone='on'"}},
        {"db/private/msg-service/mms_send/hide_recipients", true, {"[MMS/HideAddress] Spec='off',Phone='on'"}},
        {"db/private/msg-service/mms_send/read_reply", true, {"[MMS/ReqReadRep] Spec='off',Phone='on'"}},
        {"db/private/msg-service/mms_send/priority", 0, {"[MMS/Priority] Spec='normal',Phone='low'"}},
        {"db/private/msg-service/mms_send/expiry_time", 86400, {"[MMS/Expiry] Spec='max',Phone='1d'"}},
        {"db/private/msg-service/mms_send/delivery_time", 604801, {"[MMS/DeliveryTime] Spec='imm',Phone='custom'"}},
        {"db/private/msg-service/mms_send/custom_delivery", 9, {"[MMS/DeliveryCustTime] Spec='0',Phone='9'"}},
        {"db/private/msg-service/mms_send/creation_mode", 1, {"[MMS/CreationMode] Spec='free',Phone='warning'"}},
        {"db/private/msg-service/mms_send/keep_copy", false, {"[MMS/KeepCopy] Spec='on',Phone='off'"}},
        {"db/private/com.quorvex.message-lite/mms_recipient_count_limit",
         1,
         {"[MMS/MaxRecipientMMS] Spec='10',Phone='1'"}},
        {"db/private/msg-service/mms_recv/home_network", 3, {"[MMS/Home] Spec='auto',Phone='reject'"}},
        {"db/private/msg-service/mms_recv/abroad_network", 2, {"[MMS/Roaming] Spec='manual',Phone='restricted'"}},
        {"db/private/msg-service/mms_recv/read_receipt", false, {"[MMS/SendReadRep] Spec='on',Phone='off'"}},
        {"db/private/msg-service/mms_recv/delivery_receipt", false, {"[MMS/SendDeliveryRep] Spec='on',Phone='off'"}},
        {"db/private/msg-service/mms_recv/reject_unknown", true, {"[MMS/AnonymRec] Spec='off',Phone='on'"}},
        {"db/private/msg-service/mms_recv/reject_advertisement", true, {"[MMS/AdvertRec] Spec='off',Phone='on'"}},
        {"file/private/com.quorvex.browser/cookie", 0, {"[Browser/CookieOption] Spec='accept',Phone='reject'"}},
        {"db/location/setting/GpsEnabled", 0, {"[GPS/GPSActivation] Spec='on',Phone='off'"}},
        {"db/location/setting/Usemylocation", 0, {}},
    };
    return all;
}

class VerificationOfKeys : public zel_test::ServicePhone {
  protected:
    void SetUp() override {
        ServicePhone::SetUp();
        set_string("db/zel/salescode", "BTU");
        write_customer("BTU", kFile);
        zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    }

    Value value_of(const KeyLines &row) {
        if (std::holds_alternative<int>(row.another)) return get_int(row.key).value();
        if (std::holds_alternative<bool>(row.another)) return get_bool(row.key).value();
        return get_string(row.key).value();
    }
    void set(const char *key, const Value &value) {
        if (const int *number = std::get_if<int>(&value)) return set_int(key, *number);
        if (const bool *flag = std::get_if<bool>(&value)) return set_bool(key, *flag);
        set_string(key, std::get<std::string>(value));
    }

    // The failed lines of the customer's file, without "-[Spec]".
    std::vector<std::string> failures() {
        std::vector<std::string> failed;
        const std::vector<std::string> lines = verified_lines("[Spec]");
        for (const std::string &line : lines)
            if (line.front() == '-') failed.push_back(line.substr(std::string_view{"-[Spec]"}.size()));
        compared_ = lines.size();
        return failed;
    }

    std::size_t compared_ = 0;
};

} // namespace

TEST_F(VerificationOfKeys, EachFailsItsOwnLines) {
    EXPECT_THAT(failures(), IsEmpty());
    const std::size_t all = compared_;
    std::set<std::string> failed; // "[GPS/GPSActivation]"
    for (const KeyLines &row : key_lines()) {
        const Value before = value_of(row);
        set(row.key, row.another);
        EXPECT_THAT(failures(), ElementsAreArray(row.lines)) << row.key;
        EXPECT_EQ(compared_, all) << row.key;
        set(row.key, before);
        for (const std::string &line : row.lines)
            failed.insert(line.substr(0, line.find(' ')));
    }
    EXPECT_THAT(failures(), IsEmpty());
    EXPECT_EQ(failed.size(), all - 1) << "every line but that of the sales code";
}

// Whatever a key says: a document that the phone wrote itself is met by it, but for the earphone's own level,
// which no document can tell.
TEST_F(VerificationOfKeys, MeetsWhatThePhonesOwnExportSays) {
    const std::map<std::string_view, std::string> levels = {
        {"db/private/sound/volume/ringtone", "[RngVolume] Spec='11',Phone='(Speaker)11,(Earphone)3'"},
        {"db/private/sound/volume/notification", "[MsgToneVolume] Spec='1',Phone='(Speaker)1,(Earphone)9'"},
    };
    for (const KeyLines &row : key_lines()) {
        const Value before = value_of(row);
        set(row.key, row.another);
        ASSERT_EQ(zel_svc_config_encoding_xml(), 1);
        write("/opt/system/zel/mps/ZEL/Customer/BTU/customer.xml",
              read("/opt/system/zel-default/output/customer-phone.xml"));
        const auto level = levels.find(row.key);
        const std::vector<std::string> failed = failures();
        EXPECT_EQ(failed, level == levels.end() ? std::vector<std::string>{} : std::vector{level->second}) << row.key;
        EXPECT_GT(compared_, 40U) << row.key;
        set(row.key, before);
    }
}
