// The tokens of a provisioning body. Global tokens are those of WBXML 1.x; elements, attribute
// starts and their two code pages are those of the OMA Client Provisioning content.
#ifndef QVSTOKENS_H
#define QVSTOKENS_H

#include <stdint.h>

namespace [[gnu::visibility("hidden")]] qvs {

namespace wbxml {
constexpr uint8_t kSwitchPage = 0x00;
constexpr uint8_t kEnd = 0x01;
constexpr uint8_t kStrI = 0x03;
constexpr uint8_t kLiteral = 0x04;
constexpr uint8_t kExtI0 = 0x80;
constexpr uint8_t kStrT = 0x83;
constexpr uint8_t kOpaque = 0xC3;

constexpr uint8_t kTagMask = 0x3F;
constexpr uint8_t kHasContent = 0x40;
constexpr uint8_t kHasAttr = 0x80;

constexpr uint32_t kProvisioning = 11; // public identifier of the document type

// Inline string or string-table reference.
constexpr bool isString(uint8_t token)
{
    return (token & 0x7F) == kStrI;
}
} // namespace wbxml

namespace tag {
constexpr uint8_t kWapProvisioningDoc = 0x05;
constexpr uint8_t kCharacteristic = 0x06;
constexpr uint8_t kParm = 0x07;
} // namespace tag

// Attribute starts of a document, a characteristic, and of any parm.
namespace attr {
constexpr uint8_t kName = 0x05; // the name is given as text
constexpr uint8_t kValue = 0x06;
constexpr uint8_t kVersion = 0x45;
constexpr uint8_t kVersion10 = 0x46;
constexpr uint8_t kType = 0x50; // the type is given as text
constexpr uint8_t kTypePxLogical = 0x51;
constexpr uint8_t kTypePxPhysical = 0x52;
constexpr uint8_t kTypePort = 0x53;
constexpr uint8_t kTypeValidity = 0x54;
constexpr uint8_t kTypeNapDef = 0x55;       // page 0
constexpr uint8_t kTypeApplication = 0x55;  // page 1
constexpr uint8_t kTypeBootstrap = 0x56;    // page 0
constexpr uint8_t kTypeAppAddr = 0x56;      // page 1
constexpr uint8_t kTypeVendorConfig = 0x57; // page 0
constexpr uint8_t kTypeAppAuth = 0x57;      // page 1
constexpr uint8_t kTypeClientIdentity = 0x58;
constexpr uint8_t kTypePxAuthInfo = 0x59; // page 0
constexpr uint8_t kTypeResource = 0x59;   // page 1
constexpr uint8_t kTypeNapAuthInfo = 0x5A;
constexpr uint8_t kTypeAccess = 0x5B;
} // namespace attr

// NAME=<parameter> on code page 0.
namespace page0 {
constexpr uint8_t kName = 0x07;
constexpr uint8_t kNapAddress = 0x08;
constexpr uint8_t kNapAddrType = 0x09;
constexpr uint8_t kCallType = 0x0A;
constexpr uint8_t kValidUntil = 0x0B;
constexpr uint8_t kAuthType = 0x0C;
constexpr uint8_t kAuthName = 0x0D;
constexpr uint8_t kAuthSecret = 0x0E;
constexpr uint8_t kLinger = 0x0F;
constexpr uint8_t kBearer = 0x10;
constexpr uint8_t kNapId = 0x11;
constexpr uint8_t kCountry = 0x12;
constexpr uint8_t kNetwork = 0x13;
constexpr uint8_t kInternet = 0x14;
constexpr uint8_t kProxyId = 0x15;
constexpr uint8_t kProxyProviderId = 0x16;
constexpr uint8_t kDomain = 0x17;
constexpr uint8_t kProvUrl = 0x18;
constexpr uint8_t kPxAuthType = 0x19;
constexpr uint8_t kPxAuthId = 0x1A;
constexpr uint8_t kPxAuthPw = 0x1B;
constexpr uint8_t kStartPage = 0x1C;
constexpr uint8_t kPushEnabled = 0x1F;
constexpr uint8_t kPxAddr = 0x20;
constexpr uint8_t kPxAddrType = 0x21;
constexpr uint8_t kToNapId = 0x22;
constexpr uint8_t kPortNbr = 0x23;
constexpr uint8_t kService = 0x24;
constexpr uint8_t kLinkSpeed = 0x25;
constexpr uint8_t kDnLinkSpeed = 0x26;
constexpr uint8_t kLocalAddr = 0x27;
constexpr uint8_t kLocalAddrType = 0x28;
constexpr uint8_t kContextAllow = 0x29;
constexpr uint8_t kTrust = 0x2A;
constexpr uint8_t kMaster = 0x2B;
constexpr uint8_t kSid = 0x2C;
constexpr uint8_t kSoc = 0x2D;
constexpr uint8_t kWspVersion = 0x2E;
constexpr uint8_t kPhysicalProxyId = 0x2F;
constexpr uint8_t kClientId = 0x30;
constexpr uint8_t kDeliveryErrSdu = 0x31;
constexpr uint8_t kDeliveryOrder = 0x32;
constexpr uint8_t kTrafficClass = 0x33;
constexpr uint8_t kMaxSduSize = 0x34;
constexpr uint8_t kMaxBitrateUplink = 0x35;
constexpr uint8_t kMaxBitrateDnlink = 0x36;
constexpr uint8_t kPxAddrFqdn = 0x3D;
constexpr uint8_t kProxyPw = 0x3E;
constexpr uint8_t kPpgAuthType = 0x3F;
constexpr uint8_t kPullEnabled = 0x47;
constexpr uint8_t kDnsAddr = 0x48;
constexpr uint8_t kMaxNumRetry = 0x49;
constexpr uint8_t kFirstRetryTimeout = 0x4A;
constexpr uint8_t kReregThreshold = 0x4B;
constexpr uint8_t kTBit = 0x4C;
constexpr uint8_t kAuthEntity = 0x4E;
} // namespace page0

// NAME=<parameter> on code page 1.
namespace page1 {
constexpr uint8_t kName = 0x07;
constexpr uint8_t kInternet = 0x14;
constexpr uint8_t kStartPage = 0x1C;
constexpr uint8_t kToNapId = 0x22;
constexpr uint8_t kAAccept = 0x2E;
constexpr uint8_t kAAuthData = 0x2F;
constexpr uint8_t kAAuthLevel = 0x30;
constexpr uint8_t kAAuthName = 0x31;
constexpr uint8_t kAAuthSecret = 0x32;
constexpr uint8_t kAAuthType = 0x33;
constexpr uint8_t kAddr = 0x34;
constexpr uint8_t kAddrType = 0x35;
constexpr uint8_t kAppId = 0x36;
constexpr uint8_t kAProtocol = 0x37;
constexpr uint8_t kProviderId = 0x38;
constexpr uint8_t kToProxy = 0x39;
constexpr uint8_t kUri = 0x3A;
constexpr uint8_t kRule = 0x3B;
} // namespace page1

// The value token that joins two values of AAUTHTYPE.
constexpr uint8_t kCommaToken = 0x90;

} // namespace qvs

#endif
