// The entry point of a load: gives the ten Java classes their natives.
#include "qvsJni.h"

#include <dlfcn.h>

// Used where the C library itself has them: the library needs no other for their sake.
#pragma weak dladdr
#pragma weak dlopen

namespace [[gnu::visibility("hidden")]] qvs {

namespace {

struct JavaClass {
    template <size_t N>
    constexpr JavaClass(const char *n, const JNINativeMethod (&m)[N])
        : name(n), natives(m), count(N)
    {
    }

    const char *name;
    const JNINativeMethod *natives;
    jint count;
};

constexpr JavaClass kClasses[] = {
    {"com/qvomacp/eng/parser/XCPCtxParser", kParserNatives},
    {"com/qvomacp/eng/parser/XCPCtxPxLogical", kPxLogicalNatives},
    {"com/qvomacp/eng/parser/XCPCtxNapDef", kNapDefNatives},
    {"com/qvomacp/eng/parser/XCPCtxBootstrap", kBootstrapNatives},
    {"com/qvomacp/eng/parser/XCPCtxClientIdentity", kClientIdentityNatives},
    {"com/qvomacp/eng/parser/XCPCtxVendorConfig", kVendorConfigNatives},
    {"com/qvomacp/eng/parser/XCPCtxApplication", kApplicationNatives},
    {"com/qvomacp/eng/parser/XCPCtxAccess", kAccessNatives},
    {"com/qvomacp/eng/parser/XCPCtxWifi", kWifiNatives},
    {"com/qvomacp/eng/parser/XCPCtxVoWifi", kVoWifiNatives},
};

// hardened: a VM lets go of a library whose load failed, or whose class loader went, though classes
// may have natives of it: it stays mapped. A link with -z nodelete sees to it alone.
void stayMapped()
{
    Dl_info self;
    if (dladdr && dlopen && dladdr(kClasses, &self)) {
        (void)dlopen(self.dli_fname, RTLD_LAZY | RTLD_NOLOAD | RTLD_NODELETE);
    }
}

// False when the class is missing or refuses a native.
bool registerNatives(JNIEnv *env, const JavaClass &known)
{
    jclass found = env->FindClass(known.name);
    if (!found) {
        return false;
    }
    const jint result = env->RegisterNatives(found, known.natives, known.count);
    env->DeleteLocalRef(found);
    return result >= 0;
}

} // namespace

} // namespace qvs

// JNI_OnLoad registers class by class and answers the interface version that the library needs;
// JNI_ERR without an environment of that version, and at the first class that is missing or refuses
// its natives. Classes registered before it keep them, and the library stays mapped.
JNIEXPORT jint JNICALL JNI_OnLoad(JavaVM *vm, void *)
{
    qvs::stayMapped();
    void *env = nullptr;
    if (vm->GetEnv(&env, JNI_VERSION_1_4) != JNI_OK || !env) {
        return JNI_ERR;
    }
    for (const qvs::JavaClass &known : qvs::kClasses) {
        if (!qvs::registerNatives(static_cast<JNIEnv *>(env), known)) {
            return JNI_ERR;
        }
    }
    return JNI_VERSION_1_4;
}
