#include "IpConnectionList.h"

#include <cstdint>
#include <cstdio>
#include <sstream>
#include <string>
#include <vector>

#include "CommandSupport.h"
#include "NetstackChoice.h"
#include "gantry/network/IpConnection.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/resource/ResourceInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::Network::IpConnection;

constexpr Parameter::Word kTypeWords[] = {{"ip", ""}, {"tcp", ""}, {"udp", ""}, {"all", ""}};
const Parameter kType = Parameter::String("type", "t", "Connection type : %ENUM%").StringEnum(kTypeWords);

// TCP's state codes 0 to 10; a code above them has no text.
const char* const kStates[] = {"CLOSED",     "LISTEN",  "SYN_SENT", "RCVD",       "ESTABLISHED", "CLOSE_WAIT",
                               "FIN_WAIT_1", "CLOSING", "LAST_ACK", "FIN_WAIT_2", "TIME_WAIT"};

std::string StateText(int state) {
    const int count = sizeof(kStates) / sizeof(kStates[0]);
    return state >= 0 && state < count ? kStates[state] : "";
}

// "address:port" in a buffer of 32 bytes: a longer text is cut to 31
// characters, so a long IPv6 address loses its port.
std::string Endpoint(std::string const& address, std::uint16_t port) {
    char buffer[32];
    std::snprintf(buffer, sizeof(buffer), "%s:%d", address.c_str(), static_cast<int>(port));
    return buffer;
}

// Appends a row for each connection of the protocol ("tcp", "udp" or "ip"),
// in the host's order. The fields are set, and so ordered, as listed.
void CollectConnections(MetaList& rows, std::string const& netstack, std::string const& protocol) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    Trellis::Resource::ResourceInfoImpl resourceInfo;
    std::vector<IpConnection> connections;
    if (protocol == "tcp") {
        networkInfo.GetCurrentTcpTesselConnections(connections, netstack);
    } else if (protocol == "udp") {
        networkInfo.GetCurrentUdpTesselConnections(connections, netstack);
    } else {
        networkInfo.GetCurrentIpTesselConnections(connections, netstack);
    }
    for (IpConnection const& connection : connections) {
        boost::shared_ptr<MetaStruct> row = MetaStruct::New("IpConnection");
        row->SetField("Proto", connection.protocol);
        row->SetField("Recv Q", connection.recvQueue);
        row->SetField("Send Q", connection.sendQueue);
        row->SetField("Local Address", Endpoint(connection.localAddress, connection.localPort));
        row->SetField("Foreign Address", Endpoint(connection.foreignAddress, connection.foreignPort));
        row->SetField("State", StateText(connection.state));
        row->SetField("CC Algo", connection.congestionControl);
        row->SetField("World ID", static_cast<long long>(connection.worldId));
        row->SetField("World Name", resourceInfo.GetWorldName(connection.worldId));
        rows.AddMetaStruct(row);
    }
}

}  // namespace

IpConnectionList::IpConnectionList() {
    SetDescription("List active TCP/IP connections");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:IpConnection",
                              "Proto,Recv Q,Send Q,Local Address,Foreign Address,State,World ID,CC Algo,World Name");
}

boost::shared_ptr<InputSpec> IpConnectionList::GetInputSpecInternal() {
    return InputSpecOf(kNetstackOrDefault, kType);
}

boost::shared_ptr<OutputSpec> IpConnectionList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> IpConnectionList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("IpConnection");
    result->SetField("Proto", MetaString::New());
    result->SetField("Recv Q", MetaInt::New());
    result->SetField("Send Q", MetaInt::New());
    result->SetField("Local Address", MetaString::New());
    result->SetField("Foreign Address", MetaString::New());
    result->SetField("State", MetaString::New());
    result->SetField("World ID", MetaInt::New());
    result->SetField("CC Algo", MetaString::New());
    result->SetField("World Name", MetaString::New());
    return result;
}

void IpConnectionList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        std::string netstack = ChosenNetstack(*input);
        std::string type = input->HasParameter(kType) ? input->GetString(kType) : "all";
        for (const char* protocol : {"tcp", "udp", "ip"})
            if (type == "all" || type == protocol) CollectConnections(*result, netstack, protocol);
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        std::ostringstream text;
        text << "Unable to get connection list." << std::endl << e.GetMessage(0);
        output->SetError(text.str());
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
