#pragma once
// A phone for a test: made in SetUp in a short temporary folder, named by $ZEL_ROOT, removed in TearDown.
//
//     struct StartDay : zel_test::BenchPhone {};
//     TEST_F(StartDay, IsStored) {
//         write("/opt/system/zel/...", "...");
//         ...
//         EXPECT_EQ(get_int("db/calendar/start"), 1);
//     }
//
// Everything here looks at the phone from outside; no injected fault fails it.

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>
#include <optional>
#include <string>
#include <string_view>
#include <vector>
#include <zel-host.h>

namespace zel_test {

class BenchPhone : public ::testing::Test {
  protected:
    void SetUp() override;
    void TearDown() override;

    // What the phone is made with; to be set in a derived constructor.
    nlohmann::json create_arguments = nlohmann::json::object();

    [[nodiscard]] std::string root() const { return root_; }
    // Runs a verb of the bench phone; an error fails the test.
    nlohmann::json call(const std::string &verb, const nlohmann::json &arguments = nlohmann::json::object());

    void write(const std::string &phone_path, std::string_view bytes, int mode = 0644); // makes parents
    std::string read(const std::string &phone_path);
    bool exists(const std::string &phone_path); // a dangling link exists too

    void set_int(const std::string &key, int value);
    void set_bool(const std::string &key, bool value);
    void set_string(const std::string &key, const std::string &value);
    // Nothing when the key is absent or of another type.
    std::optional<int> get_int(const std::string &key);
    std::optional<bool> get_bool(const std::string &key);
    std::optional<std::string> get_string(const std::string &key);

    std::string run_log();
    std::vector<std::string> system_log();

    // Fails calls of a platform function: from the `from`-th matching call on, `times` of them (-1: all).
    void fail(const std::string &function, const std::string &text = "", int from = 1, int times = -1, int result = -1);

  private:
    int try_call(const std::string &verb, const nlohmann::json &arguments, nlohmann::json &answer);
    [[nodiscard]] std::string file_of(const std::string &phone_path) const { return root_ + phone_path; }
    std::optional<nlohmann::json> value_of(const std::string &key, const std::string &type);

    std::string root_;
    zel_host_phone *phone_ = nullptr;
};

// A new empty folder with a short name; remove_folder() deletes it with its contents.
std::string make_folder();
void remove_folder(const std::string &folder);

} // namespace zel_test
