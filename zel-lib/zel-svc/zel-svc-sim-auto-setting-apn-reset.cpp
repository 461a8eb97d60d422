#include "zel-svc-sim-auto-setting-apn-reset.h"

#include "base/zel-svc-log.h"
#include "base/zel-svc-text.h"
#include "zel-svc-sim-auto-setting-modem.h"

#include <dbus/dbus.h>

#include <string>

namespace {

constexpr const char *kService = "com.tcore.ps";
constexpr const char *kInterface = "com.tcore.ps.modem";
constexpr const char *kMethod = "ResetProfile";
constexpr dbus_int32_t kResetArgument = 1; // what it means is the daemon's

using ObjectPath = FixedText<50>;

// False when the names of the modems cannot be read.
bool find_path(int slot, ObjectPath &path) {
    const bool several = zel_svc_sim_modems_are_several();
    if (!zel_svc_sim_modem_names_read()) return false;
    path.assign(std::string{"/"} + zel_svc_sim_modem_name(several ? slot : 1));
    return true;
}

// The connection is the process's shared one: it is neither closed nor ours to end the process with.
DBusConnection *connect(int slot) {
    DBusConnection *bus = dbus_bus_get(DBUS_BUS_SYSTEM, nullptr);
    if (!bus) {
        ZEL_SVC_LOG("[SIM%d] dbus_bus_get() failed, return.", slot);
        return nullptr;
    }
    dbus_connection_set_exit_on_disconnect(bus, FALSE);
    ZEL_SVC_LOG("[SIM%d] dbus_bus_get() succeeded.", slot);
    return bus;
}

// The bus library aborts the process over a path that is none, so it never gets one.
DBusMessage *new_call(const ObjectPath &path) {
    if (!dbus_validate_path(path.c_str(), nullptr)) return nullptr;
    return dbus_message_new_method_call(kService, path.c_str(), kInterface, kMethod);
}

DBusMessage *new_logged_call(int slot, const ObjectPath &path) {
    DBusMessage *call = new_call(path);
    ZEL_SVC_LOG("[SIM%d] dbus_message_new_method_call(path='%s',interface='%s') %s.", slot, path.c_str(), kInterface,
                call ? "succeeded" : "failed, return");
    return call;
}

bool append_argument(int slot, DBusMessage *call) {
    const bool appended = dbus_message_append_args(call, DBUS_TYPE_INT32, &kResetArgument, DBUS_TYPE_INVALID);
    ZEL_SVC_LOG("[SIM%d] dbus_message_append_args() %s.", slot, appended ? "succeeded" : "failed");
    return appended;
}

const char *shown(const char *text) { return text ? text : ""; }

// Null without an answer; an error that the daemon answers is none.
DBusMessage *send(int slot, DBusConnection *bus, DBusMessage *call) {
    DBusError error;
    dbus_error_init(&error);
    ZEL_SVC_LOG("[SIM%d] dbus_connection_send_with_reply_and_block() run.", slot);
    DBusMessage *reply = dbus_connection_send_with_reply_and_block(bus, call, DBUS_TIMEOUT_USE_DEFAULT, &error);
    if (reply)
        ZEL_SVC_LOG("[SIM%d] ==> succeeded.", slot);
    else
        ZEL_SVC_LOG("[SIM%d] ==> failed(err.name='%s',err.msg='%s').", slot, shown(error.name), shown(error.message));
    dbus_error_free(&error);
    return reply;
}

void release(int slot, DBusMessage *message, const char *name) {
    dbus_message_unref(message);
    ZEL_SVC_LOG("[SIM%d] dbus_message_unref(%s) run.", slot, name);
}

void call_reset(int slot, DBusConnection *bus, const ObjectPath &path) {
    DBusMessage *call = new_logged_call(slot, path);
    if (!call) return;
    DBusMessage *reply = append_argument(slot, call) ? send(slot, bus, call) : nullptr;
    release(slot, call, "Msg");
    if (reply) release(slot, reply, "MsgReply");
}

} // namespace

void __zel_svc_sim_auto_setting_reset_apn_with_dbus(int slot) {
    ObjectPath path;
    if (!find_path(slot, path)) return;
    DBusConnection *bus = connect(slot);
    if (bus) call_reset(slot, bus, path);
}
