#include "command-table.h"

#include "commands.h"
#include "phone-verbs.h"
#include "sim-command-table.h"

#include <algorithm>
#include <array>
#include <iterator>

namespace zel_command {
namespace {

constexpr const char *kRunHelp =
    "The run does what it does on a phone: nothing stops it. Exits 1 when the package does not list the customer, "
    "or when its file is missing, has no byte-order mark, or ends in a syntax error; standard error then says "
    "which. 'zel log' shows what was done.\n"
    "Progress is shown on terminals. --verbose prints each line of the run log with its time, and each text of "
    "the customer's file that its element does not take.";

std::vector<Command> own_commands() {
    return {
        {.name = "install",
         .parameters = {positional("CUSTOMER", "the operator's sales code, such as XFV")},
         .help = "Configure the phone for a customer, as at its first start.",
         .more = kRunHelp,
         .access = Access::kWrites,
         .run = install},
        {.name = "upgrade",
         .parameters = {positional("CUSTOMER", "the operator's sales code")},
         .help = "Upgrade presets, user files and file system, as after an update over the air.",
         .more = kRunHelp,
         .access = Access::kWrites,
         .run = upgrade},
        {.name = "boot",
         .help = "Upgrade the settings of the active customer, as at the first start after an update.",
         .more = kRunHelp,
         .access = Access::kWrites,
         .run = boot},
        {.name = "imei",
         .parameters = {positional("CUSTOMER", "the operator's sales code")},
         .help = "Make a customer the active one and do nothing else, as factory tools do.",
         .access = Access::kWrites,
         .run = imei},
        {.name = "factory-reset",
         .help = "Prepare a factory reset: new run log, default language, package header removed.",
         .access = Access::kWrites,
         .run = factory_reset},
        {.name = "reboot",
         .help = "Ask the phone to restart, as the library does.",
         .more = "The bench phone records the request; 'zel phone reboot' restarts it.",
         .access = Access::kWrites,
         .run = reboot},
        {.name = "summary",
         .help = "Show what the phone holds: customer, settings, networks, files.",
         .more = "Passwords and subscriber numbers are masked; --reveal shows them.",
         .access = Access::kReads,
         .run = summary},
        {.name = "customers",
         .help = "List the customers of the phone's package.",
         .access = Access::kReads,
         .run = customers},
        {.name = "version",
         .help = "Print the package's name and version.",
         .more = "Writes: what the package's header states is stored in the keys \"db/private/zel/bin_name\", "
                 "\"db/private/zel/bin_version\" and \"db/zel/bincode\". Exits 1 when the phone knows no version.",
         .access = Access::kWrites,
         .run = version},
        {.name = "approval",
         .help = "Print the approval versions of the phone's software.",
         .more = "Exits 1 when the phone states none.",
         .access = Access::kReads,
         .run = approval},
        {.name = "locks",
         .help = "Print the SIM locks that the active customer's file states.",
         .more = "Writes: the group \"/opt/system/zel-default/data/zel-default-data-security.ini\" is started afresh "
                 "with them. The counts are those that the file states; at most 70 codes of a kind are kept. Exits 1 "
                 "without an active customer, or when its file cannot be read to its end.",
         .access = Access::kWrites,
         .run = locks},
        {.name = "verify",
         .parameters = {flag("imei", "the short answer of factory tools: how many values differ, and the first"),
                        flag("failures", "only what differs"),
                        option("html", "FILE",
                               "write all of it as one page for a browser as well, which needs no other file; "
                               "with '-' in place of the report")},
         .help = "Compare the phone with the active customer's file, and write the report.",
         .more =
             "Exits 4 when anything differs: a value of the customer's file, a media folder since the install, an "
             "application's result. Exits 1 without an active customer (--imei counts that as one difference) and "
             "when its file cannot be read to its end; without --imei also when there is no room for more values, or "
             "when the report or the page cannot be written. Where values may be missing and none differs, the result "
             "is INCOMPLETE.\n"
             "Passwords are masked, in JSON and on the page too; --reveal shows them.\n"
             "Writes: \"/opt/system/zel-default/output/zel-verification-report.log\", \"zel-fs-status-verify.ini\" "
             "beside it, and the keys that 'zel version' writes.",
         .access = Access::kWrites,
         .run = verify},
        {.name = "export",
         .parameters = {with_letter("o", option("output", "FILE",
                                                "write the document there; without it, or with '-', it is "
                                                "printed")),
                        flag("installable", "add the networks of the package, without which no profile installs")},
         .help = "Print the phone's settings as a customer's file.",
         .more = "What such a file cannot carry is listed in docs/export.md. Each '?\?', which stands for a value that "
                 "could not be read, and each value that holds '<' is named on standard error. Passwords are in the "
                 "document as they are. --installable needs an active customer whose file can be read to its end.\n"
                 "Writes: \"/opt/system/zel-default/output/customer-phone.xml\".",
         .access = Access::kWrites,
         .run = export_phone},
        {.name = "log",
         .parameters = {flag("system", "the phone's system log in place of the run log")},
         .help = "Print the run log: what installs and upgrades did.",
         .access = Access::kReads,
         .run = log},
        {.name = "manual", .help = "Print the manual page: zel manual | man -l -", .run = manual},
        {.name = "vconf get",
         .parameters = {positional("KEY", "such as db/zel/salescode")},
         .help = "Print the value of a key of the settings store.",
         .more = "On a terminal MSINs and passwords are masked; --reveal shows them.",
         .access = Access::kReads,
         .run = vconf_get},
        {.name = "vconf set",
         .parameters = {positional("KEY", "such as db/zel/salescode"), positional("VALUE", "the new value"),
                        option("type", "TYPE", "int, bool or string; else the key's type, a new key's being string")},
         .help = "Set a key of the settings store.",
         .access = Access::kWrites,
         .run = vconf_set},
        {.name = "vconf unset",
         .parameters = {positional("KEY", "such as db/zel/salescode")},
         .help = "Remove a key from the settings store.",
         .access = Access::kWrites,
         .run = vconf_unset},
        {.name = "vconf list",
         .parameters = {optional_positional("PREFIX", "only keys that begin with this text")},
         .help = "List keys with their types and values.",
         .more = "MSINs and passwords are masked, in JSON too; --reveal shows them.",
         .access = Access::kReads,
         .run = vconf_list},
        {.name = "completion bash",
         .help = "Print a completion script: source <(zel completion bash)",
         .run = completion_bash},
    };
}

} // namespace

const std::vector<Command> &command_table() {
    static const std::vector<Command> table = [] {
        std::vector<Command> rows = own_commands();
        for (std::vector<Command> &more : std::array{sim_commands(), phone_verb_commands()})
            std::move(more.begin(), more.end(), std::back_inserter(rows));
        return rows;
    }();
    return table;
}

const Command *find_command(std::string_view name) {
    const auto &table = command_table();
    const auto found = std::find_if(table.begin(), table.end(), [&](const Command &row) { return row.name == name; });
    return found == table.end() ? nullptr : &*found;
}

const std::vector<Parameter> &common_options() {
    static const std::vector<Parameter> options{
        option("root", "DIR", "the phone's folder; else $ZEL_ROOT names it"),
        flag("json", "print data as JSON"),
        flag("reveal", "show MSINs and passwords"),
        with_letter("v", flag("verbose", "tell more on standard error")),
    };
    return options;
}

} // namespace zel_command
