// Queries of XCPCtxNapDef: the network access points, and the choice of the first of them.
// n counts the access points, a the NAPAUTHINFO or VALIDITY of one, d list items.
#include "qvsJni.h"
#include "qvsstring.h"

#include <string.h>

namespace [[gnu::visibility("hidden")]] qvs {

namespace {

using NapDef = qvsCtxNapDef;

NapDef *napDef(jint n)
{
    return nth(chainOf(ptCtx, &qvsClientProvCtx::ptNapDef), n);
}

qvsCtxNapAuthInfo *napAuthInfo(jint n, jint a)
{
    return nth(chainOf(napDef(n), &NapDef::ptNapAuthInfo), a);
}

// ---- Names

// The names of the bearers, by value token; the last one stands for every other.
constexpr uint8_t kFirstBearer = 0xA2;
constexpr PaddedText<26> kBearers[] = {
    "GSM-USSD",
    "GSM-SMS",
    "ANSI-136-GUTS",
    "IS-95-CDMA-SMS",
    "IS-95-CDMA-CSD",
    "IS-95-CDMA-PACKET",
    "ANSI-136-CSD",
    "ANSI-136-GPRS",
    "GSM-CSD",
    "GSM-GPRS",
    "AMPS-CDPD",
    "PDC-CSD",
    "PDC-PACKET",
    "IDEN-SMS",
    "IDEN-CSD",
    "IDEN-PACKET",
    "FLEX/REFLEX",
    "PHS-SMS",
    "PHS-CSD",
    "TETRA-SDS",
    "TETRA-PACKET",
    "ANSI-136-GHOST",
    "MOBITEX-MPAK",
    "CDMA2000-1X-SIMPLE-IP",
    "CDMA2000-1X-MOBILE-IP",
    "3G-GSM",
    "WLAN",
    "Unkown Bearer",
};
constexpr size_t kUnknownBearer = countOf(kBearers) - 1;

const char *bearerName(uint8_t token)
{
    // A token below the first wraps round to a row far behind the last.
    const size_t row = static_cast<size_t>(token) - kFirstBearer;
    return kBearers[row < kUnknownBearer ? row : kUnknownBearer].bytes;
}

// The address type codes, by value token: IPV4, IPV6, E164, ALPHA, APN, SCODE, TETRA-ITSI, MAN.
constexpr uint8_t kFirstAddrType = 0x85;
constexpr PaddedText<9> kAddrTypeCodes[] = {
    "0x85", "0x86", "0x87", "0x88", "0x89", "0x8a", "0x8b", "0x8c",
};

// Null for a type that is no token.
const char *addrTypeCode(const char *type)
{
    const size_t row = static_cast<size_t>(static_cast<uint8_t>(*type)) - kFirstAddrType;
    return row < countOf(kAddrTypeCodes) ? kAddrTypeCodes[row].bytes : nullptr;
}

constexpr struct {
    uint8_t token;
    PaddedText<16> name;
} kAuthTypes[] = {
    {0x9A, "PAP"},         {0x9B, "CHAP"},    {0x9C, "HTTP-BASIC"},
    {0x9D, "HTTP-DIGEST"}, {0x9E, "WTLS-SS"}, {0x9F, "MD5"},
};
constexpr PaddedText<9> kNoAuthType = "NONE";

const char *authTypeName(const char *type)
{
    for (const auto &known : kAuthTypes) {
        if (static_cast<uint8_t>(*type) == known.token || qvsStrcmp(type, known.name.bytes) == 0) {
            return known.name.bytes;
        }
    }
    return kNoAuthType.bytes;
}

// ---- Natives

jint qvomacp_GetPxNapDefCount(JNIEnv *, jobject)
{
    return count(chainOf(ptCtx, &qvsClientProvCtx::ptNapDef));
}

void qvomacp_SetPxNapDefIndex(JNIEnv *, jobject, jint n)
{
    if (ptCtx) {
        // kept[napdef-start]: access points count from the n-th one on, the ones before it are out
        // of reach, of the release too; with an n that is not there all are.
        ptCtx->ptNapDef = napDef(n);
    }
}

jint qvomacp_GetPxDnsAddrCount(JNIEnv *, jobject, jint n)
{
    return count(chainOf(napDef(n), &NapDef::ptDnsAddr));
}

jstring qvomacp_GetPxDnsAddrData(JNIEnv *env, jobject, jint n, jint d)
{
    return text(env, nth(chainOf(napDef(n), &NapDef::ptDnsAddr), d));
}

jint qvomacp_GetPxBearerCount(JNIEnv *, jobject, jint n)
{
    // kept[bearer-count-clamps]: an index below 1 counts the bearers of the first access point.
    return count(chainOf(napDef(n < 1 ? 1 : n), &NapDef::ptBearer));
}

jstring qvomacp_GetPxBearerData(JNIEnv *env, jobject, jint n, jint d)
{
    const NapDef *record = napDef(n);
    const qvsCtxStrNode *bearer = nth(chainOf(record, &NapDef::ptBearer), d);
    if (!bearer || !bearer->pszValue) {
        return nullptr;
    }
    const uint8_t token = static_cast<uint8_t>(*bearer->pszValue);
    // kept[bearer-text]: a bearer given as text answers the NAP-ADDRESS of its access point.
    return text(env, qvsStrIsAscii(token) ? record->pszNapAddress : bearerName(token));
}

jint qvomacp_GetPxNapAuthInfoCount(JNIEnv *, jobject, jint n)
{
    return count(chainOf(napDef(n), &NapDef::ptNapAuthInfo));
}

jobjectArray qvomacp_GetPxNapAuthInfoData(JNIEnv *env, jobject, jint n, jint a)
{
    return array(env, napAuthInfo(n, a), {&qvsCtxNapAuthInfo::pszAuthType, authTypeName});
}

jint qvomacp_GetPxNapAuthEntityCount(JNIEnv *, jobject, jint n, jint a)
{
    return count(chainOf(napAuthInfo(n, a), &qvsCtxNapAuthInfo::ptAuthEntity));
}

jstring qvomacp_GetPxAuthInfopAuthEntityData(JNIEnv *env, jobject, jint n, jint a, jint d)
{
    return text(env, nth(chainOf(napAuthInfo(n, a), &qvsCtxNapAuthInfo::ptAuthEntity), d));
}

jint qvomacp_GetPxNapValidityCount(JNIEnv *, jobject, jint n)
{
    return count(chainOf(napDef(n), &NapDef::ptValidity));
}

jobjectArray qvomacp_GetPxValidityData(JNIEnv *env, jobject, jint n, jint a)
{
    return array(env, nth(chainOf(napDef(n), &NapDef::ptValidity), a));
}

jobjectArray qvomacp_GetPxNapDefData(JNIEnv *env, jobject, jint n)
{
    const NapDef *record = napDef(n);
    if (!record) {
        return nullptr;
    }
    Shown shown = show(record, {&NapDef::pszNapAddrType, addrTypeCode});
    constexpr uint8_t kTypeElement = numberOf(&NapDef::pszNapAddrType);
    const jsize length = shown.length;
    const char **typeElement = shown.texts + kTypeElement;
    if (record->pszNapAddrType && !*typeElement) {
        // kept[napdef-shift]: an address type that is no token takes no element; those behind it
        // move down by one, and the last one of the array stays an empty string.
        --shown.length;
        memmove(typeElement, typeElement + 1,
                (static_cast<size_t>(shown.length) - kTypeElement) * sizeof *typeElement);
    }
    return stringArray(env, shown.texts, shown.length, length);
}

} // namespace

const JNINativeMethod kNapDefNatives[] = {
    NATIVE(qvomacp_GetPxNapDefCount, "()I"),
    NATIVE(qvomacp_GetPxDnsAddrCount, "(I)I"),
    NATIVE(qvomacp_GetPxDnsAddrData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_SetPxNapDefIndex, "(I)V"),
    NATIVE(qvomacp_GetPxBearerCount, "(I)I"),
    NATIVE(qvomacp_GetPxBearerData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxNapAuthInfoCount, "(I)I"),
    NATIVE(qvomacp_GetPxNapAuthInfoData, "(II)[Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxNapAuthEntityCount, "(II)I"),
    NATIVE(qvomacp_GetPxAuthInfopAuthEntityData, "(III)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxNapValidityCount, "(I)I"),
    NATIVE(qvomacp_GetPxValidityData, "(II)[Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxNapDefData, "(I)[Ljava/lang/String;"),
};

} // namespace qvs
