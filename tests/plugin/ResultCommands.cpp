#include <stdexcept>

#include "DemoCommands.h"

using namespace Plinth::CallSpec;
using namespace Plinth::MetaObj;

namespace Demo {

namespace {

boost::shared_ptr<OutputSpec> ResultType(boost::shared_ptr<MetaObject> shape) {
    boost::shared_ptr<OutputSpec> outputSpec = OutputSpec::New();
    outputSpec->SetResultType(shape);
    return outputSpec;
}

boost::shared_ptr<ParameterSpec> Flag(char const* name, char const* help) {
    boost::shared_ptr<ParameterSpec> flag = ParameterSpec::New(name, PARAMETER_FLAG);
    flag->SetDescription(help);
    return flag;
}

boost::shared_ptr<MetaStruct> NicStructure() {
    boost::shared_ptr<MetaStruct> nic = MetaStruct::New("Nic");
    nic->SetField("Name", MetaString::New());
    nic->SetField("Driver", MetaString::New());
    nic->SetField("Link Status", MetaBool::New());
    nic->SetField("Speed", MetaInt::New());
    nic->SetField("Description", MetaString::New());
    return nic;
}

boost::shared_ptr<MetaStruct> Nic(char const* name, bool up, long long speed, char const* description) {
    boost::shared_ptr<MetaStruct> nic = NicStructure();
    nic->SetField("Name", name);
    nic->SetField("Driver", "hnet");
    nic->SetField("Link Status", up);
    if (speed) nic->SetField("Speed", speed);
    nic->SetField("Description", description);
    return nic;
}

boost::shared_ptr<MetaStruct> PolicyStructure() {
    boost::shared_ptr<MetaStruct> policy = MetaStruct::New("ShapingPolicy");
    policy->SetField("Enabled", MetaBool::New());
    policy->SetField("Average Bandwidth", MetaInt::New());
    return policy;
}

boost::shared_ptr<MetaStruct> PortGroupStructure() {
    boost::shared_ptr<MetaStruct> group = MetaStruct::New("PortGroup");
    group->SetField("Name", MetaString::New());
    group->SetField("VLAN ID", MetaInt::New());
    return group;
}

boost::shared_ptr<MetaStruct> SwitchStructure() {
    boost::shared_ptr<MetaStruct> vswitch = MetaStruct::New("VirtualSwitch");
    vswitch->SetField("Name", MetaString::New());
    vswitch->SetField("MTU", MetaInt::New());
    vswitch->SetField("Uplinks", MetaList::New(META_STRING));
    vswitch->SetField("Policy", PolicyStructure());
    vswitch->SetField("Portgroups", MetaList::New(3, PortGroupStructure()));
    vswitch->SetField("Notes", MetaString::New());
    return vswitch;
}

}  // namespace

Fail::Fail() { SetDescription("Report failures, with or without a result."); }

boost::shared_ptr<InputSpec> Fail::GetInputSpecInternal() {
    boost::shared_ptr<InputSpec> inputSpec = InputSpec::New();
    inputSpec->AddParameter(Flag("with-result", "Deliver true as well."));
    return inputSpec;
}

boost::shared_ptr<OutputSpec> Fail::GetOutputSpecInternal() { return ResultType(MetaBool::New()); }

void Fail::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    output->SetError("First failure.");
    output->SetError("Second failure.");
    if (input->GetFlag("with-result")) {
        output->SetResult(MetaBool::New(true));
        output->Finish();
    }
}

Throw::Throw() { SetDescription("Fail with an exception."); }
boost::shared_ptr<InputSpec> Throw::GetInputSpecInternal() { return InputSpec::New(); }
boost::shared_ptr<OutputSpec> Throw::GetOutputSpecInternal() { return ResultType(MetaBool::New()); }
void Throw::ExecuteInternal(boost::shared_ptr<Input>, boost::shared_ptr<Output> output) {
    output->SetError("Before the throw.");
    throw std::runtime_error("The host did not answer.");
}

Bool::Bool() { SetDescription("Deliver a boolean."); }

boost::shared_ptr<InputSpec> Bool::GetInputSpecInternal() {
    boost::shared_ptr<InputSpec> inputSpec = InputSpec::New();
    boost::shared_ptr<ParameterSpec> value = ParameterSpec::New("value", PARAMETER_BOOL);
    value->SetShortName("b");
    value->SetDescription("The value to deliver.");
    inputSpec->AddParameter(value);
    return inputSpec;
}

boost::shared_ptr<OutputSpec> Bool::GetOutputSpecInternal() { return ResultType(MetaBool::New()); }

void Bool::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    output->SetResult(MetaBool::New(input->GetBool("value")));
    output->Finish();
}

NicTable::NicTable() {
    SetDescription("List the demo NICs.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:Nic", "Name,Link Status,Speed,Description");
    SetDefaultOutputParameter("header:Nic", "NIC %Name% (%Driver%)");
    SetDefaultOutputParameter("units:Nic.Speed", "Mbps");
}

boost::shared_ptr<InputSpec> NicTable::GetInputSpecInternal() {
    boost::shared_ptr<InputSpec> inputSpec = InputSpec::New();
    inputSpec->AddParameter(Flag("empty", "List no NIC at all."));
    return inputSpec;
}

boost::shared_ptr<OutputSpec> NicTable::GetOutputSpecInternal() {
    return ResultType(MetaList::New(META_STRUCT, NicStructure()));
}

void NicTable::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    boost::shared_ptr<MetaList> nics = MetaList::New(3, NicStructure());
    if (!input->GetFlag("empty")) {
        nics->AddMetaStruct(Nic("pnet0", true, 10000, "Uplink of switch0"));
        nics->AddMetaStruct(Nic("pnet1", false, 0, "Dual port, \"fast\""));
    }
    output->SetResult(nics);
    output->Finish();
}

SwitchGet::SwitchGet() {
    SetDescription("Show a demo switch.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:VirtualSwitch", "%Name%");
    SetDefaultOutputParameter("header:ShapingPolicy", "<NONE>");
    SetDefaultOutputParameter("units:ShapingPolicy.Average Bandwidth", "Kbps");
}

boost::shared_ptr<InputSpec> SwitchGet::GetInputSpecInternal() { return InputSpec::New(); }
boost::shared_ptr<OutputSpec> SwitchGet::GetOutputSpecInternal() { return ResultType(SwitchStructure()); }

void SwitchGet::ExecuteInternal(boost::shared_ptr<Input>, boost::shared_ptr<Output> output) {
    boost::shared_ptr<MetaStruct> vswitch = SwitchStructure();
    vswitch->SetField("Name", "switch0");
    vswitch->SetField("MTU", 1500);
    vswitch->SetField("Uplinks", std::vector<std::string>{"pnet0", "pnet1"});
    boost::shared_ptr<MetaStruct> policy = PolicyStructure();
    policy->SetField("Enabled", true);
    policy->SetField("Average Bandwidth", 100);
    vswitch->SetField("Policy", policy);
    boost::shared_ptr<MetaList> groups = MetaList::New(3, PortGroupStructure());
    for (auto const& entry : {std::make_pair("Host Management", 0), std::make_pair("Guest Network", 12)}) {
        boost::shared_ptr<MetaStruct> group = PortGroupStructure();
        group->SetField("Name", entry.first);
        group->SetField("VLAN ID", entry.second);
        groups->AddMetaStruct(group);
    }
    vswitch->SetField("Portgroups", groups);
    output->SetResult(vswitch);
    output->Finish();
}

}  // namespace Demo
