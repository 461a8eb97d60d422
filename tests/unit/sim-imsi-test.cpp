// A modem that fills its record to the last byte: no field is terminated.

#include "support/bench-phone.h"
#include "zel-svc.h"

#include <telephony.h>

#include <cstring>
#include <dlfcn.h>
#include <gmock/gmock.h>

namespace {

const char *gRecord = nullptr; // null: the phone's own modem answers

using ::testing::Contains;
using ::testing::Each;
using ::testing::HasSubstr;
using ::testing::Not;

class FullImsi : public zel_test::BenchPhone {
  protected:
    void TearDown() override {
        gRecord = nullptr;
        BenchPhone::TearDown();
    }
};

} // namespace

extern "C" int tel_get_sim_imsi(struct tel_handle *handle, struct tel_sim_imsi *imsi) {
    using Function = int(struct tel_handle *, struct tel_sim_imsi *);
    if (!gRecord) return reinterpret_cast<Function *>(::dlsym(RTLD_NEXT, "tel_get_sim_imsi"))(handle, imsi);
    std::memcpy(imsi, gRecord, sizeof *imsi);
    return 0;
}

TEST_F(FullImsi, IsReadFieldByField) {
    gRecord = "655x"
              "010y"
              "1234567890z";
    ZelSvcSimInfo info;
    EXPECT_EQ(zel_svc_sim_auto_setting_get_sim_info(&info, 1), 1);
    EXPECT_STREQ(info.mccmnc, "655010");
    EXPECT_STREQ(info.msin, "1234567890");
    EXPECT_THAT(system_log(), Contains(HasSubstr("[SIM1] SIM(655_010_123) read.")));
    EXPECT_THAT(system_log(), Each(Not(HasSubstr("1234"))));
}
