#include "LacpGetConfig.h"

#include <cstdint>
#include <cstdlib>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "CommandSupport.h"
#include "LacpSwitches.h"
#include "gantry/network/DVPort.h"
#include "gantry/network/DVSwitch.h"
#include "gantry/network/NetworkFactory.h"
#include "trellis/lib/TrellisException.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::Network::DVPort;
using Gantry::Network::DVPortParam;
using Gantry::Network::DVSwitch;
using Gantry::Network::LacpPortConfig;
using Gantry::Network::NetworkFactory;

constexpr const char* kDvsName = "DVS Name";
constexpr const char* kLagName = "LAG Name";
constexpr const char* kLagId = "LAG ID";
constexpr const char* kNics = "NICs";
constexpr const char* kEnabled = "Enabled";
constexpr const char* kMode = "Mode";
constexpr const char* kLoadBalance = "Load balance";

// The older LACP group of an uplink port group has no name of its own.
const char* const kUplinkPortGroupLag = "default_uplink_pg_lag";

// A failure while the uplink port groups are walked is thrown on from here.
const char* const kSource = "plugins/network/LacpGetConfig";
const unsigned int kWalkFailureLine = 215;

// Indexed by LagConfig::loadBalance.
const char* const kLoadBalanceWords[] = {
    "None",
    "Dst mac",
    "Src mac",
    "Src and dst mac",
    "Dst ip",
    "Src ip",
    "Src and dst ip",
    "Vlan",
    "Dst ip and vlan",
    "Src ip and vlan",
    "Src and dst ip, vlan",
    "Dst port",
    "Src port",
    "Src and dst port",
    "Dst ip and dst port",
    "Src ip and src port",
    "Src and dst ip, port",
    "Dst ip and dst port, vlan",
    "Src ip and src port, vlan",
    "Src and dst ip, port, vlan",
    "Src portID",
};

std::string LoadBalanceWord(std::int32_t loadBalance) {
    const std::int32_t count = sizeof(kLoadBalanceWords) / sizeof(kLoadBalanceWords[0]);
    return loadBalance >= 0 && loadBalance < count ? kLoadBalanceWords[loadBalance] : "";
}

std::string ModeWord(std::int32_t mode) {
    if (mode == Gantry::Network::LACP_MODE_ACTIVE) return "Active";
    if (mode == Gantry::Network::LACP_MODE_PASSIVE) return "Passive";
    return "None";
}

// The mode of an uplink port's LACP setting: nothing while LACP is off.
std::string PortModeWord(LacpPortConfig const& config) { return config.enabled ? ModeWord(config.mode) : ""; }

// A row of the older group of an uplink port group, without its NICs and its
// setting.
boost::shared_ptr<MetaStruct> NewUplinkPortGroupRow(LacpGetConfig& command, DVSwitch& dvSwitch) {
    boost::shared_ptr<MetaStruct> row = command.GetOutputStructure();
    row->SetField(kDvsName, dvSwitch.GetName());
    row->SetField(kLagName, kUplinkPortGroupLag);
    row->SetField(kLagId, 0);
    return row;
}

void SetUplinkPortGroupSetting(MetaStruct& row, LacpPortConfig const& config) {
    row.SetField(kEnabled, config.enabled);
    row.SetField(kMode, PortModeWord(config));
    row.SetField(kLoadBalance, "---");
}

// One row for each port group whose uplink ports have LACP on, found through
// the uplink ports with a NIC. Returns the number of rows.
int AddRowsByUplinkPorts(LacpGetConfig& command, DVSwitch& dvSwitch, std::map<std::string, DVPortParam> const& params,
                         MetaList& result) {
    std::map<std::string, std::vector<std::string>> keysOfGroup;
    for (auto const& [key, param] : params) {
        std::unique_ptr<DVPort> port(NetworkFactory::GetDVPort(param));
        if (!port) continue;
        keysOfGroup[port->GetPortGroupId()].push_back(key);
    }
    int rows = 0;
    for (auto const& group : keysOfGroup) {
        boost::shared_ptr<MetaStruct> row = NewUplinkPortGroupRow(command, dvSwitch);
        std::string nics;
        LacpPortConfig last;
        for (std::string const& key : group.second) {
            auto found = params.find(key);
            if (found == params.end()) continue;
            std::unique_ptr<DVPort> port(NetworkFactory::GetDVPort(found->second));
            if (!port) continue;
            last = port->GetLacpConfig();
            if (last.enabled) nics += (nics.empty() ? "" : ",") + key;
        }
        if (nics.empty()) continue;
        row->SetField(kNics, nics);
        SetUplinkPortGroupSetting(*row, last);
        result.AddMetaStruct(row);
        ++rows;
    }
    return rows;
}

