// The whole document, byte for byte: every element in its place, each repeating one once.

#include "dispatch/recording-table.h"
#include "spec/zel-svc-data.h"
#include "spec/zel-svc-encode.h"
#include "support/bench-phone.h"

#include <algorithm>
#include <cstdlib>
#include <memory>

namespace {

// Handlers give nothing out but the counts.
constexpr const char *kDocument = "\xEF\xBB\xBF"
                                  R"(<?xml version="1.0" encoding="UTF-8" ?>
<CustomerData>
  <GeneralInfo>
    <SalesCode></SalesCode>
    <CountryISO></CountryISO>
  </GeneralInfo>
  <Settings>
    <Main>
      <Network>
        <NbMaxPDP></NbMaxPDP>
        <MaxPDP>
          <NetworkName></NetworkName>
          <MaxPDP2G></MaxPDP2G>
          <MaxPDP3G></MaxPDP3G>
        </MaxPDP>
        <NbFastDormancy></NbFastDormancy>
        <FastDormancy>
          <NetworkName></NetworkName>
          <FastDormancyEnableStatus></FastDormancyEnableStatus>
          <TimeoutValue></TimeoutValue>
          <LCDStatus></LCDStatus>
          <Version></Version>
        </FastDormancy>
        <WbAmr>
          <WbAmrCodec></WbAmrCodec>
        </WbAmr>
      </Network>
      <Display>
      </Display>
      <Sound>
        <RngVolume></RngVolume>
        <MsgToneVolume></MsgToneVolume>
        <AlarmTone></AlarmTone>
        <KeyTone>
          <KeyVolume></KeyVolume>
        </KeyTone>
        <TouchTone></TouchTone>
        <ExtraSound>
          <ConnectTone></ConnectTone>
          <MinuteMind></MinuteMind>
          <CallEndTone></CallEndTone>
        </ExtraSound>
      </Sound>
      <Phone>
        <DefLanguage></DefLanguage>
        <DefLanguageNoSIM></DefLanguageNoSIM>
        <T9Enabling></T9Enabling>
        <DateTimeFormat>
          <DateFormat></DateFormat>
          <TimeFormat></TimeFormat>
          <TimezoneUpdate></TimezoneUpdate>
        </DateTimeFormat>
        <CallNoiseReduction></CallNoiseReduction>
      </Phone>
    </Main>
    <Contact>
      <ContactSort></ContactSort>
      <CLIDigits></CLIDigits>
    </Contact>
    <Calendar>
      <StartDay></StartDay>
    </Calendar>
    <Multimedia>
      <Camera>
        <ShutterSound></ShutterSound>
      </Camera>
    </Multimedia>
    <BT>
      <Activation></Activation>
      <Visibility></Visibility>
    </BT>
    <Wifi>
      <SleepPolicy></SleepPolicy>
    </Wifi>
    <Messages>
      <SMS>
        <Bearer></Bearer>
        <ReplyPath></ReplyPath>
        <DeliveryReport></DeliveryReport>
        <PageLimit></PageLimit>
        <MsgTypeThreshold>
          <ThresholdType></ThresholdType>
          <ThresholdValue></ThresholdValue>
        </MsgTypeThreshold>
        <MaxRecipient></MaxRecipient>
        <KeepCopy></KeepCopy>
        <CharSupport></CharSupport>
        <FontSizeByVolumeKey></FontSizeByVolumeKey>
        <ValidityPeriod></ValidityPeriod>
        <SSMS></SSMS>
        <ImeiTracker></ImeiTracker>
      </SMS>
      <PushMsg>
        <RecOption></RecOption>
        <PushLoading></PushLoading>
      </PushMsg>
      <MMS>
        <MmsSending>
          <ReqDeliveryRep></ReqDeliveryRep>
          <HideAddress></HideAddress>
          <ReqReadRep></ReqReadRep>
          <Priority></Priority>
          <Expiry></Expiry>
          <DeliveryTime></DeliveryTime>
          <DeliveryCustTime></DeliveryCustTime>
          <CreationMode></CreationMode>
          <KeepCopy></KeepCopy>
          <MaxRecipientMMS></MaxRecipientMMS>
        </MmsSending>
        <MmsReceiving>
          <Home></Home>
          <Roaming></Roaming>
          <SendReadRep></SendReadRep>
          <SendDeliveryRep></SendDeliveryRep>
          <AnonymRec></AnonymRec>
          <AdvertRec></AdvertRec>
        </MmsReceiving>
      </MMS>
    </Messages>
    <Browser>
      <CookieOption></CookieOption>
      <NbBookmark>1</NbBookmark>
      <Bookmark>
        <Editable></Editable>
        <Folder></Folder>
        <BookmarkName></BookmarkName>
        <URL></URL>
      </Bookmark>
      <NbQuickAccess>1</NbQuickAccess>
      <QuickAccess>
        <Editable></Editable>
        <QATitle></QATitle>
        <QAURL></QAURL>
      </QuickAccess>
      <eManual>
        <URL></URL>
      </eManual>
    </Browser>
    <Connections>
      <NbProfile>1</NbProfile>
      <Profile>
        <NetworkName></NetworkName>
        <ProfileName></ProfileName>
        <Editable></Editable>
        <EnableStatus></EnableStatus>
        <HiddenStatus></HiddenStatus>
        <RoamingEnableStatus></RoamingEnableStatus>
        <IpVersion></IpVersion>
        <RoamingIpVersion></RoamingIpVersion>
        <Auth></Auth>
        <PSparam>
          <APN></APN>
          <UserId></UserId>
          <Password></Password>
        </PSparam>
        <URL></URL>
        <Proxy>
          <ServAddr></ServAddr>
          <Port></Port>
        </Proxy>
        <StaticIP>
          <EnableFlag></EnableFlag>
          <IPAddr></IPAddr>
        </StaticIP>
        <DNS>
          <EnableFlag></EnableFlag>
          <IPAddr></IPAddr>
          <IPAddr></IPAddr>
        </DNS>
      </Profile>
      <NbProfileHandle>1</NbProfileHandle>
      <ProfileHandle>
        <NetworkName></NetworkName>
        <ProfBrowser></ProfBrowser>
        <ProfMMS></ProfMMS>
        <ProfIntSharing></ProfIntSharing>
        <ProfIMS></ProfIMS>
        <ProfXCAP></ProfXCAP>
        <ProfEmergencyIMSCall></ProfEmergencyIMSCall>
      </ProfileHandle>
    </Connections>
    <SyncML>
      <NbDataSync>1</NbDataSync>
      <DataSync>
        <AccName></AccName>
        <ServAddr></ServAddr>
        <UserId></UserId>
        <Password></Password>
        <DBList>
          <ContactDB>
            <EnableFlag></EnableFlag>
            <DBName></DBName>
            <DBId></DBId>
            <DBPassword></DBPassword>
          </ContactDB>
          <CalendarDB>
            <EnableFlag></EnableFlag>
            <DBName></DBName>
            <DBId></DBId>
            <DBPassword></DBPassword>
          </CalendarDB>
        </DBList>
      </DataSync>
    </SyncML>
    <GPS>
      <GPSActivation></GPSActivation>
    </GPS>
  </Settings>
</CustomerData>
)";

