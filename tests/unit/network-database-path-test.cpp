// Which SIM's network database an entry point leaves to the handlers.

#include "spec/zel-svc-parse-context.h"
#include "support/bench-phone.h"

namespace {

struct NetworkDatabasePath : zel_test::BenchPhone {};

struct NetworkDatabasePathOfTwoSims : zel_test::BenchPhone {
    NetworkDatabasePathOfTwoSims() { create_arguments["sims"] = 2; }
};

} // namespace

TEST_F(NetworkDatabasePath, IsTheFirstSimsAfterAnInstall) {
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_STREQ(ZEL_SVC_NETWORK_DB_PATH, "/opt/dbspace/.dnet.db");
    zel_svc_set_network_db_path("");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_STREQ(ZEL_SVC_NETWORK_DB_PATH, "/opt/dbspace/.dnet.db");
}

TEST_F(NetworkDatabasePath, IsNotTouchedWhereNoCustomerFileIsRead) {
    zel_svc_set_network_db_path("before");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_FOTA_MODE);
    zel_svc_config_install_customer("BTU", 3);
    EXPECT_STREQ(ZEL_SVC_NETWORK_DB_PATH, "before");
}

TEST_F(NetworkDatabasePathOfTwoSims, IsLeftAtTheSecondSims) {
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_STREQ(ZEL_SVC_NETWORK_DB_PATH, "/opt/dbspace/.dnet2.db");
}

TEST_F(NetworkDatabasePathOfTwoSims, AHeaderInstallTakesTheFirstSims) {
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    zel_svc_config_install_header();
    EXPECT_STREQ(ZEL_SVC_NETWORK_DB_PATH, "/opt/dbspace/.dnet.db");
}
