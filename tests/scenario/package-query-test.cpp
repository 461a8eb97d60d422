#include "service-phone.h"

#include <array>
#include <cstring>

namespace {

std::string listed(const std::string &customer) {
    return "<CustomerData src=\"/Customer/" + customer + "/customer.xml\"/>\n";
}

class PackageQuery : public zel_test::ServicePhone {
  protected:
    void write_customers(int count, const std::vector<std::string> &customers) {
        std::string elements = "<CustomerDataSet>\n<NbCustomer>" + std::to_string(count) + "</NbCustomer>\n";
        for (const std::string &customer : customers)
            elements += listed(customer);
        write_header(elements + "</CustomerDataSet>\n");
    }

    int read_list() {
        count_ = -1;
        return zel_svc_config_get_customer_list(list_.data(), &count_);
    }

    std::array<ZelSvcCustomer, ZEL_SVC_MAX_CUSTOMERS> list_ = {};
    int32_t count_ = -1;
};

class FirstCustomer : public PackageQuery {
  protected:
    int ask(int size = 10) {
        char buffer[10] = "unchanged";
        const int result = zel_svc_config_get_first_customer_name_in_zel_bin(buffer, size);
        name_ = buffer;
        return result;
    }
    std::string name_;
};

class PackageVersion : public PackageQuery {
  protected:
    int ask(int size = 20) {
        char buffer[20] = "unchanged";
        const int result = zel_svc_config_get_zel_bin_version(buffer, size);
        version_ = buffer;
        return result;
    }
    std::string version_;
};

} // namespace

TEST_F(PackageQuery, ListsTheCustomers) {
    write_customers(2, {"XFV", "TFG"});
    EXPECT_EQ(read_list(), 1);
    ASSERT_EQ(count_, 2);
    EXPECT_STREQ(list_[0].name, "XFV");
    EXPECT_STREQ(list_[0].path, "/Customer/XFV/customer.xml");
    EXPECT_STREQ(list_[1].name, "TFG");
}

TEST_F(PackageQuery, TheListIsReadAnewEachTime) {
    write_customers(2, {"XFV", "TFG"});
    read_list();
    write_customers(1, {"BTU"});
    read_list();
    EXPECT_EQ(count_, 1);
    EXPECT_STREQ(list_[0].name, "BTU");
    EXPECT_EQ(zel_svc_config_chk_customer_name_exist_in_zel_bin("TFG"), 0);
}

TEST_F(PackageQuery, AMissingHeaderHasNoCustomers) {
    EXPECT_EQ(read_list(), 1);
    EXPECT_EQ(count_, 0);
    EXPECT_EQ(zel_svc_config_chk_customer_name_exist_in_zel_bin("XFV"), 0);
}

TEST_F(PackageQuery, TheCountIsTheStatedOne) {
    write_customers(3, {"XFV"});
    read_list();
    EXPECT_EQ(count_, 3);
    EXPECT_STREQ(list_[1].name, "");
    EXPECT_STREQ(list_[2].name, "");
}

TEST_F(PackageQuery, AStatedCountIsBounded) {
    write_customers(100000, {"XFV"});
    read_list();
    EXPECT_EQ(count_, ZEL_SVC_MAX_CUSTOMERS);
    write_customers(-5, {"XFV"});
    read_list();
    EXPECT_EQ(count_, 0);
}

TEST_F(PackageQuery, NullArgumentsGive0) {
    EXPECT_EQ(zel_svc_config_get_customer_list(nullptr, &count_), 0);
    EXPECT_EQ(zel_svc_config_get_customer_list(list_.data(), nullptr), 0);
    EXPECT_EQ(zel_svc_config_chk_customer_name_exist_in_zel_bin(nullptr), 0);
    EXPECT_EQ(zel_svc_config_get_first_customer_name_in_zel_bin(nullptr, 10), 0);
    EXPECT_EQ(zel_svc_config_get_zel_bin_version(nullptr, 10), 0);
    EXPECT_EQ(zel_svc_config_get_approval_version(nullptr), 0);
    EXPECT_EQ(zel_svc_config_get_security_lock_info(nullptr), 0);
}

