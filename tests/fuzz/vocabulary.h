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

enum KindIndex : uint8_t {
    kPxLogical,
    kPxPhysical,
    kPort,
    kValidity,
    kNapDef,
    kApplication,
    kBootstrap,
    kAppAddr,
    kVendorConfig,
    kAppAuth,
    kClientIdentity,
    kPxAuthInfo,
    kResource,
    kNapAuthInfo,
    kAccess,
    kRoaming,
    kWifi,
    kVoWifi,
    kKindCount,
};

// In the order of KindIndex.
inline constexpr Kind kKinds[kKindCount] = {
    {"PXLOGICAL",
     0x51,
     {true, true},
     "\x07\x15\x16\x1C\x2A\x2B\x3E\x3F"sv,
     "\x17"sv,
     true,
     "\x0B\x01\x02"sv},
    {"PXPHYSICAL",
     0x52,
     {true, true},
     "\x1F\x20\x21\x2E\x2F\x3D\x47"sv,
     "\x17\x22"sv,
     true,
     "\x02"sv},
    {"PORT", 0x53, {true, true}, "\x23"sv, "\x24"sv, false, ""sv},
    {"VALIDITY", 0x54, {true, true}, "\x0B\x12\x13\x2C\x2D"sv, ""sv, false, ""sv},
    {"NAPDEF",
     0x55,
     {true, false},
     "\x07\x08\x09\x0A\x0F\x11\x14\x25\x26\x27\x28\x31\x32\x33\x34\x35\x36\x49\x4A\x4B\x4C"sv,
     "\x10\x48"sv,
     true,
     "\x0D\x03"sv,
     Names::kDropped,
     {"INIT"}},
    {"APPLICATION",
     0x55,
     {false, true},
     "\x07\x14\x2E\x36\x37\x38"sv,
     "\x22\x34\x39"sv,
     true,
     "\x07\x09\x0C\x0F"sv,
     Names::kOthersDropped,
     {"XCAP_AUID_DCS", "XCAP_AUID_PMS", "XCAP_AUID_CDMS", "XCAP_IMEI_HEADER", "XCAP_TID_HEADER",
      "FROM"}},
    {"BOOTSTRAP", 0x56, {true, false}, "\x07\x12\x18\x29"sv, "\x13\x15"sv, false, ""sv},
    {"APPADDR", 0x56, {false, true}, "\x34\x35"sv, ""sv, true, "\x02"sv},
    {"VENDORCONFIG", 0x57, {true, false}, "\x07"sv, ""sv, false, ""sv, Names::kStored},
    {"APPAUTH", 0x57, {false, true}, "\x2F\x30\x31\x32\x33"sv, ""sv, false, ""sv},
    {"CLIENTIDENTITY", 0x58, {true, true}, "\x30"sv, ""sv, false, ""sv},
    {"PXAUTHINFO", 0x59, {true, false}, "\x19\x1A\x1B"sv, ""sv, false, ""sv},
    {"RESOURCE", 0x59, {false, true}, "\x07\x1C\x2E\x2F\x31\x32\x33\x3A"sv, ""sv, false, ""sv},
    {"NAPAUTHINFO", 0x5A, {true, true}, "\x0C\x0D\x0E"sv, "\x4E"sv, false, ""sv},
    {"ACCESS", 0x5B, {true, true}, ""sv, "\x17\x22\x23\x36\x39\x3B"sv, false, ""sv},
    {"ROAMING",
     kTypeText,
     {true, true},
     ""sv,
     ""sv,
     false,
     ""sv,
     Names::kOthersRefused,
     {"SYNC-ALLOWED", "SYNC-DEFAULT"}},
    {"WI-FI",
     kTypeText,
     {true, true},
     ""sv,
     ""sv,
     false,
     ""sv,
     Names::kOthersRefused,
     {"NETSSID", "SECMODE", "EAPMETHOD", "EAPTYPE", "USERNAME", "ANONUSERNAME", "PASSWORD",
      "CACERT", "USERCERT", "PHASE1", "AUTHALGORITHM", "PRIORITY"}},
    {"Vodafone VoWiFi",
     kTypeText,
     {true, true},
     ""sv,
     ""sv,
     false,
     ""sv,
     Names::kOthersRefused,
     {"ePDG FQDN"}},
};

// How the text of a value token joins one that is already there.
enum class Join : uint8_t { kNone, kBehind, kComma, kOutOfSight };

struct ValueToken {
    uint8_t token;
    Join join;
    std::string_view text;
};

// The value tokens that stand for a text, each as it is understood.
inline constexpr ValueToken kValueTokens[] = {
    {0x85, Join::kBehind, "IPV4"},
    {0x86, Join::kBehind, "IPV6"},
    {0x87, Join::kBehind, "E164"},
    {0x88, Join::kBehind, "ALPHA"},
    {0x89, Join::kBehind, "APN"},
    {0x8A, Join::kBehind, "SCODE"},
    {0x8B, Join::kBehind, "TETRA-ITSI"},
    {0x8C, Join::kBehind, "MAN"},
    {0x90, Join::kOutOfSight, "ANALOG-MODEM"},
    {0x91, Join::kComma, "HTTP"},
    {0x92, Join::kComma, "BASIC"},
    {0x93, Join::kComma, "DIGEST"},
    {0x94, Join::kOutOfSight, "BIT-TRANSPARENT"},
    {0x95, Join::kOutOfSight, "DIRECT-ASYNCHRONOUS-DATA-SERVICE"},
    {0x9A, Join::kComma, "PAP"},
    {0x9B, Join::kComma, "CHAP"},
    {0x9C, Join::kComma, "HTTP-BASIC"},
    {0x9D, Join::kComma, "HTTP-DIGEST"},
    {0x9E, Join::kComma, "WTLS_SS"},
    {0x9F, Join::kComma, "MD5"},
};

} // namespace fuzz
