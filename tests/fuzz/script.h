// An input read as a script: what to call, and with what.
#pragma once

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <memory>
#include <string>
#include <vector>

namespace fuzz {

class Script {
public:
    Script(const uint8_t *bytes, size_t count) : at(bytes), left(count) {}

    bool isOver() const { return left == 0; }

    // The next byte, 0 behind the last one.
    uint8_t byte()
    {
        if (left == 0) {
            return 0;
        }
        --left;
        return *at++;
    }

    // A number below `count`, which is at most 256.
    unsigned below(unsigned count) { return byte() % count; }

    uint32_t word()
    {
        uint32_t number = 0;
        for (int i = 0; i < 4; ++i) {
            number = (number << 8) | byte();
        }
        return number;
    }

    // As many bytes as the next byte says.
    std::vector<uint8_t> bytes()
    {
        const size_t size = byte();
        return upTo(size);
    }

    // Those of them in front of a NUL.
    std::string text()
    {
        const std::vector<uint8_t> all = bytes();
        return {all.begin(), std::find(all.begin(), all.end(), uint8_t{0})};
    }

    std::vector<uint8_t> rest() { return upTo(left); }

private:
    std::vector<uint8_t> upTo(size_t size)
    {
        size = std::min(size, left);
        std::vector<uint8_t> taken(at, at + size);
        at += size;
        left -= size;
        return taken;
    }

    const uint8_t *at;
    size_t left;
};

// A block of just the size that is needed, so that a sanitizer sees every byte outside it.
template <class Unit>
class Exact {
public:
    explicit Exact(size_t units) : count(units), block(new Unit[units]()) {}

    // A copy of a text with its terminator.
    explicit Exact(const std::basic_string<Unit> &text) : Exact(text.size() + 1)
    {
        std::copy(text.begin(), text.end(), block.get());
    }

    // A copy of bytes.
    explicit Exact(const std::vector<Unit> &units) : Exact(units.size())
    {
        std::copy(units.begin(), units.end(), block.get());
    }

    operator Unit *() const { return block.get(); }
    size_t size() const { return count; }

private:
    size_t count;
    std::unique_ptr<Unit[]> block;
};

// The parts of the target of primitives. Each runs a script to its end, leaving no block behind.
void runDecoder(Script *script);
void runStrings(Script *script);
void runWideStrings(Script *script);
void runList(Script *script);
void runBuffer(Script *script);
void runMemory(Script *script);

} // namespace fuzz
