// "nics": the host's physical NICs, as a list of NIC records.

#include <set>

#include <nlohmann/json.hpp>

#include "host/description/HostCopy.h"
#include "host/description/Section.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/PnicRecord.h"
#include "trellis/host/records/WorldRecord.h"

namespace Trellis {
namespace Host {

namespace {

class NicsSection : public Section {
public:
    void Parse(const JsonReader& value) override {
        std::set<std::string> names;
        for (const JsonReader& element : value.Elements()) {
            PnicRecord nic = PnicRecord::FromJson(element);
            if (!names.insert(nic.name).second) element.Member("name").Fail("duplicate NIC \"" + nic.name + "\"");
            nics_.push_back(nic);
        }
    }

    void Write(Transaction& t) const override {
        for (const PnicRecord& nic : nics_) t.Put(nic);
    }

    Json Export(const Transaction& t) const override {
        Json nics = Json::array();
        for (const PnicRecord& nic : t.List<PnicRecord>()) nics.push_back(nic.ToJson());
        return nics;
    }

    void AddCopy(HostCopy& copy, Json& value) const override {
        for (PnicRecord nic : nics_) {
            nic.name = copy.Name(PnicRecord::kKind, nic.name);
            nic.macAddress = copy.Mac(nic.macAddress);
            if (nic.sriov)
                for (SriovVfRecord& vf : *nic.sriov)
                    if (!vf.ownerWorldId.empty()) vf.ownerWorldId = copy.Name(WorldRecord::kKind, vf.ownerWorldId);
            value.push_back(nic.ToJson());
        }
    }

private:
    std::vector<PnicRecord> nics_;
};

const SectionRegistration kNics("nics", 30, [] { return std::make_unique<NicsSection>(); });

}  // namespace

}  // namespace Host
}  // namespace Trellis
