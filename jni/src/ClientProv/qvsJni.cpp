// String arrays, made so that few local references live at a time and none is left behind.
#include "qvsJni.h"

namespace [[gnu::visibility("hidden")]] qvs {

namespace {

constexpr PaddedText<5> kBlank = "";

// An array of empty strings; null with an exception pending.
jobjectArray blankArray(JNIEnv *env, jsize length)
{
    jclass stringClass = env->FindClass("java/lang/String");
    if (!stringClass) {
        return nullptr;
    }
    jstring blank = env->NewStringUTF(kBlank.bytes);
    jobjectArray result = blank ? env->NewObjectArray(length, stringClass, blank) : nullptr;
    if (blank) {
        env->DeleteLocalRef(blank);
    }
    env->DeleteLocalRef(stringClass);
    return result;
}

// False with an exception pending.
bool setElement(JNIEnv *env, jobjectArray array, jsize index, const char *value)
{
    jstring element = text(env, value);
    if (value && !element) {
        return false;
    }
    env->SetObjectArrayElement(array, index, element);
    const bool set = !env->ExceptionCheck();
    if (element) {
        env->DeleteLocalRef(element);
    }
    return set;
}

} // namespace

jobjectArray stringArray(JNIEnv *env, const char *const *texts, jsize shown, jsize length)
{
    jobjectArray result = blankArray(env, length);
    for (jsize i = 0; result && i < shown; ++i) {
        if (!setElement(env, result, i, texts[i])) {
            env->DeleteLocalRef(result);
            result = nullptr;
        }
    }
    return result;
}

Shown::Shown(const void *record, uint8_t shown, Naming naming)
    : length(static_cast<jsize>(shown) + 1)
{
    for (uint8_t field = 0; field < shown; ++field) {
        const char *value = static_cast<const char *>(pointerAt(record, field));
        texts[field] = value && field == naming.field ? naming.nameOf(value) : value;
    }
    texts[shown] = nullptr;
}

jobjectArray array(JNIEnv *env, const void *record, uint8_t texts, Naming naming)
{
    if (!record) {
        return nullptr;
    }
    const Shown shown(record, texts, naming);
    return stringArray(env, shown.texts, shown.length, shown.length);
}

} // namespace qvs
