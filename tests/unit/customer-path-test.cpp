#include "zel-svc-configuration-customer-path.h"

#include <gtest/gtest.h>

TEST(CustomerPath, NamesTheCustomersFiles) {
    EXPECT_EQ(zel_svc_customer_spec_path("XFV"), "/opt/system/zel/mps/ZEL/Customer/XFV/customer.xml");
    EXPECT_EQ(zel_svc_customer_preconfig_path("XFV", "usr"), "/opt/system/zel/preconfig/XFV/usr");
    EXPECT_EQ(zel_svc_customer_preconfig_path("DEF", "power-ani"), "/opt/system/zel/preconfig/DEF/power-ani");
}

TEST(CustomerPath, ACodeIsTakenLiterally) {
    EXPECT_EQ(zel_svc_customer_spec_path("%s"), "/opt/system/zel/mps/ZEL/Customer/%s/customer.xml");
    EXPECT_EQ(zel_svc_customer_spec_path("..."), "/opt/system/zel/mps/ZEL/Customer/.../customer.xml");
}

TEST(CustomerPath, ACodeThatNamesNoFolderHasNoFiles) {
    for (const char *code : {"", ".", "..", "/", "../x", "a/b", "/etc"}) {
        EXPECT_FALSE(zel_svc_customer_names_folder(code)) << code;
        EXPECT_EQ(zel_svc_customer_spec_path(code), "") << code;
        EXPECT_EQ(zel_svc_customer_preconfig_path(code, "usr"), "") << code;
    }
}
