// The fake virtual machine itself: what it must not let pass.
#include "support/fakevm.h"

#include <gtest/gtest.h>

namespace {

using fakevm::Native;
using fakevm::Vm;

constexpr char kText[8] = "abc"; // with zero bytes behind it

// Calls `native` as the native that it would be under `signature`.
template <class Result>
void call(Result (*native)(JNIEnv *, jobject), const char *signature, long failingCall = -1)
{
    Vm vm;
    vm.failCall(failingCall);
    vm.call(Native{"", "native", signature, reinterpret_cast<void *>(native)}, {});
}

void call(void (*native)(JNIEnv *, jobject), long failingCall = -1)
{
    call<void>(native, "()V", failingCall);
}

jobjectArray emptyStrings(JNIEnv *env, jsize length)
{
    jclass stringClass = env->FindClass("java/lang/String");
    jobjectArray array = env->NewObjectArray(length, stringClass, nullptr);
    env->DeleteLocalRef(stringClass);
    return array;
}

TEST(FakeVmDeathTest, NamesAnEntryThatNobodyShouldCall)
{
    EXPECT_DEATH(call([](JNIEnv *env, jobject) { env->ExceptionClear(); }),
                 "the library calls ExceptionClear");
    EXPECT_DEATH(call([](JNIEnv *env, jobject) { (void)env->GetVersion(); }),
                 "the library calls GetVersion");
    EXPECT_DEATH(call([](JNIEnv *env, jobject) { (void)env->GetModule(nullptr); }),
                 "the library calls GetModule");
}

TEST(FakeVmDeathTest, RefusesACallWithAnExceptionPending)
{
    EXPECT_DEATH(call(
                     [](JNIEnv *env, jobject) {
                         (void)env->FindClass("java/lang/String");
                         (void)env->NewStringUTF(kText);
                     },
                     0),
                 "NewStringUTF with an exception pending");
}

TEST(FakeVmDeathTest, RefusesAnAnswerWithAnExceptionPending)
{
    EXPECT_DEATH(call<jstring>(
                     [](JNIEnv *env, jobject) {
                         jstring text = env->NewStringUTF(kText);
                         (void)env->NewByteArray(1);
                         return text;
                     },
                     "()Ljava/lang/String;", 1),
                 "an answer with an exception pending");
}

TEST(FakeVmDeathTest, AsksForAnExceptionCheck)
{
    EXPECT_DEATH(call([](JNIEnv *env, jobject) {
                     env->SetObjectArrayElement(emptyStrings(env, 1), 0, nullptr);
                     (void)env->NewStringUTF(kText);
                 }),
                 "NewStringUTF before the exception check of SetObjectArrayElement");
    EXPECT_DEATH(call([](JNIEnv *env, jobject) {
                     env->SetByteArrayRegion(env->NewByteArray(0), 0, 0, nullptr);
                 }),
                 "a return before the exception check of SetByteArrayRegion");
}

TEST(FakeVmDeathTest, CountsLocalReferences)
{
    const auto make = [](JNIEnv *env, int n) {
        for (; n > 0; --n) {
            env->DeleteLocalRef(env->NewStringUTF(kText));
            (void)env->NewStringUTF(kText);
        }
    };
    static const auto *makeTexts = &make;
    EXPECT_DEATH(call([](JNIEnv *env, jobject) { (*makeTexts)(env, 16); }),
                 "a local reference was left behind");
    EXPECT_DEATH(call([](JNIEnv *env, jobject) { (*makeTexts)(env, 17); }),
                 "more than 16 local references");
}

TEST(FakeVmDeathTest, RefusesAReferenceThatWasDeleted)
{
    EXPECT_DEATH(call([](JNIEnv *env, jobject) {
                     jbyteArray array = env->NewByteArray(1);
                     env->DeleteLocalRef(array);
                     (void)env->GetArrayLength(array);
                 }),
                 "a reference that is null, deleted");
    EXPECT_DEATH(call([](JNIEnv *env, jobject) {
                     jbyteArray array = env->NewByteArray(1);
                     env->DeleteLocalRef(array);
                     env->DeleteLocalRef(array);
                 }),
                 "DeleteLocalRef of what is no local reference");
    EXPECT_DEATH(call([](JNIEnv *env, jobject) { (void)env->GetArrayLength(nullptr); }),
                 "a reference that is null, deleted");
}

TEST(FakeVmDeathTest, RefusesAReferenceToAnotherClass)
{
    EXPECT_DEATH(call([](JNIEnv *env, jobject self) {
                     (void)env->GetArrayLength(static_cast<jarray>(self));
                 }),
                 "an object of the wrong class");
    EXPECT_DEATH(call([](JNIEnv *env, jobject) {
                     (void)env->NewObjectArray(1, env->FindClass("java/lang/Object"), nullptr);
                 }),
                 "NewObjectArray of a negative length or of another class");
}

TEST(FakeVmDeathTest, RefusesWhatIsOutsideAnArray)
{
    EXPECT_DEATH(call([](JNIEnv *env, jobject) {
                     env->SetObjectArrayElement(emptyStrings(env, 1), 1, nullptr);
                 }),
                 "SetObjectArrayElement outside the array");
    EXPECT_DEATH(call([](JNIEnv *env, jobject) {
                     const jbyte bytes[2] = {};
                     env->SetByteArrayRegion(env->NewByteArray(1), 0, 2, bytes);
                 }),
                 "SetByteArrayRegion outside the array");
    EXPECT_DEATH(call([](JNIEnv *env, jobject) { (void)env->NewByteArray(-1); }),
                 "NewByteArray of a negative length");
}

TEST(FakeVmDeathTest, WantsArrayElementsBackAsTheyWere)
{
    EXPECT_DEATH(call([](JNIEnv *env, jobject) {
                     (void)env->GetByteArrayElements(env->NewByteArray(1), nullptr);
                 }),
                 "array elements that were not handed back");
    EXPECT_DEATH(call([](JNIEnv *env, jobject) {
                     jbyteArray array = env->NewByteArray(1);
                     jbyte *bytes = env->GetByteArrayElements(array, nullptr);
                     env->ReleaseByteArrayElements(array, bytes, 0);
                 }),
                 "ReleaseByteArrayElements copies back");
    EXPECT_DEATH(call([](JNIEnv *env, jobject) {
                     jbyteArray array = env->NewByteArray(1);
                     jbyte *bytes = env->GetByteArrayElements(array, nullptr);
                     bytes[0] = 1;
                     env->ReleaseByteArrayElements(array, bytes, JNI_ABORT);
                 }),
                 "array elements were written to");
    EXPECT_DEATH(call([](JNIEnv *env, jobject) {
                     jbyte byte = 0;
                     env->ReleaseByteArrayElements(env->NewByteArray(1), &byte, JNI_ABORT);
                 }),
                 "ReleaseByteArrayElements of what was not handed out");
}

TEST(FakeVmDeathTest, WantsZeroBytesBehindAText)
{
    EXPECT_DEATH(call([](JNIEnv *env, jobject) {
                     const char text[8] = {'a', 0, 0, 0, 0, 1};
                     (void)env->NewStringUTF(text);
                 }),
                 "text without four zero bytes behind it: a");
}

TEST(FakeVmDeathTest, WantsTheArgumentsOfTheSignature)
{
    EXPECT_DEATH(call<void>([](JNIEnv *, jobject) {}, "(I)V"),
                 "other arguments than its signature");
    EXPECT_DEATH(
        {
            Vm vm;
            vm.call("qvomacp_GetPxWifiCount");
        },
        "no native of the name qvomacp_GetPxWifiCount");
}

TEST(FakeVm, FailsTheCallItIsToldTo)
{
    const auto native = [](JNIEnv *env, jobject) {
        jbyteArray array = env->NewByteArray(2);
        if (array) {
            const jbyte bytes[2] = {1, 2};
            env->SetByteArrayRegion(array, 0, 2, bytes);
            if (env->ExceptionCheck()) {
                env->DeleteLocalRef(array);
                array = nullptr;
            }
        }
        return array;
    };
    const Native registered{"", "native", "()[B", reinterpret_cast<void *>(+native)};
    Vm vm;
    for (long n = 0; n < 2; ++n) {
        vm.failCall(n);
        EXPECT_EQ(vm.call(registered, {}), fakevm::Answer{.exception = true});
        EXPECT_TRUE(vm.hasFailed());
    }
    vm.failCall(2);
    EXPECT_EQ(vm.call(registered, {}), (fakevm::Answer{.bytes = fakevm::Bytes{1, 2}}));
    EXPECT_FALSE(vm.hasFailed());
    EXPECT_EQ(vm.call(registered, {}), (fakevm::Answer{.bytes = fakevm::Bytes{1, 2}}));
    EXPECT_EQ(vm.calls(),
              (std::vector<std::string>{"NewByteArray", "SetByteArrayRegion", "ExceptionCheck"}));
}

} // namespace
