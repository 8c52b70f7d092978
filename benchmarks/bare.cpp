// Natives that make the calls of the virtual machine that an answer takes, and nothing else. They
// hold what they answer, so that nothing is looked up.
#include <jni.h>

#include <memory>
#include <string>
#include <vector>

namespace {

// The elements of a String[], or the text of a String. A null text is a null pointer.
struct Answer {
    std::vector<std::unique_ptr<std::string>> texts;
};

jint heldNumber;
std::vector<Answer> held;

std::unique_ptr<std::string> copied(JNIEnv *env, jstring text)
{
    if (!text) {
        return nullptr;
    }
    const char *bytes = env->GetStringUTFChars(text, nullptr);
    auto copy = std::make_unique<std::string>(bytes);
    env->ReleaseStringUTFChars(text, bytes);
    return copy;
}

bool isA(JNIEnv *env, jobject object, const char *type)
{
    jclass found = env->FindClass(type);
    const bool is = env->IsInstanceOf(object, found);
    env->DeleteLocalRef(found);
    return is;
}

Answer answerOf(JNIEnv *env, jobject object)
{
    Answer answer;
    if (isA(env, object, "java/lang/String")) {
        answer.texts.push_back(copied(env, static_cast<jstring>(object)));
    } else {
        auto array = static_cast<jobjectArray>(object);
        for (jsize i = 0; i < env->GetArrayLength(array); ++i) {
            jobject element = env->GetObjectArrayElement(array, i);
            answer.texts.push_back(copied(env, static_cast<jstring>(element)));
            env->DeleteLocalRef(element);
        }
    }
    return answer;
}

} // namespace

extern "C" {

JNIEXPORT void JNICALL Java_Bare_hold(JNIEnv *env, jobject, jint number, jobjectArray answers)
{
    heldNumber = number;
    held.clear();
    for (jsize i = 0; i < env->GetArrayLength(answers); ++i) {
        jobject answer = env->GetObjectArrayElement(answers, i);
        held.push_back(answerOf(env, answer));
        env->DeleteLocalRef(answer);
    }
}

JNIEXPORT jint JNICALL Java_Bare_number(JNIEnv *, jobject)
{
    return heldNumber;
}

JNIEXPORT jstring JNICALL Java_Bare_text(JNIEnv *env, jobject, jint i)
{
    return env->NewStringUTF(held[static_cast<size_t>(i)].texts[0]->c_str());
}

JNIEXPORT jobjectArray JNICALL Java_Bare_array(JNIEnv *env, jobject, jint i)
{
    const Answer &answer = held[static_cast<size_t>(i)];
    jclass type = env->FindClass("java/lang/String");
    jstring empty = env->NewStringUTF("");
    jobjectArray array = env->NewObjectArray(static_cast<jsize>(answer.texts.size()), type, empty);
    env->DeleteLocalRef(empty);
    env->DeleteLocalRef(type);
    jsize index = 0;
    for (const auto &text : answer.texts) {
        jstring element = text ? env->NewStringUTF(text->c_str()) : nullptr;
        env->SetObjectArrayElement(array, index++, element);
        if (env->ExceptionCheck()) {
            return nullptr;
        }
        if (element) {
            env->DeleteLocalRef(element);
        }
    }
    return array;
}
}
