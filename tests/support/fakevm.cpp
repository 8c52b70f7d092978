#include "support/fakevm.h"

#include "support/fakevm_entries.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <map>
#include <set>
#include <utility>

// Lets a function stand for entries of all types, to say which one was called.
#ifdef __clang__
#define CALLED_UNDER_ANY_TYPE [[clang::no_sanitize("function")]]
#else
#define CALLED_UNDER_ANY_TYPE
#endif

namespace fakevm {

namespace {

constexpr size_t kLocalReferences = 16; // what a machine grants a native without being asked
constexpr char kZeroBytes[5] = {};      // at the end of a text, its terminator and four more

// An object of the machine; which of its members count follows from its kind.
struct Object {
    enum Kind { kThis, kClass, kString, kStringArray, kByteArray } kind;
    std::string text{}; // of a string; the name of a class
    std::vector<std::shared_ptr<Object>> elements{};
    Bytes bytes{};
};
using ObjectPtr = std::shared_ptr<Object>;

// What a local reference points to. The object is let go when the reference is deleted; the block
// stays until the native has returned, so that a stale reference is recognised.
struct Reference {
    ObjectPtr object;
};

[[noreturn]] void die(const std::string &what)
{
    fprintf(stderr, "fake VM: %s\n", what.c_str());
    abort();
}

} // namespace

struct Vm::State {
    struct Env : JNIEnv_ {
        State *state;
    };
    struct JavaVm : JavaVM_ {
        State *state;
    };
    // The array elements that a native has in its hands.
    struct Pinned {
        ObjectPtr array;
        std::unique_ptr<jbyte[]> copy;
    };

    explicit State(Vm *vm) : owner(vm)
    {
        env.functions = &table;
        env.state = this;
        javaVm.functions = &invokeTable;
        javaVm.state = this;
        fillTables();
    }

    Vm *owner;
    JNINativeInterface_ table;
    JNIInvokeInterface_ invokeTable;
    Env env;
    JavaVm javaVm;

    std::vector<Native> natives;
    std::vector<std::string> calls;
    long failIn = -1;
    bool failed = false;

    // ---- The native that is running

    bool pending = false;       // an exception
    std::string uncheckedEntry; // its exception check is due
    std::vector<std::unique_ptr<Reference>> references;
    std::set<Reference *> live;      // local references made by the native
    std::set<Reference *> arguments; // and those that it was given
    std::map<jbyte *, Pinned> pinned;

    static State &of(JNIEnv *env) { return *static_cast<Env *>(env)->state; }

    // ---- References

    jobject refer(ObjectPtr object, std::set<Reference *> *owners)
    {
        references.push_back(std::make_unique<Reference>(Reference{std::move(object)}));
        owners->insert(references.back().get());
        return reinterpret_cast<jobject>(references.back().get());
    }

    template <class Ref = jobject>
    Ref local(Object object)
    {
        if (live.size() == kLocalReferences) {
            die("a native holds more than 16 local references");
        }
        return static_cast<Ref>(refer(std::make_shared<Object>(std::move(object)), &live));
    }

    ObjectPtr object(jobject reference)
    {
        Reference *known = reinterpret_cast<Reference *>(reference);
        if (!live.count(known) && !arguments.count(known)) {
            die("a reference that is null, deleted or of another call");
        }
        return known->object;
    }

    ObjectPtr object(jobject reference, Object::Kind kind)
    {
        ObjectPtr found = object(reference);
        if (found->kind != kind) {
            die("a reference to an object of the wrong class");
        }
        return found;
    }

    // ---- Rules of every call

    void enterAnyway(const char *entry) { calls.emplace_back(entry); }

    void enter(const char *entry)
    {
        enterAnyway(entry);
        if (pending) {
            die(std::string(entry) + " with an exception pending");
        }
        if (!uncheckedEntry.empty()) {
            die(std::string(entry) + " before the exception check of " + uncheckedEntry);
        }
    }

    // False when the call is to fail; then an exception is pending.
    bool enterFallible(const char *entry)
    {
        enter(entry);
        if (failIn >= 0 && failIn-- == 0) {
            failed = true;
            pending = true;
        }
        return !pending;
    }

    // ---- Entries

    static jclass JNICALL FindClass(JNIEnv *env, const char *name)
    {
        State &state = of(env);
        if (!state.enterFallible("FindClass")) {
            return nullptr;
        }
        if (name == state.owner->lackedClass) {
            state.pending = true;
            return nullptr;
        }
        return state.local<jclass>({.kind = Object::kClass, .text = name});
    }

