#pragma once
// A SQLite file of the phone under test, opened from outside with the library's own C interface.
//
//     const SqliteFile networks{root() + "/opt/dbspace/.dnet.db"};
//     networks.run("insert into network_info values(7, 'A', '26202')");
//     EXPECT_EQ(networks.rows("select * from network_info"), (SqliteRows{{"7", "A", "26202"}}));

#include <sqlite3.h>

#include <stdexcept>
#include <string>
#include <vector>

namespace zel_test {

using SqliteRows = std::vector<std::vector<std::string>>;

class SqliteFile {
  public:
    explicit SqliteFile(const std::string &path) {
        if (sqlite3_open_v2(path.c_str(), &database_, SQLITE_OPEN_READWRITE, nullptr) != SQLITE_OK)
            throw std::runtime_error("cannot open " + path);
    }
    SqliteFile(const SqliteFile &) = delete;
    SqliteFile &operator=(const SqliteFile &) = delete;
    ~SqliteFile() { sqlite3_close(database_); }

    void run(const std::string &sql) const { static_cast<void>(rows(sql)); }

    // A null value is the text "NULL".
    [[nodiscard]] SqliteRows rows(const std::string &sql) const {
        SqliteRows found;
        char *error = nullptr;
        if (sqlite3_exec(database_, sql.c_str(), &add_row, &found, &error) == SQLITE_OK) return found;
        const std::string message = error ? error : "no message";
        sqlite3_free(error);
        throw std::runtime_error(sql + ": " + message);
    }

  private:
    static int add_row(void *rows, int count, char **values, char ** /*names*/) {
        std::vector<std::string> row;
        for (int i = 0; i < count; ++i)
            row.emplace_back(values[i] ? values[i] : "NULL");
        static_cast<SqliteRows *>(rows)->push_back(std::move(row));
        return 0;
    }

    sqlite3 *database_ = nullptr;
};

} // namespace zel_test
