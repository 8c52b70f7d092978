#include "fake_vm.h"

#include "counting.h"

#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <sys/mman.h>
#include <unistd.h>

#include <array>
#include <map>
#include <utility>

Heap heap;
Fence fence;
Object messageArray;
std::vector<Method> methods;
std::string faults;

void die(const std::string &why)
{
    fflush(stdout);
    fprintf(stderr, "replay: %s\n", why.c_str());
    _exit(2);
}

void fault(const char *what)
{
    const NotCounting pause;
    if (faults.find(what) == std::string::npos) {
        faults += faults.empty() ? "" : "; ";
        faults += what;
    }
}

Object *Heap::make(Kind kind)
{
    if (used == objects.size()) {
        objects.emplace_back();
    }
    Object *object = &objects[used++];
    object->kind = kind;
    object->text.clear();
    object->elements.clear();
    return object;
}

void Fence::place(const std::string &message)
{
    const auto page = static_cast<size_t>(sysconf(_SC_PAGESIZE));
    if (!pages || message.size() > size) {
        if (pages) {
            munmap(pages - page, size + 2 * page);
        }
        size = (message.size() / page + 1) * page;
        void *block = mmap(nullptr, size + 2 * page, PROT_NONE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
        if (block == MAP_FAILED) {
            die("no memory for a message");
        }
        pages = static_cast<uint8_t *>(block) + page;
    }
    mprotect(pages, size, PROT_READ | PROT_WRITE);
    used = message.size();
    bytes = front ? pages : pages + size - used;
    memcpy(bytes, message.data(), used);
    close();
    handedOut = 0;
}

void Fence::open() const
{
    mprotect(pages, size, PROT_READ);
}

void Fence::close() const
{
    mprotect(pages, size, PROT_NONE);
}

// --- The function tables
// --------------------------------------------------------------------------

namespace {

template <size_t N>
void unexpected()
{
    die("function " + std::to_string(N) + " of the environment was called");
}

jclass JNICALL findClass(JNIEnv *, const char *name)
{
    static std::map<std::string, Object> classes;
    const NotCounting pause;
    Object &found = classes[name];
    found.text = name;
    return handleOf<jclass>(&found);
}

jint JNICALL registerNatives(JNIEnv *, jclass owner, const JNINativeMethod *rows, jint count)
{
    const NotCounting pause;
    for (jint i = 0; i < count; ++i) {
        methods.push_back({objectOf(owner)->text, rows[i].name, rows[i].signature, rows[i].fnPtr});
    }
    return 0;
}

jstring JNICALL newStringUtf(JNIEnv *, const char *text)
{
    const NotCounting pause;
    static const char kZeros[4] = {};
    if (!text) {
        fault("NewStringUTF of null");
        return nullptr;
    }
    Object *object = heap.make(Kind::kText);
    object->text = text;
    if (memcmp(text + object->text.size(), kZeros, sizeof kZeros) != 0) {
        fault("a text is not followed by four zero bytes");
    }
    return handleOf<jstring>(object);
}

jobjectArray JNICALL newObjectArray(JNIEnv *, jsize count, jclass type, jobject initial)
{
    const NotCounting pause;
    if (count < 0 || objectOf(type)->text != "java/lang/String") {
        fault("NewObjectArray of something else than texts");
        return nullptr;
    }
    Object *object = heap.make(Kind::kTexts);
    object->elements.assign(static_cast<size_t>(count), objectOf(initial));
    return handleOf<jobjectArray>(object);
}

void JNICALL setObjectArrayElement(JNIEnv *, jobjectArray array, jsize index, jobject value)
{
    Object *object = objectOf(array);
    if (!object || index < 0 || static_cast<size_t>(index) >= object->elements.size()) {
        fault("SetObjectArrayElement outside the array");
        return;
    }
    object->elements[static_cast<size_t>(index)] = objectOf(value);
}

jsize JNICALL getArrayLength(JNIEnv *, jarray array)
{
    const Object *object = objectOf(array);
    return static_cast<jsize>(object->kind == Kind::kTexts ? object->elements.size()
                              : object == &messageArray    ? fence.used
                                                           : object->text.size());
}

jbyteArray JNICALL newByteArray(JNIEnv *, jsize count)
{
    const NotCounting pause;
    if (count < 0) {
        fault("NewByteArray with a negative size");
        return nullptr;
    }
    Object *object = heap.make(Kind::kBytes);
    object->text.assign(static_cast<size_t>(count), '\0');
    return handleOf<jbyteArray>(object);
}

void JNICALL setByteArrayRegion(JNIEnv *, jbyteArray array, jsize start, jsize count,
                                const jbyte *bytes)
{
    Object *object = objectOf(array);
    if (start < 0 || count < 0 ||
        static_cast<size_t>(start) + static_cast<size_t>(count) > object->text.size()) {
        fault("SetByteArrayRegion outside the array");
        return;
    }
    if (count > 0) {
        memcpy(&object->text[static_cast<size_t>(start)], bytes, static_cast<size_t>(count));
    }
}

jbyte *JNICALL getByteArrayElements(JNIEnv *, jbyteArray array, jboolean *isCopy)
{
    if (objectOf(array) != &messageArray) {
        fault("GetByteArrayElements of another array than the message");
        return nullptr;
    }
    if (isCopy) {
        *isCopy = JNI_TRUE;
    }
    fence.open();
    ++fence.handedOut;
    return reinterpret_cast<jbyte *>(fence.bytes);
}

void JNICALL releaseByteArrayElements(JNIEnv *, jbyteArray array, jbyte *bytes, jint mode)
{
    if (objectOf(array) != &messageArray || reinterpret_cast<uint8_t *>(bytes) != fence.bytes) {
        fault("ReleaseByteArrayElements of something that was not handed out");
        return;
    }
    if (mode != JNI_ABORT) {
        fault("the message was copied back");
    }
    --fence.handedOut;
    fence.close();
}

jboolean JNICALL exceptionCheck(JNIEnv *)
{
    return JNI_FALSE;
}

jthrowable JNICALL exceptionOccurred(JNIEnv *)
{
    return nullptr;
}

void JNICALL deleteLocalRef(JNIEnv *, jobject) {}

template <size_t... N>
std::array<void *, sizeof...(N)> unexpectedTable(std::index_sequence<N...>)
{
    return {reinterpret_cast<void *>(unexpected<N>)...};
}

JNINativeInterface_ makeFunctions()
{
    constexpr size_t kCount = sizeof(JNINativeInterface_) / sizeof(void *);
    const auto table = unexpectedTable(std::make_index_sequence<kCount>{});
    JNINativeInterface_ functions;
    memcpy(&functions, table.data(), sizeof functions);
    functions.FindClass = findClass;
    functions.RegisterNatives = registerNatives;
    functions.NewStringUTF = newStringUtf;
    functions.NewObjectArray = newObjectArray;
    functions.SetObjectArrayElement = setObjectArrayElement;
    functions.GetArrayLength = getArrayLength;
    functions.NewByteArray = newByteArray;
    functions.SetByteArrayRegion = setByteArrayRegion;
    functions.GetByteArrayElements = getByteArrayElements;
    functions.ReleaseByteArrayElements = releaseByteArrayElements;
    functions.ExceptionCheck = exceptionCheck;
    functions.ExceptionOccurred = exceptionOccurred;
    functions.DeleteLocalRef = deleteLocalRef;
    return functions;
}

JNINativeInterface_ functions = makeFunctions();

jint JNICALL getEnv(JavaVM *, void **result, jint version)
{
    if (version != JNI_VERSION_1_4) {
        fault("GetEnv for another version than 1.4");
    }
    *result = &env;
    return JNI_OK;
}

JNIInvokeInterface_ makeInvocation()
{
    const auto table =
        unexpectedTable(std::make_index_sequence<sizeof(JNIInvokeInterface_) / sizeof(void *)>{});
    JNIInvokeInterface_ invocation;
    memcpy(&invocation, table.data(), sizeof invocation);
    invocation.GetEnv = getEnv;
    return invocation;
}

JNIInvokeInterface_ invocation = makeInvocation();

} // namespace

JNIEnv env = {&functions};
JavaVM machine = {&invocation};