    static jint JNICALL RegisterNatives(JNIEnv *env, jclass javaClass,
                                        const JNINativeMethod *methods, jint count)
    {
        State &state = of(env);
        if (!state.enterFallible("RegisterNatives")) {
            return JNI_ERR;
        }
        const std::string name = state.object(javaClass, Object::kClass)->text;
        if (name == state.owner->refusedClass) {
            state.pending = true;
            return JNI_ERR;
        }
        for (jint i = 0; i < count; ++i) {
            state.natives.push_back(
                {name, methods[i].name, methods[i].signature, methods[i].fnPtr});
        }
        return JNI_OK;
    }

    static jboolean JNICALL ExceptionCheck(JNIEnv *env)
    {
        State &state = of(env);
        state.enterAnyway("ExceptionCheck");
        state.uncheckedEntry.clear();
        return state.pending ? JNI_TRUE : JNI_FALSE;
    }

    static void JNICALL DeleteLocalRef(JNIEnv *env, jobject reference)
    {
        State &state = of(env);
        state.enterAnyway("DeleteLocalRef");
        Reference *known = reinterpret_cast<Reference *>(reference);
        if (!state.live.erase(known)) {
            die("DeleteLocalRef of what is no local reference of this native");
        }
        known->object.reset();
    }

    static jstring JNICALL NewStringUTF(JNIEnv *env, const char *text)
    {
        State &state = of(env);
        if (!state.enterFallible("NewStringUTF")) {
            return nullptr;
        }
        const std::string bytes = text;
        if (memcmp(text + bytes.size(), kZeroBytes, sizeof kZeroBytes) != 0) {
            die("text without four zero bytes behind it: " + bytes);
        }
        return state.local<jstring>({.kind = Object::kString, .text = bytes});
    }

    static jobjectArray JNICALL NewObjectArray(JNIEnv *env, jsize length, jclass elementClass,
                                               jobject initial)
    {
        State &state = of(env);
        if (!state.enterFallible("NewObjectArray")) {
            return nullptr;
        }
        if (length < 0 || state.object(elementClass, Object::kClass)->text != "java/lang/String") {
            die("NewObjectArray of a negative length or of another class than String");
        }
        const ObjectPtr element = initial ? state.object(initial, Object::kString) : nullptr;
        return state.local<jobjectArray>(
            {.kind = Object::kStringArray,
             .elements = std::vector<ObjectPtr>(static_cast<size_t>(length), element)});
    }

    static void JNICALL SetObjectArrayElement(JNIEnv *env, jobjectArray array, jsize index,
                                              jobject element)
    {
        State &state = of(env);
        const bool succeeds = state.enterFallible("SetObjectArrayElement");
        state.uncheckedEntry = "SetObjectArrayElement";
        std::vector<ObjectPtr> &elements = state.object(array, Object::kStringArray)->elements;
        const ObjectPtr value = element ? state.object(element, Object::kString) : nullptr;
        if (index < 0 || static_cast<size_t>(index) >= elements.size()) {
            die("SetObjectArrayElement outside the array");
        }
        if (succeeds) {
            elements[static_cast<size_t>(index)] = value;
        }
    }

    static jbyteArray JNICALL NewByteArray(JNIEnv *env, jsize length)
    {
        State &state = of(env);
        if (!state.enterFallible("NewByteArray")) {
            return nullptr;
        }
        if (length < 0) {
            die("NewByteArray of a negative length");
        }
        return state.local<jbyteArray>(
            {.kind = Object::kByteArray, .bytes = Bytes(static_cast<size_t>(length))});
    }

    static void JNICALL SetByteArrayRegion(JNIEnv *env, jbyteArray array, jsize start, jsize length,
                                           const jbyte *bytes)
    {
        State &state = of(env);
        const bool succeeds = state.enterFallible("SetByteArrayRegion");
        state.uncheckedEntry = "SetByteArrayRegion";
        Bytes &target = state.object(array, Object::kByteArray)->bytes;
        if (start < 0 || length < 0 ||
            static_cast<size_t>(start) + static_cast<size_t>(length) > target.size()) {
            die("SetByteArrayRegion outside the array");
        }
        if (succeeds) {
            std::copy_n(reinterpret_cast<const uint8_t *>(bytes), length, target.begin() + start);
        }
    }

    static jsize JNICALL GetArrayLength(JNIEnv *env, jarray array)
    {
        State &state = of(env);
        state.enter("GetArrayLength");
        return static_cast<jsize>(state.object(array, Object::kByteArray)->bytes.size());
    }