TEST_F(PackageQuery, ACustomerExistsUnderItsFolder) {
    write_customers(2, {"XFV", "TFG"});
    EXPECT_EQ(zel_svc_config_chk_customer_name_exist_in_zel_bin("XFV"), 1);
    EXPECT_EQ(zel_svc_config_chk_customer_name_exist_in_zel_bin("UFN"), 1);
    EXPECT_EQ(zel_svc_config_chk_customer_name_exist_in_zel_bin("XF"), 0);
    EXPECT_EQ(zel_svc_config_chk_customer_name_exist_in_zel_bin("BTU"), 0);
}

TEST_F(PackageQuery, AnEmptyNameNeverExists) {
    write_customers(2, {"XFV"});
    EXPECT_EQ(zel_svc_config_chk_customer_name_exist_in_zel_bin(""), 0);
}

TEST_F(FirstCustomer, IsTheFirstOfTheList) {
    write_customers(2, {"XFV", "TFG"});
    EXPECT_EQ(ask(), 1);
    EXPECT_EQ(name_, "XFV");
    EXPECT_EQ(ask(3), 1);
    EXPECT_EQ(name_, "XF");
}

TEST_F(FirstCustomer, WithoutOneTheBufferIsEmpty) {
    EXPECT_EQ(ask(), 0);
    EXPECT_EQ(name_, "");
    write_customers(2, {});
    EXPECT_EQ(ask(), 0);
    EXPECT_EQ(name_, "");
    EXPECT_EQ(ask(0), 0);
    EXPECT_EQ(name_, "unchanged");
}

TEST_F(PackageVersion, IsNameAndVersion) {
    write_header("<ZELName>ABC123XYZ</ZELName><ZELVersion>V01</ZELVersion>");
    EXPECT_EQ(ask(), 1);
    EXPECT_EQ(version_, "ABC123XYZV01");
    EXPECT_EQ(get_string("db/private/zel/bin_name"), "ABC123XYZ");
    EXPECT_EQ(get_string("db/private/zel/bin_version"), "V01");
    EXPECT_EQ(get_string("db/zel/bincode"), "XYZ");
}

TEST_F(PackageVersion, EachPartIsCutTo9BytesAndTheWholeToTheBuffer) {
    write_header("<ZELName>ABCDEFGHIJKL</ZELName><ZELVersion>1234567890</ZELVersion>");
    EXPECT_EQ(ask(), 1);
    EXPECT_EQ(version_, "ABCDEFGHI123456789");
    EXPECT_EQ(ask(12), 1);
    EXPECT_EQ(version_, "ABCDEFGHI12");
}

TEST_F(PackageVersion, WithoutANameItIsUnknown) {
    write_header("<ZELVersion>V01</ZELVersion>");
    EXPECT_EQ(ask(), 0);
    EXPECT_EQ(version_, "Q0000NXBBBB1");
    EXPECT_EQ(ask(6), 0);
    EXPECT_EQ(version_, "Q0000");
}

TEST_F(PackageVersion, WithoutAHeaderThePhonesKeysAnswer) {
    set_string("db/private/zel/bin_name", "NAME");
    set_string("db/private/zel/bin_version", "V9");
    EXPECT_EQ(ask(), 1);
    EXPECT_EQ(version_, "NAMEV9");
    set_string("db/private/zel/bin_version", "");
    EXPECT_EQ(ask(), 0);
    EXPECT_EQ(version_, "Q0000NXBBBB1");
}

TEST_F(PackageVersion, ASizeBelow1TouchesNothing) {
    write_header("<ZELName>ABC123XYZ</ZELName><ZELVersion>V01</ZELVersion>");
    EXPECT_EQ(ask(0), 0);
    EXPECT_EQ(version_, "unchanged");
    EXPECT_EQ(ask(-1), 0);
    EXPECT_EQ(get_string("db/private/zel/bin_name"), std::nullopt);
}

