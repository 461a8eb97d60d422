#include "support/phone-bus.h"

#include "support/bench-phone.h"
#include "support/lines.h"
#include "support/telephony-daemon.h"

#include <array>
#include <csignal>
#include <dbus/dbus.h>
#include <fcntl.h>
#include <filesystem>
#include <fstream>
#include <stdexcept>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace zel_test {
namespace {

std::string configuration(const std::string &socket, int reply_limit_ms) {
    return R"(<!DOCTYPE busconfig PUBLIC "-//freedesktop//DTD D-BUS Bus Configuration 1.0//EN" "busconfig.dtd">
<busconfig>
  <listen>unix:path=)" +
           socket + R"(</listen>
  <auth>EXTERNAL</auth>
  <apparmor mode="disabled"/>
  <policy context="default">
    <allow user="*"/>
    <allow own="*"/>
    <allow send_destination="*"/>
    <allow receive_sender="*"/>
  </policy>
  <limit name="reply_timeout">)" +
           std::to_string(reply_limit_ms) + R"(</limit>
</busconfig>
)";
}

struct Pipe {
    std::array<int, 2> ends{-1, -1};
    Pipe() {
        if (::pipe2(ends.data(), O_CLOEXEC) != 0) throw std::runtime_error("cannot make a pipe");
    }
};

// A process that does `work` and ends with this one; the descriptors of `pipe` are its own.
template <typename Work> pid_t started(Pipe &pipe, Work work) {
    const pid_t parent = ::getpid();
    const pid_t process = ::fork();
    if (process < 0) throw std::runtime_error("cannot start a process");
    if (process != 0) {
        ::close(pipe.ends[1]);
        return process;
    }
    ::prctl(PR_SET_PDEATHSIG, SIGKILL);
    if (::getppid() != parent) ::_exit(1);
    ::close(pipe.ends[0]);
    work();
    ::_exit(127);
}

// Waits for the first line that a process writes; it writes none when it fails.
void await_line(int from, const char *who) {
    char byte = 0;
    while (::read(from, &byte, 1) == 1)
        if (byte == '\n') return;
    throw std::runtime_error(std::string(who) + " does not start");
}

void end(pid_t &process) {
    if (process <= 0) return;
    ::kill(process, SIGKILL);
    ::waitpid(process, nullptr, 0);
    process = -1;
}

void become_bus(const std::string &config, int ready) {
    // Descriptor 3 is where the bus tells its address.
    if (ready != 3)
        ::dup2(ready, 3);
    else
        ::fcntl(ready, F_SETFD, 0);
    const std::string option = "--config-file=" + config;
    ::execlp("dbus-daemon", "dbus-daemon", option.c_str(), "--nofork", "--nopidfile", "--nosyslog", "--print-address=3",
             nullptr);
}

} // namespace

PhoneBus::PhoneBus(const std::string &root, int reply_limit_ms)
    : socket_(root + "/run/dbus/system_bus_socket"), folder_(make_folder()) {
    const std::string config = folder_ + "/bus.conf";
    std::ofstream(config) << configuration(socket_, reply_limit_ms);
    Pipe ready;
    bus_ = started(ready, [&] { become_bus(config, ready.ends[1]); });
    await_line(ready.ends[0], "the bus (the program dbus-daemon)");
    ::close(ready.ends[0]);
}

PhoneBus::~PhoneBus() {
    end(telephony_);
    stop();
    if (record_ >= 0) ::close(record_);
    remove_folder(folder_);
}

void PhoneBus::stop() {
    end(bus_);
    std::error_code ignored;
    std::filesystem::remove(socket_, ignored);
}

void PhoneBus::start_telephony(Telephony behaviour) {
    end(telephony_);
    if (record_ >= 0) ::close(record_);
    recorded_.clear();
    Pipe record;
    const std::string where = address();
    telephony_ = started(record, [&] { run_telephony(where, behaviour, record.ends[1], bus_); });
    record_ = record.ends[0];
    await_line(record_, "the telephony daemon");
    ::fcntl(record_, F_SETFL, O_NONBLOCK);
}

std::vector<std::string> PhoneBus::calls() {
    std::array<char, 1024> buffer{};
    for (ssize_t size = 0; (size = ::read(record_, buffer.data(), buffer.size())) > 0;)
        recorded_.append(buffer.data(), static_cast<std::size_t>(size));
    return lines_of(recorded_);
}

// A bus numbers its connections: ":1.0" is the first.
int connections_seen(const std::string &address) {
    DBusConnection *bus = dbus_connection_open_private(address.c_str(), nullptr);
    if (bus == nullptr || dbus_bus_register(bus, nullptr) == 0) throw std::runtime_error("no bus at " + address);
    const std::string name = dbus_bus_get_unique_name(bus);
    dbus_connection_close(bus);
    dbus_connection_unref(bus);
    return std::stoi(name.substr(name.rfind('.') + 1));
}

} // namespace zel_test
