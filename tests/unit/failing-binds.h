#pragma once
// Makes SQLite refuse one parameter of one statement, which no phone can be brought to.
//
//     const zel_test::FailingBind failing{"insert into pdp_profile", 25, SQLITE_NOMEM};

#include <string>

namespace zel_test {

class FailingBind {
  public:
    FailingBind(std::string statement, int parameter, int result);
    FailingBind(const FailingBind &) = delete;
    FailingBind &operator=(const FailingBind &) = delete;
    ~FailingBind();

    // How often it struck.
    [[nodiscard]] int strikes() const;
};

} // namespace zel_test
