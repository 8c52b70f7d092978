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
constexpr auto kNameAlone = tableOf<Parm<Record>>({{attr::kName, kByReader}});

// Reads one named parameter of `record`. A name that is not listed leaves its value to the loop,
// which refuses it.
qvsResult readAnyNamed(qvsWbxmlDecoder *decoder, DecodeState *state, void *record, uint8_t tag,
                       const Rows<NamedRow> &names, const char *label)
{
    ParmName name;
    if (qvsResult result = readParmName(decoder, state, tag, label, false, &name)) {
        return result;
    }
    if (name.next == attr::kValue) {
        // kept[named-unknown-refused]: the VALUE of an unknown name is not read.
        if (char **field = findNamed(record, names, name.text)) {
            if (qvsResult result = readValue(decoder, state, field)) {
                return result;
            }
        }
    }
    trace("[%s] nID [0x%x]", label, name.next);
    return QVS_OK;
}

template <class Record, size_t N>
qvsResult readNamed(qvsWbxmlDecoder *decoder, DecodeState *state, Record *record, uint8_t tag,
                    const Table<Record, NamedRow, N> &names, const char *label)
{
    return readAnyNamed(decoder, state, record, tag, rowsFor<Record>(names), label);
}

namespace roaming {
using R = qvsWapRoaming;
constexpr auto kNamed = tableOf<NamedParm<R>>({
    {"SYNC-ALLOWED", &R::pszSyncAllowed},
    {"SYNC-DEFAULT", &R::pszSyncDefault},
});

qvsResult read(qvsWbxmlDecoder *decoder, DecodeState *state, R *record)
{
    return readNamed(decoder, state, record, attr::kName, kNamed,
                     "qvsClientProvWbxmlDecoderParamRoamingNameString");
}
} // namespace roaming

namespace wifi {
using R = qvsWapWifi;
constexpr auto kNamed = tableOf<NamedParm<R>>({
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

qvsResult read(qvsWbxmlDecoder *decoder, DecodeState *state, R *record)
{
    return readNamed(decoder, state, record, attr::kName, kNamed,
                     "qvsClientProvWbxmlDecoderParamNameString");
}
} // namespace wifi

namespace voWifi {
using R = qvsWapVoWifi;
constexpr auto kNamed = tableOf<NamedParm<R>>({
    {"ePDG FQDN", &R::pszEpdgFqdn},
});

qvsResult read(qvsWbxmlDecoder *decoder, DecodeState *state, R *record)
{
    return readNamed(decoder, state, record, attr::kName, kNamed,
                     "qvsClientProvWbxmlDecoderParamNameString");
}
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

char **qvs::findNamed(void *record, const Rows<NamedRow> &names, const Text &name)
{
    const char *const text = name.str();
    const uint32_t length = name.length;
    for (const NamedRow &known : names) {
        if (known.name[0] == text[0] && length < sizeof known.name && known.name[length] == '\0' &&
            memcmp(text, known.name, length) == 0) {
            return textAt(record, known.field);
        }
    }
    return nullptr;
}

constexpr ParmsOf<qvsWapRoaming> qvs::kRoamingParms = {{.name = kRefusedBy, .entered = "Roming"},
                                                       kNameAlone<qvsWapRoaming>,
                                                       kReadBy<qvsWapRoaming, roaming::read>};

constexpr ParmsOf<qvsWapWifi> qvs::kWifiParms = {{.name = kRefusedBy, .entered = "Wifi"},
                                                 kNameAlone<qvsWapWifi>,
                                                 kReadBy<qvsWapWifi, wifi::read>};

constexpr ParmsOf<qvsWapVoWifi> qvs::kVoWifiParms = {{.name = kRefusedBy, .entered = "VoWifi"},
                                                     kNameAlone<qvsWapVoWifi>,
                                                     kReadBy<qvsWapVoWifi, voWifi::read>};

qvsResult qvsClientProvWbxmlDecoderParamRoaming(qvsWbxmlDecoder *decoder, qvsWapRoaming *record)
{
    return readParms(decoder, record, kRoamingParms);
}

qvsResult qvsClientProvWbxmlDecoderParamRoamingNameString(qvsWbxmlDecoder *decoder,
                                                          qvsWapRoaming **record, uint8_t tag)
{
    DecodeState alone;
    return readNamed(decoder, &alone, *record, tag, roaming::kNamed,
                     "qvsClientProvWbxmlDecoderParamRoamingNameString");
}

qvsResult qvsClientProvWbxmlDecoderParamWifi(qvsWbxmlDecoder *decoder, qvsWapWifi *record)
{
    return readParms(decoder, record, kWifiParms);
}

qvsResult qvsClientProvWbxmlDecoderParamWifiNameString(qvsWbxmlDecoder *decoder,
                                                       qvsWapWifi **record, uint8_t tag)
{
    DecodeState alone;
    return readNamed(decoder, &alone, *record, tag, wifi::kNamed,
                     "qvsClientProvWbxmlDecoderParamNameString");
}

qvsResult qvsClientProvWbxmlDecoderParamVoWifi(qvsWbxmlDecoder *decoder, qvsWapVoWifi *record)
{
    return readParms(decoder, record, kVoWifiParms);
}

qvsResult qvsClientProvWbxmlDecoderParamVoWifiNameString(qvsWbxmlDecoder *decoder,
                                                         qvsWapVoWifi **record, uint8_t tag)
{
    DecodeState alone;
    return readNamed(decoder, &alone, *record, tag, voWifi::kNamed,
                     "qvsClientProvWbxmlDecoderParamNameString");
}
