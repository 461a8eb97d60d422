#pragma once
// The phone's system bus: the workstation's dbus-daemon program on the socket inside the phone's root, and a
// telephony daemon on it that writes down every call it gets.
//
//     PhoneBus bus(root());
//     bus.start_telephony(Telephony::Answers);
//     zel_svc_sim_auto_setting_install_operator(...);
//     EXPECT_THAT(bus.calls(), ElementsAre("/modem1 com.tcore.ps.modem ResetProfile(int32 1)"));
//
// Both end with the object, and with the test's process however it ends.

#include <string>
#include <sys/types.h>
#include <vector>

namespace zel_test {

// What the telephony daemon does with a call, once it has written it down.
enum class Telephony { Answers, AnswersAnError, NeverAnswers, Dies, EndsTheBus };

class PhoneBus {
  public:
    // A caller waits no longer than `reply_limit_ms` for an answer: then the bus itself gives an error.
    explicit PhoneBus(const std::string &root, int reply_limit_ms = 200);
    ~PhoneBus();
    PhoneBus(const PhoneBus &) = delete;
    PhoneBus &operator=(const PhoneBus &) = delete;

    // Returns when the daemon owns its name.
    void start_telephony(Telephony behaviour);
    // "PATH INTERFACE METHOD(ARGUMENTS)" of every call since the daemon started.
    std::vector<std::string> calls();
    // The bus goes away, with its socket.
    void stop();

    [[nodiscard]] std::string address() const { return "unix:path=" + socket_; }

  private:
    std::string socket_;
    std::string folder_; // of its configuration
    pid_t bus_ = -1;
    pid_t telephony_ = -1;
    int record_ = -1; // end of a pipe
    std::string recorded_;
};

// How many programs were connected to a bus until now, this call's own aside.
int connections_seen(const std::string &address);

} // namespace zel_test
