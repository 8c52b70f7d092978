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

// The field of `record` that a name selects; null for a name that is not listed.
inline char **findNamed(void *record, const Rows<NamedRow> &names, const char *name,
                        uint32_t length)
{
    for (size_t at = homeOf(name, length);; ++at) {
        const NamedRow &known = names.first[at & (names.count - 1U)];
        if (known.length == length && memcmp(known.name, name, length) == 0) {
            return textAt(record, known.field);
        }
        if (known.length == 0) {
            return nullptr;
        }
    }
}

// Takes the NAME attribute `tag` and a name of one string in front of a VALUE. False, with nothing
// read, for any other.
[[gnu::always_inline]] inline bool takeName(qvsWbxmlDecoder *decoder, DecodeState *state,
                                            uint8_t tag, Piece *name)
{
    const uint32_t left = bytesLeft(decoder);
    if (left < 2 || *decoder->ptBuffer->pHead != tag) {
        return false;
    }
    uint8_t *at = decoder->ptBuffer->pHead + 2;
    if (!onlyString(decoder, at[-1], &at, at + (left - 2), name) || *at != attr::kValue ||
        name->length == 0 || name->length > state->textLeft) {
        return false;
    }
    state->textLeft -= name->length;
    decoder->ptBuffer->pHead = at;
    return true;
}

// Reads the VALUE that comes next into a field.
inline qvsResult readField(qvsWbxmlDecoder *decoder, DecodeState *state, char **field)
{
    ++decoder->ptBuffer->pHead;
    return readValue(decoder, state, field);
}

// Reads the VALUE of a name that is not listed and drops it, or leaves it.
[[gnu::noinline]] qvsResult leaveUnknown(qvsWbxmlDecoder *decoder, DecodeState *state,
                                         const NamedParms &parms)
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

// readNamed() for a name in any encoding, and traced.
[[gnu::noinline]] qvsResult readAnyNamed(qvsWbxmlDecoder *decoder, DecodeState *state, void *record,
                                         uint8_t tag, const NamedParms &parms)
{
    ParmName name;
    qvsResult result = readParmName(decoder, state, tag, parms.label, false, &name);
    if (result == QVS_OK && name.next == attr::kValue) {
        const Text &text = name.text;
        char **field = findNamed(record, parms.names, text.str(), text.length);
        result = field ? readField(decoder, state, field) : leaveUnknown(decoder, state, parms);
    }
    if (result == QVS_OK && !parms.dropsUnknown) {
        trace("[%s] nID [0x%x]", parms.label, name.next);
    }
    return result;
}

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

qvsResult qvs::readNamed(qvsWbxmlDecoder *decoder, DecodeState *state, void *record, uint8_t tag,
                         const NamedParms &parms)
{
    Piece name;
    if (traceSink || !takeName(decoder, state, tag, &name)) {
        return readAnyNamed(decoder, state, record, tag, parms);
    }
    char **field = findNamed(record, parms.names, name.bytes, name.length);
    return field ? readField(decoder, state, field) : leaveUnknown(decoder, state, parms);
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
