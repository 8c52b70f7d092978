// The parameters of the characteristics that are named by text, ROAMING, WI-FI and Vodafone VoWiFi.
// They are all named by text themselves.
#include "qvsParm.h"

using namespace qvs;

namespace {

// kept[named-refusal]: a refused token is traced under the ACCESS decoder's name.
constexpr char kRefusedBy[] = "qvsClientProvWbxmlDecoderParamAccess";

// The NAME is all that the loop knows of these characteristics.
constexpr Parm kNameAlone[] = {
    {attr::kName, kByReader},
};

namespace roaming {
using R = qvsWapRoaming;
constexpr NamedParm kNamed[] = {
    {"SYNC-ALLOWED", QVS_FIELD(R, pszSyncAllowed)},
    {"SYNC-DEFAULT", QVS_FIELD(R, pszSyncDefault)},
};

qvsResult read(qvsWbxmlDecoder *decoder, void *record)
{
    auto *typed = static_cast<R *>(record);
    return qvsClientProvWbxmlDecoderParamRoamingNameString(decoder, &typed, attr::kName);
}
} // namespace roaming

namespace wifi {
using R = qvsWapWifi;
constexpr NamedParm kNamed[] = {
    {"NETSSID", QVS_FIELD(R, pszNetSsid)},
    {"SECMODE", QVS_FIELD(R, pszSecMode)},
    {"EAPMETHOD", QVS_FIELD(R, pszEapMethod)},
    {"EAPTYPE", QVS_FIELD(R, pszEapType)},
    {"USERNAME", QVS_FIELD(R, pszUserName)},
    {"ANONUSERNAME", QVS_FIELD(R, pszAnonUserName)},
    {"PASSWORD", QVS_FIELD(R, pszPassword)},
    {"CACERT", QVS_FIELD(R, pszCaCert)},
    {"USERCERT", QVS_FIELD(R, pszUserCert)},
    {"PHASE1", QVS_FIELD(R, pszPhase1)},
    {"AUTHALGORITHM", QVS_FIELD(R, pszAuthAlgorithm)},
    {"PRIORITY", QVS_FIELD(R, pszPriority)},
};

qvsResult read(qvsWbxmlDecoder *decoder, void *record)
{
    auto *typed = static_cast<R *>(record);
    return qvsClientProvWbxmlDecoderParamWifiNameString(decoder, &typed, attr::kName);
}
} // namespace wifi

namespace voWifi {
using R = qvsWapVoWifi;
constexpr NamedParm kNamed[] = {
    {"ePDG FQDN", QVS_FIELD(R, pszEpdgFqdn)},
};

qvsResult read(qvsWbxmlDecoder *decoder, void *record)
{
    auto *typed = static_cast<R *>(record);
    return qvsClientProvWbxmlDecoderParamVoWifiNameString(decoder, &typed, attr::kName);
}
} // namespace voWifi

// Reads one named parameter of `record`. A name that is not listed leaves its value to the loop,
// which refuses it.
qvsResult readNamed(qvsWbxmlDecoder *decoder, void *record, uint8_t tag,
                    const Rows<NamedParm> &names, const char *label)
{
    ParmName name;
    if (qvsResult result = readParmName(decoder, tag, label, false, &name)) {
        return result;
    }
    if (name.next == attr::kValue) {
        // kept[named-unknown-refused]: the VALUE of an unknown name is not read.
        if (char **field = findNamed(record, names, name.text.data)) {
            if (qvsResult result = readParmValue(decoder, field)) {
                return result;
            }
        }
    }
    trace("[%s] nID [0x%x]", label, name.next);
    return QVS_OK;
}

} // namespace

constexpr ParmTable qvs::kRoamingParms = {
    .name = kRefusedBy,
    .rows = kNameAlone,
    .reader = roaming::read,
    .entered = "qvsClientProvWbxmlDecoderParamRoming",
};

constexpr ParmTable qvs::kWifiParms = {
    .name = kRefusedBy,
    .rows = kNameAlone,
    .reader = wifi::read,
    .entered = "qvsClientProvWbxmlDecoderParamWifi",
};

constexpr ParmTable qvs::kVoWifiParms = {
    .name = kRefusedBy,
    .rows = kNameAlone,
    .reader = voWifi::read,
    .entered = "qvsClientProvWbxmlDecoderParamVoWifi",
};

qvsResult qvsClientProvWbxmlDecoderParamRoaming(qvsWbxmlDecoder *decoder, qvsWapRoaming *record)
{
    return readParms(decoder, record, kRoamingParms);
}

qvsResult qvsClientProvWbxmlDecoderParamRoamingNameString(qvsWbxmlDecoder *decoder,
                                                          qvsWapRoaming **record, uint8_t tag)
{
    return readNamed(decoder, *record, tag, roaming::kNamed,
                     "qvsClientProvWbxmlDecoderParamRoamingNameString");
}

qvsResult qvsClientProvWbxmlDecoderParamWifi(qvsWbxmlDecoder *decoder, qvsWapWifi *record)
{
    return readParms(decoder, record, kWifiParms);
}

qvsResult qvsClientProvWbxmlDecoderParamWifiNameString(qvsWbxmlDecoder *decoder,
                                                       qvsWapWifi **record, uint8_t tag)
{
    return readNamed(decoder, *record, tag, wifi::kNamed,
                     "qvsClientProvWbxmlDecoderParamNameString");
}

qvsResult qvsClientProvWbxmlDecoderParamVoWifi(qvsWbxmlDecoder *decoder, qvsWapVoWifi *record)
{
    return readParms(decoder, record, kVoWifiParms);
}

qvsResult qvsClientProvWbxmlDecoderParamVoWifiNameString(qvsWbxmlDecoder *decoder,
                                                         qvsWapVoWifi **record, uint8_t tag)
{
    return readNamed(decoder, *record, tag, voWifi::kNamed,
                     "qvsClientProvWbxmlDecoderParamNameString");
}
