#include "support/fakevm.h"

#include "support/fakevm_entries.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <map>
#include <span>
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

jbyte *elementsOf(const uint8_t *bytes)
{
    return reinterpret_cast<jbyte *>(const_cast<uint8_t *>(bytes));
}

// Sets a flag, if there is one, for as long as it lives.
class Flag {
public:
    Flag(bool *flag, bool value) : flag_(flag), before_(flag && std::exchange(*flag, value)) {}
    Flag(const Flag &) = delete;
    Flag &operator=(const Flag &) = delete;
    ~Flag()
    {
        if (flag_) {
            *flag_ = before_;
        }
    }

private:
    bool *flag_;
    bool before_;
};

} // namespace

struct Vm::State {
    struct Env : JNIEnv_ {
        State *state;
    };
    struct JavaVm : JavaVM_ {
        State *state;
    };

    State(Vm *vm, const Options &chosen) : owner(vm), options(chosen)
    {
        fill(&table, std::make_index_sequence<sizeof table / sizeof(void *)>());
        env.functions = &table;
        env.state = this;
        invokeTable.GetEnv = GetEnv;
        javaVm.functions = &invokeTable;
        javaVm.state = this;
    }
    State(const State &) = delete;
    State &operator=(const State &) = delete;
    virtual ~State() = default;

    Vm *owner;
    const Options options;
    JNINativeInterface_ table;
    JNIInvokeInterface_ invokeTable{};
    Env env;
    JavaVm javaVm;

    std::vector<Native> natives;
    std::vector<const char *> calls;
    long failIn = -1;
    bool failed = false;

    // ---- What a native is called with, and what becomes of its answer

    virtual jobject begin() = 0;
    virtual jbyteArray argument(const Bytes &message) = 0;
    virtual Answer end(jint number, jobject result) = 0;

    // ---- Entries

    template <auto Entry>
    struct Entered;
    template <class Rules, class Result, class... Arguments, Result (Rules::*Entry)(Arguments...)>
    struct Entered<Entry> {
        static Result JNICALL call(JNIEnv *env, Arguments... arguments)
        {
            State &state = *static_cast<Env *>(env)->state;
            const Flag machine(state.options.inNative, false);
            return (static_cast<Rules &>(state).*Entry)(arguments...);
        }
    };

    // The entries that the library has business with.
    template <class Rules>
    void provide()
    {
        table.FindClass = Entered<&Rules::FindClass>::call;
        table.RegisterNatives = Entered<&Rules::RegisterNatives>::call;
        table.ExceptionCheck = Entered<&Rules::ExceptionCheck>::call;
        table.DeleteLocalRef = Entered<&Rules::DeleteLocalRef>::call;
        table.NewStringUTF = Entered<&Rules::NewStringUTF>::call;
        table.NewObjectArray = Entered<&Rules::NewObjectArray>::call;
        table.SetObjectArrayElement = Entered<&Rules::SetObjectArrayElement>::call;
        table.NewByteArray = Entered<&Rules::NewByteArray>::call;
        table.SetByteArrayRegion = Entered<&Rules::SetByteArrayRegion>::call;
        table.GetArrayLength = Entered<&Rules::GetArrayLength>::call;
        table.GetByteArrayElements = Entered<&Rules::GetByteArrayElements>::call;
        table.ReleaseByteArrayElements = Entered<&Rules::ReleaseByteArrayElements>::call;
    }

    virtual void enter(const char *entry) = 0;

    static jint JNICALL GetEnv(JavaVM *vm, void **env, jint version)
    {
        State &state = *static_cast<JavaVm *>(vm)->state;
        const Flag machine(state.options.inNative, false);
        state.enter("GetEnv");
        if (version != JNI_VERSION_1_4) {
            die("GetEnv of another version than 1.4");
        }
        *env = state.owner->hasEnvironment ? static_cast<JNIEnv *>(&state.env) : nullptr;
        return state.owner->environmentResult;
    }

    void keep(const std::string &javaClass, const JNINativeMethod *methods, size_t count)
    {
        std::for_each_n(methods, count, [&](const JNINativeMethod &method) {
            natives.push_back({javaClass, method.name, method.signature, method.fnPtr});
        });
    }

    virtual const std::vector<Native> &registered() { return natives; }

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

    // ---- Natives

    template <class Result, class... Argument>
    Result invoke(void *function, Argument... arguments)
    {
        const Flag native(options.inNative, true);
        return reinterpret_cast<Result (*)(Argument...)>(function)(arguments...);
    }

