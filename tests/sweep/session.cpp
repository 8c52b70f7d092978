#include "session.h"

#include "qvsJni.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <climits>
#include <utility>

namespace sweep {

namespace {

using fakevm::Answer;
using fakevm::Native;
using fakevm::Vm;
using Indexes = std::vector<jint>;

constexpr jint kHeaderOnly = 1;
constexpr jint kWhole = 0;
constexpr char kSetter[] = "qvomacp_SetPxNapDefIndex";
constexpr char kDelete[] = "qvomacp_parser_del";

// The indexes that a native with so many of them is called with: the first of everything, nothing,
// and the second of the innermost and of the outermost.
std::vector<Indexes> representative(size_t count)
{
    std::vector<Indexes> all = {Indexes(count, 1)};
    if (count > 0) {
        all.push_back(Indexes(count, 0));
        all.push_back(Indexes(count, 1));
        all.back().back() = 2;
    }
    if (count > 1) {
        all.push_back(Indexes(count, 1));
        all.back().front() = 2;
    }
    return all;
}

std::string shown(const std::string &name, const Indexes &indexes)
{
    std::string text = name;
    for (const jint index : indexes) {
        text += ' ' + std::to_string(index);
    }
    return text;
}

// Whether a native asks something and takes nothing but indexes.
bool isQuery(const Native &native)
{
    return native.signature.back() != 'V' && native.signature.back() != 'Z';
}

bool isFallible(const std::string &entry)
{
    static const std::vector<std::string> kSafe = {
        "ExceptionCheck", "DeleteLocalRef", "GetArrayLength", "ReleaseByteArrayElements", "GetEnv"};
    return std::find(kSafe.begin(), kSafe.end(), entry) == kSafe.end();
}

// The texts among so many first fields of a record.
template <class Record>
size_t textsOf(const Record *record, size_t fields)
{
    const char *const *field = reinterpret_cast<const char *const *>(record);
    return static_cast<size_t>(
        std::count_if(field, field + fields, [](const char *text) { return text; }));
}

// What a context does not let go of: WI-FI and ROAMING records, the texts of XCAP, and the copy of
// FROM that was replaced.
size_t keptBy(const qvsClientProvCtx *context)
{
    size_t kept = 0;
    for (const auto *wifi = context->ptWifi; wifi; wifi = wifi->ptNext) {
        kept += 1 + textsOf(wifi, 12);
    }
    for (const auto *one = context->ptApplication; one; one = one->ptNext) {
        kept += textsOf(one, 12) - textsOf(one, 7) + (one->pszFrom ? 1 : 0);
        for (const auto *roaming = one->ptRoaming; roaming; roaming = roaming->ptNext) {
            kept += 1 + textsOf(roaming, 2);
        }
    }
    return kept;
}

} // namespace

// One run through a session.
struct Session::Run {
    explicit Run(const fakevm::Bytes &message) : message_(message) {}

    Steps play()
    {
        if (load().number != JNI_VERSION_1_4) {
            return steps;
        }
        parse(kHeaderOnly);
        askHeader();
        call(kDelete);
        parse(kWhole);
        askEverything();
        // The access points before a chosen one are lost, behind the last one all are.
        for (const jint chosen : {1, 2, INT_MAX}) {
            call(kSetter, {chosen});
            call("qvomacp_GetPxNapDefCount");
            call("qvomacp_GetPxNapDefData", {1});
        }
        call(kDelete);
        parse(kWhole);
        call("qvomacp_GetParserContentType");
        call("qvomacp_GetPxNapDefCount");
        call(kDelete);
        EXPECT_EQ(ptCtx, nullptr);
        EXPECT_EQ(qvs::ptPushHdlrInfo, nullptr);
        return steps;
    }

    Vm vm;
    Steps steps;
    long fallible = 0;
    size_t kept = 0;
    bool repeating = false;

private:
    const Answer &note(const std::string &name, const Answer &answer)
    {
        fallible += std::count_if(vm.calls().begin(), vm.calls().end(), isFallible);
        steps.push_back({name, answer});
        return answer;
    }

    Answer load()
    {
        // Each on a machine of its own, which keeps the classes that were registered before.
        for (long n = 0; repeating; ++n) {
            Vm fresh;
            fresh.failCall(n);
            const Answer answer = fresh.load();
            if (!fresh.hasFailed()) {
                break;
            }
            EXPECT_EQ(answer, (Answer{.number = JNI_ERR, .exception = true})) << n;
        }
        return note("load", vm.load());
    }

    void parse(jint mode)
    {
        const std::string name = "parse " + std::to_string(mode);
        if (repeating) {
            // One call can fail; behind it a message would be parsed.
            vm.failCall(0);
            EXPECT_EQ(vm.parse(message_, mode), Answer{.exception = true}) << name;
            EXPECT_TRUE(vm.hasFailed());
        }
        note(name, vm.parse(message_, mode));
        kept += ptCtx ? keptBy(ptCtx) : 0;
    }

    void call(const Native &native, const Indexes &indexes)
    {
        const std::string name = shown(native.name, indexes);
        long n = 0;
        if (repeating) {
            vm.failCall(n);
        }
        Answer answer = vm.call(native, indexes);
        while (repeating && vm.hasFailed()) {
            EXPECT_EQ(answer, Answer{.exception = true}) << name << ", call " << n;
            vm.failCall(++n);
            answer = vm.call(native, indexes);
        }
        note(name, answer);
    }

    void call(const std::string &name, const Indexes &indexes = {})
    {
        for (const Native &native : vm.natives()) {
            if (native.name == name) {
                call(native, indexes);
                return;
            }
        }
        ADD_FAILURE() << "no native " << name;
    }

    void askHeader()
    {
        for (const Native &native : vm.natives()) {
            if (isQuery(native) && native.name.rfind("qvomacp_GetParser", 0) == 0) {
                call(native, {});
            }
        }
    }

    void askEverything()
    {
        for (const Native &native : vm.natives()) {
            if (isQuery(native)) {
                for (const Indexes &indexes : representative(native.indexes())) {
                    call(native, indexes);
                }
            }
        }
    }

    const fakevm::Bytes &message_;
};

void PrintTo(const Step &step, std::ostream *out)
{
    *out << step.call << ": ";
    PrintTo(step.answer, out);
}

Steps Session::play()
{
    Run run(message_);
    Steps steps = run.play();
    fallibleCalls_ = run.fallible;
    keptByContexts_ = run.kept;
    return steps;
}

Steps Session::playFailing(long n)
{
    Run run(message_);
    run.vm.failCall(n);
    Steps steps = run.play();
    EXPECT_TRUE(run.vm.hasFailed()) << "there was no such call";
    return steps;
}

Steps Session::playRepeating()
{
    Run run(message_);
    run.repeating = true;
    return run.play();
}

} // namespace sweep
