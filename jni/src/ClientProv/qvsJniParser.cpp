// The parse session: what XCPCtxParser parses and deletes, and its queries of the push header.
#include "qvsJniParser.h"

#include "qvsClientProvWbxmlDecoder.h"
#include "qvsJni.h"

qvsClientProvCtx *ptCtx = nullptr;

namespace [[gnu::visibility("hidden")]] qvs {

smlpushHdlrInfo *ptPushHdlrInfo = nullptr;

namespace {

using Header = smlpushHdlrInfo;

constexpr jint kHeaderOnly = 1; // the mode; every other one is a full parse

void deleteHeader()
{
    releasePushHeader(ptPushHdlrInfo);
    ptPushHdlrInfo = nullptr;
}

// kept[parse-overwrites]: what an earlier parse left is neither released nor handed out again.
bool parseHeader(JNIEnv *env, jbyteArray message, uint32_t length)
{
    ptPushHdlrInfo = nullptr;
    // hardened: no array, or fewer bytes in it than the length says, is a message refused.
    if (!message || length > static_cast<uint32_t>(env->GetArrayLength(message))) {
        return false;
    }
    // hardened: and so is one whose bytes cannot be had.
    jbyte *bytes = env->GetByteArrayElements(message, nullptr);
    if (!bytes) {
        return false;
    }
    ptPushHdlrInfo = smlpushHdlrParsingWSPHeader(reinterpret_cast<const uint8_t *>(bytes), length);
    env->ReleaseByteArrayElements(message, bytes, JNI_ABORT);
    return ptPushHdlrInfo != nullptr;
}

// A number of the header; -1 without a header.
jint number(uint32_t Header::*field)
{
    return ptPushHdlrInfo ? static_cast<jint>(ptPushHdlrInfo->*field) : -1;
}

// A new byte array; null with an exception pending.
jbyteArray byteArray(JNIEnv *env, const void *bytes, uint32_t length)
{
    // hardened: null for more bytes than a Java array holds.
    if (length > INT32_MAX) {
        return nullptr;
    }
    const jsize size = static_cast<jsize>(length);
    jbyteArray result = env->NewByteArray(size);
    if (!result) {
        return nullptr;
    }
    env->SetByteArrayRegion(result, 0, size, static_cast<const jbyte *>(bytes));
    if (env->ExceptionCheck()) {
        env->DeleteLocalRef(result);
        return nullptr;
    }
    return result;
}

// ---- Natives

jboolean qvomacp_parser(JNIEnv *env, jobject, jbyteArray message, jlong length, jint mode)
{
    // kept[parse-keeps-context]: a message refused by its header, or parsed for its header alone,
    // leaves the context of an earlier parse in place.
    if (!parseHeader(env, message, static_cast<uint32_t>(length))) {
        return JNI_FALSE;
    }
    if (mode == kHeaderOnly) {
        return JNI_TRUE;
    }
    ptCtx = qvsClinetProvWbxmlDecoderMain(ptPushHdlrInfo->pBody, ptPushHdlrInfo->nBodyLen);
    if (!ptCtx) {
        deleteHeader();
        return JNI_FALSE;
    }
    return JNI_TRUE;
}

void qvomacp_parser_del(JNIEnv *, jobject)
{
    if (ptCtx) {
        qvsClientProvCtxDelectContext(ptCtx);
        ptCtx = nullptr;
    }
    deleteHeader();
}

jint qvomacp_GetParserContentType(JNIEnv *, jobject)
{
    return number(&Header::nContentType);
}

jint qvomacp_GetParserHeaderLen(JNIEnv *, jobject)
{
    return number(&Header::nHeaderLen);
}

jint qvomacp_GetParserBodyLen(JNIEnv *, jobject)
{
    return number(&Header::nBodyLen);
}

jint qvomacp_GetParserMACLen(JNIEnv *, jobject)
{
    return number(&Header::nMacLen);
}

jint qvomacp_GetParserSEC(JNIEnv *, jobject)
{
    return number(&Header::nSec);
}

jbyteArray qvomacp_GetParserMAC(JNIEnv *env, jobject)
{
    const Header *header = ptPushHdlrInfo;
    // hardened: null without a header, here and for the body.
    return header ? byteArray(env, header->szMac, header->nMacLen) : nullptr;
}

jbyteArray qvomacp_GetParserBody(JNIEnv *env, jobject)
{
    const Header *header = ptPushHdlrInfo;
    return header ? byteArray(env, header->pBody, header->nBodyLen) : nullptr;
}

} // namespace

const JNINativeMethod kParserNatives[] = {
    NATIVE(qvomacp_parser, "([BJI)Z"),           NATIVE(qvomacp_parser_del, "()V"),
    NATIVE(qvomacp_GetParserContentType, "()I"), NATIVE(qvomacp_GetParserHeaderLen, "()I"),
    NATIVE(qvomacp_GetParserBodyLen, "()I"),     NATIVE(qvomacp_GetParserMACLen, "()I"),
    NATIVE(qvomacp_GetParserSEC, "()I"),         NATIVE(qvomacp_GetParserMAC, "()[B"),
    NATIVE(qvomacp_GetParserBody, "()[B"),
};

} // namespace qvs
