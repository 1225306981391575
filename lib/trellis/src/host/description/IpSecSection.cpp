// "ipsec": the host's IPsec databases and its key exchange configuration, an
// object of "associations", "policies" and "ikeConfig". Association names are
// unique, and so are (source, destination, SPI); a policy's saName is empty,
// an association's name, or "UNKNOWN" for one that was removed. A host has
// them once, whatever its size.

#include <set>
#include <tuple>

#include <nlohmann/json.hpp>

#include "host/description/Section.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/IpSecRecords.h"

namespace Trellis {
namespace Host {

namespace {

class IpSecSection : public Section {
public:
    void Parse(const JsonReader& value) override {
        if (!value.IsPresent()) return;
        value.ExpectObject();
        std::set<std::string> keys;
        std::set<std::tuple<std::string, std::string, std::uint32_t>> flows;
        for (const JsonReader& element : value.Array("associations")) {
            IpSecSaRecord sa = IpSecSaRecord::FromJson(element);
            if (!keys.insert(sa.name).second) element.Fail("duplicate association \"" + sa.name + "\"");
            if (!flows.emplace(sa.srcAddress, sa.dstAddress, sa.spi).second)
                element.Fail("another association has the same source, destination and SPI");
            associations_.push_back(sa);
        }
        std::set<std::string> names;
        for (const JsonReader& element : value.Array("policies")) {
            IpSecSpRecord sp = IpSecSpRecord::FromJson(element);
            if (!names.insert(sp.name).second) element.Member("name").Fail("duplicate policy \"" + sp.name + "\"");
            bool known = sp.saName.empty() || sp.saName == IpSecSpRecord::kUnknownSa;
            for (const IpSecSaRecord& sa : associations_) known = known || (!sa.saName.empty() && sa.saName == sp.saName);
            if (!known) element.Member("saName").Fail("no association \"" + sp.saName + "\"");
            policies_.push_back(sp);
        }
        if (value.Member("ikeConfig").IsPresent()) ike_ = IkeConfigRecord::FromJson(value.Member("ikeConfig"));
        value.RejectUnknownMembers();
    }

    void Write(Transaction& t) const override {
        for (const IpSecSaRecord& sa : associations_) t.Put(sa);
        for (const IpSecSpRecord& sp : policies_) t.Put(sp);
        t.Put(ike_);
    }

    Json Export(const Transaction& t) const override {
        Json associations = Json::array();
        for (const IpSecSaRecord& sa : t.List<IpSecSaRecord>()) associations.push_back(sa.ToJson());
        Json policies = Json::array();
        for (const IpSecSpRecord& sp : t.List<IpSecSpRecord>()) policies.push_back(sp.ToJson());
        IkeConfigRecord ike = t.Find<IkeConfigRecord>(IkeConfigRecord::kName).value_or(IkeConfigRecord());
        return Json{{"associations", associations}, {"policies", policies}, {"ikeConfig", ike.ToJson()}};
    }

private:
    std::vector<IpSecSaRecord> associations_;
    std::vector<IpSecSpRecord> policies_;
    IkeConfigRecord ike_;
};

const SectionRegistration kIpSec("ipsec", 90, [] { return std::make_unique<IpSecSection>(); });

}  // namespace

}  // namespace Host
}  // namespace Trellis
