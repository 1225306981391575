#pragma once

// The sections of the host's kernel interfaces: "netstacks", and
// "tesselNics", whose interfaces name a netstack, a connection point of the
// switching sections, and hold their port of "ports".

#include <string>
#include <vector>

#include "host/description/HostCopy.h"
#include "host/description/Section.h"
#include "trellis/host/records/NetstackRecord.h"
#include "trellis/host/records/TslNicRecord.h"

namespace Trellis {
namespace Host {

class NetstacksSection : public Section {
public:
    void Parse(const JsonReader& value) override;
    void CheckReferences(const ParsedDescription& description) const override;
    void Write(Transaction& t) const override;
    Json Export(const Transaction& t) const override;

    bool Contains(const std::string& key) const;

private:
    std::vector<NetstackRecord> netstacks_;
};

class TesselNicsSection : public Section {
public:
    void Parse(const JsonReader& value) override;
    void CheckReferences(const ParsedDescription& description) const override;
    void Write(Transaction& t) const override;
    Json Export(const Transaction& t) const override;
    void AddCopy(HostCopy& copy, Json& value) const override;

    // The netstack of the interface of that name; "" when there is none.
    std::string NetstackOf(const std::string& name) const;

private:
    std::vector<TslNicRecord> nics_;
    std::vector<std::string> paths_;
};

}  // namespace Host
}  // namespace Trellis