// The same for a switch whose uplink ports have no NIC, found through the
// uplink ports' names; these rows have no NICs. Returns the number of rows.
int AddRowsByUplinkNames(LacpGetConfig& command, DVSwitch& dvSwitch, MetaList& result) {
    std::vector<std::string> nicNames;
    std::vector<std::string> portNames;
    dvSwitch.GetUplinkPortNames(nicNames, portNames);
    std::map<std::string, std::string> firstPortOfGroup;
    for (std::string const& name : portNames) {
        // The first answer only tells whether the port exists; the second is
        // the one asked.
        std::unique_ptr<DVPort> probe(dvSwitch.GetUplinkPort(name));
        if (!probe) continue;
        std::unique_ptr<DVPort> port(dvSwitch.GetUplinkPort(name));
        if (!port || !port->GetLacpConfig().enabled) continue;
        firstPortOfGroup.emplace(port->GetPortGroupId(), name);
    }
    int rows = 0;
    for (auto const& group : firstPortOfGroup) {
        boost::shared_ptr<MetaStruct> row = NewUplinkPortGroupRow(command, dvSwitch);
        std::unique_ptr<DVPort> port(dvSwitch.GetUplinkPort(group.second));
        if (!port) continue;
        SetUplinkPortGroupSetting(*row, port->GetLacpConfig());
        result.AddMetaStruct(row);
        ++rows;
    }
    return rows;
}

// One row for each named LAG, with the NICs of those of its ports that have
// one. Returns the number of rows.
int AddLagRows(LacpGetConfig& command, DVSwitch& dvSwitch, MetaList& result) {
    int rows = 0;
    for (Gantry::Network::LagConfig const& lag : dvSwitch.GetLagConfigs()) {
        std::string prefix = lag.name + "-";
        boost::shared_ptr<MetaStruct> row = command.GetOutputStructure();
        row->SetField(kDvsName, dvSwitch.GetName());
        row->SetField(kLagName, lag.name);
        row->SetField(kLagId, static_cast<long long>(std::strtol(lag.id.c_str(), nullptr, 10)));
        std::map<std::string, DVPortParam> params = dvSwitch.GetUplinkPortParams();
        std::string nics;
        for (std::uint32_t index = 0; index < lag.uplinkCount; ++index) {
            auto found = params.find(prefix + std::to_string(index));
            if (found == params.end()) continue;
            std::unique_ptr<DVPort> port(NetworkFactory::GetDVPort(found->second));
            if (!port) continue;
            nics += (nics.empty() ? "" : ",") + port->GetUplinkName();
        }
        row->SetField(kNics, nics);
        row->SetField(kEnabled, true);
        row->SetField(kMode, ModeWord(lag.mode));
        row->SetField(kLoadBalance, LoadBalanceWord(lag.loadBalance));
        result.AddMetaStruct(row);
        ++rows;
    }
    return rows;
}

}  // namespace

LacpGetConfig::LacpGetConfig() {
    SetDescription("Get LACP configuration on DVS");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:LACP", std::string(kDvsName) + "," + kLagName + "," + kLagId + "," + kNics + "," +
                                                 kEnabled + "," + kMode + "," + kLoadBalance);
}

boost::shared_ptr<InputSpec> LacpGetConfig::GetInputSpecInternal() { return InputSpecOf(kLacpSwitchName); }

boost::shared_ptr<OutputSpec> LacpGetConfig::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> LacpGetConfig::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("LACP");
    result->SetField(kDvsName, MetaString::New());
    result->SetField(kLagName, MetaString::New());
    result->SetField(kLagId, MetaInt::New());
    result->SetField(kNics, MetaString::New());
    result->SetField(kEnabled, MetaBool::New());
    result->SetField(kMode, MetaString::New());
    result->SetField(kLoadBalance, MetaString::New());
    return result;
}

void LacpGetConfig::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        OwnedVector<DVSwitch> switches;
        if (!FindLacpSwitches(*input, *output, switches)) return;
        int rows = 0;
        for (DVSwitch* dvSwitch : switches) {
            if (dvSwitch == nullptr) continue;
            std::map<std::string, DVPortParam> params = dvSwitch->GetUplinkPortParams();
            try {
                rows += params.empty() ? AddRowsByUplinkNames(*this, *dvSwitch, *result)
                                       : AddRowsByUplinkPorts(*this, *dvSwitch, params, *result);
            } catch (GantryException& e) {
                throw Trellis::Lib::TrellisException(e.GetMessage(0), kSource, kWalkFailureLine);
            }
            rows += AddLagRows(*this, *dvSwitch, *result);
        }
        if (rows == 0) {
            output->SetError("LACP is disabled on DVSwitch.");
            return;
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
