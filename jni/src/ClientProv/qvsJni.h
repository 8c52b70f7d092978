// What the natives of the ten Java classes share: walks along the context, answers made for the
// virtual machine, and the tables they are registered with. Private, C++ only.
#ifndef QVSJNI_H
#define QVSJNI_H

#include "qvsClientProvCtx.h"
#include "qvsFields.h"
#include "qvsJniParser.h"
#include "qvspushhandler.h"

#include <stdarg.h>
#include <stddef.h>
#include <stdint.h>
#include <stdio.h>

// The inline wrappers of jni.h are compiled into this library, but no exports of it.
#pragma GCC visibility push(hidden)
#include <jni.h>
#pragma GCC visibility pop

namespace [[gnu::visibility("hidden")]] qvs {

// ---- The session

// The header of the last parse: null before the first one, after a message that was refused, and
// after the delete method. Owned by the session.
extern smlpushHdlrInfo *ptPushHdlrInfo;

// ---- Walks. Indexes count from 1.

// The n-th record of a chain; null when the chain ends before it or n is below 1.
template <class Node>
Node *nth(Node *node, jint n)
{
    for (jint i = 1; node && i != n; ++i) {
        node = node->ptNext;
    }
    return node;
}

// The first record of the chain that hangs from `record`; null from a missing record.
template <class Record, class Node>
Node *chainOf(const Record *record, Node *Record::*head)
{
    return record ? record->*head : nullptr;
}

template <class Node>
jint count(const Node *node)
{
    jint n = 0;
    for (; node; node = node->ptNext) {
        ++n;
    }
    return n;
}

// ---- Answers. Each is a new local reference, or null; with an exception pending it is null.

// Constant text for the virtual machine in `Room` bytes, with the four zero bytes behind it that
// stand behind every text of the context too: a multi-byte sequence cut off at the end is never
// read past them.
template <size_t Room>
struct PaddedText {
    consteval PaddedText(const char *text)
    {
        for (size_t i = 0; text[i] != '\0'; ++i) {
            bytes[i] = text[i];
            bytes[i + kZeroes] = '\0'; // does not compile when the text leaves no room for it
        }
    }

    static constexpr size_t kZeroes = 5; // the terminator is one of them
    char bytes[Room] = {};
};

inline jstring text(JNIEnv *env, const char *value)
{
    return value ? env->NewStringUTF(value) : nullptr;
}

inline jstring text(JNIEnv *env, const qvsCtxStrNode *node)
{
    return node ? text(env, node->pszValue) : nullptr;
}

template <class Record>
jstring text(JNIEnv *env, const Record *record, char *Record::*field)
{
    return record ? text(env, record->*field) : nullptr;
}

// A String[] of `length` elements. The first `shown` hold the texts, null for a null text; those
// behind them stay empty strings.
jobjectArray stringArray(JNIEnv *env, const char *const *texts, jsize shown, jsize length);

// A text that is shown under a name made from it; null for a text that has none.
struct Naming {
    uint8_t field = kNoField;
    const char *(*nameOf)(const char *value) = nullptr;
};

template <class Record>
struct NamingOf {
    consteval NamingOf() = default;
    consteval NamingOf(char *Record::*text, const char *(*name)(const char *value))
        : naming{numberOf(text), name}
    {
    }

    Naming naming;
};

// What an array shows: the first `shown` fields of a record, and a null behind them.
// kept[last-element-null]: an array ends with an element that is null.
struct Shown {
    static constexpr size_t kMost = 28;

    Shown(const void *record, uint8_t shown, Naming naming);

    const char *texts[kMost + 1];
    jsize length;
};

// The length of the array of a record.
template <class Record>
constexpr jsize lengthOf(const Record * /*record*/)
{
    return textsOf<Record>() + 1;
}

// All texts of a record, in their order.
template <class Record>
Shown show(const Record *record, NamingOf<Record> naming = {})
{
    static_assert(textsOf<Record>() <= Shown::kMost);
    return {record, textsOf<Record>(), naming.naming};
}

// The texts of a record as a String[]; null for a missing record.
jobjectArray array(JNIEnv *env, const void *record, uint8_t texts, Naming naming);
template <class Record>
jobjectArray array(JNIEnv *env, const Record *record, NamingOf<Record> naming = {})
{
    static_assert(textsOf<Record>() <= Shown::kMost);
    return array(env, record, textsOf<Record>(), naming.naming);
}

// ---- Registration

// What a type of a native is in a JNI signature.
template <class Type>
inline constexpr const char *kJavaType = nullptr;
template <>
inline constexpr const char *kJavaType<void> = "V";
template <>
inline constexpr const char *kJavaType<jboolean> = "Z";
template <>
inline constexpr const char *kJavaType<jint> = "I";
template <>
inline constexpr const char *kJavaType<jlong> = "J";
template <>
inline constexpr const char *kJavaType<jbyteArray> = "[B";
template <>
inline constexpr const char *kJavaType<jstring> = "Ljava/lang/String;";
template <>
inline constexpr const char *kJavaType<jobjectArray> = "[Ljava/lang/String;";

consteval bool eat(const char *&text, const char *expected)
{
    while (*expected != '\0') {
        if (*text++ != *expected++) {
            return false;
        }
    }
    return true;
}

template <class Result, class... Args>
consteval bool describes(const char *signature, Result (*)(JNIEnv *, jobject, Args...))
{
    return eat(signature, "(") && (eat(signature, kJavaType<Args>) && ...) && eat(signature, ")") &&
           eat(signature, kJavaType<Result>) && *signature == '\0';
}

template <bool Described>
consteval const char *checked(const char *signature)
{
    static_assert(Described, "the JNI signature does not describe this function");
    return signature;
}

// The JNI of a desktop VM takes these texts as char * and leaves them alone.
consteval char *unguarded(const char *text)
{
    return const_cast<char *>(text);
}

// One row of a table: a native under its own name, with a signature that is held against its type.
#define NATIVE(function, signature)                                                                \
    {                                                                                              \
        unguarded(#function), unguarded(checked<describes(signature, function)>(signature)),       \
            reinterpret_cast<void *>(function)                                                     \
    }

// The natives of each class, in the order of their registration.
extern const JNINativeMethod kParserNatives[9];
extern const JNINativeMethod kPxLogicalNatives[20];
extern const JNINativeMethod kNapDefNatives[13];
extern const JNINativeMethod kBootstrapNatives[6];
extern const JNINativeMethod kClientIdentityNatives[1];
extern const JNINativeMethod kVendorConfigNatives[2];
extern const JNINativeMethod kApplicationNatives[19];
extern const JNINativeMethod kAccessNatives[13];
extern const JNINativeMethod kWifiNatives[2];
extern const JNINativeMethod kVoWifiNatives[2];

} // namespace qvs

#endif
