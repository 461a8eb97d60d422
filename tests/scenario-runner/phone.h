#pragma once
// A bench phone in a short temporary folder, seen from outside and removed at the end.

#include <zel-host.h>

#include <nlohmann/json.hpp>

#include <string>

namespace zel_scenario {

using Json = nlohmann::ordered_json;

class Phone {
  public:
    explicit Phone(const Json &create_arguments);
    Phone(const Phone &) = delete;
    Phone &operator=(const Phone &) = delete;
    ~Phone();

    // Runs one verb of the phone; throws std::runtime_error with the phone's own error text.
    Json call(const std::string &verb, const Json &arguments = Json::object());

    [[nodiscard]] const std::string &root() const { return root_; }
    // The workstation's path of a phone path, for looking from outside.
    [[nodiscard]] std::string outside(const std::string &phone_path) const { return root_ + phone_path; }

  private:
    std::string root_;
    zel_host_phone *phone_ = nullptr;
};

} // namespace zel_scenario
