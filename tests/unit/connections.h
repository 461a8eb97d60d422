#pragma once
// A phone with a network database, and pieces of spec text about its data connections.
//
//     class Things : public ConnectionPhone {};
//     TEST_F(Things, AreDone) {
//         add_network("One", "26201");
//         install_connections(handle("One", tag("ProfBrowser", "Web")) + profile("One", "Web"));
//         EXPECT_EQ(profiles("profile_name, svc_category_id"), (SqliteRows{{"Web", "1"}}));
//     }

#include "operator-items.h"
#include "support/bench-phone.h"
#include "support/spec-text.h"
#include "support/sqlite-file.h"

#include <filesystem>
#include <memory>

namespace zel_test {

inline std::string tag(const std::string &name, const std::string &content) {
    return "<" + name + ">" + content + "</" + name + ">";
}
inline std::string profile(const std::string &network, const std::string &name, const std::string &more = "") {
    return tag("Profile", tag("NetworkName", network) + tag("ProfileName", name) + more);
}
inline std::string handle(const std::string &network, const std::string &names) {
    return tag("ProfileHandle", tag("NetworkName", network) + names);
}
inline std::string connections(const std::string &content) { return tag("Connections", content); }
inline void install_connections(const std::string &content, ZelSvcParseMode mode = ZEL_SVC_PARSE_MODE_FULL) {
    install_spec(connections(content), mode);
}

// An entry of the network table. Its row of the database is made by the first profile.
inline void add_network(std::string_view name, std::string_view mccmnc) {
    ZelSvcNetworkEntry entry{};
    zel_svc_text_copy(entry.network_name, sizeof entry.network_name, name);
    zel_svc_text_copy(entry.mccmnc, sizeof entry.mccmnc, mccmnc);
    zel_svc_network_table_append(entry);
}

inline void set_operator(std::string_view network_name, std::string_view mccmnc) {
    set_operator(network_name);
    ZelSvcSimOperator &current = zel_svc_current_operator();
    zel_svc_text_copy(current.mccmnc, sizeof current.mccmnc, mccmnc);
}

// What keeps a profile's row from being read, each struck once.
struct ReadFault {
    const char *function;
    const char *text;
    int from;
};
inline constexpr ReadFault kReadFaults[] = {
    {"db_util_open", ZEL_SVC_NETWORK_DB_PATH_SIM1, 1},       // the profile's and its network's connection
    {"sqlite3_prepare_v2", ZEL_SVC_NETWORK_DB_PATH_SIM1, 1}, // each of its statements
    {"sqlite3_step", "select * from pdp_profile", 1},
    {"sqlite3_step", "select network_name, mccmnc", 1},
};

class ConnectionPhone : public BenchPhone {
  protected:
    void SetUp() override {
        BenchPhone::SetUp();
        zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM1);
        group_ = std::make_unique<LoadedGroup>(ZEL_SVC_DATA_CONNECTION);
    }
    void TearDown() override {
        group_.reset();
        BenchPhone::TearDown();
    }

    [[nodiscard]] std::string file() const { return root() + ZEL_SVC_NETWORK_DB_PATH_SIM1; }
    void run(const std::string &sql) const { SqliteFile{file()}.run(sql); }
    [[nodiscard]] SqliteRows rows(const std::string &sql) const { return SqliteFile{file()}.rows(sql); }
    // Columns of all profiles, in the order of their ids.
    [[nodiscard]] SqliteRows profiles(const std::string &columns) const {
        return rows("select " + columns + " from pdp_profile order by profile_id");
    }
    [[nodiscard]] SqliteRows networks() const { return rows("select * from network_info order by network_info_id"); }

    // An entry of the connection group.
    [[nodiscard]] std::optional<std::string> recorded(const char *section, const std::string &key) const {
        return group_->text(section, key.c_str());
    }
    [[nodiscard]] std::optional<std::string> mirrored(const std::string &key) const {
        return recorded("connection", key);
    }

    // Descriptors of this process on the network databases: none between two calls.
    [[nodiscard]] static std::size_t open_databases() {
        std::size_t count = 0;
        std::error_code error;
        for (const auto &entry : std::filesystem::directory_iterator{"/proc/self/fd"})
            if (std::filesystem::read_symlink(entry.path(), error).string().find("/opt/dbspace/") != std::string::npos)
                ++count;
        return count;
    }

  private:
    std::unique_ptr<LoadedGroup> group_;
};

} // namespace zel_test
