#include "support/telephony-daemon.h"

#include <csignal>
#include <dbus/dbus.h>
#include <memory>
#include <unistd.h>

namespace zel_test {
namespace {

constexpr const char *kName = "com.tcore.ps";

struct Unref {
    void operator()(DBusMessage *message) const { dbus_message_unref(message); }
};
using Message = std::unique_ptr<DBusMessage, Unref>;

void write_line(int record, const std::string &text) {
    const std::string line = text + "\n";
    if (::write(record, line.data(), line.size()) != static_cast<ssize_t>(line.size())) ::_exit(1);
}

std::string argument_text(DBusMessageIter &iterator) {
    switch (dbus_message_iter_get_arg_type(&iterator)) {
    case DBUS_TYPE_INT32: {
        dbus_int32_t number = 0;
        dbus_message_iter_get_basic(&iterator, &number);
        return "int32 " + std::to_string(number);
    }
    case DBUS_TYPE_STRING: {
        const char *text = nullptr;
        dbus_message_iter_get_basic(&iterator, &text);
        return std::string("string ") + text;
    }
    default:
        return "something else";
    }
}

std::string call_text(DBusMessage *message) {
    std::string arguments;
    DBusMessageIter iterator;
    if (dbus_message_iter_init(message, &iterator) != 0) do
            arguments += (arguments.empty() ? "" : ", ") + argument_text(iterator);
        while (dbus_message_iter_next(&iterator) != 0);
    const char *interface = dbus_message_get_interface(message);
    return std::string(dbus_message_get_path(message)) + " " + (interface == nullptr ? "-" : interface) + " " +
           dbus_message_get_member(message) + "(" + arguments + ")";
}

void answer(DBusConnection *bus, DBusMessage *call, Telephony behaviour) {
    const Message reply(behaviour == Telephony::Answers
                            ? dbus_message_new_method_return(call)
                            : dbus_message_new_error(call, "com.tcore.ps.Error", "no profile to reset"));
    dbus_connection_send(bus, reply.get(), nullptr);
    dbus_connection_flush(bus);
}

void serve(DBusConnection *bus, DBusMessage *call, Telephony behaviour, int record, pid_t bus_process) {
    write_line(record, call_text(call));
    if (behaviour == Telephony::Dies) ::_exit(0);
    if (behaviour == Telephony::EndsTheBus) ::kill(bus_process, SIGKILL);
    if (behaviour == Telephony::Answers || behaviour == Telephony::AnswersAnError) answer(bus, call, behaviour);
}

} // namespace

void run_telephony(const std::string &address, Telephony behaviour, int record, pid_t bus_process) {
    DBusConnection *bus = dbus_connection_open_private(address.c_str(), nullptr);
    if (bus == nullptr || dbus_bus_register(bus, nullptr) == 0) ::_exit(1);
    if (dbus_bus_request_name(bus, kName, DBUS_NAME_FLAG_DO_NOT_QUEUE, nullptr) !=
        DBUS_REQUEST_NAME_REPLY_PRIMARY_OWNER)
        ::_exit(1);
    write_line(record, "");
    while (dbus_connection_read_write(bus, -1) != 0)
        while (const Message message{dbus_connection_pop_message(bus)})
            if (dbus_message_get_type(message.get()) == DBUS_MESSAGE_TYPE_METHOD_CALL)
                serve(bus, message.get(), behaviour, record, bus_process);
    ::_exit(0);
}

} // namespace zel_test
