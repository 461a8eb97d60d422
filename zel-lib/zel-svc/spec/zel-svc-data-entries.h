#pragma once
// The entries of one group in memory, in the order in which they came, found by name in constant time. The
// INI library searches its dictionary from the start for every look-up, which a package of many networks
// would feel.

#include <cstddef>
#include <list>
#include <string>
#include <string_view>
#include <unordered_map>

struct ZelSvcDataEntry {
    // What stands between the name and the value of an entry and its text in the file.
    enum class Form {
        Section, // a header without value
        Plain,   // a number: written as it stands
        Quoted,  // a string of this run: carries its quotes already
        Loaded,  // from the file: the library has taken its quotes off
    };

    std::string name; // "section" or "section:key", A to Z in lower case as in the file
    std::string value;
    Form form;
};

class ZelSvcDataEntries {
  public:
    using List = std::list<ZelSvcDataEntry>;

    // Null when absent. Stays where it is until it is erased. Names are compared without regard to case.
    [[nodiscard]] const ZelSvcDataEntry *find(std::string_view name) const;
    // Adds an entry at the end, or gives an existing one a new value in its place.
    void put(std::string_view name, std::string value, ZelSvcDataEntry::Form form);
    void erase(std::string_view name);
    // A section's keys, then its header.
    void erase_section(std::string_view section);
    void clear();

    [[nodiscard]] List::const_iterator begin() const { return list_.begin(); }
    [[nodiscard]] List::const_iterator end() const { return list_.end(); }

  private:
    using Index = std::unordered_map<std::string_view, List::iterator>; // by the names in the list

    List::iterator erase(List::iterator entry);

    List list_;
    Index index_;
};
