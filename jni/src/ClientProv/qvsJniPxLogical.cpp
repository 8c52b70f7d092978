// Queries of XCPCtxPxLogical: the proxies, logical and physical, with what hangs below them.
// p counts the logical proxies, h the physical proxies of one, t ports, s services, d list items.
#include "qvsJni.h"
#include "qvsstring.h"

namespace [[gnu::visibility("hidden")]] qvs {

namespace {

using Logical = qvsCtxPxLogical;
using Physical = qvsCtxPxPhysical;

Logical *logical(jint p)
{
    return nth(chainOf(ptCtx, &qvsClientProvCtx::ptPxLogical), p);
}

Physical *physical(jint p, jint h)
{
    return nth(chainOf(logical(p), &Logical::ptPxPhysical), h);
}

qvsCtxPort *port(jint p, jint t)
{
    return nth(chainOf(logical(p), &Logical::ptPort), t);
}

qvsCtxPort *port(jint p, jint h, jint t)
{
    return nth(chainOf(physical(p, h), &Physical::ptPort), t);
}

// ---- Names

// The services in the order of their value tokens, 0xCA to 0xD3, and the one for all others.
constexpr PaddedText<20> kServices[] = {
    "CL-WSP",      "CO-WSP",          "CL-SEC-WSP",     "CO-SEC-WSP",
    "CL-SEC-WTA",  "CO-SEC-WTA",      "OTA-HTTP-TO",    "OTA-HTTP-TLS-TO",
    "OTA-HTTP-PO", "OTA-HTTP-TLS-PO", "Unkown Service",
};

// kept[service-by-index]: service s, counted from 1, has the name of row s, counted from 0,
// whatever its SERVICE says.
jstring serviceName(JNIEnv *env, const qvsCtxPort *owner, jint s)
{
    if (!nth(chainOf(owner, &qvsCtxPort::ptService), s)) {
        return nullptr;
    }
    // hardened: an index behind the last row answers null.
    const size_t row = static_cast<size_t>(s);
    return row < countOf(kServices) ? text(env, kServices[row].bytes) : nullptr;
}

constexpr PaddedText<18> kIpv4 = "NET_ADDR_IPV4";
constexpr PaddedText<18> kIpv6 = "NET_ADDR_IPV6";
constexpr uint8_t kIpv6Token = 0x86;

// kept[pxaddrtype-ipv4]: every type that is not IPV6 is named NET_ADDR_IPV4.
const char *addrTypeName(const char *type)
{
    const bool ipv6 = static_cast<uint8_t>(*type) == kIpv6Token || qvsStrcmp(type, "IPV6") == 0;
    return ipv6 ? kIpv6.bytes : kIpv4.bytes;
}

// ---- Natives: logical proxies

jint qvomacp_GetPxLogicalCount(JNIEnv *, jobject)
{
    return count(chainOf(ptCtx, &qvsClientProvCtx::ptPxLogical));
}

jint qvomacp_GetPxDomainCount(JNIEnv *, jobject, jint p)
{
    return count(chainOf(logical(p), &Logical::ptDomain));
}

jstring qvomacp_GetPxDomainData(JNIEnv *env, jobject, jint p, jint d)
{
    // hardened: a missing proxy has no DOMAIN.
    return text(env, nth(chainOf(logical(p), &Logical::ptDomain), d));
}

jint qvomacp_GetPxAuthInfoCount(JNIEnv *, jobject, jint p)
{
    return count(chainOf(logical(p), &Logical::ptPxAuthInfo));
}

jobjectArray qvomacp_GetPxAuthInfoData(JNIEnv *env, jobject, jint p, jint d)
{
    return array(env, nth(chainOf(logical(p), &Logical::ptPxAuthInfo), d));
}

jint qvomacp_GetPxPortCount(JNIEnv *, jobject, jint p)
{
    return count(chainOf(logical(p), &Logical::ptPort));
}

jstring qvomacp_GetPxPortData(JNIEnv *env, jobject, jint p, jint t)
{
    return text(env, port(p, t), &qvsCtxPort::pszPortNbr);
}

jint qvomacp_GetPxPortServiceCount(JNIEnv *, jobject, jint p, jint t)
{
    return count(chainOf(port(p, t), &qvsCtxPort::ptService));
}

jstring qvomacp_GetPxPortServiceData(JNIEnv *env, jobject, jint p, jint t, jint s)
{
    return serviceName(env, port(p, t), s);
}

jobjectArray qvomacp_GetProxyData(JNIEnv *env, jobject, jint p)
{
    if (!ptCtx) {
        return nullptr;
    }
    const Logical *record = logical(p);
    // kept[proxy-blank]: unlike its siblings, a missing proxy answers an array of empty strings.
    return record ? array(env, record) : stringArray(env, nullptr, 0, lengthOf(record));
}

// ---- Natives: physical proxies

jint qvomacp_GetPxPhysicalCount(JNIEnv *, jobject, jint p)
{
    return count(chainOf(logical(p), &Logical::ptPxPhysical));
}

jobjectArray qvomacp_GetPxPhysicalData(JNIEnv *env, jobject, jint p, jint h)
{
    return array(env, physical(p, h), {&Physical::pszPxAddrType, addrTypeName});
}

jint qvomacp_GetPxPhysicalDomainCount(JNIEnv *, jobject, jint p, jint h)
{
    return count(chainOf(physical(p, h), &Physical::ptDomain));
}

jstring qvomacp_GetPxPhsicalDomainData(JNIEnv *env, jobject, jint p, jint h, jint d)
{
    return text(env, nth(chainOf(physical(p, h), &Physical::ptDomain), d));
}

jint qvomacp_GetPxPhsicalNapIdCount(JNIEnv *, jobject, jint p, jint h)
{
    return count(chainOf(physical(p, h), &Physical::ptToNapId));
}

jstring qvomacp_GetPxPhysicalNapIdData(JNIEnv *env, jobject, jint p, jint h, jint d)
{
    return text(env, nth(chainOf(physical(p, h), &Physical::ptToNapId), d));
}

jint qvomacp_GetPxPhysicalPortCount(JNIEnv *, jobject, jint p, jint h)
{
    return count(chainOf(physical(p, h), &Physical::ptPort));
}

jstring qvomacp_GetPxPhysicalPortData(JNIEnv *env, jobject, jint p, jint h, jint t)
{
    return text(env, port(p, h, t), &qvsCtxPort::pszPortNbr);
}

jint qvomacp_GetPxPhysicalPortServiceCount(JNIEnv *, jobject, jint p, jint h, jint t)
{
    return count(chainOf(port(p, h, t), &qvsCtxPort::ptService));
}

jstring qvomacp_GetPxPhysicalPortServiceData(JNIEnv *env, jobject, jint p, jint h, jint t, jint s)
{
    return serviceName(env, port(p, h, t), s);
}

} // namespace

const JNINativeMethod kPxLogicalNatives[] = {
    NATIVE(qvomacp_GetPxLogicalCount, "()I"),
    NATIVE(qvomacp_GetPxDomainCount, "(I)I"),
    NATIVE(qvomacp_GetPxDomainData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxAuthInfoCount, "(I)I"),
    NATIVE(qvomacp_GetPxAuthInfoData, "(II)[Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxPortCount, "(I)I"),
    NATIVE(qvomacp_GetPxPortData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxPortServiceCount, "(II)I"),
    NATIVE(qvomacp_GetPxPortServiceData, "(III)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxPhysicalCount, "(I)I"),
    NATIVE(qvomacp_GetPxPhysicalData, "(II)[Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxPhysicalDomainCount, "(II)I"),
    NATIVE(qvomacp_GetPxPhsicalDomainData, "(III)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxPhsicalNapIdCount, "(II)I"),
    NATIVE(qvomacp_GetPxPhysicalNapIdData, "(III)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxPhysicalPortCount, "(II)I"),
    NATIVE(qvomacp_GetPxPhysicalPortData, "(III)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxPhysicalPortServiceCount, "(III)I"),
    NATIVE(qvomacp_GetPxPhysicalPortServiceData, "(IIII)Ljava/lang/String;"),
    NATIVE(qvomacp_GetProxyData, "(I)[Ljava/lang/String;"),
};

} // namespace qvs
