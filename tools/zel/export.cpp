// What does this phone say? Its settings as a customer's file.

#include "auto-flags.h"
#include "commands.h"
#include "export-document.h"
#include "failure.h"
#include "output.h"
#include "package-check.h"

#include <zel-svc.h>

#include <fstream>

namespace zel_command {
namespace {

constexpr const char *kDocumentPath = "/opt/system/zel-default/output/customer-phone.xml";

std::string content_of(const Invocation &invocation, const std::string &path) {
    Json answer;
    if (invocation.phone.try_call("read", {{"path", path}}, answer) == 0) return bytes_of(answer, "content");
    throw Failure{kFailed, "export: cannot read " + path + " of the phone in '" + invocation.root +
                               "': " + bytes_of(answer, "error")};
}

std::string exported(const Invocation &invocation) {
    if (zel_svc_config_encoding_xml() == 1) return content_of(invocation, kDocumentPath);
    throw Failure{kFailed,
                  std::string{"export: the library cannot write "} + kDocumentPath + " of the phone in '" +
                      invocation.root + "'",
                  "Look whether its folder is there and whether the disk is full."};
}

std::string active_customer(const Invocation &invocation) {
    char name[10] = {};
    if (zel_svc_config_get_active_customer_name(name, sizeof name) == 1) return name;
    throw Failure{kFailed,
                  "export: the phone in '" + invocation.root +
                      "' has no active customer, so no file of the package holds its networks",
                  "Configure it with 'zel install CUSTOMER', or export without --installable."};
}

std::string with_networks(const Invocation &invocation, const std::string &document) {
    const std::string path = customer_file_path(active_customer(invocation));
    const NetworkElements found = network_elements(content_of(invocation, path));
    if (!found.problem.empty()) throw Failure{kFailed, "export: " + path + ":" + found.problem};
    if (found.texts.empty()) report("export: " + path + " states no networks, so no profile can be installed");
    return document_with_networks(document, found.texts);
}

void print_document(const Invocation &invocation, const std::string &document,
                    const std::vector<std::string> &warnings) {
    if (!invocation.json) return print(document);
    Json answer = Json::object();
    put_text(answer, "document", document);
    answer["warnings"] = Json::array();
    for (const std::string &warning : warnings)
        put_text(answer["warnings"].emplace_back(Json::object()), "warning", warning);
    print_json(answer);
}

void write_document(const std::string &path, const std::string &document) {
    std::ofstream file{path, std::ios::binary};
    file << document;
    if (!file.flush()) throw Failure{kFailed, "export: cannot write the document to '" + path + "'"};
}

} // namespace

int export_phone(Invocation &invocation) {
    std::string document = exported(invocation);
    const std::vector<std::string> warnings = document_warnings(document);
    if (invocation.has("installable")) document = with_networks(invocation, document);
    if (invocation.has("output"))
        write_document(invocation.value("output"), document);
    else
        print_document(invocation, document, warnings);
    for (const std::string &warning : warnings)
        report("export: " + escaped_line(warning));
    return kDone;
}

} // namespace zel_command
