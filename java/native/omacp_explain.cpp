// What com.qvomacp.eng.omacp asks of the decoder when a message is refused: the result code, and how
// much of the body had been read by then. A library of its own, so that libomacp.so shows no more to
// Java than its ten classes.
#include "qvsClientProvWbxmlDecoder.h"

#include <jni.h>

namespace {

constexpr jsize kAnswers = 2; // result code, bytes read

// Decodes `length` bytes into a document that is released at once.
void decode(const uint8_t *body, uint32_t length, jint *answers)
{
    qvsWbxmlDecoder *decoder = nullptr;
    qvsResult result = qvsClientProvWbxmlInitDecoder(&decoder, body, length);
    if (result == QVS_OK) {
        qvsWapDoc *document = nullptr;
        result = qvsClientProvWbxmlDecoder(decoder, &document);
        (void)qvsClientProvWbxmlDeleteWapDoc(document);
    }
    answers[0] = static_cast<jint>(result);
    answers[1] = static_cast<jint>(qvsClientProvWbxmlDecoderDecodingSize(decoder));
    (void)qvsClientProvWbxmlDeleteDecoder(decoder);
}

} // namespace

// Answers {result code, bytes read} for a body; null with an exception pending.
extern "C" QVS_API jintArray Java_com_qvomacp_eng_omacp_NativeDecoder_decode(JNIEnv *env, jclass,
                                                                       jbyteArray body);

jintArray Java_com_qvomacp_eng_omacp_NativeDecoder_decode(JNIEnv *env, jclass, jbyteArray body)
{
    jbyte *bytes = env->GetByteArrayElements(body, nullptr);
    if (!bytes) {
        return nullptr;
    }
    jint answers[kAnswers] = {};
    decode(reinterpret_cast<const uint8_t *>(bytes),
           static_cast<uint32_t>(env->GetArrayLength(body)), answers);
    env->ReleaseByteArrayElements(body, bytes, JNI_ABORT);
    jintArray result = env->NewIntArray(kAnswers);
    if (result) {
        env->SetIntArrayRegion(result, 0, kAnswers, answers);
    }
    return result;
}