    // Hands out a copy, so that a sanitizer sees every byte that is read or written outside it.
    static jbyte *JNICALL GetByteArrayElements(JNIEnv *env, jbyteArray array, jboolean *isCopy)
    {
        State &state = of(env);
        if (!state.enterFallible("GetByteArrayElements")) {
            return nullptr;
        }
        const ObjectPtr source = state.object(array, Object::kByteArray);
        auto copy = std::make_unique<jbyte[]>(source->bytes.size());
        std::copy(source->bytes.begin(), source->bytes.end(), copy.get());
        if (isCopy) {
            *isCopy = JNI_TRUE;
        }
        jbyte *elements = copy.get();
        state.pinned[elements] = {source, std::move(copy)};
        return elements;
    }

    static void JNICALL ReleaseByteArrayElements(JNIEnv *env, jbyteArray array, jbyte *elements,
                                                 jint mode)
    {
        State &state = of(env);
        state.enterAnyway("ReleaseByteArrayElements");
        const auto found = state.pinned.find(elements);
        if (found == state.pinned.end() || state.object(array) != found->second.array) {
            die("ReleaseByteArrayElements of what was not handed out");
        }
        const Bytes &source = found->second.array->bytes;
        if (mode != JNI_ABORT) {
            die("ReleaseByteArrayElements copies back");
        }
        if (!std::equal(source.begin(), source.end(), reinterpret_cast<uint8_t *>(elements))) {
            die("array elements were written to");
        }
        state.pinned.erase(found);
    }

    static jint JNICALL GetEnv(JavaVM *vm, void **env, jint version)
    {
        State &state = *static_cast<JavaVm *>(vm)->state;
        state.enter("GetEnv");
        if (version != JNI_VERSION_1_4) {
            die("GetEnv of another version than 1.4");
        }
        *env = state.owner->hasEnvironment ? static_cast<JNIEnv *>(&state.env) : nullptr;
        return state.owner->environmentResult;
    }

    // ---- Tables

    template <size_t Slot>
    CALLED_UNDER_ANY_TYPE static void unexpected()
    {
        constexpr size_t kNamed = sizeof kEntryNames / sizeof *kEntryNames;
        die(Slot < kNamed ? std::string("the library calls ") + kEntryNames[Slot]
                          : "the library calls entry " + std::to_string(Slot));
    }

    template <class Table, size_t... Slots>
    static void fill(Table *table, std::index_sequence<Slots...>)
    {
        void (*const entries[])() = {unexpected<Slots>...};
        static_assert(sizeof entries == sizeof *table);
        memcpy(table, entries, sizeof entries);
    }

    void fillTables()
    {
        fill(&table, std::make_index_sequence<sizeof table / sizeof(void *)>());
        table.FindClass = FindClass;
        table.RegisterNatives = RegisterNatives;
        table.ExceptionCheck = ExceptionCheck;
        table.DeleteLocalRef = DeleteLocalRef;
        table.NewStringUTF = NewStringUTF;
        table.NewObjectArray = NewObjectArray;
        table.SetObjectArrayElement = SetObjectArrayElement;
        table.NewByteArray = NewByteArray;
        table.SetByteArrayRegion = SetByteArrayRegion;
        table.GetArrayLength = GetArrayLength;
        table.GetByteArrayElements = GetByteArrayElements;
        table.ReleaseByteArrayElements = ReleaseByteArrayElements;
        invokeTable = {};
        invokeTable.GetEnv = GetEnv;
    }

    // ---- Natives

    jobject begin()
    {
        calls.clear();
        return argument({.kind = Object::kThis});
    }

    jobject argument(Object object)
    {
        return refer(std::make_shared<Object>(std::move(object)), &arguments);
    }

    // Takes what a native returned for an answer, and holds it to the rules of a return.
    Answer end(jint number, jobject result)
    {
        if (pending && (number > 0 || result)) {
            die("an answer with an exception pending");
        }
        if (!uncheckedEntry.empty()) {
            die("a return before the exception check of " + uncheckedEntry);
        }
        if (!pinned.empty()) {
            die("array elements that were not handed back");
        }
        Answer answer = shown(result ? object(result) : nullptr);
        live.erase(reinterpret_cast<Reference *>(result));
        if (!live.empty()) {
            die("a local reference was left behind");
        }
        answer.number = number;
        answer.exception = std::exchange(pending, false);
        arguments.clear();
        references.clear();
        return answer;
    }

    static Answer shown(const ObjectPtr &result)
    {
        Answer answer;
        if (result && result->kind == Object::kString) {
            answer.text = result->text;
        } else if (result && result->kind == Object::kByteArray) {
            answer.bytes = result->bytes;
        } else if (result && result->kind == Object::kStringArray) {
            answer.array.emplace();
            for (const ObjectPtr &element : result->elements) {
                answer.array->push_back(element ? Text(element->text) : std::nullopt);
            }
        } else if (result) {
            die("an answer of an unknown class");
        }
        return answer;
    }