    template <class Result>
    Result apply(void *function, jobject self, std::span<const jint> i)
    {
        JNIEnv *e = &env;
        switch (i.size()) {
        case 0:
            return invoke<Result>(function, e, self);
        case 1:
            return invoke<Result>(function, e, self, i[0]);
        case 2:
            return invoke<Result>(function, e, self, i[0], i[1]);
        case 3:
            return invoke<Result>(function, e, self, i[0], i[1], i[2]);
        case 4:
            return invoke<Result>(function, e, self, i[0], i[1], i[2], i[3]);
        default:
            die("a native with more than four indexes");
        }
    }
};

// Holds the library to the rules.
struct Vm::Strict : Vm::State {
    // The array elements that a native has in its hands.
    struct Pinned {
        ObjectPtr array;
        std::unique_ptr<jbyte[]> copy; // unless they are lent
    };

    Strict(Vm *vm, const Options &chosen) : State(vm, chosen) { provide<Strict>(); }

    // ---- The native that is running

    ObjectPtr message;          // that it was given
    bool pending = false;       // an exception
    std::string uncheckedEntry; // its exception check is due
    std::vector<std::unique_ptr<Reference>> references;
    std::vector<Reference *> live;      // local references made by the native
    std::vector<Reference *> arguments; // and those that it was given
    std::map<const jbyte *, Pinned> pinned;

    // ---- References

