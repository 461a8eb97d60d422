#pragma once
// The bench phone that a command works on.

#include "command.h"
#include "output.h"

#include <zel-host.h>

#include <memory>
#include <string>

namespace zel_command {

class Phone {
  public:
    // Opens the phone in a folder; throws a Failure with kNoRoot when there is none.
    static Phone open(const std::string &root);
    Phone() = default;

    // Keeps other commands that change the phone off it for as long as this one is open; throws a Failure that
    // says who holds it. `command` is what they are told about this one.
    void lock(const std::string &command) const;

    // Runs one verb of the bench phone. Throws a Failure with the phone's own words. The verbs that work
    // without a phone ("create", "verbs") may be called on an empty Phone.
    [[nodiscard]] Json call(const std::string &verb, const Json &arguments = Json::object()) const;
    // The same, with the answer's result number in place of the exception.
    int try_call(const std::string &verb, const Json &arguments, Json &answer) const;

  private:
    struct Close {
        void operator()(zel_host_phone *phone) const { zel_host_close(phone); }
    };
    std::unique_ptr<zel_host_phone, Close> phone_;
};

} // namespace zel_command
