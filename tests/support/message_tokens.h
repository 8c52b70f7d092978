// The tokens of a provisioning document, for the message builder: OMA Provisioning Content, read
// apart from the library's own table.
#pragma once

#include <cstdint>

namespace message {

// clang-format off
// Global tokens of WBXML.
enum Global : uint8_t {
    kSwitchPage = 0x00, kEnd = 0x01, kStrI = 0x03, kStrT = 0x83, kOpaque = 0xC3,
};

// Tags of a provisioning document, and the flags of an element.
enum Tag : uint8_t {
    kDocumentTag = 0x05, kCharacteristicTag = 0x06, kParmTag = 0x07,
    kHasContent = 0x40, kHasAttributes = 0x80,
    kParm = 0x87, // a parm as it is sent: attributes, no content
};

// TYPE of a characteristic: the token in the low byte, the page it needs in the high byte.
enum Type : uint16_t {
    kAnyPage = 0x200,
    kPxLogical = 0x251, kPxPhysical = 0x252, kPort = 0x253, kValidity = 0x254,
    kClientIdentity = 0x258, kNapAuthInfo = 0x25A, kAccess = 0x25B,
    kNapDef = 0x055, kBootstrap = 0x056, kVendorConfig = 0x057, kPxAuthInfo = 0x059,
    kApplication = 0x155, kAppAddr = 0x156, kAppAuth = 0x157, kResource = 0x159,
};

// Attribute tokens. Where a value occurs twice, the characteristic around the parm says which of
// the two names is meant.
enum Attribute : uint8_t {
    kTypeText = 0x50,                    // TYPE, a text follows
    kVersion = 0x45, kVersion1_0 = 0x46, // version, a text follows; and version="1.0" as a whole
    kNameText = 0x05,                    // NAME, a text follows
    kValue = 0x06,
    // NAME of a parm, page 0.
    kName = 0x07, kNapAddress = 0x08, kNapAddrType = 0x09, kCallType = 0x0A, kValidUntil = 0x0B,
    kAuthType = 0x0C, kAuthName = 0x0D, kAuthSecret = 0x0E, kLinger = 0x0F, kBearer = 0x10,
    kNapId = 0x11, kCountry = 0x12, kNetwork = 0x13, kInternet = 0x14, kProxyId = 0x15,
    kProxyProviderId = 0x16, kDomain = 0x17, kProvUrl = 0x18, kPxAuthType = 0x19, kPxAuthId = 0x1A,
    kPxAuthPw = 0x1B, kStartPage = 0x1C, kBasAuthId = 0x1D, kBasAuthPw = 0x1E, kPushEnabled = 0x1F,
    kPxAddr = 0x20, kPxAddrType = 0x21, kToNapId = 0x22, kPortNbr = 0x23, kService = 0x24,
    kLinkSpeed = 0x25, kDnLinkSpeed = 0x26, kLocalAddr = 0x27, kLocalAddrType = 0x28,
    kContextAllow = 0x29, kTrust = 0x2A, kMaster = 0x2B, kSid = 0x2C, kSoc = 0x2D,
    kWspVersion = 0x2E, kPhysicalProxyId = 0x2F, kClientId = 0x30, kDeliveryErrSdu = 0x31,
    kDeliveryOrder = 0x32, kTrafficClass = 0x33, kMaxSduSize = 0x34, kMaxBitrateUplink = 0x35,
    kMaxBitrateDnlink = 0x36, kResidualBer = 0x37, kPxAddrFqdn = 0x3D, kProxyPw = 0x3E,
    kPpgAuthType = 0x3F, kPullEnabled = 0x47, kDnsAddr = 0x48, kMaxNumRetry = 0x49,
    kFirstRetryTimeout = 0x4A, kReregThreshold = 0x4B, kTBit = 0x4C, kAuthEntity = 0x4E,
    kSpi = 0x4F,
    // NAME of a parm, page 1.
    kAAccept = 0x2E, kAAuthData = 0x2F, kAAuthLevel = 0x30, kAAuthName = 0x31, kAAuthSecret = 0x32,
    kAAuthType = 0x33, kAddr = 0x34, kAddrType = 0x35, kAppId = 0x36, kAProtocol = 0x37,
    kProviderId = 0x38, kToProxy = 0x39, kUri = 0x3A, kRule = 0x3B,
};
// clang-format on

} // namespace message
