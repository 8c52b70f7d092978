// Whole sessions with an allocation, or a call of the virtual machine, that fails: each in turn.
// Nothing may be lost that is not lost without a failure, and the next session works.
#include "documents.h"
#include "losses.h"
#include "session.h"

#include "support/blocks.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <set>
#include <string>

namespace sweep {

namespace {

// OMACP_SWEEP=all in the environment: no failure is left out.
bool sweepsAll()
{
    const char *wanted = getenv("OMACP_SWEEP");
    return wanted && std::string(wanted) == "all";
}

// A session as it goes when nothing fails.
struct Expected {
    explicit Expected(Session *session)
    {
        Losses losses;
        blocks::startCounting();
        steps = session->play();
        allocations = static_cast<long>(blocks::allocations());
        lost = losses.count();
        fallibleCalls = session->fallibleCalls();
        keptByContexts = session->keptByContexts();
    }

    // How many blocks the last play of the session may lose.
    size_t mayLose(const Session &session) const
    {
        return lost + std::max(session.keptByContexts(), keptByContexts) - keptByContexts;
    }

    Steps steps;
    long allocations;
    size_t lost;
    long fallibleCalls;
    size_t keptByContexts;
};

// The failures to try out of `count`: all of them, or the first and the last ones and so many in
// between that there are about `most`.
std::vector<long> chosen(long count, long most)
{
    const long edge = most / 4;
    const long stride = std::max(1L, (count - 2 * edge) / (most - 2 * edge));
    std::vector<long> numbers;
    for (long n = 0; n < count; ++n) {
        if (sweepsAll() || n < edge || n >= count - edge || (n - edge) % stride == 0) {
            numbers.push_back(n);
        }
    }
    return numbers;
}

void expectSame(const Steps &steps, const Steps &expected)
{
    EXPECT_EQ(steps.size(), expected.size());
    const auto [step, other] =
        std::mismatch(steps.begin(), steps.end(), expected.begin(), expected.end());
    if (step != steps.end() && other != expected.end()) {
        EXPECT_EQ(*step, *other);
    }
}

void expectWorks(Session *session, const Expected &expected)
{
    SCOPED_TRACE("the next session");
    Losses losses;
    expectSame(session->play(), expected.steps);
    EXPECT_EQ(losses.count(), expected.lost);
}

bool saysNothing(const fakevm::Answer &answer)
{
    return answer.number <= 0 && !answer.text && !answer.array && !answer.bytes;
}

// Without memory a message is parsed in part, or not at all: then there is nothing to be asked. No
// native throws anything.
void expectLessThan(const Steps &steps, const Expected &expected)
{
    ASSERT_EQ(steps.size(), expected.steps.size());
    bool parsed = true;
    for (size_t i = 0; i < steps.size(); ++i) {
        EXPECT_FALSE(steps[i].answer.exception);
        if (steps[i].call.rfind("parse ", 0) == 0) {
            parsed = steps[i].answer.number == 1;
            EXPECT_LE(steps[i].answer.number, expected.steps[i].answer.number);
        } else if (!parsed) {
            EXPECT_TRUE(saysNothing(steps[i].answer)) << testing::PrintToString(steps[i]);
        } else if (steps[i].call.rfind("qvomacp_GetParser", 0) == 0) {
            EXPECT_EQ(steps[i], expected.steps[i]);
        }
    }
}

// With an allocation failing, once or from then on.
void sweepAllocations(const Document &document, long most)
{
    SCOPED_TRACE(document.name);
    Session session(document.message);
    const Expected expected(&session);
    for (const bool fromThenOn : {false, true}) {
        for (const long n : chosen(expected.allocations, most)) {
            SCOPED_TRACE(testing::Message()
                         << (fromThenOn ? "from" : "only") << " allocation " << n << " fails");
            Losses losses;
            blocks::failFromThenOn = fromThenOn;
            blocks::failAt = n;
            const Steps steps = session.play();
            EXPECT_LT(blocks::failAt, 0) << "there was no such allocation";
            blocks::reset();
            blocks::failFromThenOn = false;
            EXPECT_LE(losses.count(), expected.mayLose(session));
            expectLessThan(steps, expected);
            expectWorks(&session, expected);
            if (testing::Test::HasFailure()) {
                return;
            }
        }
    }
}

// With each call of the machine failing and the native called again.
void sweepCalls(const Document &document)
{
    SCOPED_TRACE(document.name);
    Session session(document.message);
    const Expected expected(&session);
    Losses losses;
    expectSame(session.playRepeating(), expected.steps);
    EXPECT_EQ(losses.count(), expected.lost);
}

// With each call of the machine failing and the session going on as if nothing had been.
void sweepCallsOfSession(const Document &document, long most)
{
    SCOPED_TRACE(document.name);
    Session session(document.message);
    const Expected expected(&session);
    EXPECT_GT(expected.fallibleCalls, 0);
    for (const long n : chosen(expected.fallibleCalls, most)) {
        SCOPED_TRACE(testing::Message() << "call " << n << " fails");
        Losses losses;
        const Steps steps = session.playFailing(n);
        EXPECT_LE(losses.count(), expected.lost);
        EXPECT_EQ(std::count_if(steps.begin(), steps.end(),
                                [](const Step &step) { return step.answer.exception; }),
                  1);
        expectWorks(&session, expected);
        if (testing::Test::HasFailure()) {
            return;
        }
    }
}

TEST(Documents, LetEveryNativeAnswerSomething)
{
    std::set<std::string> silent;
    std::set<std::string> heard;
    for (const Document &document : smallDocuments()) {
        Losses losses;
        for (const Step &step : Session(document.message).play()) {
            const std::string name = step.call.substr(0, step.call.find(' '));
            (saysNothing(step.answer) ? silent : heard).insert(name);
        }
        losses.count();
    }
    for (const std::string &name : silent) {
        const bool answersNothing =
            name == "qvomacp_parser_del" || name == "qvomacp_SetPxNapDefIndex";
        EXPECT_EQ(heard.count(name), answersNothing ? 0U : 1U) << name;
    }
    EXPECT_FALSE(samples().empty());
}

constexpr long kForSmall = 40;
constexpr long kForSamples = 120;
constexpr long kForSeeds = 12;

TEST(AllocationSweep, OverSmallDocuments)
{
    for (const Document &document : smallDocuments()) {
        sweepAllocations(document, kForSmall);
    }
}

TEST(AllocationSweep, OverSamples)
{
    for (const Document &document : samples()) {
        sweepAllocations(document, kForSamples);
    }
}

TEST(AllocationSweep, OverSeeds)
{
    for (const Document &document : seeds()) {
        sweepAllocations(document, kForSeeds);
    }
}

TEST(CallSweep, OverSmallDocuments)
{
    for (const Document &document : smallDocuments()) {
        sweepCalls(document);
    }
}

TEST(CallSweep, OverSamples)
{
    for (const Document &document : samples()) {
        sweepCalls(document);
        sweepCallsOfSession(document, kForSamples);
    }
}

TEST(CallSweep, OverSeeds)
{
    for (const Document &document : seeds()) {
        sweepCalls(document);
    }
}

} // namespace

} // namespace sweep
