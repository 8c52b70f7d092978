// What becomes of a message, by a reading of the format that shares nothing with the library: no
// text is stored and no record made, only what decides about success and about the blocks that
// stay allocated by design is followed.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

namespace fuzz {

// What becomes of the body of a message.
struct BodyReading {
    uint32_t result = 0;  // of the decode
    bool context = false; // whether a context is made of it
    std::size_t kept = 0; // blocks that stay allocated when document and decoder are gone
};

BodyReading readBody(const uint8_t *data, std::size_t size);

// What becomes of the header of a message.
struct HeaderReading {
    bool accepted = false;
    uint32_t contentType = 0;
    uint32_t headerLength = 0;
    uint32_t security = 0;
    std::string mac;
};

HeaderReading readHeader(const uint8_t *data, std::size_t size);

} // namespace fuzz