    jobject refer(ObjectPtr object, std::vector<Reference *> *owners)
    {
        references.push_back(std::make_unique<Reference>(Reference{std::move(object)}));
        owners->push_back(references.back().get());
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
        if (!std::count(live.begin(), live.end(), known) &&
            !std::count(arguments.begin(), arguments.end(), known)) {
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

    void enter(const char *entry) override
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

    jclass FindClass(const char *name)
    {
        if (!enterFallible("FindClass")) {
            return nullptr;
        }
        if (name == owner->lackedClass) {
            pending = true;
            return nullptr;
        }
        return local<jclass>({.kind = Object::kClass, .text = name});
    }

    jint RegisterNatives(jclass javaClass, const JNINativeMethod *methods, jint count)
    {
        if (!enterFallible("RegisterNatives")) {
            return JNI_ERR;
        }
        const std::string name = object(javaClass, Object::kClass)->text;
        if (name == owner->refusedClass) {
            pending = true;
            return JNI_ERR;
        }
        keep(name, methods, static_cast<size_t>(count));
        return JNI_OK;
    }

    jboolean ExceptionCheck()
    {
        enterAnyway("ExceptionCheck");
        uncheckedEntry.clear();
        return pending ? JNI_TRUE : JNI_FALSE;
    }

    void DeleteLocalRef(jobject reference)
    {
        enterAnyway("DeleteLocalRef");
        Reference *known = reinterpret_cast<Reference *>(reference);
        if (!std::erase(live, known)) {
            die("DeleteLocalRef of what is no local reference of this native");
        }
        known->object.reset();
    }

    jstring NewStringUTF(const char *text)
    {
        if (!enterFallible("NewStringUTF")) {
            return nullptr;
        }
        const std::string bytes = text;
        if (memcmp(text + bytes.size(), kZeroBytes, sizeof kZeroBytes) != 0) {
            die("text without four zero bytes behind it: " + bytes);
        }
        return local<jstring>({.kind = Object::kString, .text = bytes});
    }

    jobjectArray NewObjectArray(jsize length, jclass elementClass, jobject initial)
    {
        if (!enterFallible("NewObjectArray")) {
            return nullptr;
        }
        if (length < 0 || object(elementClass, Object::kClass)->text != "java/lang/String") {
            die("NewObjectArray of a negative length or of another class than String");
        }
        const ObjectPtr element = initial ? object(initial, Object::kString) : nullptr;
        return local<jobjectArray>(
            {.kind = Object::kStringArray,
             .elements = std::vector<ObjectPtr>(static_cast<size_t>(length), element)});
    }

    void SetObjectArrayElement(jobjectArray array, jsize index, jobject element)
    {
        const bool succeeds = enterFallible("SetObjectArrayElement");
        uncheckedEntry = "SetObjectArrayElement";
        std::vector<ObjectPtr> &elements = object(array, Object::kStringArray)->elements;
        const ObjectPtr value = element ? object(element, Object::kString) : nullptr;
        if (index < 0 || static_cast<size_t>(index) >= elements.size()) {
            die("SetObjectArrayElement outside the array");
        }
        if (succeeds) {
            elements[static_cast<size_t>(index)] = value;
        }
    }

    jbyteArray NewByteArray(jsize length)
    {
        if (!enterFallible("NewByteArray")) {
            return nullptr;
        }
        if (length < 0) {
            die("NewByteArray of a negative length");
        }
        return local<jbyteArray>(
            {.kind = Object::kByteArray, .bytes = Bytes(static_cast<size_t>(length))});
    }

    void SetByteArrayRegion(jbyteArray array, jsize start, jsize length, const jbyte *bytes)
    {
        const bool succeeds = enterFallible("SetByteArrayRegion");
        uncheckedEntry = "SetByteArrayRegion";
        Bytes &target = object(array, Object::kByteArray)->bytes;
        if (start < 0 || length < 0 ||
            static_cast<size_t>(start) + static_cast<size_t>(length) > target.size()) {
            die("SetByteArrayRegion outside the array");
        }
        if (succeeds) {
            std::copy_n(reinterpret_cast<const uint8_t *>(bytes), length, target.begin() + start);
        }
    }

    jsize GetArrayLength(jarray array)
    {
        enter("GetArrayLength");
        return static_cast<jsize>(object(array, Object::kByteArray)->bytes.size());
    }

    // Hands out a copy, so that a sanitizer sees every byte that is read or written outside it,
    // unless the message is lent.
    jbyte *GetByteArrayElements(jbyteArray array, jboolean *isCopy)
    {
        if (!enterFallible("GetByteArrayElements")) {
            return nullptr;
        }
        const ObjectPtr source = object(array, Object::kByteArray);
        if (isCopy) {
            *isCopy = JNI_TRUE;
        }
        if (options.lender && source == message) {
            jbyte *elements = elementsOf(options.lender->lend());
            pinned[elements] = {source, nullptr};
            return elements;
        }
        auto copy = std::make_unique<jbyte[]>(source->bytes.size());
        std::copy(source->bytes.begin(), source->bytes.end(), copy.get());
        jbyte *elements = copy.get();
        pinned[elements] = {source, std::move(copy)};
        return elements;
    }

    void ReleaseByteArrayElements(jbyteArray array, jbyte *elements, jint mode)
    {
        enterAnyway("ReleaseByteArrayElements");
        const auto found = pinned.find(elements);
        if (found == pinned.end() || object(array) != found->second.array) {
            die("ReleaseByteArrayElements of what was not handed out");
        }
        const Bytes &source = found->second.array->bytes;
        if (mode != JNI_ABORT) {
            die("ReleaseByteArrayElements copies back");
        }
        if (!std::equal(source.begin(), source.end(), reinterpret_cast<uint8_t *>(elements))) {
            die("array elements were written to");
        }
        if (!found->second.copy) {
            options.lender->takeBack();
        }
        pinned.erase(found);
    }

    // ---- Natives

    jobject begin() override
    {
        calls.clear();
        return refer(std::make_shared<Object>(Object{.kind = Object::kThis}), &arguments);
    }

    jbyteArray argument(const Bytes &bytes) override
    {
        message = std::make_shared<Object>(Object{.kind = Object::kByteArray, .bytes = bytes});
        return static_cast<jbyteArray>(refer(message, &arguments));
    }

    // Takes what a native returned for an answer, and holds it to the rules of a return.
    Answer end(jint number, jobject result) override
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
        std::erase(live, reinterpret_cast<Reference *>(result));
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
};

// Costs next to nothing.
struct Vm::Quiet : Vm::State {
    Quiet(Vm *vm, const Options &chosen) : State(vm, chosen) { provide<Quiet>(); }

    std::vector<JNINativeMethod> rows; // that were registered; `natives` when they are asked for
    const Bytes *message = nullptr;
    size_t textSeen = 0;

    // Something that is not null.
    template <class Reference = jobject>
    static Reference refer()
    {
        static _jobjectArray something;
        return static_cast<Reference>(static_cast<void *>(&something));
    }

    jclass FindClass(const char *) { return refer<jclass>(); }
    jint RegisterNatives(jclass, const JNINativeMethod *methods, jint count)
    {
        rows.insert(rows.end(), methods, methods + count);
        return JNI_OK;
    }
    jboolean ExceptionCheck() { return JNI_FALSE; }
    void DeleteLocalRef(jobject) {}
    jstring NewStringUTF(const char *text)
    {
        textSeen += strlen(text);
        return refer<jstring>();
    }
    jobjectArray NewObjectArray(jsize, jclass, jobject) { return refer<jobjectArray>(); }
    void SetObjectArrayElement(jobjectArray, jsize, jobject) {}
    jbyteArray NewByteArray(jsize) { return refer<jbyteArray>(); }
    void SetByteArrayRegion(jbyteArray, jsize, jsize, const jbyte *) {}
    jsize GetArrayLength(jarray) { return static_cast<jsize>(message->size()); }
    jbyte *GetByteArrayElements(jbyteArray, jboolean *) { return elementsOf(message->data()); }
    void ReleaseByteArrayElements(jbyteArray, jbyte *, jint) {}

    const std::vector<Native> &registered() override
    {
        keep({}, rows.data() + natives.size(), rows.size() - natives.size());
        return natives;
    }
    void enter(const char *) override {}
    jobject begin() override { return refer(); }
    jbyteArray argument(const Bytes &bytes) override
    {
        message = &bytes;
        return refer<jbyteArray>();
    }
    Answer end(jint number, jobject result) override { return {.number = result ? 1 : number}; }
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

bool saysNothing(const Answer &answer)
{
    return answer.number <= 0 && !answer.text && !answer.array && !answer.bytes;
}

Vm::Vm(const Options &options)
{
    if (options.quiet) {
        state_ = std::make_unique<Quiet>(this, options);
    } else {
        state_ = std::make_unique<Strict>(this, options);
    }
}

Vm::~Vm() = default;

Answer Vm::load(jint (*entry)(JavaVM *, void *))
{
    state_->begin();
    JavaVM *vm = &state_->javaVm;
    return state_->end(
        state_->invoke<jint>(reinterpret_cast<void *>(entry), vm, static_cast<void *>(nullptr)),
        nullptr);
}

const std::vector<Native> &Vm::natives() const
{
    return state_->registered();
}

const Native &Vm::native(std::string_view name) const
{
    const auto found = std::find_if(natives().begin(), natives().end(),
                                    [name](const Native &native) { return native.name == name; });
    if (found == natives().end()) {
        die("no native of the name " + std::string(name));
    }
    return *found;
}

Answer Vm::call(std::string_view name, std::initializer_list<jint> indexes)
{
    return call(native(name), {indexes.begin(), indexes.size()});
}

Answer Vm::call(const Native &native, std::span<const jint> indexes)
{
    const size_t end = indexes.size() + 1;
    if (native.indexes() != indexes.size() || native.signature.find_first_not_of('I', 1) != end) {
        die(std::string(native.name) + " called with other arguments than its signature names");
    }
    const std::string_view result = native.signature.substr(end + 1);
    jobject self = state_->begin();
    jint number = 0;
    jobject object = nullptr;
    if (result == "V") {
        state_->apply<void>(native.function, self, indexes);
    } else if (result == "I") {
        number = state_->apply<jint>(native.function, self, indexes);
    } else if (result == "[B") {
        object = state_->apply<jbyteArray>(native.function, self, indexes);
    } else if (result == "[Ljava/lang/String;") {
        object = state_->apply<jobjectArray>(native.function, self, indexes);
    } else {
        object = state_->apply<jstring>(native.function, self, indexes);
    }
    return state_->end(number, object);
}

long Vm::query(jint first, jint last)
{
    long answered = 0;
    for (const Native &native : natives()) {
        if (native.isQuery()) {
            jint indexes[] = {first, first, first, first};
            const size_t count = native.indexes();
            indexes[count > 0 ? count - 1 : 0] = last;
            answered += !saysNothing(call(native, {indexes, count}));
        }
    }
    return answered;
}

Answer Vm::parse(const Bytes *message, jlong length, jint mode)
{
    const Native &parser = native("qvomacp_parser");
    if (parser.signature != "([BJI)Z") {
        die("a parse method with other arguments");
    }
    JNIEnv *env = &state_->env;
    jobject self = state_->begin();
    jbyteArray array = message ? state_->argument(*message) : nullptr;
    return state_->end(state_->invoke<jboolean>(parser.function, env, self, array, length, mode),
                       nullptr);
}

Answer Vm::parse(const Bytes &message, jint mode)
{
    return parse(&message, static_cast<jlong>(message.size()), mode);
}

std::vector<std::string> Vm::calls() const
{
    return {state_->calls.begin(), state_->calls.end()};
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
