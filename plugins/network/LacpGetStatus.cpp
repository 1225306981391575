#include "LacpGetStatus.h"

#include <cstdint>
#include <cstdio>
#include <cstring>
#include <iterator>
#include <string>
#include <vector>

#include "CommandSupport.h"
#include "LacpSwitches.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::Network::LacpGroup;
using Gantry::Network::LacpNic;

// LAG
constexpr const char* kDvSwitch = "DVSwitch";
constexpr const char* kLagId = "LAG ID";
constexpr const char* kMode = "Mode";
constexpr const char* kFlags = "Flags";
constexpr const char* kNicList = "Nic List";
// NicStatus
constexpr const char* kNic = "Nic";
constexpr const char* kState = "State";
constexpr const char* kLocalInformation = "Local Information";
constexpr const char* kPartnerInformation = "Partner Information";
// LocalInfo and PartnerInfo
constexpr const char* kPortState = "Port State";
constexpr const char* kAdminKey = "Admin Key";
constexpr const char* kOperKey = "Oper Key";
constexpr const char* kPortPriority = "Port Priority";
constexpr const char* kPortNumber = "Port Number";
constexpr const char* kDeviceId = "Device ID";
constexpr const char* kAge = "Age";

const char* const kSource = "plugins/network/LacpGetStatus";

// What the letters of the flags mean, shown with every group whatever its
// flags are.
constexpr const char* kFlagLegend[] = {
    "S - Device is sending Slow LACPDUs",
    "F - Device is sending fast LACPDUs",
    "A - Device is in active mode",
    "P - Device is in passive mode",
};

// The bits of a port state, from the lowest up.
const char* const kPortStateWords[] = {"ACT", "FTO", "AGG", "SYN", "COL", "DIST", "DEF", "EXP"};

// Each set bit's word followed by ",": the text keeps its trailing comma.
std::string PortStateText(std::uint8_t state) {
    std::string text;
    for (int bit = 0; bit < 8; ++bit)
        if (state & (1u << bit)) text += std::string(kPortStateWords[bit]) + ",";
    return text;
}

// hh:mm:ss, each part at least two digits; the hours grow as they need.
std::string AgeText(std::uint32_t seconds) {
    char text[24];
    std::snprintf(text, sizeof text, "%02u:%02u:%02u", static_cast<unsigned>(seconds / 3600),
                  static_cast<unsigned>(seconds / 60 % 60), static_cast<unsigned>(seconds % 60));
    return text;
}

// A text field of the kernel's record, which may fill its array to the end.
template <std::size_t N>
std::string Text(const char (&field)[N]) {
    return std::string(field, strnlen(field, N));
}


// One NIC of a running group: its own side and its partner's.
boost::shared_ptr<MetaStruct> NicStatusOf(LacpGetStatus& command, LacpNic const& nic) {
    boost::shared_ptr<MetaStruct> status = command.GetLACPNicInfoStruct();
    status->SetField(kNic, Text(nic.name));
    status->SetField(kState, Text(nic.state));

    boost::shared_ptr<MetaStruct> local = command.GetLACPLocalInfoStruct();
    local->SetField(kFlags, Text(nic.localFlags));
    local->SetField(kAdminKey, static_cast<int>(nic.adminKey));
    local->SetField(kOperKey, static_cast<int>(nic.operKey));
    local->SetField(kPortPriority, static_cast<int>(nic.portPriority));
    local->SetField(kPortNumber, static_cast<int>(nic.portNumber));
    local->SetField(kPortState, PortStateText(nic.portState));
    status->SetField(kLocalInformation, local);

    boost::shared_ptr<MetaStruct> partner = command.GetLACPPartnerInfoStruct();
    partner->SetField(kPortState, PortStateText(nic.partnerPortState));
    partner->SetField(kFlags, Text(nic.partnerFlags));
    partner->SetField(kDeviceId, Text(nic.partnerDeviceId));
    partner->SetField(kAge, AgeText(nic.partnerAge));
    partner->SetField(kOperKey, static_cast<int>(nic.partnerOperKey));
    partner->SetField(kPortPriority, static_cast<int>(nic.partnerPortPriority));
    partner->SetField(kPortNumber, static_cast<int>(nic.partnerPortNumber));
    status->SetField(kPartnerInformation, partner);
    return status;
}

}  // namespace

