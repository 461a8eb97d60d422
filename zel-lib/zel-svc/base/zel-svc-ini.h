#pragma once
// INI files of the phone, through the INI library: one dictionary that frees itself. The only code that
// calls the library.
//
//     ZelSvcIni ini = ZelSvcIni::load("/opt/system/zel-default/usr/zel/zel-approval-ver.ini");
//     if (ini && ini.has("info:ap")) use(ini.text("info:ap"));
//
// Sections and keys are lower-cased by the library; values are not touched. Its look-ups are linear.

#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

struct _dictionary_;

class ZelSvcIni {
  public:
    // Loads a file of the phone; empty (false) when it does not open or the library refuses it.
    static ZelSvcIni load(const char *path);
    // Loads what an open file holds, from its start.
    static ZelSvcIni load(int fd);

    ZelSvcIni() = default;
    explicit operator bool() const { return dictionary_ != nullptr; }

    [[nodiscard]] bool has(const std::string &key) const;
    // The value as the dictionary holds it; null when absent. It belongs to the dictionary.
    [[nodiscard]] const char *text(const std::string &key) const;
    [[nodiscard]] int number(const std::string &key, int fallback) const;
    [[nodiscard]] int boolean(const std::string &key, int fallback) const;

    // A section comes into being with add_section(); a key set without its section is lost in a dump.
    bool add_section(const std::string &section);
    bool set(const std::string &key, const std::string &value);

    // For what is written afresh: clear() empties the dictionary, then append() adds a section (null value) or a
    // key that it does not hold yet, without a search for it.
    void clear();
    bool append(const std::string &key, const char *value);

    // Every "section:key" with its value in the file's order; sections stand as names without a value (null).
    [[nodiscard]] std::vector<std::pair<std::string, const char *>> entries() const;

    // Writes the dictionary into an open file; false when it could not be written to the end.
    bool dump(int fd) const;

  private:
    struct Free {
        void operator()(_dictionary_ *dictionary) const;
    };
    std::unique_ptr<_dictionary_, Free> dictionary_;
};

// The form in which a string loads back as it was: wrapped in double quotes, in single quotes when it holds
// a double one; with both kinds inside, its double quotes become single ones. A line feed becomes a blank.
// An empty string stays without quotes.
std::string zel_svc_ini_quoted(std::string_view value);

// A value as the library's integer getter reads it: a leading 0x or 0 makes it hexadecimal or octal, and
// what is no number is 0.
int zel_svc_ini_number(const std::string &value);
