#pragma once
// The bench phone's state database (ROOT/.platform/state.db): write-ahead log, no flush to disk, a busy wait,
// statements prepared once.
//
//     Query query = store.query("SELECT value FROM setting WHERE name = ?");
//     query.bind(name);
//     if (query.row()) use(query.text(0));
//
// A failure throws StoreError. A connection must not cross fork(2): every store closes its own just before,
// and opens it again when it is next asked.

#include <cstdint>
#include <map>
#include <sqlite3.h>
#include <stdexcept>
#include <string>
#include <string_view>

namespace zel_host {

class StoreError : public std::runtime_error {
    using std::runtime_error::runtime_error;
};

class Query {
  public:
    Query(sqlite3 *database, sqlite3_stmt *statement) : database_(database), statement_(statement) {}
    Query(Query &&other) noexcept;
    Query &operator=(Query &&) = delete;
    Query(const Query &) = delete;
    Query &operator=(const Query &) = delete;
    ~Query();

    Query &bind(std::string_view text); // the text must live until the query ends
    Query &bind(std::int64_t number);
    Query &bind_null();
    bool row(); // the next row; false at the end
    void run(); // all rows

    [[nodiscard]] std::int64_t integer(int column) const { return sqlite3_column_int64(statement_, column); }
    [[nodiscard]] std::string_view view(int column) const; // until the next row
    [[nodiscard]] std::string text(int column) const { return std::string(view(column)); }
    [[nodiscard]] bool null(int column) const { return sqlite3_column_type(statement_, column) == SQLITE_NULL; }

  private:
    [[noreturn]] void fail() const;
    sqlite3 *database_;
    sqlite3_stmt *statement_;
    int next_ = 1;
};

class Store {
  public:
    explicit Store(std::string file);
    ~Store();
    Store(const Store &) = delete;
    Store &operator=(const Store &) = delete;

    // `sql` is a literal: statements are kept by its address.
    Query query(const char *sql);
    // Several statements without result.
    void execute(const char *sql);
    void close();

  private:
    sqlite3 *database();

    std::string file_;
    sqlite3 *database_ = nullptr;
    std::map<const char *, sqlite3_stmt *> statements_;
};

// All writes between its making and commit() happen at once, or not at all. Also the fast way to make many.
class Transaction {
  public:
    explicit Transaction(Store &store) : store_(store) { store_.execute("BEGIN IMMEDIATE"); }
    ~Transaction();
    Transaction(const Transaction &) = delete;
    Transaction &operator=(const Transaction &) = delete;
    void commit();

  private:
    Store &store_;
    bool open_ = true;
};

} // namespace zel_host