class ApprovalVersion : public zel_test::ServicePhone {
  protected:
    void write_file(const std::string &text) { write("/opt/system/zel-default/usr/zel/zel-approval-ver.ini", text); }
    int ask() {
        std::memset(&versions_, 'x', sizeof versions_);
        return zel_svc_config_get_approval_version(&versions_);
    }
    ZelSvcApprovalVersion versions_ = {};
};

TEST_F(ApprovalVersion, HasThreeParts) {
    write_file("[info]\nap=\"AP1\"\ncp=CP2\nzel=ZEL3\n");
    EXPECT_EQ(ask(), 1);
    EXPECT_STREQ(versions_.ap, "AP1");
    EXPECT_STREQ(versions_.cp, "CP2");
    EXPECT_STREQ(versions_.zel, "ZEL3");
    EXPECT_EQ(zel_svc_config_chk_approval_version_exist(), 1);
}

TEST_F(ApprovalVersion, AMissingFileStatesNothing) {
    EXPECT_EQ(ask(), 0);
    const ZelSvcApprovalVersion empty = {};
    EXPECT_EQ(std::memcmp(&versions_, &empty, sizeof empty), 0);
    EXPECT_EQ(zel_svc_config_chk_approval_version_exist(), 0);
}

TEST_F(ApprovalVersion, AnEmptyValueStatesNothing) {
    write_file("[info]\nap=\"\"\ncp=CP2\n");
    EXPECT_EQ(ask(), 1);
    EXPECT_STREQ(versions_.ap, "");
    EXPECT_STREQ(versions_.cp, "CP2");
    write_file("[info]\nap=\"\"\n");
    EXPECT_EQ(ask(), 0);
    EXPECT_EQ(zel_svc_config_chk_approval_version_exist(), 1);
}

TEST_F(ApprovalVersion, AValueThatSortsBeforeTwoQuotesStatesNothing) {
    write_file("[info]\nap=!AP\ncp=CP2\n");
    EXPECT_EQ(ask(), 1);
    EXPECT_STREQ(versions_.ap, "");
}

TEST_F(ApprovalVersion, BytesCompareUnsigned) {
    write_file("[info]\nap=\xC3\x84P\n");
    EXPECT_EQ(ask(), 1);
    EXPECT_STREQ(versions_.ap, "\xC3\x84P");
}

TEST_F(ApprovalVersion, ThePackagesVersionNeedsTheProcessors) {
    write_file("[info]\nzel=ZEL3\n");
    EXPECT_EQ(ask(), 0);
    EXPECT_STREQ(versions_.zel, "");
    EXPECT_EQ(zel_svc_config_chk_approval_version_exist(), 1);
    write_file("[info]\ncp=\"\"\nzel=ZEL3\n");
    EXPECT_EQ(ask(), 1);
    EXPECT_STREQ(versions_.cp, "");
    EXPECT_STREQ(versions_.zel, "ZEL3");
}

TEST_F(ApprovalVersion, AVersionIsCutTo19Bytes) {
    write_file("[info]\nap=12345678901234567890123\n");
    EXPECT_EQ(ask(), 1);
    EXPECT_STREQ(versions_.ap, "1234567890123456789");
}

TEST_F(ApprovalVersion, AFileWithoutTheSectionStatesNothing) {
    write_file("[other]\nap=AP1\n");
    EXPECT_EQ(ask(), 0);
    EXPECT_EQ(zel_svc_config_chk_approval_version_exist(), 0);
}

class SecurityLock : public zel_test::ServicePhone {
  protected:
    int ask() {
        std::memset(&locks_, 'x', sizeof locks_);
        return zel_svc_config_get_security_lock_info(&locks_);
    }
    bool empty() const {
        const ZelSvcSecurityLock none = {};
        return std::memcmp(&locks_, &none, sizeof none) == 0;
    }
    ZelSvcSecurityLock locks_ = {};
};

