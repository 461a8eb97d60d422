// A program in C, with the public header and the shared library alone, on a phone of its own.

#include "service-phone.h"

#include <cstdlib>
#include <sys/wait.h>

namespace {

class CProgram : public zel_test::ServicePhone {
  protected:
    static int run() {
        const int status = std::system(ZEL_C_PROGRAM); // NOLINT(cert-env33-c,concurrency-mt-unsafe): our own program
        return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    }
};

} // namespace

TEST_F(CProgram, UsesEveryFunction) {
    write_header("<CustomerDataSet><ZELName>NAME01</ZELName><ZELVersion>V02</ZELVersion><NbCustomer>1</NbCustomer>"
                 "<CustomerData src=\"/Customer/XFV/customer.xml\"/></CustomerDataSet>");
    write_customer("XFV", "<GeneralInfo><CountryISO>ZA</CountryISO><NetworkInfo><NetworkName>Network</NetworkName>"
                          "<MCCMNC>00101</MCCMNC></NetworkInfo></GeneralInfo>");
    EXPECT_EQ(run(), 0);
    EXPECT_EQ(get_string("db/zel/country_iso"), "ZA");
    EXPECT_EQ(call("status").at("restarts_asked"), 1);
}

TEST_F(CProgram, NoticesWrongAnswers) {
    EXPECT_EQ(run(), 1); // no package: its customers and version are not the expected ones
}
