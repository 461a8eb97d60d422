#include "base/zel-svc-internal-customer.h"
#include "zel-svc.h"

#include <gtest/gtest.h>

#include <string>

namespace {

struct Answer {
    int result;
    std::string name;
};

Answer ask(const char *customer) {
    char name[10] = "unchanged";
    const int result = zel_svc_config_get_internal_customer_name(customer, name, sizeof name);
    return {result, name};
}

} // namespace

TEST(InternalCustomer, ThirteenCodesShareAFolder) {
    for (const char *code :
         {"CHT", "COB", "CRM", "EBE", "NBS", "PBS", "SAL", "SAM", "TGU", "TMM", "UFN", "UFU", "VMT"}) {
        EXPECT_EQ(zel_svc_internal_customer(code), "TFG") << code;
        const Answer answer = ask(code);
        EXPECT_EQ(answer.result, 1) << code;
        EXPECT_EQ(answer.name, "TFG") << code;
    }
}

TEST(InternalCustomer, OtherCodesAreTheirOwnFolder) {
    for (const char *code : {"UF", "UFNX", "XFV", "TFG", "ufn", "", "DEF"}) {
        const Answer answer = ask(code);
        EXPECT_EQ(answer.result, 0) << code;
        EXPECT_EQ(answer.name, code);
    }
}

TEST(InternalCustomer, TheNameIsBoundedByTheBuffer) {
    char name[4] = {'x', 'x', 'x', 'x'};
    EXPECT_EQ(zel_svc_config_get_internal_customer_name("UFN", name, 3), 1);
    EXPECT_STREQ(name, "TF");
    EXPECT_EQ(name[3], 'x');
    EXPECT_EQ(zel_svc_config_get_internal_customer_name("ABCDEF", name, 4), 0);
    EXPECT_STREQ(name, "ABC");
}

TEST(InternalCustomer, NoRoomIsNotTouched) {
    char name[2] = {'x', 'y'};
    EXPECT_EQ(zel_svc_config_get_internal_customer_name("UFN", name, 0), 1);
    EXPECT_EQ(zel_svc_config_get_internal_customer_name("UFN", name, -1), 1);
    EXPECT_EQ(name[0], 'x');
    EXPECT_EQ(name[1], 'y');
}

TEST(InternalCustomer, NullArgumentsGiveZero) {
    char name[10];
    EXPECT_EQ(zel_svc_config_get_internal_customer_name(nullptr, name, sizeof name), 0);
    EXPECT_EQ(zel_svc_config_get_internal_customer_name("UFN", nullptr, 10), 0);
}
