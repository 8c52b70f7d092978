#include "session.h"

#include "qvsJni.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <climits>

extern "C" void __real_qvsClientProvCtxDelectContext(qvsClientProvCtx *context);

namespace sweep {

namespace {

size_t keptByReleased = 0; // blocks, of the contexts that were released

using fakevm::Answer;
using fakevm::Native;
using fakevm::Vm;
using Indexes = std::vector<jint>;

constexpr jint kHeaderOnly = 1;
constexpr jint kWhole = 0;

Vm &machine()
{
    static Vm *const vm = [] {
        auto *made = new Vm;
        EXPECT_EQ(made->load().number, JNI_VERSION_1_4);
        return made;
    }();
    return *vm;
}

// The indexes that a query with so many of them is asked with: the first of everything, nothing,
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

std::vector<Call> makeCalls()
{
    std::vector<Call> all;
    const auto add = [&](std::string_view name, const Indexes &arguments = {}) {
        for (const Native &native : machine().natives()) {
            if (native.name == name) {
                all.push_back({Call::kOther, &native, arguments});
            }
        }
    };
    const auto addQueries = [&](bool ofHeader) {
        for (const Native &native : machine().natives()) {
            const bool asksHeader = native.name.rfind("qvomacp_GetParser", 0) == 0;
            if (native.isQuery() && (asksHeader || !ofHeader)) {
                for (const Indexes &indexes : representative(native.indexes())) {
                    all.push_back(
                        {asksHeader ? Call::kHeaderQuery : Call::kQuery, &native, indexes});
                }
            }
        }
    };
    all.push_back({Call::kParse, nullptr, {kHeaderOnly}});
    addQueries(true);
    add("qvomacp_parser_del");
    all.push_back({Call::kParse, nullptr, {kWhole}});
    addQueries(false);
    // The access points before a chosen one are lost, behind the last one all are.
    for (const jint chosen : {1, 2, INT_MAX}) {
        add("qvomacp_SetPxNapDefIndex", {chosen});
        add("qvomacp_GetPxNapDefCount");
        add("qvomacp_GetPxNapDefData", {1});
    }
    add("qvomacp_parser_del");
    return all;
}

// The texts among so many first fields of a record.
template <class Record>
size_t textsOf(const Record *record, size_t fields)
{
    const char *const *field = reinterpret_cast<const char *const *>(record);
    return static_cast<size_t>(
        std::count_if(field, field + fields, [](const char *text) { return text; }));
}

} // namespace

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

const std::vector<Call> &calls()
{
    static const std::vector<Call> all = makeCalls();
    return all;
}

std::string Call::shown() const
{
    std::string text(native ? native->name : "parse");
    for (const jint argument : arguments) {
        text += ' ' + std::to_string(argument);
    }
    return text;
}

Answer Session::ask(const Call &call)
{
    return call.kind == Call::kParse ? machine().parse(message_, call.arguments[0])
                                     : machine().call(*call.native, call.arguments);
}

void Session::failEach(const Call &call)
{
    for (long n = 0;; ++n) {
        machine().failCall(n);
        // A parse has one call that can fail; behind it a message would be parsed.
        const Answer answer = n > 0 && call.kind == Call::kParse ? Answer{} : ask(call);
        if (!machine().hasFailed()) {
            return;
        }
        ++failures_;
        EXPECT_EQ(answer, Answer{.exception = true}) << call.shown() << ", call " << n;
    }
}

Answers Session::play()
{
    Answers answers;
    answers.reserve(calls().size());
    const size_t keptBefore = keptByReleased;
    for (const Call &call : calls()) {
        answers.push_back(ask(call));
    }
    kept_ = keptByReleased - keptBefore;
    EXPECT_EQ(ptCtx, nullptr);
    EXPECT_EQ(qvs::ptPushHdlrInfo, nullptr);
    return answers;
}

Answers Session::playFailing()
{
    Answers answers;
    for (const Call &call : calls()) {
        // What sets or deletes calls nothing that can fail, and is done once.
        if (call.kind != Call::kOther) {
            failEach(call);
        }
        if (call.kind == Call::kParse) {
            for (const Call &other : calls()) {
                if (other.kind == Call::kQuery || other.kind == Call::kHeaderQuery) {
                    EXPECT_TRUE(saysNothing(ask(other))) << other.shown();
                }
            }
        }
        answers.push_back(ask(call));
    }
    return answers;
}

} // namespace sweep

// In place of the release, for whoever calls it: a parse may release a context that nobody saw.
extern "C" void __wrap_qvsClientProvCtxDelectContext(qvsClientProvCtx *context)
{
    sweep::keptByReleased += context ? sweep::keptBy(context) : 0;
    __real_qvsClientProvCtxDelectContext(context);
}
