#pragma once
// Another program that uses a database of the phone: the sqlite3 shell, in a process of its own.
//
//     const SqliteProgram other{root() + "/opt/dbspace/.dnet.db"};
//     other.run("begin exclusive;");
//     other.wait_until_locked();
//
// It ends, and lets go of its locks, with the object.

#include <sqlite3.h>
#include <unistd.h>

#include <cstdio>
#include <stdexcept>
#include <string>

namespace zel_test {

class SqliteProgram {
  public:
    explicit SqliteProgram(const std::string &file)
        : file_(file), input_(popen(("exec sqlite3 -batch '" + file + "' >/dev/null 2>&1").c_str(), "we")) {
        if (!input_) throw std::runtime_error("cannot start sqlite3");
        run(".timeout 60000"); // it tries again when it meets wait_until_locked's own look at the database
    }
    SqliteProgram(const SqliteProgram &) = delete;
    SqliteProgram &operator=(const SqliteProgram &) = delete;
    ~SqliteProgram() { pclose(input_); }

    void run(const std::string &sql) const {
        std::fputs((sql + "\n").c_str(), input_);
        std::fflush(input_);
    }

    // Until nobody else may write, or, with "select 1 from sqlite_master", read.
    void wait_until_locked(const char *refused = "begin immediate") const {
        constexpr int kTries = 3000;
        for (int i = 0; i < kTries; ++i) {
            if (is_refused(refused)) return;
            usleep(10'000);
        }
        throw std::runtime_error("sqlite3 takes no lock");
    }

  private:
    [[nodiscard]] bool is_refused(const char *sql) const {
        sqlite3 *database = nullptr;
        sqlite3_open_v2(file_.c_str(), &database, SQLITE_OPEN_READWRITE, nullptr);
        const int result = sqlite3_exec(database, sql, nullptr, nullptr, nullptr);
        sqlite3_close(database);
        return result == SQLITE_BUSY;
    }

    std::string file_;
    std::FILE *input_;
};

} // namespace zel_test
