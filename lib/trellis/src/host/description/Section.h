#pragma once

// One section of a host description: a top-level key ("firewall") with its
// part of the host. Adding a section is one new source file:
//
//   class SwitchesSection : public Section { ... };
//   const SectionRegistration kSwitches("switches", 30, [] { return std::make_unique<SwitchesSection>(); });
//
// The order number places the section in an exported description (and in
// the order of Parse, CheckReferences and Write); docs/host-format.md keeps
// the list of numbers in use. Import runs, for a whole description: Parse of
// every section, then CheckReferences of every section, and only then, in one
// transaction on a host whose records, faults and exec log were all erased,
// Write of every section. Export writes, after "format", each section's
// Export under its key. A host N times the size of another is made by each
// section's AddCopy, once for every copy (see HostCopy.h).

#include <functional>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

class HostCopy;
class ParsedDescription;
class Transaction;

class Section {
public:
    virtual ~Section() = default;
    // Checks the section's value and keeps what it read. value is not
    // IsPresent() when the description lacks the key: the empty section.
    virtual void Parse(const JsonReader& value) = 0;
    // Checks references into other sections, after every section was parsed.
    virtual void CheckReferences(const ParsedDescription& description) const { (void)description; }
    // Stores what Parse kept.
    virtual void Write(Transaction& t) const = 0;
    // The section's part of the host, in the form that Parse reads.
    virtual Json Export(const Transaction& t) const = 0;
    // Adds to value, the section's value in the description being made, the
    // copy of what Parse kept, its names given by copy.Name. A section that
    // holds one of a kind for the whole host (the firewall's state, the
    // modules) keeps it single and adds nothing.
    virtual void AddCopy(HostCopy& copy, Json& value) const {
        (void)copy;
        (void)value;
    }
};

struct SectionType {
    std::string key;
    int order;
    std::function<std::unique_ptr<Section>()> make;
};

// Registers a section type while the library loads.
class SectionRegistration {
public:
    SectionRegistration(std::string key, int order, std::function<std::unique_ptr<Section>()> make);
};

// Every registered section type, by order.
const std::vector<SectionType>& SectionTypes();

// The sections of one description, each parsed.
class ParsedDescription {
public:
    struct Entry {
        std::string key;
        std::unique_ptr<Section> section;
    };

    explicit ParsedDescription(std::vector<Entry> sections) : sections_(std::move(sections)) {}
    const std::vector<Entry>& Sections() const { return sections_; }

    // The parsed section of type S (for CheckReferences).
    template <class S>
    const S& Get() const {
        for (const Entry& entry : sections_)
            if (auto* section = dynamic_cast<const S*>(entry.section.get())) return *section;
        throw std::logic_error("A section type that is not registered");
    }

private:
    std::vector<Entry> sections_;
};

}  // namespace Host
}  // namespace Trellis
