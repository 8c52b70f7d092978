// A virtual machine that costs next to nothing, to see what the library costs: it hands out the
// same references again and again, reads text as far as a machine has to, and keeps nothing. What
// the library may do and what it answers is held to the rules by fakevm.h.
#pragma once

#include <jni.h>

#include <climits>
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <vector>

namespace quietvm {

// A message that stays where it is.
struct Message {
    const uint8_t *bytes;
    size_t size;
};

class Vm {
public:
    // Loads the library.
    Vm()
    {
        table_.FindClass = [](JNIEnv *, const char *) { return refer<jclass>(); };
        table_.RegisterNatives = [](JNIEnv *env, jclass, const JNINativeMethod *methods,
                                    jint count) {
            std::vector<JNINativeMethod> &natives = of(env).natives_;
            natives.insert(natives.end(), methods, methods + count);
            return jint{JNI_OK};
        };
        table_.ExceptionCheck = [](JNIEnv *) { return jboolean{JNI_FALSE}; };
        table_.DeleteLocalRef = [](JNIEnv *, jobject) {};
        table_.NewStringUTF = [](JNIEnv *env, const char *text) {
            of(env).textSeen_ += strlen(text);
            return refer<jstring>();
        };
        table_.NewObjectArray = [](JNIEnv *, jsize, jclass, jobject) {
            return refer<jobjectArray>();
        };
        table_.SetObjectArrayElement = [](JNIEnv *, jobjectArray, jsize, jobject) {};
        table_.NewByteArray = [](JNIEnv *, jsize) { return refer<jbyteArray>(); };
        table_.SetByteArrayRegion = [](JNIEnv *, jbyteArray, jsize, jsize, const jbyte *) {};
        table_.GetArrayLength = [](JNIEnv *env, jarray) {
            return static_cast<jsize>(of(env).message_.size);
        };
        table_.GetByteArrayElements = [](JNIEnv *env, jbyteArray, jboolean *) {
            return reinterpret_cast<jbyte *>(const_cast<uint8_t *>(of(env).message_.bytes));
        };
        table_.ReleaseByteArrayElements = [](JNIEnv *, jbyteArray, jbyte *, jint) {};
        invokeTable_.GetEnv = [](JavaVM *vm, void **env, jint) {
            *env = static_cast<JNIEnv *>(&static_cast<JavaVm *>(vm)->owner->env_);
            return jint{JNI_OK};
        };
        env_.functions = &table_;
        env_.owner = this;
        javaVm_.functions = &invokeTable_;
        javaVm_.owner = this;
        if (JNI_OnLoad(&javaVm_, nullptr) != JNI_VERSION_1_4 || natives_.size() != 87) {
            fputs("quiet VM: the library does not load\n", stderr);
            abort();
        }
    }
    Vm(const Vm &) = delete;
    Vm &operator=(const Vm &) = delete;

    bool parse(const Message &message)
    {
        using Parse = jboolean (*)(JNIEnv *, jobject, jbyteArray, jlong, jint);
        message_ = message;
        return reinterpret_cast<Parse>(find("qvomacp_parser"))(
            &env_, refer<jobject>(), refer<jbyteArray>(), static_cast<jlong>(message.size), 0);
    }

    void remove()
    {
        reinterpret_cast<void (*)(JNIEnv *, jobject)>(find("qvomacp_parser_del"))(&env_,
                                                                                  refer<jobject>());
    }

    // Chooses an access point by its index.
    void choose(jint index)
    {
        reinterpret_cast<void (*)(JNIEnv *, jobject, jint)>(find("qvomacp_SetPxNapDefIndex"))(
            &env_, refer<jobject>(), index);
    }

    // Asks each query once: the last of its indexes is `last`, those before it are `first`.
    // Answers how many of them answered something, numbers counted.
    long query(jint first, jint last)
    {
        long answered = 0;
        for (const JNINativeMethod &native : natives_) {
            const size_t indexes =
                static_cast<size_t>(strchr(native.signature, ')') - native.signature - 1);
            const char *result = native.signature + indexes + 2;
            const bool query = *result != 'V' && *result != 'Z';
            answered += query && answers(native.fnPtr, *result == 'I', indexes, first, last);
        }
        return answered;
    }

    size_t textSeen() const { return textSeen_; }

private:
    struct Env : JNIEnv_ {
        Vm *owner;
    };
    struct JavaVm : JavaVM_ {
        Vm *owner;
    };

    static Vm &of(JNIEnv *env) { return *static_cast<Env *>(env)->owner; }

    // Something that is not null.
    template <class Reference>
    static Reference refer()
    {
        static _jobjectArray something;
        return static_cast<Reference>(static_cast<void *>(&something));
    }

    void *find(const char *name)
    {
        for (const JNINativeMethod &native : natives_) {
            if (strcmp(native.name, name) == 0) {
                return native.fnPtr;
            }
        }
        abort();
    }

    template <class... Index>
    bool answers(void *function, bool number, Index... indexes)
    {
        JNIEnv *env = &env_;
        jobject self = refer<jobject>();
        if (number) {
            return reinterpret_cast<jint (*)(JNIEnv *, jobject, Index...)>(function)(
                       env, self, indexes...) > 0;
        }
        return reinterpret_cast<jobject (*)(JNIEnv *, jobject, Index...)>(function)(
                   env, self, indexes...) != nullptr;
    }

    bool answers(void *function, bool number, size_t indexes, jint first, jint last)
    {
        switch (indexes) {
        case 0:
            return answers(function, number);
        case 1:
            return answers(function, number, last);
        case 2:
            return answers(function, number, first, last);
        case 3:
            return answers(function, number, first, first, last);
        default:
            return answers(function, number, first, first, first, last);
        }
    }

    JNINativeInterface_ table_{};
    JNIInvokeInterface_ invokeTable_{};
    Env env_;
    JavaVm javaVm_;
    std::vector<JNINativeMethod> natives_;
    Message message_{};
    size_t textSeen_ = 0;
};

} // namespace quietvm
