// A virtual machine just large enough for the library: it keeps what the natives make, and the
// message's bytes where no access outside of them goes unnoticed.
#ifndef MODEL_FAKE_VM_H
#define MODEL_FAKE_VM_H

#include <jni.h>
#include <stddef.h>
#include <stdint.h>

#include <deque>
#include <string>
#include <vector>

[[noreturn]] void die(const std::string &why);

enum class Kind { kClass, kText, kTexts, kBytes };

struct Object {
    Kind kind = Kind::kClass;
    std::string text;               // of a text, the bytes of an array, the name of a class
    std::vector<Object *> elements; // of an array of texts
};

// Objects live until the native that made them has been answered for.
struct Heap {
    std::deque<Object> objects;
    size_t used = 0;

    Object *make(Kind kind);
};

// A block with a forbidden page on either side. Its bytes can be read only while they are handed
// out.
struct Fence {
    bool front = false; // the bytes begin behind a forbidden page instead of ending before one
    uint8_t *bytes = nullptr;
    size_t used = 0;
    int handedOut = 0;

    void place(const std::string &message);
    void open() const;
    void close() const;

    uint8_t *pages = nullptr;
    size_t size = 0; // between the forbidden pages
};

struct Method {
    std::string owner;
    std::string name;
    std::string signature;
    void *function;
};

extern Heap heap;
extern Fence fence;
extern Object messageArray;
extern std::vector<Method> methods; // in the order of registration
extern std::string faults;          // what the library did wrong with the current message
extern JNIEnv env;
extern JavaVM machine;

void fault(const char *what);

template <class Handle>
Object *objectOf(Handle handle)
{
    return reinterpret_cast<Object *>(handle);
}
template <class Handle>
Handle handleOf(Object *object)
{
    return reinterpret_cast<Handle>(object);
}

#endif
