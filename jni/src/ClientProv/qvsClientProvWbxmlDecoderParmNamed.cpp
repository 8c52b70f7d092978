// The parameters of the characteristics that are named by text, ROAMING, WI-FI and Vodafone VoWiFi.
// They are all named by text themselves.
#include "qvsParm.h"

using namespace qvs;

namespace {

// kept[named-refusal]: a refused token is traced under the ACCESS decoder's name.
constexpr ParmStyle kStyle = {.name = "qvsClientProvWbxmlDecoderParamAccess"};

// Reads one named parameter of `record`. A name that is not listed leaves its value to the loop,
// which refuses it.
template <class Record, size_t N>
qvsResult readNamed(qvsWbxmlDecoder *decoder, Record **record, uint8_t tag,
                    const NamedParm<Record> (&names)[N], const char *label)
{
    ParmName name;
    if (qvsResult result = readParmName(decoder, tag, label, false, &name)) {
        return result;
    }
    if (name.next == attr::kValue) {
        // kept[named-unknown-refused]: the VALUE of an unknown name is not read.
        if (char **field = findNamed(*record, names, name.text.data)) {
            if (qvsResult result = readParmValue(decoder, field)) {
                return result;
            }
        }
    }
    trace("[%s] nID [0x%x]", label, name.next);
    return QVS_OK;
}

qvsResult readRoaming(qvsWbxmlDecoder *decoder, qvsWapRoaming *record)
{
    return qvsClientProvWbxmlDecoderParamRoamingNameString(decoder, &record, attr::kName);
}

qvsResult readWifi(qvsWbxmlDecoder *decoder, qvsWapWifi *record)
{
    return qvsClientProvWbxmlDecoderParamWifiNameString(decoder, &record, attr::kName);
}

qvsResult readVoWifi(qvsWbxmlDecoder *decoder, qvsWapVoWifi *record)
{
    return qvsClientProvWbxmlDecoderParamVoWifiNameString(decoder, &record, attr::kName);
}

} // namespace

qvsResult qvsClientProvWbxmlDecoderParamRoaming(qvsWbxmlDecoder *decoder, qvsWapRoaming *record)
{
    static constexpr Parm<qvsWapRoaming> kParms[] = {{attr::kName, readRoaming}};
    trace("qvsClientProvWbxmlDecoderParamRoming");
    return readParms(decoder, record, kParms, kStyle);
}

qvsResult qvsClientProvWbxmlDecoderParamRoamingNameString(qvsWbxmlDecoder *decoder,
                                                          qvsWapRoaming **record, uint8_t tag)
{
    using R = qvsWapRoaming;
    static constexpr NamedParm<R> kNames[] = {
        {"SYNC-ALLOWED", &R::pszSyncAllowed},
        {"SYNC-DEFAULT", &R::pszSyncDefault},
    };
    return readNamed(decoder, record, tag, kNames,
                     "qvsClientProvWbxmlDecoderParamRoamingNameString");
}

qvsResult qvsClientProvWbxmlDecoderParamWifi(qvsWbxmlDecoder *decoder, qvsWapWifi *record)
{
    static constexpr Parm<qvsWapWifi> kParms[] = {{attr::kName, readWifi}};
    trace("qvsClientProvWbxmlDecoderParamWifi");
    return readParms(decoder, record, kParms, kStyle);
}

qvsResult qvsClientProvWbxmlDecoderParamWifiNameString(qvsWbxmlDecoder *decoder,
                                                       qvsWapWifi **record, uint8_t tag)
{
    using R = qvsWapWifi;
    static constexpr NamedParm<R> kNames[] = {
        {"NETSSID", &R::pszNetSsid},
        {"SECMODE", &R::pszSecMode},
        {"EAPMETHOD", &R::pszEapMethod},
        {"EAPTYPE", &R::pszEapType},
        {"USERNAME", &R::pszUserName},
        {"ANONUSERNAME", &R::pszAnonUserName},
        {"PASSWORD", &R::pszPassword},
        {"CACERT", &R::pszCaCert},
        {"USERCERT", &R::pszUserCert},
        {"PHASE1", &R::pszPhase1},
        {"AUTHALGORITHM", &R::pszAuthAlgorithm},
        {"PRIORITY", &R::pszPriority},
    };
    return readNamed(decoder, record, tag, kNames, "qvsClientProvWbxmlDecoderParamNameString");
}

qvsResult qvsClientProvWbxmlDecoderParamVoWifi(qvsWbxmlDecoder *decoder, qvsWapVoWifi *record)
{
    static constexpr Parm<qvsWapVoWifi> kParms[] = {{attr::kName, readVoWifi}};
    trace("qvsClientProvWbxmlDecoderParamVoWifi");
    return readParms(decoder, record, kParms, kStyle);
}

qvsResult qvsClientProvWbxmlDecoderParamVoWifiNameString(qvsWbxmlDecoder *decoder,
                                                         qvsWapVoWifi **record, uint8_t tag)
{
    using R = qvsWapVoWifi;
    static constexpr NamedParm<R> kNames[] = {
        {"ePDG FQDN", &R::pszEpdgFqdn},
    };
    return readNamed(decoder, record, tag, kNames, "qvsClientProvWbxmlDecoderParamNameString");
}
