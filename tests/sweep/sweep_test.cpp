// Whole sessions with an allocation, or a call of the virtual machine, that fails: each in turn.
// Nothing may be lost that is not lost without a failure, and the next session works.
#include "choice.h"
#include "documents.h"
#include "losses.h"
#include "session.h"

#include "fuzz/generate.h"
#include "support/blocks.h"

#include <gtest/gtest.h>

#include <malloc.h>

#include <algorithm>
#include <climits>
#include <cstdlib>
#include <set>
#include <string>

namespace sweep {

namespace {

// A session as it goes when nothing fails.
struct Expected {
    explicit Expected(Session *session)
    {
        Losses losses;
        blocks::startCounting();
        answers = session->play();
        allocations = blocks::allocations();
        lost = losses.count();
        keptByContexts = session->keptByContexts();
    }

    // How many blocks the last play of the session may lose.
    size_t mayLose(const Session &session) const
    {
        return lost + std::max(session.keptByContexts(), keptByContexts) - keptByContexts;
    }

    Answers answers;
    size_t allocations;
    size_t lost;
    size_t keptByContexts;
};

void expectSame(const Answers &answers, const Answers &expected)
{
    ASSERT_EQ(answers.size(), expected.size());
    for (size_t i = 0; i < answers.size(); ++i) {
        ASSERT_EQ(answers[i], expected[i]) << calls()[i].shown();
    }
}

void expectWorks(Session *session, const Expected &expected)
{
    SCOPED_TRACE("the next session");
    Losses losses;
    expectSame(session->play(), expected.answers);
    EXPECT_EQ(losses.count(), expected.lost);
}

// Without memory for all of it a message is refused: then there is nothing to be asked. One that is
// taken is taken whole. No native throws anything.
void expectWholeOrRefused(const Answers &answers, const Expected &expected)
{
    bool parsed = true;
    for (size_t i = 0; i < answers.size(); ++i) {
        const Call &call = calls()[i];
        EXPECT_FALSE(answers[i].exception) << call.shown();
        if (call.kind == Call::kParse) {
            parsed = answers[i].number == 1;
        }
        if (parsed) {
            EXPECT_EQ(answers[i], expected.answers[i]) << call.shown();
        } else {
            EXPECT_TRUE(saysNothing(answers[i])) << call.shown();
        }
    }
}

// With an allocation failing, once or from then on. Returns how many failures were tried.
size_t sweepAllocations(const Document &document, fuzz::Random *random, size_t parts)
{
    SCOPED_TRACE(document.name);
    Session session(document.message);
    const Expected expected(&session);
    size_t tried = 0;
    for (const bool fromThenOn : {false, true}) {
        for (size_t n = random->below(parts); n < expected.allocations; n += parts) {
            SCOPED_TRACE(testing::Message()
                         << (fromThenOn ? "from" : "only") << " allocation " << n << " fails");
            Losses losses;
            blocks::failFromThenOn = fromThenOn;
            blocks::failAt = static_cast<long>(n);
            const Answers answers = session.play();
            EXPECT_LT(blocks::failAt, 0) << "there was no such allocation";
            blocks::reset();
            blocks::failFromThenOn = false;
            EXPECT_LE(losses.count(), expected.mayLose(session));
            expectWholeOrRefused(answers, expected);
            expectWorks(&session, expected);
            ++tried;
            if (testing::Test::HasFailure()) {
                return tried;
            }
        }
    }
    return tried;
}

// With each call of the machine failing, in one of so many documents. Returns how many were tried.
size_t sweepCalls(const Document &document, fuzz::Random *random, size_t parts)
{
    if (!random->oneIn(parts)) {
        return 0;
    }
    SCOPED_TRACE(document.name);
    Session session(document.message);
    const Expected expected(&session);
    Losses losses;
    expectSame(session.playFailing(), expected.answers);
    EXPECT_EQ(losses.count(), expected.lost);
    expectWorks(&session, expected);
    return session.failures();
}

using Try = size_t (*)(const Document &document, fuzz::Random *random, size_t parts);

// Takes no memory back from the C library between sessions, which for the largest would take longer
// than the sessions.
void keepHeap()
{
    mallopt(M_TRIM_THRESHOLD, INT_MAX);
    mallopt(M_MMAP_MAX, 0);
}

void tryAll(const std::vector<Document> &documents, Try attempt)
{
    keepHeap();
    const Choice chosen = choice();
    fuzz::Random random(chosen.seed);
    size_t tried = 0;
    for (const Document &document : documents) {
        tried += attempt(document, &random, chosen.parts);
        if (testing::Test::HasFailure()) {
            return;
        }
    }
    EXPECT_GT(tried, 0U);
    printf("%zu failures in %zu documents\n", tried, documents.size());
}

TEST(Sweep, OfAllocations)
{
    tryAll(files(), sweepAllocations);
}

TEST(Sweep, OfAllocationsWithGenerated)
{
    tryAll(generated(choice().seed), sweepAllocations);
}

TEST(Sweep, OfCallsOfTheMachine)
{
    tryAll(files(), sweepCalls);
}

TEST(Sweep, OfCallsOfTheMachineWithGenerated)
{
    tryAll(generated(choice().seed), sweepCalls);
}

TEST(Sweep, OfTheLoad)
{
    long n = 0;
    for (;; ++n) {
        fakevm::Vm vm; // which keeps the classes that were registered before
        vm.failCall(n);
        const fakevm::Answer answer = vm.load();
        if (!vm.hasFailed()) {
            EXPECT_EQ(answer, fakevm::Answer{.number = JNI_VERSION_1_4});
            break;
        }
        EXPECT_EQ(answer, (fakevm::Answer{.number = JNI_ERR, .exception = true})) << n;
    }
    EXPECT_GT(n, 0);
}

TEST(Documents, LetEveryNativeAnswerSomething)
{
    std::set<std::string> silent;
    for (const Call &call : calls()) {
        silent.emplace(call.native ? call.native->name : "parse");
    }
    for (const Document &document : files()) {
        Losses losses;
        const Answers answers = Session(document.message).play();
        losses.count();
        for (size_t i = 0; i < answers.size(); ++i) {
            if (!saysNothing(answers[i])) {
                silent.erase(std::string(calls()[i].native ? calls()[i].native->name : "parse"));
            }
        }
    }
    EXPECT_EQ(silent, (std::set<std::string>{"qvomacp_SetPxNapDefIndex", "qvomacp_parser_del"}));
}

} // namespace

} // namespace sweep
