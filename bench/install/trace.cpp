#include "install/trace.h"

#include <db-util.h>

#include <unordered_map>

// The library's calls come here, for the linker was told to wrap them; the platform's own do not.
extern "C" {
int __real_db_util_open(const char *path, sqlite3 **database, int option);
int __real_db_util_close(sqlite3 *database);
int __real_sqlite3_prepare_v2(sqlite3 *database, const char *sql, int size, sqlite3_stmt **statement,
                              const char **tail);
int __real_sqlite3_bind_int(sqlite3_stmt *statement, int at, int value);
int __real_sqlite3_bind_text(sqlite3_stmt *statement, int at, const char *text, int size, void (*release)(void *));
int __real_sqlite3_bind_null(sqlite3_stmt *statement, int at);
int __real_sqlite3_step(sqlite3_stmt *statement);
const unsigned char *__real_sqlite3_column_text(sqlite3_stmt *statement, int column);
int __real_sqlite3_finalize(sqlite3_stmt *statement);
}

namespace zel_bench {
namespace {

struct Recorder {
    bool on = false;
    Trace trace;
    std::unordered_map<const void *, std::size_t> databases;
    std::unordered_map<const void *, std::size_t> statements;

    void note(TracedCall call) { trace.calls.push_back(std::move(call)); }
    void note_statement(Call call, const void *statement, int at = 0, int value = 0, std::string text = {}) {
        note({.call = call, .statement = statements[statement], .at = at, .value = value, .text = std::move(text)});
    }
};

Recorder gRecorder;

} // namespace

void start_recording() {
    gRecorder = {};
    gRecorder.on = true;
}

Trace stop_recording() {
    gRecorder.on = false;
    return std::move(gRecorder.trace);
}

namespace {

// One after the other; a statement is null when it could not be prepared, as it was in the recorded run.
struct Player {
    explicit Player(const Trace &trace) : databases(trace.databases), statements(trace.statements) {}

    void play(const TracedCall &call) {
        sqlite3 *&database = databases[call.database];
        sqlite3_stmt *&statement = statements[call.statement];
        switch (call.call) {
        case Call::Open:
            __real_db_util_open(call.text.c_str(), &database, 0);
            break;
        case Call::Close:
            __real_db_util_close(database);
            break;
        case Call::Prepare:
            __real_sqlite3_prepare_v2(database, call.text.c_str(), -1, &statement, nullptr);
            break;
        case Call::BindInt:
            __real_sqlite3_bind_int(statement, call.at, call.value);
            break;
        case Call::BindText:
            __real_sqlite3_bind_text(statement, call.at, call.text.data(), static_cast<int>(call.text.size()),
                                     SQLITE_TRANSIENT);
            break;
        case Call::BindNull:
            __real_sqlite3_bind_null(statement, call.at);
            break;
        case Call::Step:
            __real_sqlite3_step(statement);
            break;
        case Call::Column:
            __real_sqlite3_column_text(statement, call.at);
            break;
        case Call::Finalize:
            __real_sqlite3_finalize(statement);
            break;
        }
    }

    std::vector<sqlite3 *> databases;
    std::vector<sqlite3_stmt *> statements;
};

} // namespace

void replay(const Trace &trace) {
    Player player{trace};
    for (const TracedCall &call : trace.calls)
        player.play(call);
}

} // namespace zel_bench

using zel_bench::Call;
using zel_bench::gRecorder;

extern "C" {
int __wrap_db_util_open(const char *path, sqlite3 **database, int option);
int __wrap_db_util_close(sqlite3 *database);
int __wrap_sqlite3_prepare_v2(sqlite3 *database, const char *sql, int size, sqlite3_stmt **statement,
                              const char **tail);
int __wrap_sqlite3_bind_int(sqlite3_stmt *statement, int at, int value);
int __wrap_sqlite3_bind_text(sqlite3_stmt *statement, int at, const char *text, int size, void (*release)(void *));
int __wrap_sqlite3_bind_null(sqlite3_stmt *statement, int at);
int __wrap_sqlite3_step(sqlite3_stmt *statement);
const unsigned char *__wrap_sqlite3_column_text(sqlite3_stmt *statement, int column);
int __wrap_sqlite3_finalize(sqlite3_stmt *statement);
}

int __wrap_db_util_open(const char *path, sqlite3 **database, int option) {
    const int result = __real_db_util_open(path, database, option);
    if (!gRecorder.on) return result;
    gRecorder.databases[*database] = gRecorder.trace.databases;
    gRecorder.note({.call = Call::Open, .database = gRecorder.trace.databases++, .text = path});
    return result;
}

int __wrap_db_util_close(sqlite3 *database) {
    if (gRecorder.on) gRecorder.note({.call = Call::Close, .database = gRecorder.databases[database], .text = {}});
    return __real_db_util_close(database);
}

int __wrap_sqlite3_prepare_v2(sqlite3 *database, const char *sql, int size, sqlite3_stmt **statement,
                              const char **tail) {
    const int result = __real_sqlite3_prepare_v2(database, sql, size, statement, tail);
    if (!gRecorder.on) return result;
    gRecorder.statements[*statement] = gRecorder.trace.statements;
    gRecorder.note({.call = Call::Prepare,
                    .database = gRecorder.databases[database],
                    .statement = gRecorder.trace.statements++,
                    .text = sql});
    return result;
}

int __wrap_sqlite3_bind_int(sqlite3_stmt *statement, int at, int value) {
    if (gRecorder.on) gRecorder.note_statement(Call::BindInt, statement, at, value);
    return __real_sqlite3_bind_int(statement, at, value);
}

int __wrap_sqlite3_bind_text(sqlite3_stmt *statement, int at, const char *text, int size, void (*release)(void *)) {
    if (gRecorder.on)
        gRecorder.note_statement(Call::BindText, statement, at, 0, std::string(text, static_cast<std::size_t>(size)));
    return __real_sqlite3_bind_text(statement, at, text, size, release);
}

int __wrap_sqlite3_bind_null(sqlite3_stmt *statement, int at) {
    if (gRecorder.on) gRecorder.note_statement(Call::BindNull, statement, at);
    return __real_sqlite3_bind_null(statement, at);
}

int __wrap_sqlite3_step(sqlite3_stmt *statement) {
    if (gRecorder.on) gRecorder.note_statement(Call::Step, statement);
    return __real_sqlite3_step(statement);
}

const unsigned char *__wrap_sqlite3_column_text(sqlite3_stmt *statement, int column) {
    if (gRecorder.on) gRecorder.note_statement(Call::Column, statement, column);
    return __real_sqlite3_column_text(statement, column);
}

int __wrap_sqlite3_finalize(sqlite3_stmt *statement) {
    if (gRecorder.on && statement) gRecorder.note_statement(Call::Finalize, statement);
    return __real_sqlite3_finalize(statement);
}
