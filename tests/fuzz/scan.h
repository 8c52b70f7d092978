// Where the tokens of a body stand, for the mutator: elements, attributes, strings. Any bytes have
// some reading; it is looser than that of the library, so that what is broken can still be worked
// on.
#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

namespace fuzz {

using Bytes = std::vector<uint8_t>;

enum class Part : uint8_t {
    kCharacteristic, // an element from its tag to its END
    kParm,
    kTag,    // the byte of any element
    kToken,  // a type, a name, a value token
    kString, // with its token: an inline one with its NUL,
    kTable,  // a reference into the string table,
    kOpaque, // or opaque data
    kPage,   // SWITCH_PAGE and the page
    kEnd,
};

struct Span {
    Part part;
    size_t begin;
    size_t end;
};

struct Layout {
    size_t tableLength = 0;  // where the number stands
    size_t table = 0;        // and the table itself
    size_t content = 0;      // behind the header
    std::vector<Span> spans; // in the order in which they begin
};

Layout scan(const Bytes &body);

} // namespace fuzz
