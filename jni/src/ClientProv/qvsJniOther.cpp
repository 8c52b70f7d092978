// Queries of the classes with few natives: XCPCtxBootstrap, XCPCtxClientIdentity,
// XCPCtxVendorConfig, XCPCtxAccess, XCPCtxWifi and XCPCtxVoWifi. n counts the records, d list
// items.
#include "qvsJni.h"

namespace [[gnu::visibility("hidden")]] qvs {

namespace {

using Context = qvsClientProvCtx;
using Access = qvsCtxAccess;

qvsCtxBootstrap *bootstrap(jint n)
{
    return nth(chainOf(ptCtx, &Context::ptBootstrap), n);
}

Access *access(jint n)
{
    return nth(chainOf(ptCtx, &Context::ptAccess), n);
}

// ---- Natives: bootstrap, client identity, vendor configuration

jint qvomacp_GetPxBootstrapCount(JNIEnv *, jobject)
{
    return count(chainOf(ptCtx, &Context::ptBootstrap));
}

jint qvomacp_GetPxProxyIdCount(JNIEnv *, jobject, jint n)
{
    return count(chainOf(bootstrap(n), &qvsCtxBootstrap::ptProxyId));
}

jstring qvomacp_GetPxProxyIdData(JNIEnv *env, jobject, jint n, jint d)
{
    return text(env, nth(chainOf(bootstrap(n), &qvsCtxBootstrap::ptProxyId), d));
}

jint qvomacp_GetPxNetworkCount(JNIEnv *, jobject, jint n)
{
    return count(chainOf(bootstrap(n), &qvsCtxBootstrap::ptNetwork));
}

jstring qvomacp_GetPxNetworkData(JNIEnv *env, jobject, jint n, jint d)
{
    return text(env, nth(chainOf(bootstrap(n), &qvsCtxBootstrap::ptNetwork), d));
}

jobjectArray qvomacp_GetBootstrapData(JNIEnv *env, jobject, jint n)
{
    return array(env, bootstrap(n));
}

jstring qvomacp_GetPxClientIdentityData(JNIEnv *env, jobject)
{
    return text(env, chainOf(ptCtx, &Context::ptClientIdent), &qvsCtxClientIdent::pszClientId);
}

jint qvomacp_GetPxVenderConfigCount(JNIEnv *, jobject)
{
    return count(chainOf(ptCtx, &Context::ptVendorConfig));
}

jobjectArray qvomacp_GetPxVenderConfigData(JNIEnv *env, jobject, jint n)
{
    return array(env, nth(chainOf(ptCtx, &Context::ptVendorConfig), n));
}

// ---- Natives: access rules

jint qvomacp_GetPxCtxAccessCount(JNIEnv *, jobject)
{
    return count(chainOf(ptCtx, &Context::ptAccess));
}

jint qvomacp_GetPxRuleCount(JNIEnv *, jobject, jint n)
{
    return count(chainOf(access(n), &Access::ptRule));
}

jstring qvomacp_GetPxRuleData(JNIEnv *env, jobject, jint n, jint d)
{
    return text(env, nth(chainOf(access(n), &Access::ptRule), d));
}

jint qvomacp_GetPxAppIdCount(JNIEnv *, jobject, jint n)
{
    return count(chainOf(access(n), &Access::ptAppId));
}

jstring qvomacp_GetPxAppIdData(JNIEnv *env, jobject, jint n, jint d)
{
    // hardened: an index that the list does not have answers null here too.
    return text(env, nth(chainOf(access(n), &Access::ptAppId), d));
}

jint qvomacp_GetPxPortNbrCount(JNIEnv *, jobject, jint n)
{
    return count(chainOf(access(n), &Access::ptPortNbr));
}

jstring qvomacp_GetPxPortNbrData(JNIEnv *env, jobject, jint n, jint d)
{
    return text(env, nth(chainOf(access(n), &Access::ptPortNbr), d));
}

jint qvomacp_GetPxAccessDomainCount(JNIEnv *, jobject, jint n)
{
    return count(chainOf(access(n), &Access::ptDomain));
}

jstring qvomacp_GetPxAccessDomainData(JNIEnv *env, jobject, jint n, jint d)
{
    return text(env, nth(chainOf(access(n), &Access::ptDomain), d));
}

jint qvomacp_GetPxAccessToNapIdCount(JNIEnv *, jobject, jint n)
{
    return count(chainOf(access(n), &Access::ptToNapId));
}

jstring qvomacp_GetPxAccessToNapIdData(JNIEnv *env, jobject, jint n, jint d)
{
    return text(env, nth(chainOf(access(n), &Access::ptToNapId), d));
}

jint qvomacp_GetPxAccessToProxyCount(JNIEnv *, jobject, jint n)
{
    return count(chainOf(access(n), &Access::ptToProxy));
}

jstring qvomacp_GetPxAccessToProxyData(JNIEnv *env, jobject, jint n, jint d)
{
    return text(env, nth(chainOf(access(n), &Access::ptToProxy), d));
}

// ---- Natives: Wi-Fi

jint qvomacp_GetPxWifiCount(JNIEnv *, jobject)
{
    return count(chainOf(ptCtx, &Context::ptWifi));
}

jobjectArray qvomacp_GetPxWifiData(JNIEnv *env, jobject, jint n)
{
    return array(env, nth(chainOf(ptCtx, &Context::ptWifi), n));
}

jint qvomacp_GetPxVoWifiCount(JNIEnv *, jobject)
{
    return count(chainOf(ptCtx, &Context::ptVoWifi));
}

jobjectArray qvomacp_GetPxVoWifiData(JNIEnv *env, jobject, jint n)
{
    return array(env, nth(chainOf(ptCtx, &Context::ptVoWifi), n));
}

} // namespace

const JNINativeMethod kBootstrapNatives[] = {
    NATIVE(qvomacp_GetPxBootstrapCount, "()I"),
    NATIVE(qvomacp_GetPxProxyIdCount, "(I)I"),
    NATIVE(qvomacp_GetPxProxyIdData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxNetworkCount, "(I)I"),
    NATIVE(qvomacp_GetPxNetworkData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetBootstrapData, "(I)[Ljava/lang/String;"),
};

const JNINativeMethod kClientIdentityNatives[] = {
    NATIVE(qvomacp_GetPxClientIdentityData, "()Ljava/lang/String;"),
};

const JNINativeMethod kVendorConfigNatives[] = {
    NATIVE(qvomacp_GetPxVenderConfigCount, "()I"),
    NATIVE(qvomacp_GetPxVenderConfigData, "(I)[Ljava/lang/String;"),
};

const JNINativeMethod kAccessNatives[] = {
    NATIVE(qvomacp_GetPxCtxAccessCount, "()I"),
    NATIVE(qvomacp_GetPxRuleCount, "(I)I"),
    NATIVE(qvomacp_GetPxRuleData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxAppIdCount, "(I)I"),
    NATIVE(qvomacp_GetPxAppIdData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxPortNbrCount, "(I)I"),
    NATIVE(qvomacp_GetPxPortNbrData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxAccessDomainCount, "(I)I"),
    NATIVE(qvomacp_GetPxAccessDomainData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxAccessToNapIdCount, "(I)I"),
    NATIVE(qvomacp_GetPxAccessToNapIdData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxAccessToProxyCount, "(I)I"),
    NATIVE(qvomacp_GetPxAccessToProxyData, "(II)Ljava/lang/String;"),
};

const JNINativeMethod kWifiNatives[] = {
    NATIVE(qvomacp_GetPxWifiCount, "()I"),
    NATIVE(qvomacp_GetPxWifiData, "(I)[Ljava/lang/String;"),
};

const JNINativeMethod kVoWifiNatives[] = {
    NATIVE(qvomacp_GetPxVoWifiCount, "()I"),
    NATIVE(qvomacp_GetPxVoWifiData, "(I)[Ljava/lang/String;"),
};

} // namespace qvs
