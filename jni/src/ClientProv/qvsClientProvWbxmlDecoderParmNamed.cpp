// Parameters whose name is given as text, and the characteristics that have no others and are named
// by text themselves: ROAMING, WI-FI and Vodafone VoWiFi.
#include "qvsParm.h"
#include "qvsstring.h"

using namespace qvs;

namespace {

// kept[named-refusal]: a refused token is traced under the ACCESS decoder's name.
constexpr char kRefusedBy[] = "Access";

// The NAME is all that the loop knows of these characteristics.
template <class Record>
constexpr auto kNameAlone = tableOf<Parm<Record>>({{attr::kName, kByName}});

namespace roaming {
using R = qvsWapRoaming;
constexpr auto kNames = namesOf<R>({
    {"SYNC-ALLOWED", &R::pszSyncAllowed},
    {"SYNC-DEFAULT", &R::pszSyncDefault},
});

constexpr NamedOf<R> kNamed = {kNames, "qvsClientProvWbxmlDecoderParamRoamingNameString"};
} // namespace roaming

namespace wifi {
using R = qvsWapWifi;
constexpr auto kNames = namesOf<R>({
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
});

constexpr NamedOf<R> kNamed = {kNames, "qvsClientProvWbxmlDecoderParamNameString"};
} // namespace wifi

namespace voWifi {
using R = qvsWapVoWifi;
constexpr auto kNames = namesOf<R>({
    {"ePDG FQDN", &R::pszEpdgFqdn},
});

constexpr NamedOf<R> kNamed = {kNames, "qvsClientProvWbxmlDecoderParamNameString"};
} // namespace voWifi

} // namespace

qvsResult qvs::readParmName(qvsWbxmlDecoder *decoder, DecodeState *state, uint8_t tag,
                            const char *label, bool isKept, ParmName *name)
{
    trace("[%s] nTagID [0x%x]", label, tag);
    if (qvsResult result = checkAttr(decoder, tag)) {
        return result;
    }
    qvsResult result =
        isKept ? content(decoder, state, &name->text) : lookAt(decoder, state, &name->text);
    if (result == QVS_OK && !isKept && name->text.length == 0) {
        result = QVS_ERROR_FAILED;
    }
    if (result != QVS_OK) {
        // Silent where not even a part of a name was read.
        if (isKept || name->text.str() || result == QVS_ERROR_FAILED) {
            trace("[%s] pszName NULL", label);
        }
        return result;
    }
    trace("[%s] pszName [%s]", label, name->text.str() ? name->text.str() : "");
    if (!peekByte(decoder, &name->next)) {
        return QVS_ERROR_WBXML_NO_DATA;
    }
    trace("[%s] nID [0x%x]", label, name->next);
    return QVS_OK;
}

qvsResult qvs::leaveUnknown(qvsWbxmlDecoder *decoder, DecodeState *state, const NamedParms &parms)
{
    if (!parms.dropsUnknown) {
        // kept[named-unknown-refused]: the VALUE of another unknown name is not read.
        return QVS_OK;
    }
    Text dropped;
    const qvsResult result = paramValue(decoder, state, &dropped, lookAt);
    if (result == QVS_OK) {
        trace("[%s] pszValue [%s]", parms.label, dropped.str() ? dropped.str() : "");
    }
    return result;
}

qvsResult qvs::readNamed(qvsWbxmlDecoder *decoder, DecodeState *state, void *record, uint8_t tag,
                         const NamedParms &parms)
{
    ParmName name;
    qvsResult result = readParmName(decoder, state, tag, parms.label, false, &name);
    if (result == QVS_OK && name.next == attr::kValue) {
        const Text &text = name.text;
        if (char **field = findNamed(record, parms.names, text.str(), text.length)) {
            result = readValue(decoder, state, field);
        } else {
            result = leaveUnknown(decoder, state, parms);
        }
    }
    if (result == QVS_OK && !parms.dropsUnknown) {
        trace("[%s] nID [0x%x]", parms.label, name.next);
    }
    return result;
}

constexpr ParmsOf<qvsWapRoaming> qvs::kRoamingParms = {
    {.name = kRefusedBy, .entered = "Roming"}, kNameAlone<qvsWapRoaming>, roaming::kNamed};

constexpr ParmsOf<qvsWapWifi> qvs::kWifiParms = {
    {.name = kRefusedBy, .entered = "Wifi"}, kNameAlone<qvsWapWifi>, wifi::kNamed};

constexpr ParmsOf<qvsWapVoWifi> qvs::kVoWifiParms = {
    {.name = kRefusedBy, .entered = "VoWifi"}, kNameAlone<qvsWapVoWifi>, voWifi::kNamed};

qvsResult qvsClientProvWbxmlDecoderParamRoaming(qvsWbxmlDecoder *decoder, qvsWapRoaming *record)
{
    return readParms(decoder, record, kRoamingParms);
}

qvsResult qvsClientProvWbxmlDecoderParamRoamingNameString(qvsWbxmlDecoder *decoder,
                                                          qvsWapRoaming **record, uint8_t tag)
{
    DecodeState alone;
    return readNamed(decoder, &alone, *record, tag, roaming::kNamed);
}

qvsResult qvsClientProvWbxmlDecoderParamWifi(qvsWbxmlDecoder *decoder, qvsWapWifi *record)
{
    return readParms(decoder, record, kWifiParms);
}

qvsResult qvsClientProvWbxmlDecoderParamWifiNameString(qvsWbxmlDecoder *decoder,
                                                       qvsWapWifi **record, uint8_t tag)
{
    DecodeState alone;
    return readNamed(decoder, &alone, *record, tag, wifi::kNamed);
}

qvsResult qvsClientProvWbxmlDecoderParamVoWifi(qvsWbxmlDecoder *decoder, qvsWapVoWifi *record)
{
    return readParms(decoder, record, kVoWifiParms);
}

qvsResult qvsClientProvWbxmlDecoderParamVoWifiNameString(qvsWbxmlDecoder *decoder,
                                                         qvsWapVoWifi **record, uint8_t tag)
{
    DecodeState alone;
    return readNamed(decoder, &alone, *record, tag, voWifi::kNamed);
}
