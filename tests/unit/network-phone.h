#pragma once
// A phone whose network database and network table hold networks, for groups that write rows of networks.

#include "operator-items.h"
#include "support/bench-phone.h"
#include "support/spec-text.h"
#include "support/sqlite-file.h"

#include <cstdint>
#include <string>

namespace zel_test {

class NetworkPhone : public BenchPhone {
  protected:
    void SetUp() override {
        BenchPhone::SetUp();
        zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM1);
    }

    [[nodiscard]] std::string file(const char *path = ZEL_SVC_NETWORK_DB_PATH_SIM1) const { return root() + path; }
    void run(const std::string &sql) const { SqliteFile{file()}.run(sql); }
    [[nodiscard]] SqliteRows rows(const std::string &sql) const { return SqliteFile{file()}.rows(sql); }

    // A network of the customer, as its NetworkInfo element leaves it.
    void add_network(const std::string &name, const std::string &mccmnc, std::int32_t id) const {
        run("insert into network_info values(" + std::to_string(id) + ", '" + name + "', '" + mccmnc + "')");
        add_table_entry(name, mccmnc, id);
    }
    static void add_table_entry(const std::string &name, const std::string &mccmnc, std::int32_t id) {
        ZelSvcNetworkEntry entry{};
        zel_svc_text_copy(entry.network_name, sizeof entry.network_name, name);
        zel_svc_text_copy(entry.mccmnc, sizeof entry.mccmnc, mccmnc);
        entry.network_id = id;
        ASSERT_TRUE(zel_svc_network_table_append(entry));
    }
    // The operator of an operator install.
    static void choose_operator(std::string_view network_name, std::string_view mccmnc) {
        set_operator(network_name);
        zel_svc_text_copy(zel_svc_current_operator().mccmnc, sizeof zel_svc_current_operator().mccmnc, mccmnc);
    }
};

} // namespace zel_test
