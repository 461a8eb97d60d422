#include "libdbus.h"

#include <dbus/dbus.h>

#include <cstdarg>
#include <dlfcn.h>

namespace {

zel_test::Libdbus *gFake = nullptr;
char gConnection = 0; // its address stands for a connection

template <class Function> Function *real(const char *name) {
    return reinterpret_cast<Function *>(::dlsym(RTLD_NEXT, name));
}

std::string text(const char *bytes) { return bytes ? bytes : "(null)"; }

void note(zel_test::Libdbus &fake, DBusMessage *message, int time_out) {
    fake.sent.push_back(text(dbus_message_get_destination(message)) + " " + text(dbus_message_get_path(message)) + " " +
                        text(dbus_message_get_interface(message)) + " " + text(dbus_message_get_member(message)) + "(" +
                        text(dbus_message_get_signature(message)) + ")");
    dbus_int32_t argument = 0;
    if (dbus_message_get_args(message, nullptr, DBUS_TYPE_INT32, &argument, DBUS_TYPE_INVALID))
        fake.arguments.push_back(argument);
    fake.time_outs.push_back(time_out);
}

} // namespace

void zel_test::use_libdbus(Libdbus *fake) { gFake = fake; }

extern "C" {

DBusConnection *dbus_bus_get(DBusBusType type, DBusError *error) {
    if (!gFake) return real<DBusConnection *(DBusBusType, DBusError *)>("dbus_bus_get")(type, error);
    if (!gFake->connects || type != DBUS_BUS_SYSTEM) return nullptr;
    return reinterpret_cast<DBusConnection *>(&gConnection);
}

void dbus_connection_set_exit_on_disconnect(DBusConnection *connection, dbus_bool_t exits) {
    if (gFake)
        gFake->exits_on_disconnect = exits != 0;
    else
        real<void(DBusConnection *, dbus_bool_t)>("dbus_connection_set_exit_on_disconnect")(connection, exits);
}

dbus_bool_t dbus_message_append_args(DBusMessage *message, int first_type, ...) {
    if (gFake && !gFake->appends) return FALSE;
    std::va_list arguments;
    va_start(arguments, first_type);
    const dbus_bool_t appended = dbus_message_append_args_valist(message, first_type, arguments);
    va_end(arguments);
    return appended;
}

DBusMessage *dbus_connection_send_with_reply_and_block(DBusConnection *connection, DBusMessage *message, int time_out,
                                                       DBusError *error) {
    if (!gFake)
        return real<DBusMessage *(DBusConnection *, DBusMessage *, int, DBusError *)>(
            "dbus_connection_send_with_reply_and_block")(connection, message, time_out, error);
    note(*gFake, message, time_out);
    if (gFake->replies) return dbus_message_new(DBUS_MESSAGE_TYPE_METHOD_RETURN);
    if (!gFake->error_name.empty()) dbus_set_error(error, gFake->error_name.c_str(), "%s", gFake->error_text.c_str());
    return nullptr;
}
}
