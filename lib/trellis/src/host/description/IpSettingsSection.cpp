// "ipSettings": the host's IP settings of its own, an object. A description
// without it gives the host's defaults (IPv6 on).

#include <nlohmann/json.hpp>

#include "host/description/Section.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/IpSettingsRecord.h"

namespace Trellis {
namespace Host {

namespace {

class IpSettingsSection : public Section {
public:
    void Parse(const JsonReader& value) override {
        if (value.IsPresent()) settings_ = IpSettingsRecord::FromJson(value);
    }

    void Write(Transaction& t) const override { t.Put(settings_); }

    Json Export(const Transaction& t) const override {
        return t.Find<IpSettingsRecord>(IpSettingsRecord::kName).value_or(IpSettingsRecord()).ToJson();
    }

private:
    IpSettingsRecord settings_;
};

const SectionRegistration kIpSettings("ipSettings", 15, [] { return std::make_unique<IpSettingsSection>(); });

}  // namespace

}  // namespace Host
}  // namespace Trellis
