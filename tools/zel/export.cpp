// What does this phone say? Its settings as a customer's file.

#include "auto-flags.h"
#include "commands.h"
#include "export-document.h"
#include "failure.h"
#include "output-file.h"
#include "output.h"
#include "package-check.h"

#include <zel-svc.h>

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

void print_json_answer(const std::string *document, const std::vector<std::string> &warnings) {
    Json answer = Json::object();
    if (document != nullptr) put_text(answer, "document", *document);
    answer["warnings"] = Json::array();
    for (const std::string &warning : warnings)
        put_text(answer["warnings"].emplace_back(Json::object()), "warning", warning);
    print_json(answer);
}

void write_document(const std::string &path, const std::string &document) {
    const std::string error = write_file(path, document);
    if (error.empty()) return;
    throw Failure{kFailed, "export: cannot write the document to '" + path + "': " + error};
}

} // namespace

int export_phone(Invocation &invocation) {
    std::string document = exported(invocation);
    const std::vector<std::string> warnings = document_warnings(document);
    if (invocation.has("installable")) document = with_networks(invocation, document);
    const bool to_file = invocation.names_file("output");
    if (to_file) write_document(invocation.value("output"), document);
    if (invocation.json)
        print_json_answer(to_file ? nullptr : &document, warnings);
    else if (!to_file)
        print(document);
    for (const std::string &warning : warnings)
        report("export: " + escaped_line(warning));
    return kDone;
}

} // namespace zel_command
