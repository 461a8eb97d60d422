#pragma once
// The network database of the SIM being installed: a connection and its statements, which close themselves.
//
//     NetworkDatabase database;                          // opens whatever ZEL_SVC_NETWORK_DB_PATH names
//     NetworkStatement select = database.prepare("select network_info_id from network_info where mccmnc=?");
//     select.bind(1, mccmnc);
//     switch (select.step()) {
//     case NetworkStep::Row:    return select.integer(0);
//     case NetworkStep::Done:   return 0;                // no such network
//     case NetworkStep::Failed: return std::nullopt;     // locked, broken, out of memory: nothing is known
//     }
//
// Every value is bound, so no text of a customer's package can change a statement. There is no transaction
// and no waiting for a lock: what is locked fails.

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <string_view>

struct sqlite3;
struct sqlite3_stmt;

enum class NetworkStep { Row, Done, Failed };

class NetworkStatement {
  public:
    NetworkStatement() = default;
    explicit NetworkStatement(sqlite3_stmt *statement) : statement_(statement) {}

    // False when it could not be prepared; every use is then a failure.
    explicit operator bool() const { return statement_ != nullptr; }

    // Parameters count from 1. A bind that fails makes the steps that follow fail.
    bool bind(int parameter, std::int32_t value) { return note(bind_result(parameter, value)); }
    bool bind(int parameter, std::string_view text) { return note(bind_result(parameter, text)); }
    bool bind_null(int parameter) { return note(bind_result(parameter, nullptr)); }

    // The same with SQLite's own result, for those who tell it.
    int bind_result(int parameter, std::int32_t value);
    int bind_result(int parameter, std::string_view text);
    int bind_result(int parameter, std::nullptr_t null);

    NetworkStep step();
    // Steps a statement without rows; whether it ran to completion.
    bool run() { return step() == NetworkStep::Done; }

    // Columns of the row, from 0. A null is 0 or empty; a fraction is cut, what lies outside 32 bits
    // saturates, and a word is 0.
    [[nodiscard]] std::int32_t integer(int column) const;
    [[nodiscard]] std::string_view text(int column) const; // until the next step

  private:
    bool note(int result);

    struct Finalize {
        void operator()(sqlite3_stmt *statement) const;
    };
    std::unique_ptr<sqlite3_stmt, Finalize> statement_;
    bool bound_ = true;
};

class NetworkDatabase {
  public:
    NetworkDatabase();

    explicit operator bool() const { return database_ != nullptr; }

    // An empty statement when the database is not open or refuses the text.
    [[nodiscard]] NetworkStatement prepare(const char *sql);

    // Prepares, binds in order and runs a statement without rows; whether it ran to completion.
    template <class... Values> bool run(const char *sql, Values... values) {
        NetworkStatement statement = prepare(sql);
        [[maybe_unused]] int parameter = 0;
        return statement && (statement.bind(++parameter, values) && ...) && statement.run();
    }

  private:
    struct Close {
        void operator()(sqlite3 *database) const;
    };
    std::unique_ptr<sqlite3, Close> database_;
};

// The id of a row behind the largest one of its table; nothing behind the largest integer there is.
std::optional<std::int32_t> zel_svc_network_id_after(std::int32_t last);
