// A decoder over given bytes, and a text that a test owns.
#ifndef DECODING_H
#define DECODING_H

#include "qvsClientProvWbxmlDecoder.h"
#include "qvsmemory.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

namespace decoding {

using Bytes = std::vector<uint8_t>;

// The decoder of one test, released at its end. It stands in front of the first byte: no header is
// read.
class Decoder {
public:
    explicit Decoder(const Bytes &bytes)
    {
        static const uint8_t nothing = 0;
        EXPECT_EQ(qvsClientProvWbxmlInitDecoder(&record, bytes.empty() ? &nothing : bytes.data(),
                                                static_cast<uint32_t>(bytes.size())),
                  QVS_OK);
    }
    Decoder(const Decoder &) = delete;
    Decoder &operator=(const Decoder &) = delete;
    ~Decoder() { (void)qvsClientProvWbxmlDeleteDecoder(record); }

    operator qvsWbxmlDecoder *() const { return record; }
    qvsWbxmlDecoder *operator->() const { return record; }

    // Bytes read so far.
    uint32_t position() const { return qvsClientProvWbxmlDecoderDecodingSize(record); }

private:
    qvsWbxmlDecoder *record = nullptr;
};

// A text made by the library and released by the test; prints as what it holds.
class OwnText {
public:
    OwnText() = default;
    explicit OwnText(const char *initial) : text(qvsStrdup_debug(initial, "test", __LINE__)) {}
    OwnText(const OwnText &) = delete;
    OwnText &operator=(const OwnText &) = delete;
    ~OwnText() { qvsMemFree_debug(text); }

    char **operator&() { return &text; }
    bool isNull() const { return !text; }
    std::string str() const { return text ? text : "(null)"; }

    char *text = nullptr;
};

} // namespace decoding

#endif
