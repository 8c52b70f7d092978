// The vocabulary of a provisioning document, for the reading and for the mutator: elements,
// attributes and values of the OMA Client Provisioning content. Written apart from the library's
// own tables.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace fuzz {

using namespace std::string_view_literals;

// Global tokens of WBXML, and the tags and attributes that every document uses.
enum Token : uint8_t {
    kSwitchPage = 0x00,
    kEnd = 0x01,
    kStrI = 0x03,
    kLiteral = 0x04,
    kExtI0 = 0x80,
    kStrT = 0x83,
    kOpaque = 0xC3,

    kDocument = 0x05,
    kCharacteristic = 0x06,
    kParm = 0x07,
    kTagBits = 0x3F,
    kContentBit = 0x40,
    kAttributesBit = 0x80,

    kNameText = 0x05,
    kValue = 0x06,
    kVersionText = 0x45,
    kVersion10 = 0x46,
    kTypeText = 0x50,
    kLastType = 0x5B,

    kStartPage = 0x1C,
    kDomain = 0x17,
    kAAuthType = 0x33,
    kComma = 0x90,
};

constexpr std::string_view kDocumentType = "-//WAPFORUM//DTD PROV 1.0//EN";
constexpr uint32_t kProvisioning = 11;

// What a characteristic does with parameters whose NAME is given as text.
enum class Names : uint8_t {
    kRefused,       // it has none
    kDropped,       // their values are read and dropped
    kOthersDropped, // the listed ones are stored, the values of others dropped
    kOthersRefused, // the listed ones are stored, the value of any other is refused
    kStored,        // name and value are stored, whatever the name
};

// A kind of characteristic.
struct Kind {
    std::string_view name; // its TYPE as text where the token is kTypeText
    uint8_t token;
    bool pages[2];             // whether the token means it on page 0, on page 1
    std::string_view texts;    // NAME tokens of single values
    std::string_view lists;    // NAME tokens of lists
    bool mayHaveChildren;      // that is, further characteristics inside
    std::string_view children; // what its place in the context takes, by index in kKinds
    Names names = Names::kRefused;
    std::array<std::string_view, 12> listed = {};
};

// How the text of a value token joins one that is already there.
enum class Join : uint8_t { kNone, kBehind, kComma, kOutOfSight };

struct ValueToken {
    uint8_t token;
    Join join;
    std::string_view text;
};

} // namespace fuzz

// The kinds and the value tokens, which are written from tools/tokens.py.
#include "fuzz_kinds.h"