struct EncodeSequence : zel_test::BenchPhone {
    static void record_one_of_each() {
        for (const char *count : {"NbBookmark", "NbQuickAccess", "NbProfile", "NbProfileHandle", "NbDataSync"})
            zel_test::export_texts()[std::string{"value "} + count] = "1";
        for (const ZelSvcDataGroup group : {ZEL_SVC_DATA_MAX_PDP, ZEL_SVC_DATA_FAST_DORMANCY, ZEL_SVC_DATA_MAIN})
            zel_svc_data_load(group, ZEL_SVC_DATA_SIM1, 1);
        zel_svc_data_set_int(ZEL_SVC_DATA_MAX_PDP, "max_pdp", "count", 1);
        zel_svc_data_set_int(ZEL_SVC_DATA_FAST_DORMANCY, "spec", "count", 1);
        zel_svc_data_set_int(ZEL_SVC_DATA_MAIN, "phone", "lang_automatic", 1);
        zel_svc_data_set_str(ZEL_SVC_DATA_MAIN, "phone", "lang_no_sim", "english_us");
    }
};

} // namespace

TEST_F(EncodeSequence, IsTheOneOfTheFormat) {
    record_one_of_each();
    char *document = nullptr;
    ASSERT_EQ(zel_svc_spec_encode_xml(&document), 1);
    const std::unique_ptr<char, decltype(&std::free)> owned{document, &std::free};
    EXPECT_STREQ(document, kDocument);
}

