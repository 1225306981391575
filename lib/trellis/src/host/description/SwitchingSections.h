#pragma once

// The sections of the host's standard switching, declared here because each
// checks its references into the one before it:
//   "standardSwitches" -> "portGroups" (a group's switch) -> "ports" (a
//   port's switch and group);
//   "distributedSwitches" (with their DVPorts) and "worlds" -> "ports" (a
//   port's DVPort, its VM);
// and the copy of a switch keeps the ports that "ports" has in use on it.

#include <map>
#include <string>
#include <vector>

#include "host/description/HostCopy.h"
#include "host/description/Section.h"
#include "trellis/host/records/DVSwitchRecords.h"
#include "trellis/host/records/PortRecord.h"
#include "trellis/host/records/WorldRecord.h"
#include "trellis/host/records/SwitchRecords.h"

namespace Trellis {
namespace Host {

// The family of copied VM names, shared by worlds and the ports of VMs'
// adapters so that their copies match.
inline constexpr const char* kVmNameFamily = "vm";

// The copy of a stored teaming policy's uplink order names the copied NICs.
void CopyUplinkOrder(HostCopy& copy, StoredPolicies& policies);

class StandardSwitchesSection : public Section {
public:
    void Parse(const JsonReader& value) override;
    void Write(Transaction& t) const override;
    Json Export(const Transaction& t) const override;
    void AddCopy(HostCopy& copy, Json& value) const override;

    const StandardSwitchRecord* Find(const std::string& name) const;
    // Each uplink with its switch.
    std::map<std::string, std::string> Uplinks() const;

private:
    std::vector<StandardSwitchRecord> switches_;
};

class PortGroupsSection : public Section {
public:
    void Parse(const JsonReader& value) override;
    void CheckReferences(const ParsedDescription& description) const override;
    void Write(Transaction& t) const override;
    Json Export(const Transaction& t) const override;
    void AddCopy(HostCopy& copy, Json& value) const override;

    const PortGroupRecord* Find(const std::string& name) const;

private:
    std::vector<PortGroupRecord> groups_;
    std::vector<std::string> paths_;  // where each group stands, for messages
};

class DistributedSwitchesSection : public Section {
public:
    void Parse(const JsonReader& value) override;
    void CheckReferences(const ParsedDescription& description) const override;
    void Write(Transaction& t) const override;
    Json Export(const Transaction& t) const override;
    void AddCopy(HostCopy& copy, Json& value) const override;

    const DVSwitchRecord* Find(const std::string& name) const;
    // The switch's port of that id, or null.
    const DVPortRecord* FindPort(const std::string& dvswitch, const std::string& portId) const;

private:
    struct Entry {
        DVSwitchRecord vswitch;
        std::vector<DVPortRecord> ports;
        std::string path;
    };
    std::vector<Entry> switches_;
};

class WorldsSection : public Section {
public:
    void Parse(const JsonReader& value) override;
    void Write(Transaction& t) const override;
    Json Export(const Transaction& t) const override;
    void AddCopy(HostCopy& copy, Json& value) const override;

    const WorldRecord* Find(std::int64_t id) const;

private:
    std::vector<WorldRecord> worlds_;
};

class PortsSection : public Section {
public:
    void Parse(const JsonReader& value) override;
    void CheckReferences(const ParsedDescription& description) const override;
    void Write(Transaction& t) const override;
    Json Export(const Transaction& t) const override;
    void AddCopy(HostCopy& copy, Json& value) const override;

    // The client ports on a switch (uplinks' ports are not counted).
    int PortsOn(const std::string& vswitch) const;
    // The port of the kernel interface of that name, or null.
    const PortRecord* InterfacePort(const std::string& name) const;

private:
    std::vector<PortRecord> ports_;
    std::vector<std::string> paths_;
};

}  // namespace Host
}  // namespace Trellis
