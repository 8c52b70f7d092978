// A virtual machine for the natives, made of objects in memory: they run without Java, on any
// width, under sanitizers. What a real one only warns of or answers with a crash ends the program
// here, with a line that says what was wrong:
//   - an entry of the function table that the library has no business with
//   - a call that is forbidden while an exception is pending, and one that comes before the
//     exception check that the call before it asks for
//   - more than 16 local references at a time, one used after it was deleted, one left behind
//   - array elements not handed back, handed back with a copy, or written to
//   - text without four zero bytes at its end
#pragma once

#include <jni.h>

#include <cstdint>
#include <initializer_list>
#include <memory>
#include <optional>
#include <ostream>
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

// A native as it was registered.
struct Native {
    std::string javaClass;
    std::string name;
    std::string signature;
    void *function;

    // The number of its arguments, for the natives that take ints alone.
    size_t indexes() const { return signature.find(')') - 1; }
};

class Vm {
public:
    Vm();
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
    Answer load();

    // All that was registered, in that order.
    const std::vector<Native> &natives() const;

    // ---- Calling natives

    // Calls a native that takes ints alone, by its name.
    Answer call(std::string_view name, std::initializer_list<jint> indexes = {});
    Answer call(const Native &native, const std::vector<jint> &indexes);

    // Calls the parse method with a message, or with null; `length` is that of the message.
    Answer parse(const std::optional<Bytes> &message, jlong length, jint mode);
    Answer parse(const Bytes &message, jint mode = 0);

    // The entries of the function table that the last native called, in order.
    const std::vector<std::string> &calls() const;

    // The n-th call from now on that can fail, counted from 0, fails with an exception pending.
    void failCall(long n);
    // Whether that call has come. Otherwise it is forgotten.
    bool hasFailed();

private:
    struct State;
    std::unique_ptr<State> state_;
};

} // namespace fakevm