    template <class Result, class... Index>
    Result invoke(void *function, Index... index)
    {
        return reinterpret_cast<Result (*)(JNIEnv *, jobject, Index...)>(function)(&env, begin(),
                                                                                   index...);
    }

    // Calls `function` with the indexes, taken from a list of them.
    template <class Result, size_t... I>
    Result apply(void *function, const std::vector<jint> &indexes, std::index_sequence<I...>)
    {
        return invoke<Result>(function, indexes[I]...);
    }

    template <class Result>
    Result apply(void *function, const std::vector<jint> &indexes)
    {
        switch (indexes.size()) {
        case 0:
            return invoke<Result>(function);
        case 1:
            return apply<Result>(function, indexes, std::make_index_sequence<1>());
        case 2:
            return apply<Result>(function, indexes, std::make_index_sequence<2>());
        case 3:
            return apply<Result>(function, indexes, std::make_index_sequence<3>());
        case 4:
            return apply<Result>(function, indexes, std::make_index_sequence<4>());
        default:
            die("a native with more than four indexes");
        }
    }
};

void PrintTo(const Answer &answer, std::ostream *out)
{
    const auto print = [out](const Text &text) {
        text ? *out << '"' << *text << '"' : *out << "null";
        *out << ' ';
    };
    *out << "number " << answer.number << (answer.exception ? ", an exception" : "") << ", text ";
    print(answer.text);
    if (answer.array) {
        *out << ", array of " << answer.array->size() << ": ";
        std::for_each(answer.array->begin(), answer.array->end(), print);
    }
    if (answer.bytes) {
        *out << ", bytes " << std::string(answer.bytes->begin(), answer.bytes->end());
    }
}

Vm::Vm() : state_(std::make_unique<State>(this)) {}

Vm::~Vm() = default;

Answer Vm::load()
{
    state_->begin();
    return state_->end(JNI_OnLoad(&state_->javaVm, nullptr), nullptr);
}

const std::vector<Native> &Vm::natives() const
{
    return state_->natives;
}

Answer Vm::call(std::string_view name, std::initializer_list<jint> indexes)
{
    const auto found = std::find_if(state_->natives.begin(), state_->natives.end(),
                                    [name](const Native &native) { return native.name == name; });
    if (found == state_->natives.end()) {
        die("no native of the name " + std::string(name));
    }
    return call(*found, indexes);
}

Answer Vm::call(const Native &native, const std::vector<jint> &indexes)
{
    const std::string arguments = "(" + std::string(indexes.size(), 'I') + ")";
    if (native.signature.rfind(arguments, 0) != 0) {
        die(native.name + " called with other arguments than its signature names");
    }
    const std::string result = native.signature.substr(arguments.size());
    if (result == "V") {
        state_->apply<void>(native.function, indexes);
        return state_->end(0, nullptr);
    }
    if (result == "I") {
        return state_->end(state_->apply<jint>(native.function, indexes), nullptr);
    }
    if (result == "[B") {
        return state_->end(0, state_->apply<jbyteArray>(native.function, indexes));
    }
    if (result == "[Ljava/lang/String;") {
        return state_->end(0, state_->apply<jobjectArray>(native.function, indexes));
    }
    return state_->end(0, state_->apply<jstring>(native.function, indexes));
}

Answer Vm::parse(const std::optional<Bytes> &message, jlong length, jint mode)
{
    using Parse = jboolean (*)(JNIEnv *, jobject, jbyteArray, jlong, jint);
    const auto found =
        std::find_if(state_->natives.begin(), state_->natives.end(),
                     [](const Native &native) { return native.signature == "([BJI)Z"; });
    if (found == state_->natives.end()) {
        die("no parse method");
    }
    jobject self = state_->begin();
    jobject array = nullptr;
    if (message) {
        array = state_->argument({.kind = Object::kByteArray, .bytes = *message});
    }
    const Parse native = reinterpret_cast<Parse>(found->function);
    return state_->end(native(&state_->env, self, static_cast<jbyteArray>(array), length, mode),
                       nullptr);
}

Answer Vm::parse(const Bytes &message, jint mode)
{
    return parse(message, static_cast<jlong>(message.size()), mode);
}

const std::vector<std::string> &Vm::calls() const
{
    return state_->calls;
}

void Vm::failCall(long n)
{
    state_->failIn = n;
    state_->failed = false;
}

bool Vm::hasFailed()
{
    state_->failIn = -1;
    return std::exchange(state_->failed, false);
}

} // namespace fakevm