// Rows of one name are told by their place: each handler that was asked is that of the element at this place.
TEST_F(EncodeSequence, AsksTheRowOfTheEnclosingElement) {
    record_one_of_each();
    char *document = nullptr;
    ASSERT_EQ(zel_svc_spec_encode_xml(&document), 1);
    std::free(document);
    std::vector<ZelSvcElementId> asked;
    for (const zel_test::Call &call : zel_test::calls())
        if (call.occurrence.kind == OccurrenceKind::Value) asked.push_back(call.occurrence.element);
    const auto times = [&](ZelSvcElementId id) { return std::count(asked.begin(), asked.end(), id); };
    for (const ZelSvcElementId id :
         {ZEL_SVC_ELEMENT_MAX_PDP_NETWORK_NAME,   ZEL_SVC_ELEMENT_FAST_DORMANCY_NETWORK_NAME,
          ZEL_SVC_ELEMENT_PROFILE_NETWORK_NAME,   ZEL_SVC_ELEMENT_PROFILE_HANDLE_NETWORK_NAME,
          ZEL_SVC_ELEMENT_SMS_KEEP_COPY,          ZEL_SVC_ELEMENT_MMS_SENDING_KEEP_COPY,
          ZEL_SVC_ELEMENT_BOOKMARK_EDITABLE,      ZEL_SVC_ELEMENT_QUICK_ACCESS_EDITABLE,
          ZEL_SVC_ELEMENT_PROFILE_EDITABLE,       ZEL_SVC_ELEMENT_BOOKMARK_URL,
          ZEL_SVC_ELEMENT_E_MANUAL_URL,           ZEL_SVC_ELEMENT_PROFILE_URL,
          ZEL_SVC_ELEMENT_PROXY_SERV_ADDR,        ZEL_SVC_ELEMENT_DATA_SYNC_SERV_ADDR,
          ZEL_SVC_ELEMENT_PS_PARAM_USER_ID,       ZEL_SVC_ELEMENT_DATA_SYNC_USER_ID,
          ZEL_SVC_ELEMENT_PS_PARAM_PASSWORD,      ZEL_SVC_ELEMENT_DATA_SYNC_PASSWORD,
          ZEL_SVC_ELEMENT_STATIC_IP_ENABLE_FLAG,  ZEL_SVC_ELEMENT_DNS_ENABLE_FLAG,
          ZEL_SVC_ELEMENT_CONTACT_DB_ENABLE_FLAG, ZEL_SVC_ELEMENT_CALENDAR_DB_ENABLE_FLAG,
          ZEL_SVC_ELEMENT_STATIC_IP_ADDR,         ZEL_SVC_ELEMENT_CONTACT_DB_NAME,
          ZEL_SVC_ELEMENT_CALENDAR_DB_NAME,       ZEL_SVC_ELEMENT_CONTACT_DB_ID,
          ZEL_SVC_ELEMENT_CALENDAR_DB_ID,         ZEL_SVC_ELEMENT_CONTACT_DB_PASSWORD,
          ZEL_SVC_ELEMENT_CALENDAR_DB_PASSWORD,   ZEL_SVC_ELEMENT_FAST_DORMANCY_VERSION,
          ZEL_SVC_ELEMENT_BT_ACTIVATION,          ZEL_SVC_ELEMENT_BT_VISIBILITY})
        EXPECT_EQ(times(id), 1) << id;
    EXPECT_EQ(times(ZEL_SVC_ELEMENT_DNS_IP_ADDR), 2);
}
