#include "failing-binds.h"

#include <sqlite3.h>

#include <dlfcn.h>
#include <string_view>

namespace {

struct Failure {
    std::string statement;
    int parameter = 0;
    int result = SQLITE_OK;
    int strikes = 0;
};
Failure gFailure;

bool strikes(sqlite3_stmt *statement, int parameter) {
    if (parameter != gFailure.parameter) return false;
    const char *sql = sqlite3_sql(statement);
    if (!sql || std::string_view{sql}.find(gFailure.statement) == std::string_view::npos) return false;
    ++gFailure.strikes;
    return true;
}

// SQLite's own function, behind the one of this program.
template <class Function> Function real(const char *name) { return reinterpret_cast<Function>(dlsym(RTLD_NEXT, name)); }

} // namespace

int sqlite3_bind_int(sqlite3_stmt *statement, int parameter, int value) {
    if (strikes(statement, parameter)) return gFailure.result;
    return real<decltype(&sqlite3_bind_int)>("sqlite3_bind_int")(statement, parameter, value);
}

int sqlite3_bind_null(sqlite3_stmt *statement, int parameter) {
    if (strikes(statement, parameter)) return gFailure.result;
    return real<decltype(&sqlite3_bind_null)>("sqlite3_bind_null")(statement, parameter);
}

int sqlite3_bind_text(sqlite3_stmt *statement, int parameter, const char *text, int size, void (*release)(void *)) {
    if (strikes(statement, parameter)) return gFailure.result;
    return real<decltype(&sqlite3_bind_text)>("sqlite3_bind_text")(statement, parameter, text, size, release);
}

namespace zel_test {

FailingBind::FailingBind(std::string statement, int parameter, int result) {
    gFailure = {std::move(statement), parameter, result, 0};
}
FailingBind::~FailingBind() { gFailure = {}; }
int FailingBind::strikes() const { return gFailure.strikes; }

} // namespace zel_test