LacpGetStatus::LacpGetStatus() {
    SetDescription("Get LACP status on DVS");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:LAG", "%DVSwitch%");
    SetDefaultOutputParameter("header:NicStatus", "<NONE>");
    SetDefaultOutputParameter("header:LocalInfo", "<NONE>");
    SetDefaultOutputParameter("header:PartnerInfo", "<NONE>");
    SetDefaultOutputParameter("table-columns:LAG",
                              std::string(kDvSwitch) + "," + kLagId + "," + kMode + "," + kFlags + "," + kNicList);
    SetDefaultOutputParameter("table-columns:NicStatus",
                              std::string(kNic) + "," + kState + "," + kLocalInformation + "," + kPartnerInformation);
    SetDefaultOutputParameter("table-columns:LocalInfo", std::string(kPortState) + "," + kFlags + "," + kAdminKey +
                                                             "," + kOperKey + "," + kPortPriority + "," + kPortNumber);
    SetDefaultOutputParameter("table-columns:PartnerInfo", std::string(kDeviceId) + "," + kPortState + "," + kFlags +
                                                               "," + kAge + "," + kOperKey + "," + kPortPriority +
                                                               "," + kPortNumber);
}

boost::shared_ptr<InputSpec> LacpGetStatus::GetInputSpecInternal() { return InputSpecOf(kLacpSwitchName); }

boost::shared_ptr<OutputSpec> LacpGetStatus::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> LacpGetStatus::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("LAG");
    result->SetField(kDvSwitch, MetaString::New());
    result->SetField(kLagId, MetaInt::New());
    result->SetField(kMode, MetaString::New());
    result->SetField(kFlags, MetaList::New(Plinth::MetaObj::META_STRING));
    result->SetField(kNicList, MetaList::New(Plinth::MetaObj::META_STRUCT, GetLACPNicInfoStruct()));
    return result;
}

boost::shared_ptr<MetaStruct> LacpGetStatus::GetLACPNicInfoStruct() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("NicStatus");
    result->SetField(kNic, MetaString::New());
    result->SetField(kState, MetaString::New());
    result->SetField(kLocalInformation, GetLACPLocalInfoStruct());
    result->SetField(kPartnerInformation, GetLACPPartnerInfoStruct());
    return result;
}

boost::shared_ptr<MetaStruct> LacpGetStatus::GetLACPLocalInfoStruct() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("LocalInfo");
    result->SetField(kPortState, MetaString::New());
    result->SetField(kFlags, MetaString::New());
    result->SetField(kAdminKey, MetaInt::New());
    result->SetField(kOperKey, MetaInt::New());
    result->SetField(kPortPriority, MetaInt::New());
    result->SetField(kPortNumber, MetaInt::New());
    return result;
}

boost::shared_ptr<MetaStruct> LacpGetStatus::GetLACPPartnerInfoStruct() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("PartnerInfo");
    result->SetField(kDeviceId, MetaString::New());
    result->SetField(kPortState, MetaString::New());
    result->SetField(kFlags, MetaString::New());
    result->SetField(kAge, MetaString::New());
    result->SetField(kOperKey, MetaInt::New());
    result->SetField(kPortPriority, MetaInt::New());
    result->SetField(kPortNumber, MetaInt::New());
    return result;
}

void LacpGetStatus::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        OwnedVector<Gantry::Network::DVSwitch> switches;
        if (!FindLacpSwitches(*input, *output, switches)) return;
        std::size_t groups = 0;
        for (Gantry::Network::DVSwitch* dvSwitch : switches) {
            if (dvSwitch == nullptr) continue;
            groups += ForEachLacpGroup(*dvSwitch, kSource, __LINE__, [&](LacpGroup& group) {
                boost::shared_ptr<MetaStruct> lag = GetOutputStructure();
                lag->SetField(kDvSwitch, dvSwitch->GetName());
                lag->SetField(kLagId, static_cast<long long>(group.lagId));
                lag->SetField(kMode, group.mode == Gantry::Network::LACP_MODE_PASSIVE ? "Passive" : "Active");
                lag->SetField(kFlags, std::vector<std::string>(std::begin(kFlagLegend), std::end(kFlagLegend)));
                boost::shared_ptr<MetaList> nics =
                    MetaList::New(Plinth::MetaObj::META_STRUCT, GetLACPNicInfoStruct());
                for (LacpNic* nic : group.nics) nics->AddMetaStruct(NicStatusOf(*this, *nic));
                lag->SetField(kNicList, nics);
                result->AddMetaStruct(lag);
            });
        }
        if (groups == 0) {
            output->SetError("No running LACP group on the host.");
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
