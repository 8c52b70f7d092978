// A virtual machine for the natives, made of objects in memory: they run without Java, on any
// width, under sanitizers. What a real one only warns of or answers with a crash ends the program
// here, with a line that says what was wrong:
//   - an entry of the function table that the library has no business with
//   - a call that is forbidden while an exception is pending, and one that comes before the
//     exception check that the call before it asks for
//   - more than 16 local references at a time, one used after it was deleted, one left behind
//   - array elements not handed back, handed back with a copy, or written to
//   - text without four zero bytes at its end
// One that is quiet asks for none of it, to see what the library costs.
#pragma once

#include <jni.h>

#include <cstdint>
#include <initializer_list>
#include <memory>
#include <optional>
#include <ostream>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace fakevm {

using Bytes = std::vector<uint8_t>;
using Text = std::optional<std::string>; // null, or the bytes of a String
using Array = std::vector<Text>;

// What a native answered: the one that its type has a place for. An int 0, false and null are the
// same as no answer.
struct Answer {
    jint number = 0;
    Text text = {};
    std::optional<Array> array = {};
    std::optional<Bytes> bytes = {};
    bool exception = false; // one was pending on return; it has been cleared

    bool operator==(const Answer &) const = default;
};

void PrintTo(const Answer &answer, std::ostream *out);

// No number above 0, and null for all else.
bool saysNothing(const Answer &answer);

// A native as it was registered.
struct Native {
    std::string javaClass;
    std::string_view name; // where the library has it, which stays loaded
    std::string_view signature;
    void *function;

    // The number of its arguments, for the natives that take ints alone.
    size_t indexes() const { return signature.find(')') - 1; }
    // Whether it is asked something: not parse, delete and the choice of an access point.
    bool isQuery() const { return signature.back() != 'V' && signature.back() != 'Z'; }
};

// Memory that the bytes of a message are handed out in.
class Lender {
public:
    virtual const uint8_t *lend() = 0;
    virtual void takeBack() = 0;

protected:
    ~Lender() = default;
};

struct Options {
    // Costs next to nothing: hands out the same reference again and again, reads text as far as a
    // machine has to, and keeps nothing but the natives, without their classes. An answer that is
    // not null is the number 1. A message stays where it is.
    bool quiet = false;
    // True while a native runs, and as before while the machine does; null for none.
    bool *inNative = nullptr;
    // Of the bytes of a message; null for a copy on the heap each time.
    Lender *lender = nullptr;
};

class Vm {
public:
    explicit Vm(const Options &options = {});
    ~Vm();
    Vm(const Vm &) = delete;
    Vm &operator=(const Vm &) = delete;

    // ---- Loading

    // Set before load(): what the machine answers when it is asked for its environment, and
    // whether it has one; a class that it lacks, or whose natives it refuses, both with an
    // exception pending.
    jint environmentResult = JNI_OK;
    bool hasEnvironment = true;
    std::string lackedClass;
    std::string refusedClass;

    // Calls JNI_OnLoad. An exception that it leaves is cleared, as the answer says.
    Answer load(jint (*entry)(JavaVM *, void *) = JNI_OnLoad);

    // All that was registered, in that order.
    const std::vector<Native> &natives() const;
    const Native &native(std::string_view name) const;

    // ---- Calling natives

    // Calls a native that takes ints alone, by its name.
    Answer call(std::string_view name, std::initializer_list<jint> indexes = {});
    Answer call(const Native &native, std::span<const jint> indexes);

    // Asks each query once: the last of its indexes is `last`, those before it are `first`.
    // Answers how many of them said something.
    long query(jint first, jint last);

    // Calls the parse method with a message, or with null; `length` is that of the message.
    Answer parse(const Bytes *message, jlong length, jint mode);
    Answer parse(const Bytes &message, jint mode = 0);

    // The entries of the function table that the last native called, in order.
    std::vector<std::string> calls() const;

    // The n-th call from now on that can fail, counted from 0, fails with an exception pending.
    void failCall(long n);
    // Whether that call has come. Otherwise it is forgotten.
    bool hasFailed();

private:
    struct State;
    struct Strict;
    struct Quiet;
    std::unique_ptr<State> state_;
};

} // namespace fakevm