TEST_F(SecurityLock, NeedsAnActiveCustomer) {
    mark_group("security");
    EXPECT_EQ(ask(), 0);
    EXPECT_TRUE(group_is_marked("security"));
}

TEST_F(SecurityLock, OfAMissingFileIsEmpty) {
    set_string("db/zel/salescode", "XFV");
    EXPECT_EQ(ask(), 1);
    EXPECT_TRUE(empty());
}

TEST_F(SecurityLock, StartsTheSecurityGroupAfreshAndNoOther) {
    set_string("db/zel/salescode", "XFV");
    mark_group("security");
    mark_group("gps");
    EXPECT_EQ(ask(), 1);
    EXPECT_FALSE(group_is_marked("security"));
    EXPECT_TRUE(group_is_marked("gps"));
}

TEST_F(SecurityLock, IsThatOfTheActiveCustomersFolder) {
    set_string("db/zel/salescode", "UFN");
    write_customer("TFG", "<Settings><Main><Security><NbNetworkLock>2</NbNetworkLock><NetworkLock>00101</NetworkLock>"
                          "<NetworkLock>00102</NetworkLock><AutoSIMLock>on</AutoSIMLock><UnlockCnt>5</UnlockCnt>"
                          "</Security></Main></Settings>");
    EXPECT_EQ(ask(), 1);
    EXPECT_EQ(locks_.network_lock_count, 2);
    EXPECT_STREQ(locks_.network_locks[0], "00101");
    EXPECT_STREQ(locks_.network_locks[1], "00102");
    EXPECT_EQ(locks_.auto_sim_lock, 1);
    EXPECT_EQ(locks_.unlock_count, 5);
    EXPECT_NE(read(data_path("security")).find("net_lock_count"), std::string::npos);
}

TEST_F(SecurityLock, OfAFileWithoutLocksIsEmptyAndNotAnEarlierCustomers) {
    write_customer("XFV", "<Settings><Main><Security><UnlockCnt>5</UnlockCnt></Security></Main></Settings>");
    write_customer("BTU", "<Settings><Main></Main></Settings>");
    set_string("db/zel/salescode", "XFV");
    EXPECT_EQ(ask(), 1);
    EXPECT_EQ(locks_.unlock_count, 5);
    set_string("db/zel/salescode", "BTU");
    EXPECT_EQ(ask(), 1);
    EXPECT_TRUE(empty());
}

class InstallHeader : public PackageQuery {};

TEST_F(InstallHeader, WritesNameAndVersionBetweenItsLines) {
    write_header("<CustomerDataSet><ZELName>ABC123XYZ</ZELName><ZELVersion>V01</ZELVersion></CustomerDataSet>");
    zel_svc_config_install_header();
    EXPECT_EQ(get_string("db/private/zel/bin_name"), "ABC123XYZ");
    EXPECT_EQ(get_string("db/private/zel/bin_version"), "V01");
    EXPECT_EQ(get_string("db/zel/bin_full_version"), "ABC123XYZV01");
    EXPECT_EQ(run_log(), "[Config/Start] Install header.\n"
                         "[Header/Success] Binary version('ABC123XYZV01') set.\n"
                         "[Config/Ended] Install header.\n");
}

TEST_F(InstallHeader, AMissingFileLeavesItsLines) {
    zel_svc_config_install_header();
    EXPECT_EQ(run_log(), "[Config/Start] Install header.\n[Config/Ended] Install header.\n");
}

TEST_F(InstallHeader, EveryElementIsRead) {
    zel_svc_config_chk_customer_name_exist_in_zel_bin("XFV"); // leaves a few elements enabled
    write_header("<GeneralInfo><CountryISO>ZA</CountryISO></GeneralInfo>");
    zel_svc_config_install_header();
    EXPECT_EQ(get_string("db/zel/country_iso"), "ZA");
}
