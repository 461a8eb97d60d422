// The phone's system bus: the socket inside its root, and never the workstation's bus.

#include "support/bench-phone.h"
#include "support/phone-bus.h"

#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <dbus/dbus.h>
#include <gmock/gmock.h>
#include <sys/socket.h>
#include <sys/syscall.h>
#include <sys/un.h>
#include <unistd.h>
#include <vconf.h>

namespace {

// Where this program tried to connect to, whether or not somebody listened there.
std::vector<std::string> &tried() {
    static std::vector<std::string> paths;
    return paths;
}

} // namespace

// Stands before the system's own for every library of this program, the bus library among them.
extern "C" int connect(int socket, const sockaddr *address, socklen_t size) {
    if (address->sa_family == AF_UNIX) {
        const auto *place = reinterpret_cast<const sockaddr_un *>(address);
        const std::size_t head = offsetof(sockaddr_un, sun_path);
        tried().emplace_back(place->sun_path, ::strnlen(place->sun_path, size - head));
    }
    return static_cast<int>(::syscall(SYS_connect, socket, address, size));
}

namespace {

using ::testing::ElementsAre;
using zel_test::PhoneBus;
using zel_test::Telephony;

struct SystemBus : zel_test::BenchPhone {
    // What a call of the telephony daemon gives: "" or the name of the error.
    static std::string call_telephony() {
        vconf_set_int("db/x", 1); // the first call of the platform: the phone's root is known from here on
        DBusConnection *bus = dbus_bus_get(DBUS_BUS_SYSTEM, nullptr);
        if (bus == nullptr) return "no bus";
        dbus_connection_set_exit_on_disconnect(bus, FALSE);
        DBusMessage *call =
            dbus_message_new_method_call("com.tcore.ps", "/modem1", "com.tcore.ps.modem", "ResetProfile");
        dbus_int32_t one = 1;
        dbus_message_append_args(call, DBUS_TYPE_INT32, &one, DBUS_TYPE_INVALID);
        DBusError error;
        dbus_error_init(&error);
        DBusMessage *reply = dbus_connection_send_with_reply_and_block(bus, call, -1, &error);
        dbus_message_unref(call);
        if (reply != nullptr) dbus_message_unref(reply);
        const std::string name = reply != nullptr ? "" : error.name;
        dbus_error_free(&error);
        return name;
    }
};

TEST_F(SystemBus, IsTheOneInTheRoot) {
    PhoneBus bus(root());
    bus.start_telephony(Telephony::Answers);
    EXPECT_EQ(call_telephony(), "");
    EXPECT_THAT(bus.calls(), ElementsAre("/modem1 com.tcore.ps.modem ResetProfile(int32 1)"));
    EXPECT_EQ(zel_test::connections_seen(bus.address()), 2); // the daemon and this process
}

TEST_F(SystemBus, IsNoneWithoutItsSocket) {
    EXPECT_EQ(call_telephony(), "no bus");
    EXPECT_THAT(tried(), ElementsAre(root() + "/run/dbus/system_bus_socket"));
}

TEST_F(SystemBus, IsNoneForAProcessWithoutPhone) {
    ::unsetenv("ZEL_ROOT");
    EXPECT_EQ(call_telephony(), "no bus");
    EXPECT_THAT(tried(), ElementsAre("/dev/null/no-phone"));
}

TEST_F(SystemBus, HasNoTelephonyUntilItsDaemonRuns) {
    PhoneBus bus(root());
    EXPECT_EQ(call_telephony(), "org.freedesktop.DBus.Error.ServiceUnknown");
}

TEST_F(SystemBus, HandsOnADaemonsError) {
    PhoneBus bus(root());
    bus.start_telephony(Telephony::AnswersAnError);
    EXPECT_EQ(call_telephony(), "com.tcore.ps.Error");
}

TEST_F(SystemBus, GivesUpADaemonThatDoesNotAnswer) {
    PhoneBus bus(root(), 100);
    bus.start_telephony(Telephony::NeverAnswers);
    EXPECT_EQ(call_telephony(), "org.freedesktop.DBus.Error.NoReply");
    EXPECT_EQ(bus.calls().size(), 1U);
}

TEST_F(SystemBus, GivesUpADaemonThatDies) {
    PhoneBus bus(root(), 60'000);
    bus.start_telephony(Telephony::Dies);
    EXPECT_EQ(call_telephony(), "org.freedesktop.DBus.Error.NoReply");
}

// Whatever bus the user's environment names: a program that runs on a phone does not connect to it.
TEST_F(SystemBus, IsNotTheOneThatTheEnvironmentNames) {
    const std::string elsewhere = zel_test::make_folder();
    for (const char *folder : {"/run", "/run/dbus"})
        ASSERT_EQ(::mkdir((elsewhere + folder).c_str(), 0700), 0);
    PhoneBus other(elsewhere);
    ASSERT_EQ(::setenv("DBUS_SYSTEM_BUS_ADDRESS", other.address().c_str(), 1), 0);
    EXPECT_EQ(call_telephony(), "no bus");
    EXPECT_EQ(zel_test::connections_seen(other.address()), 0);
    zel_test::remove_folder(elsewhere);
}

} // namespace
