#include "IpIpsecSAAdd.h"

#include <string>

#include "CommandSupport.h"
#include "IpsecValues.h"
#include "gantry/network/IpSec.h"
#include "trellis/network/IpSecConfigImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kName = Parameter::String("sa-name", "n", "Name for the Security Association to be added.").Required();
const Parameter kSource =
    Parameter::String("sa-source", "s",
                      "Ipv6 address of Security Association source. Can be specified as 'any' or a correct IPv6 "
                      "address.")
        .Required();
const Parameter kDestination =
    Parameter::String("sa-destination", "d",
                      "Ipv6 address of Security Association destination. Can be specified as 'any' or a correct IPv6 "
                      "address.")
        .Required();
constexpr Parameter::Word kModeWords[] = {{"transport", ""}, {"tunnel", ""}};
const Parameter kMode = Parameter::String("sa-mode", "m", "Security Association mode. Should be one in set %ENUM%.")
                            .StringEnum(kModeWords);
const Parameter kSpi = Parameter::String("sa-spi", "p", "SPI value for the Security Association(hex).").Required();
constexpr Parameter::Word kEncryptionAlgorithmWords[] = {{"null", ""}, {"3des-cbc", ""}, {"aes128-cbc", ""}};
const Parameter kEncryptionAlgorithm =
    Parameter::String("encryption-algorithm", "e",
                      "Encryption algorithm for the Security Association. Should be one in set %ENUM%.")
        .Required()
        .StringEnum(kEncryptionAlgorithmWords);
const Parameter kEncryptionKey =
    Parameter::String("encryption-key", "k",
                      "Encryption key(ASCII or hex). Length of hex key is dependent upon algorithm used. Required "
                      "when a encryption algorithm has been specified.");
constexpr Parameter::Word kIntegrityAlgorithmWords[] = {{"hmac-sha1", ""}, {"hmac-sha2-256", ""}};
const Parameter kIntegrityAlgorithm =
    Parameter::String("integrity-algorithm", "i",
                      "Integrity algorithm for the Security Association. Should be one in set %ENUM%.")
        .Required()
        .StringEnum(kIntegrityAlgorithmWords);
const Parameter kIntegrityKey =
    Parameter::String("integrity-key", "K",
                      "Integrity key(ASCII or hex). Length of hex key is dependent upon algorithm used.")
        .Required();

// The encryption algorithm that takes no key.
const char* const kNullEncryption = "null";

}  // namespace

IpIpsecSAAdd::IpIpsecSAAdd() {
    SetDescription("Add a Security Association.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpIpsecSAAdd::GetInputSpecInternal() {
    return InputSpecOf(kName, kSource, kDestination, kMode, kSpi, kEncryptionAlgorithm, kEncryptionKey,
                       kIntegrityAlgorithm, kIntegrityKey);
}

boost::shared_ptr<OutputSpec> IpIpsecSAAdd::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpIpsecSAAdd::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::IpSecConfigImpl ipsecConfig;
    try {
        Gantry::Network::IpSecSadParam param;
        param.name = input->GetString(kName);
        param.srcAddress = Gantry::Network::Ipv6Address(AnyAsUnspecified(input->GetString(kSource)));
        param.dstAddress = Gantry::Network::Ipv6Address(AnyAsUnspecified(input->GetString(kDestination)));
        std::string spi = input->GetString(kSpi);
        if (!ReadSpi(spi, param.spi)) {
            output->SetError("Check the input value for '--sa-spi'. Should be hex integer. Got " + spi);
            return;
        }
        param.mode = ipsecConfig.StringToIpSecMode(input->GetString(kMode));
        std::string encryptionAlgorithm = input->GetString(kEncryptionAlgorithm);
        param.encryptionAlgorithm = ipsecConfig.StringToIpSecEncyptAlgo(encryptionAlgorithm);
        param.integrityAlgorithm = ipsecConfig.StringToIpSecAuthAlgo(input->GetString(kIntegrityAlgorithm));
        param.integrityKey = input->GetString(kIntegrityKey);
        if (input->HasParameter(kEncryptionKey)) {
            param.encryptionKey = input->GetString(kEncryptionKey);
        } else if (encryptionAlgorithm != kNullEncryption) {
            output->SetError("Missing encryption key");
            return;
        }
        ipsecConfig.AddSADConfig(param);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
