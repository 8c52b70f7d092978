// Queries of XCPCtxApplication: the applications with their addresses, ports and credentials.
// a counts the applications, r the records of one kind below one, t ports, s services, d list
// items.
#include "qvsJni.h"
#include "qvsstring.h"

namespace [[gnu::visibility("hidden")]] qvs {

namespace {

using Application = qvsCtxApplication;

Application *application(jint a)
{
    return nth(chainOf(ptCtx, &qvsClientProvCtx::ptApplication), a);
}

qvsCtxAppAddr *appAddr(jint a, jint r)
{
    return nth(chainOf(application(a), &Application::ptAppAddr), r);
}

qvsCtxPort *port(jint a, jint r, jint t)
{
    return nth(chainOf(appAddr(a, r), &qvsCtxAppAddr::ptPort), t);
}

// ---- Names

constexpr PaddedText<11> kAppSrv = "APPSRV";
constexpr PaddedText<11> kClient = "CLIENT";
constexpr uint8_t kAppSrvToken = 0x8D;

// kept[aauthlevel-name]: APPSRV is known by its token or its exact text, CLIENT by its text in any
// case and never by its token; everything else has no name.
const char *authLevelName(const char *level)
{
    if (static_cast<uint8_t>(*level) == kAppSrvToken || qvsStrcmp(level, kAppSrv.bytes) == 0) {
        return kAppSrv.bytes;
    }
    return qvsStricmp(level, kClient.bytes) == 0 ? kClient.bytes : nullptr;
}

// ---- Natives

jint qvomacp_GetPxApplicationCount(JNIEnv *, jobject)
{
    return count(chainOf(ptCtx, &qvsClientProvCtx::ptApplication));
}

jint qvomacp_GetPxToProxyCount(JNIEnv *, jobject, jint a)
{
    return count(chainOf(application(a), &Application::ptToProxy));
}

jstring qvomacp_GetPxToProxyData(JNIEnv *env, jobject, jint a, jint d)
{
    return text(env, nth(chainOf(application(a), &Application::ptToProxy), d));
}

jint qvomacp_GetPxNapIdCount(JNIEnv *, jobject, jint a)
{
    return count(chainOf(application(a), &Application::ptToNapId));
}

jstring qvomacp_GetPxNapIdData(JNIEnv *env, jobject, jint a, jint d)
{
    return text(env, nth(chainOf(application(a), &Application::ptToNapId), d));
}

jint qvomacp_GetPxToAddrCount(JNIEnv *, jobject, jint a)
{
    return count(chainOf(application(a), &Application::ptToAddr));
}

jstring qvomacp_GetPxToAddrData(JNIEnv *env, jobject, jint a, jint d)
{
    return text(env, nth(chainOf(application(a), &Application::ptToAddr), d));
}

jint qvomacp_GetPxAppAddrCount(JNIEnv *, jobject, jint a)
{
    return count(chainOf(application(a), &Application::ptAppAddr));
}

jobjectArray qvomacp_GetPxAppAddrData(JNIEnv *env, jobject, jint a, jint r)
{
    return array(env, appAddr(a, r));
}

jint qvomacp_GetPxAppPortCount(JNIEnv *, jobject, jint a, jint r)
{
    return count(chainOf(appAddr(a, r), &qvsCtxAppAddr::ptPort));
}

jstring qvomacp_GetPxAppPortData(JNIEnv *env, jobject, jint a, jint r, jint t)
{
    return text(env, port(a, r, t), &qvsCtxPort::pszPortNbr);
}

jint qvomacp_GetPxServiceCount(JNIEnv *, jobject, jint a, jint r, jint t)
{
    return count(chainOf(port(a, r, t), &qvsCtxPort::ptService));
}

jstring qvomacp_GetPxServiceData(JNIEnv *env, jobject, jint a, jint r, jint t, jint s)
{
    return text(env, nth(chainOf(port(a, r, t), &qvsCtxPort::ptService), s));
}

jint qvomacp_GetPxAppAuthCount(JNIEnv *, jobject, jint a)
{
    return count(chainOf(application(a), &Application::ptAppAuth));
}

jobjectArray qvomacp_GetPxAppAuthData(JNIEnv *env, jobject, jint a, jint r)
{
    return array(env, nth(chainOf(application(a), &Application::ptAppAuth), r),
                 {&qvsCtxAppAuth::pszAAuthLevel, authLevelName});
}

jint qvomacp_GetPxResourceCount(JNIEnv *, jobject, jint a)
{
    return count(chainOf(application(a), &Application::ptResource));
}

jobjectArray qvomacp_GetPxResourceData(JNIEnv *env, jobject, jint a, jint r)
{
    return array(env, nth(chainOf(application(a), &Application::ptResource), r));
}

jobjectArray qvomacp_GetApplicationData(JNIEnv *env, jobject, jint a)
{
    return array(env, application(a));
}

jobjectArray qvomacp_GetPxRoamingData(JNIEnv *env, jobject)
{
    // kept[roaming-first]: only the first ROAMING of the first application can be asked for.
    return array(env, chainOf(application(1), &Application::ptRoaming));
}

} // namespace

const JNINativeMethod kApplicationNatives[] = {
    NATIVE(qvomacp_GetPxApplicationCount, "()I"),
    NATIVE(qvomacp_GetPxToProxyCount, "(I)I"),
    NATIVE(qvomacp_GetPxToProxyData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxNapIdCount, "(I)I"),
    NATIVE(qvomacp_GetPxNapIdData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxToAddrCount, "(I)I"),
    NATIVE(qvomacp_GetPxToAddrData, "(II)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxAppAddrCount, "(I)I"),
    NATIVE(qvomacp_GetPxAppAddrData, "(II)[Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxAppPortCount, "(II)I"),
    NATIVE(qvomacp_GetPxAppPortData, "(III)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxServiceCount, "(III)I"),
    NATIVE(qvomacp_GetPxServiceData, "(IIII)Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxAppAuthCount, "(I)I"),
    NATIVE(qvomacp_GetPxAppAuthData, "(II)[Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxResourceCount, "(I)I"),
    NATIVE(qvomacp_GetPxResourceData, "(II)[Ljava/lang/String;"),
    NATIVE(qvomacp_GetApplicationData, "(I)[Ljava/lang/String;"),
    NATIVE(qvomacp_GetPxRoamingData, "()[Ljava/lang/String;"),
};

} // namespace qvs
