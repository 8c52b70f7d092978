// Makes elements, values and headers at random: mostly as the format has them, sometimes odd.
#pragma once

#include "scan.h"
#include "vocabulary.h"

#include <cstdint>
#include <initializer_list>
#include <string_view>

namespace fuzz {

// A source of numbers that a seed repeats.
class Random {
public:
    explicit Random(uint64_t seed) : state(seed) {}

    uint64_t next()
    {
        uint64_t mixed = state += 0x9E3779B97F4A7C15ULL;
        mixed = (mixed ^ (mixed >> 30)) * 0xBF58476D1CE4E5B9ULL;
        mixed = (mixed ^ (mixed >> 27)) * 0x94D049BB133111EBULL;
        return mixed ^ (mixed >> 31);
    }

    // A number below `count`, which is not 0.
    size_t below(size_t count) { return static_cast<size_t>(next() % count); }

    bool oneIn(size_t count) { return below(count) == 0; }

    template <class Items>
    auto &pick(Items &items)
    {
        return items[below(std::size(items))];
    }

    uint8_t byte() { return static_cast<uint8_t>(next()); }

private:
    uint64_t state;
};

class Generator {
public:
    explicit Generator(Random *source) : random(source) {}

    // A document with a few characteristics; the header, a string table, the root element.
    Bytes document();

    // A characteristic with all that is in it, `depth` levels down at most.
    Bytes characteristic(int depth);
    Bytes characteristic(const Kind &kind, int depth);

    // A parameter of a characteristic: of a kind, or of any.
    Bytes parm(const Kind &kind);
    Bytes parm() { return parm(random->pick(kKinds)); }

    // A value as it stands behind VALUE: strings, tokens, opaque data.
    Bytes value();
    Bytes string();
    Bytes page();

    // A token that has a meaning somewhere.
    uint8_t token();

    // A number of one to six bytes: a length or an index near `about`, or an extreme one.
    Bytes number(size_t about);

    // A push header, with the length of it that is right for a body behind it.
    Bytes pushHeader();

private:
    std::string_view word();
    uint8_t tag(uint8_t tag);
    Bytes name(std::string_view text);

    Random *random;
};

void append(Bytes *bytes, std::string_view text);
void append(Bytes *bytes, const Bytes &more);

} // namespace fuzz
