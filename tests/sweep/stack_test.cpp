// The stack that a session takes, whatever the message: sessions on a thread with 64 KiB, whose
// stack is painted to see how much of it the library touches.
#include "losses.h"

#include "cost/families.h"

#include "support/fakevm.h"

#include "qvstrace.h"

#include <gtest/gtest.h>

#include <pthread.h>
#include <sys/mman.h>

#include <climits>
#include <cstdint>
#include <cstring>
#include <string>

namespace {

constexpr size_t kStack = 64 * 1024;
constexpr size_t kGuard = 64 * 1024;
constexpr size_t kShare = 16 * 1024; // of the library
constexpr uint8_t kPaint = 0xA5;

#if defined(__SANITIZE_ADDRESS__)
constexpr bool kMeasures = false; // what a sanitizer adds to a frame is not the library's
constexpr size_t kSize = 128 * 1024;
#else
constexpr bool kMeasures = true;
constexpr size_t kSize = 1024 * 1024;
#endif

// The stack of a thread, with memory that cannot be touched below it.
class Stack {
public:
    Stack()
        : pages_(static_cast<uint8_t *>(mmap(nullptr, kGuard + kStack, PROT_READ | PROT_WRITE,
                                             MAP_PRIVATE | MAP_ANONYMOUS, -1, 0)))
    {
        EXPECT_NE(pages_, MAP_FAILED);
        EXPECT_EQ(mprotect(pages_, kGuard, PROT_NONE), 0);
    }
    Stack(const Stack &) = delete;
    Stack &operator=(const Stack &) = delete;
    ~Stack() { munmap(pages_, kGuard + kStack); }

    uint8_t *lowest() const { return pages_ + kGuard; }

private:
    uint8_t *pages_;
};

struct Work {
    fakevm::Vm *vm;
    const fakevm::Bytes &message;
    uint8_t *lowest;
    bool parsed = false;
    long answers = 0;
    size_t touched = 0; // bytes of stack
};

__attribute__((noinline)) void session(Work *work)
{
    work->parsed = work->vm->parse(work->message).number != 0;
    work->answers = work->vm->query(1, 1);
    work->vm->query(1, INT_MAX);
    work->vm->query(INT_MAX, 1);
    work->vm->call("qvomacp_parser_del");
}

// Paints what lies below its own frame, plays the session, and looks how far the paint is gone.
void *measure(void *argument)
{
    constexpr size_t kOwn = 512; // more than this frame takes below its address
    Work *work = static_cast<Work *>(argument);
    uint8_t *const here = static_cast<uint8_t *>(__builtin_frame_address(0));
    if (kMeasures) {
        for (volatile uint8_t *byte = work->lowest; byte != here - kOwn; ++byte) {
            *byte = kPaint;
        }
    }
    session(work);
    if (kMeasures) {
        const volatile uint8_t *byte = work->lowest;
        while (byte != here - kOwn && *byte == kPaint) {
            ++byte;
        }
        work->touched = static_cast<size_t>(here - byte);
    }
    return nullptr;
}

// The session over a message of the family, on a small stack.
Work play(const std::string &family, bool parsed)
{
    SCOPED_TRACE(family);
    const cost::Bytes bytes = cost::messageOf(cost::family(family), kSize);
    EXPECT_GT(bytes.size(), kSize - 1024);
    fakevm::Vm vm({.quiet = true});
    EXPECT_EQ(vm.load().number, JNI_VERSION_1_4);
    const Stack stack;
    Work work{.vm = &vm, .message = bytes, .lowest = stack.lowest()};
    sweep::Losses losses;
    pthread_attr_t attributes;
    EXPECT_EQ(pthread_attr_init(&attributes), 0);
    EXPECT_EQ(pthread_attr_setstack(&attributes, stack.lowest(), kStack), 0);
    pthread_t thread;
    EXPECT_EQ(pthread_create(&thread, &attributes, measure, &work), 0);
    EXPECT_EQ(pthread_join(thread, nullptr), 0);
    EXPECT_EQ(pthread_attr_destroy(&attributes), 0);
    losses.count();
    EXPECT_EQ(work.parsed, parsed);
    EXPECT_EQ(work.answers > 0, parsed);
    EXPECT_LE(work.touched, kShare);
    if (kMeasures) {
        EXPECT_GT(work.touched, 0U);
        testing::Test::RecordProperty("stack_of_" + family, static_cast<int>(work.touched));
        printf("%zu bytes of stack for %s\n", work.touched, family.c_str());
    }
    return work;
}

// With every message of the library formed, and dropped.
class Tracing {
public:
    Tracing()
    {
        qvs::traceSink = [](const char *, uint32_t) {};
    }
    Tracing(const Tracing &) = delete;
    Tracing &operator=(const Tracing &) = delete;
    ~Tracing() { qvs::traceSink = nullptr; }
};

const char *const kParsed[] = {"nesting", "nesting-filled", "siblings",
                               "lists",   "types",          "skip-deep"};
const char *const kRefused[] = {"nesting-refused", "nesting-unfinished", "siblings-refused",
                                "lists-refused"};

TEST(SmallStack, HoldsASessionOfAnyMessage)
{
    for (const char *family : kParsed) {
        play(family, true);
    }
}

TEST(SmallStack, HoldsASessionWhoseDecodeFailsAtItsEnd)
{
    for (const char *family : kRefused) {
        play(family, false);
    }
}

TEST(SmallStack, HoldsTheTracesToo)
{
    const Tracing tracing;
    play("nesting", true);
    play("lists", true);
    play("nesting-unfinished", false);
}

} // namespace
