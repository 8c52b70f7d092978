// Natives that make the calls of the virtual machine that an answer takes, and nothing else. They
// hold what they answer, so that nothing is looked up.
#include <jni.h>

#include <stdlib.h>
#include <string.h>

namespace {

constexpr jsize kMost = 32;

jint heldNumber;
char *heldText;
char *heldArray[kMost];
jsize heldLength;

char *copied(JNIEnv *env, jstring text)
{
    if (!text) {
        return nullptr;
    }
    const char *bytes = env->GetStringUTFChars(text, nullptr);
    char *copy = strdup(bytes);
    env->ReleaseStringUTFChars(text, bytes);
    return copy;
}

} // namespace

extern "C" {

JNIEXPORT void JNICALL Java_Bare_keep(JNIEnv *env, jobject, jint number, jstring text,
                                      jobjectArray array)
{
    heldNumber = number;
    heldText = copied(env, text);
    heldLength = env->GetArrayLength(array);
    if (heldLength > kMost) {
        abort();
    }
    for (jsize i = 0; i < heldLength; ++i) {
        heldArray[i] = copied(env, static_cast<jstring>(env->GetObjectArrayElement(array, i)));
    }
}

JNIEXPORT jint JNICALL Java_Bare_number(JNIEnv *, jobject)
{
    return heldNumber;
}

JNIEXPORT jstring JNICALL Java_Bare_text(JNIEnv *env, jobject, jint)
{
    return env->NewStringUTF(heldText);
}

JNIEXPORT jobjectArray JNICALL Java_Bare_array(JNIEnv *env, jobject, jint)
{
    jclass type = env->FindClass("java/lang/String");
    jstring empty = env->NewStringUTF("");
    jobjectArray array = env->NewObjectArray(heldLength, type, empty);
    env->DeleteLocalRef(empty);
    env->DeleteLocalRef(type);
    for (jsize i = 0; i < heldLength; ++i) {
        jstring text = heldArray[i] ? env->NewStringUTF(heldArray[i]) : nullptr;
        env->SetObjectArrayElement(array, i, text);
        if (env->ExceptionCheck()) {
            return nullptr;
        }
        if (text) {
            env->DeleteLocalRef(text);
        }
    }
    return array;
}
}
