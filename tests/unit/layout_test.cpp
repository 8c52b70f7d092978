// The fields of the records where code outside the library looks for them.
#include "qvsClientProvCtx.h"
#include "qvsClientProvWbxml.h"
#include "qvslist.h"
#include "smlbuffer.h"

#include <gtest/gtest.h>

#include <cstddef>

namespace {

// The offset of the field with this number, counted from 1, in a record of pointers.
constexpr size_t at(size_t number)
{
    return (number - 1) * sizeof(void *);
}

// ---- The decoder, the list and the buffer: the fields that others may look at

TEST(Layout, qvsWbxmlDecoder)
{
    EXPECT_EQ(offsetof(qvsWbxmlDecoder, nHasContent), 0u);
    EXPECT_EQ(offsetof(qvsWbxmlDecoder, nHasAttr), 4u);
    EXPECT_EQ(offsetof(qvsWbxmlDecoder, nStrSize), 8u);
    EXPECT_EQ(offsetof(qvsWbxmlDecoder, nCodePage), 12u);
    EXPECT_EQ(offsetof(qvsWbxmlDecoder, pStringTable), 16u);
    EXPECT_EQ(offsetof(qvsWbxmlDecoder, ptBuffer), 16u + sizeof(void *));
}

TEST(Layout, qvsList)
{
    EXPECT_EQ(offsetof(qvsListNode, pItem), at(1));
    EXPECT_EQ(offsetof(qvsListNode, ptNext), at(2));
    EXPECT_EQ(offsetof(qvsList, nCount), at(1));
    EXPECT_EQ(offsetof(qvsList, ptFirst), at(2));
    EXPECT_EQ(offsetof(qvsList, ptCursor), at(3));
}

TEST(Layout, smlBuffer)
{
    EXPECT_EQ(offsetof(smlBuffer, pHead), at(1));
    EXPECT_EQ(offsetof(smlBuffer, pStorage), at(2));
    EXPECT_EQ(offsetof(smlBuffer, pTail), at(3));
    EXPECT_EQ(offsetof(smlBuffer, pEnd), at(4));
    EXPECT_EQ(offsetof(smlBuffer, nSize), at(5));
    EXPECT_EQ(offsetof(smlBuffer, nCapacity), at(5) + 4);
    EXPECT_EQ(offsetof(smlBuffer, bOutside), at(5) + 8);
}

// ---- The document tree

TEST(Layout, qvsWapDoc)
{
    EXPECT_EQ(sizeof(qvsWapDoc), at(2));
    EXPECT_EQ(offsetof(qvsWapDoc, ptCharacterList), at(1));
}

TEST(Layout, qvsWapCharacter)
{
    EXPECT_EQ(sizeof(qvsWapCharacter), at(19));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptPxLogical), at(1));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptPxAuthInfo), at(2));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptPort), at(3));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptPxPhysical), at(4));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptNapDef), at(5));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptNapAuthInfo), at(6));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptValidity), at(7));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptAppAddr), at(8));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptResource), at(9));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptAppAuth), at(10));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptApplication), at(11));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptBootstrap), at(12));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptVendorConfig), at(13));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptClientIdentity), at(14));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptAccess), at(15));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptRoaming), at(16));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptWifi), at(17));
    EXPECT_EQ(offsetof(qvsWapCharacter, ptVoWifi), at(18));
}

TEST(Layout, qvsWapPxLogical)
{
    EXPECT_EQ(sizeof(qvsWapPxLogical), at(16));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszProxyId), at(1));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszProxyPw), at(2));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszPpgAuthType), at(3));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszProxyProviderId), at(4));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszName), at(5));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszTrust), at(6));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszMaster), at(7));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszStartPage), at(8));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszReserved1), at(9));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszReserved2), at(10));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszReserved3), at(11));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszReserved4), at(12));
    EXPECT_EQ(offsetof(qvsWapPxLogical, pszReserved5), at(13));
    EXPECT_EQ(offsetof(qvsWapPxLogical, ptDomainList), at(14));
    EXPECT_EQ(offsetof(qvsWapPxLogical, ptCharacterList), at(15));
}

TEST(Layout, qvsWapPxAuthInfo)
{
    EXPECT_EQ(sizeof(qvsWapPxAuthInfo), at(4));
    EXPECT_EQ(offsetof(qvsWapPxAuthInfo, pszPxAuthType), at(1));
    EXPECT_EQ(offsetof(qvsWapPxAuthInfo, pszPxAuthId), at(2));
    EXPECT_EQ(offsetof(qvsWapPxAuthInfo, pszPxAuthPw), at(3));
}

TEST(Layout, qvsWapPort)
{
    EXPECT_EQ(sizeof(qvsWapPort), at(3));
    EXPECT_EQ(offsetof(qvsWapPort, pszPortNbr), at(1));
    EXPECT_EQ(offsetof(qvsWapPort, ptServiceList), at(2));
}

TEST(Layout, qvsWapPxPhysical)
{
    EXPECT_EQ(sizeof(qvsWapPxPhysical), at(11));
    EXPECT_EQ(offsetof(qvsWapPxPhysical, pszPhysicalProxyId), at(1));
    EXPECT_EQ(offsetof(qvsWapPxPhysical, pszPxAddr), at(2));
    EXPECT_EQ(offsetof(qvsWapPxPhysical, pszPxAddrType), at(3));
    EXPECT_EQ(offsetof(qvsWapPxPhysical, pszPxAddrFqdn), at(4));
    EXPECT_EQ(offsetof(qvsWapPxPhysical, pszWspVersion), at(5));
    EXPECT_EQ(offsetof(qvsWapPxPhysical, pszPushEnabled), at(6));
    EXPECT_EQ(offsetof(qvsWapPxPhysical, pszPullEnabled), at(7));
    EXPECT_EQ(offsetof(qvsWapPxPhysical, ptToNapIdList), at(8));
    EXPECT_EQ(offsetof(qvsWapPxPhysical, ptDomainList), at(9));
    EXPECT_EQ(offsetof(qvsWapPxPhysical, ptCharacterList), at(10));
}

TEST(Layout, qvsWapNapDef)
{
    EXPECT_EQ(sizeof(qvsWapNapDef), at(32));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszNapId), at(1));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszName), at(2));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszInternet), at(3));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszNapAddress), at(4));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszNapAddrType), at(5));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszCallType), at(6));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszLocalAddr), at(7));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszLocalAddrType), at(8));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszLinkSpeed), at(9));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszDnLinkSpeed), at(10));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszLinger), at(11));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszDeliveryErrSdu), at(12));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszDeliveryOrder), at(13));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszTrafficClass), at(14));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszMaxSduSize), at(15));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszMaxBitrateUplink), at(16));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszMaxBitrateDnlink), at(17));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszReserved1), at(18));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszReserved2), at(19));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszReserved3), at(20));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszReserved4), at(21));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszReserved5), at(22));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszReserved6), at(23));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszMaxNumRetry), at(24));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszFirstRetryTimeout), at(25));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszReregThreshold), at(26));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszTBit), at(27));
    EXPECT_EQ(offsetof(qvsWapNapDef, pszInit), at(28));
    EXPECT_EQ(offsetof(qvsWapNapDef, ptDnsAddrList), at(29));
    EXPECT_EQ(offsetof(qvsWapNapDef, ptBearerList), at(30));
    EXPECT_EQ(offsetof(qvsWapNapDef, ptCharacterList), at(31));
}

TEST(Layout, qvsWapNapAuthInfo)
{
    EXPECT_EQ(sizeof(qvsWapNapAuthInfo), at(6));
    EXPECT_EQ(offsetof(qvsWapNapAuthInfo, pszAuthType), at(1));
    EXPECT_EQ(offsetof(qvsWapNapAuthInfo, pszAuthName), at(2));
    EXPECT_EQ(offsetof(qvsWapNapAuthInfo, pszAuthSecret), at(3));
    EXPECT_EQ(offsetof(qvsWapNapAuthInfo, pszReserved), at(4));
    EXPECT_EQ(offsetof(qvsWapNapAuthInfo, ptAuthEntityList), at(5));
}

TEST(Layout, qvsWapValidity)
{
    EXPECT_EQ(sizeof(qvsWapValidity), at(6));
    EXPECT_EQ(offsetof(qvsWapValidity, pszCountry), at(1));
    EXPECT_EQ(offsetof(qvsWapValidity, pszNetwork), at(2));
    EXPECT_EQ(offsetof(qvsWapValidity, pszSid), at(3));
    EXPECT_EQ(offsetof(qvsWapValidity, pszSoc), at(4));
    EXPECT_EQ(offsetof(qvsWapValidity, pszValidUntil), at(5));
}

TEST(Layout, qvsWapAppAddr)
{
    EXPECT_EQ(sizeof(qvsWapAppAddr), at(4));
    EXPECT_EQ(offsetof(qvsWapAppAddr, pszAddr), at(1));
    EXPECT_EQ(offsetof(qvsWapAppAddr, pszAddrType), at(2));
    EXPECT_EQ(offsetof(qvsWapAppAddr, ptCharacterList), at(3));
}

TEST(Layout, qvsWapResource)
{
    EXPECT_EQ(sizeof(qvsWapResource), at(9));
    EXPECT_EQ(offsetof(qvsWapResource, pszUri), at(1));
    EXPECT_EQ(offsetof(qvsWapResource, pszName), at(2));
    EXPECT_EQ(offsetof(qvsWapResource, pszAAccept), at(3));
    EXPECT_EQ(offsetof(qvsWapResource, pszAAuthType), at(4));
    EXPECT_EQ(offsetof(qvsWapResource, pszAAuthName), at(5));
    EXPECT_EQ(offsetof(qvsWapResource, pszAAuthSecret), at(6));
    EXPECT_EQ(offsetof(qvsWapResource, pszAAuthData), at(7));
    EXPECT_EQ(offsetof(qvsWapResource, pszStartPage), at(8));
}

TEST(Layout, qvsWapAppAuth)
{
    EXPECT_EQ(sizeof(qvsWapAppAuth), at(6));
    EXPECT_EQ(offsetof(qvsWapAppAuth, pszAAuthLevel), at(1));
    EXPECT_EQ(offsetof(qvsWapAppAuth, pszAAuthType), at(2));
    EXPECT_EQ(offsetof(qvsWapAppAuth, pszAAuthName), at(3));
    EXPECT_EQ(offsetof(qvsWapAppAuth, pszAAuthSecret), at(4));
    EXPECT_EQ(offsetof(qvsWapAppAuth, pszAAuthData), at(5));
}

TEST(Layout, qvsWapApplication)
{
    EXPECT_EQ(sizeof(qvsWapApplication), at(17));
    EXPECT_EQ(offsetof(qvsWapApplication, pszAppId), at(1));
    EXPECT_EQ(offsetof(qvsWapApplication, pszProviderId), at(2));
    EXPECT_EQ(offsetof(qvsWapApplication, pszFrom), at(3));
    EXPECT_EQ(offsetof(qvsWapApplication, pszName), at(4));
    EXPECT_EQ(offsetof(qvsWapApplication, pszAAccept), at(5));
    EXPECT_EQ(offsetof(qvsWapApplication, pszAProtocol), at(6));
    EXPECT_EQ(offsetof(qvsWapApplication, pszInternet), at(7));
    EXPECT_EQ(offsetof(qvsWapApplication, pszXcapAuidDcs), at(8));
    EXPECT_EQ(offsetof(qvsWapApplication, pszXcapAuidPms), at(9));
    EXPECT_EQ(offsetof(qvsWapApplication, pszXcapAuidCdms), at(10));
    EXPECT_EQ(offsetof(qvsWapApplication, pszXcapImeiHeader), at(11));
    EXPECT_EQ(offsetof(qvsWapApplication, pszXcapTidHeader), at(12));
    EXPECT_EQ(offsetof(qvsWapApplication, ptToProxyList), at(13));
    EXPECT_EQ(offsetof(qvsWapApplication, ptToNapIdList), at(14));
    EXPECT_EQ(offsetof(qvsWapApplication, ptAddrList), at(15));
    EXPECT_EQ(offsetof(qvsWapApplication, ptCharacterList), at(16));
}

TEST(Layout, qvsWapBootstrap)
{
    EXPECT_EQ(sizeof(qvsWapBootstrap), at(7));
    EXPECT_EQ(offsetof(qvsWapBootstrap, pszName), at(1));
    EXPECT_EQ(offsetof(qvsWapBootstrap, pszCountry), at(2));
    EXPECT_EQ(offsetof(qvsWapBootstrap, pszProvUrl), at(3));
    EXPECT_EQ(offsetof(qvsWapBootstrap, pszContextAllow), at(4));
    EXPECT_EQ(offsetof(qvsWapBootstrap, ptProxyIdList), at(5));
    EXPECT_EQ(offsetof(qvsWapBootstrap, ptNetworkList), at(6));
}

TEST(Layout, qvsWapVendorConfig)
{
    EXPECT_EQ(sizeof(qvsWapVendorConfig), at(4));
    EXPECT_EQ(offsetof(qvsWapVendorConfig, pszName), at(1));
    EXPECT_EQ(offsetof(qvsWapVendorConfig, pszParamName), at(2));
    EXPECT_EQ(offsetof(qvsWapVendorConfig, pszParamValue), at(3));
}

TEST(Layout, qvsWapClientIdentity)
{
    EXPECT_EQ(sizeof(qvsWapClientIdentity), at(2));
    EXPECT_EQ(offsetof(qvsWapClientIdentity, pszClientId), at(1));
}

TEST(Layout, qvsWapAccess)
{
    EXPECT_EQ(sizeof(qvsWapAccess), at(7));
    EXPECT_EQ(offsetof(qvsWapAccess, ptRuleList), at(1));
    EXPECT_EQ(offsetof(qvsWapAccess, ptAppIdList), at(2));
    EXPECT_EQ(offsetof(qvsWapAccess, ptPortNbrList), at(3));
    EXPECT_EQ(offsetof(qvsWapAccess, ptDomainList), at(4));
    EXPECT_EQ(offsetof(qvsWapAccess, ptToNapIdList), at(5));
    EXPECT_EQ(offsetof(qvsWapAccess, ptToProxyList), at(6));
}

TEST(Layout, qvsWapRoaming)
{
    EXPECT_EQ(sizeof(qvsWapRoaming), at(3));
    EXPECT_EQ(offsetof(qvsWapRoaming, pszSyncAllowed), at(1));
    EXPECT_EQ(offsetof(qvsWapRoaming, pszSyncDefault), at(2));
}

TEST(Layout, qvsWapWifi)
{
    EXPECT_EQ(sizeof(qvsWapWifi), at(13));
    EXPECT_EQ(offsetof(qvsWapWifi, pszNetSsid), at(1));
    EXPECT_EQ(offsetof(qvsWapWifi, pszSecMode), at(2));
    EXPECT_EQ(offsetof(qvsWapWifi, pszEapMethod), at(3));
    EXPECT_EQ(offsetof(qvsWapWifi, pszEapType), at(4));
    EXPECT_EQ(offsetof(qvsWapWifi, pszUserName), at(5));
    EXPECT_EQ(offsetof(qvsWapWifi, pszAnonUserName), at(6));
    EXPECT_EQ(offsetof(qvsWapWifi, pszPassword), at(7));
    EXPECT_EQ(offsetof(qvsWapWifi, pszCaCert), at(8));
    EXPECT_EQ(offsetof(qvsWapWifi, pszUserCert), at(9));
    EXPECT_EQ(offsetof(qvsWapWifi, pszPhase1), at(10));
    EXPECT_EQ(offsetof(qvsWapWifi, pszAuthAlgorithm), at(11));
    EXPECT_EQ(offsetof(qvsWapWifi, pszPriority), at(12));
}

TEST(Layout, qvsWapVoWifi)
{
    EXPECT_EQ(sizeof(qvsWapVoWifi), at(2));
    EXPECT_EQ(offsetof(qvsWapVoWifi, pszEpdgFqdn), at(1));
}

// ---- The context

TEST(Layout, qvsCtxStrNode)
{
    EXPECT_EQ(sizeof(qvsCtxStrNode), at(3));
    EXPECT_EQ(offsetof(qvsCtxStrNode, pszValue), at(1));
    EXPECT_EQ(offsetof(qvsCtxStrNode, pAuthEntity), at(1));
    EXPECT_EQ(offsetof(qvsCtxStrNode, ptNext), at(2));
}

TEST(Layout, qvsCtxPxAuthInfo)
{
    EXPECT_EQ(sizeof(qvsCtxPxAuthInfo), at(5));
    EXPECT_EQ(offsetof(qvsCtxPxAuthInfo, pszPxAuthType), at(1));
    EXPECT_EQ(offsetof(qvsCtxPxAuthInfo, pszPxAuthId), at(2));
    EXPECT_EQ(offsetof(qvsCtxPxAuthInfo, pszPxAuthPw), at(3));
    EXPECT_EQ(offsetof(qvsCtxPxAuthInfo, ptNext), at(4));
}

TEST(Layout, qvsCtxPort)
{
    EXPECT_EQ(sizeof(qvsCtxPort), at(4));
    EXPECT_EQ(offsetof(qvsCtxPort, pszPortNbr), at(1));
    EXPECT_EQ(offsetof(qvsCtxPort, ptService), at(2));
    EXPECT_EQ(offsetof(qvsCtxPort, ptNext), at(3));
}

TEST(Layout, qvsCtxPxPhysical)
{
    EXPECT_EQ(sizeof(qvsCtxPxPhysical), at(12));
    EXPECT_EQ(offsetof(qvsCtxPxPhysical, pszPhysicalProxyId), at(1));
    EXPECT_EQ(offsetof(qvsCtxPxPhysical, pszPxAddr), at(2));
    EXPECT_EQ(offsetof(qvsCtxPxPhysical, pszPxAddrType), at(3));
    EXPECT_EQ(offsetof(qvsCtxPxPhysical, pszPxAddrFqdn), at(4));
    EXPECT_EQ(offsetof(qvsCtxPxPhysical, pszWspVersion), at(5));
    EXPECT_EQ(offsetof(qvsCtxPxPhysical, pszPushEnabled), at(6));
    EXPECT_EQ(offsetof(qvsCtxPxPhysical, pszPullEnabled), at(7));
    EXPECT_EQ(offsetof(qvsCtxPxPhysical, ptDomain), at(8));
    EXPECT_EQ(offsetof(qvsCtxPxPhysical, ptToNapId), at(9));
    EXPECT_EQ(offsetof(qvsCtxPxPhysical, ptPort), at(10));
    EXPECT_EQ(offsetof(qvsCtxPxPhysical, ptNext), at(11));
}

TEST(Layout, qvsCtxPxLogical)
{
    EXPECT_EQ(sizeof(qvsCtxPxLogical), at(19));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszProxyId), at(1));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszProxyPw), at(2));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszPpgAuthType), at(3));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszProxyProviderId), at(4));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszName), at(5));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszTrust), at(6));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszMaster), at(7));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszStartPage), at(8));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszReserved1), at(9));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszReserved2), at(10));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszReserved3), at(11));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszReserved4), at(12));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, pszReserved5), at(13));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, ptDomain), at(14));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, ptPxAuthInfo), at(15));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, ptPort), at(16));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, ptPxPhysical), at(17));
    EXPECT_EQ(offsetof(qvsCtxPxLogical, ptNext), at(18));
}

TEST(Layout, qvsCtxNapAuthInfo)
{
    EXPECT_EQ(sizeof(qvsCtxNapAuthInfo), at(7));
    EXPECT_EQ(offsetof(qvsCtxNapAuthInfo, pszAuthType), at(1));
    EXPECT_EQ(offsetof(qvsCtxNapAuthInfo, pszAuthName), at(2));
    EXPECT_EQ(offsetof(qvsCtxNapAuthInfo, pszAuthSecret), at(3));
    EXPECT_EQ(offsetof(qvsCtxNapAuthInfo, pszReserved), at(4));
    EXPECT_EQ(offsetof(qvsCtxNapAuthInfo, ptAuthEntity), at(5));
    EXPECT_EQ(offsetof(qvsCtxNapAuthInfo, ptNext), at(6));
}

TEST(Layout, qvsCtxValidity)
{
    EXPECT_EQ(sizeof(qvsCtxValidity), at(7));
    EXPECT_EQ(offsetof(qvsCtxValidity, pszCountry), at(1));
    EXPECT_EQ(offsetof(qvsCtxValidity, pszNetwork), at(2));
    EXPECT_EQ(offsetof(qvsCtxValidity, pszSid), at(3));
    EXPECT_EQ(offsetof(qvsCtxValidity, pszSoc), at(4));
    EXPECT_EQ(offsetof(qvsCtxValidity, pszValidUntil), at(5));
    EXPECT_EQ(offsetof(qvsCtxValidity, ptNext), at(6));
}

TEST(Layout, qvsCtxNapDef)
{
    EXPECT_EQ(sizeof(qvsCtxNapDef), at(34));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszNapId), at(1));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszName), at(2));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszInternet), at(3));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszNapAddress), at(4));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszNapAddrType), at(5));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszCallType), at(6));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszLocalAddr), at(7));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszLocalAddrType), at(8));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszLinkSpeed), at(9));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszDnLinkSpeed), at(10));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszLinger), at(11));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszDeliveryErrSdu), at(12));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszDeliveryOrder), at(13));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszTrafficClass), at(14));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszMaxSduSize), at(15));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszMaxBitrateUplink), at(16));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszMaxBitrateDnlink), at(17));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszReserved1), at(18));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszReserved2), at(19));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszReserved3), at(20));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszReserved4), at(21));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszReserved5), at(22));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszReserved6), at(23));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszMaxNumRetry), at(24));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszFirstRetryTimeout), at(25));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszReregThreshold), at(26));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszTBit), at(27));
    EXPECT_EQ(offsetof(qvsCtxNapDef, pszInit), at(28));
    EXPECT_EQ(offsetof(qvsCtxNapDef, ptDnsAddr), at(29));
    EXPECT_EQ(offsetof(qvsCtxNapDef, ptBearer), at(30));
    EXPECT_EQ(offsetof(qvsCtxNapDef, ptNapAuthInfo), at(31));
    EXPECT_EQ(offsetof(qvsCtxNapDef, ptValidity), at(32));
    EXPECT_EQ(offsetof(qvsCtxNapDef, ptNext), at(33));
}

TEST(Layout, qvsCtxAppAddr)
{
    EXPECT_EQ(sizeof(qvsCtxAppAddr), at(5));
    EXPECT_EQ(offsetof(qvsCtxAppAddr, pszAddr), at(1));
    EXPECT_EQ(offsetof(qvsCtxAppAddr, pszAddrType), at(2));
    EXPECT_EQ(offsetof(qvsCtxAppAddr, ptPort), at(3));
    EXPECT_EQ(offsetof(qvsCtxAppAddr, ptNext), at(4));
}

TEST(Layout, qvsCtxAppAuth)
{
    EXPECT_EQ(sizeof(qvsCtxAppAuth), at(7));
    EXPECT_EQ(offsetof(qvsCtxAppAuth, pszAAuthLevel), at(1));
    EXPECT_EQ(offsetof(qvsCtxAppAuth, pszAAuthType), at(2));
    EXPECT_EQ(offsetof(qvsCtxAppAuth, pszAAuthName), at(3));
    EXPECT_EQ(offsetof(qvsCtxAppAuth, pszAAuthSecret), at(4));
    EXPECT_EQ(offsetof(qvsCtxAppAuth, pszAAuthData), at(5));
    EXPECT_EQ(offsetof(qvsCtxAppAuth, ptNext), at(6));
}

TEST(Layout, qvsCtxResource)
{
    EXPECT_EQ(sizeof(qvsCtxResource), at(10));
    EXPECT_EQ(offsetof(qvsCtxResource, pszUri), at(1));
    EXPECT_EQ(offsetof(qvsCtxResource, pszName), at(2));
    EXPECT_EQ(offsetof(qvsCtxResource, pszAAccept), at(3));
    EXPECT_EQ(offsetof(qvsCtxResource, pszAAuthType), at(4));
    EXPECT_EQ(offsetof(qvsCtxResource, pszAAuthName), at(5));
    EXPECT_EQ(offsetof(qvsCtxResource, pszAAuthSecret), at(6));
    EXPECT_EQ(offsetof(qvsCtxResource, pszAAuthData), at(7));
    EXPECT_EQ(offsetof(qvsCtxResource, pszStartPage), at(8));
    EXPECT_EQ(offsetof(qvsCtxResource, ptNext), at(9));
}

TEST(Layout, qvsCtxRoaming)
{
    EXPECT_EQ(sizeof(qvsCtxRoaming), at(4));
    EXPECT_EQ(offsetof(qvsCtxRoaming, pszSyncAllowed), at(1));
    EXPECT_EQ(offsetof(qvsCtxRoaming, pszSyncDefault), at(2));
    EXPECT_EQ(offsetof(qvsCtxRoaming, ptNext), at(3));
}

TEST(Layout, qvsCtxApplication)
{
    EXPECT_EQ(sizeof(qvsCtxApplication), at(21));
    EXPECT_EQ(offsetof(qvsCtxApplication, pszAppId), at(1));
    EXPECT_EQ(offsetof(qvsCtxApplication, pszProviderId), at(2));
    EXPECT_EQ(offsetof(qvsCtxApplication, pszFrom), at(3));
    EXPECT_EQ(offsetof(qvsCtxApplication, pszName), at(4));
    EXPECT_EQ(offsetof(qvsCtxApplication, pszAAccept), at(5));
    EXPECT_EQ(offsetof(qvsCtxApplication, pszAProtocol), at(6));
    EXPECT_EQ(offsetof(qvsCtxApplication, pszInternet), at(7));
    EXPECT_EQ(offsetof(qvsCtxApplication, pszXcapAuidDcs), at(8));
    EXPECT_EQ(offsetof(qvsCtxApplication, pszXcapAuidPms), at(9));
    EXPECT_EQ(offsetof(qvsCtxApplication, pszXcapAuidCdms), at(10));
    EXPECT_EQ(offsetof(qvsCtxApplication, pszXcapImeiHeader), at(11));
    EXPECT_EQ(offsetof(qvsCtxApplication, pszXcapTidHeader), at(12));
    EXPECT_EQ(offsetof(qvsCtxApplication, ptToProxy), at(13));
    EXPECT_EQ(offsetof(qvsCtxApplication, ptToNapId), at(14));
    EXPECT_EQ(offsetof(qvsCtxApplication, ptToAddr), at(15));
    EXPECT_EQ(offsetof(qvsCtxApplication, ptAppAddr), at(16));
    EXPECT_EQ(offsetof(qvsCtxApplication, ptAppAuth), at(17));
    EXPECT_EQ(offsetof(qvsCtxApplication, ptResource), at(18));
    EXPECT_EQ(offsetof(qvsCtxApplication, ptRoaming), at(19));
    EXPECT_EQ(offsetof(qvsCtxApplication, ptNext), at(20));
}

TEST(Layout, qvsCtxBootstrap)
{
    EXPECT_EQ(sizeof(qvsCtxBootstrap), at(8));
    EXPECT_EQ(offsetof(qvsCtxBootstrap, pszName), at(1));
    EXPECT_EQ(offsetof(qvsCtxBootstrap, pszCountry), at(2));
    EXPECT_EQ(offsetof(qvsCtxBootstrap, pszProvUrl), at(3));
    EXPECT_EQ(offsetof(qvsCtxBootstrap, pszContextAllow), at(4));
    EXPECT_EQ(offsetof(qvsCtxBootstrap, ptProxyId), at(5));
    EXPECT_EQ(offsetof(qvsCtxBootstrap, ptNetwork), at(6));
    EXPECT_EQ(offsetof(qvsCtxBootstrap, ptNext), at(7));
}

TEST(Layout, qvsCtxClientIdent)
{
    EXPECT_EQ(sizeof(qvsCtxClientIdent), at(2));
    EXPECT_EQ(offsetof(qvsCtxClientIdent, pszClientId), at(1));
}

TEST(Layout, qvsCtxVendorConfig)
{
    EXPECT_EQ(sizeof(qvsCtxVendorConfig), at(5));
    EXPECT_EQ(offsetof(qvsCtxVendorConfig, pszName), at(1));
    EXPECT_EQ(offsetof(qvsCtxVendorConfig, pszParamName), at(2));
    EXPECT_EQ(offsetof(qvsCtxVendorConfig, pszParamValue), at(3));
    EXPECT_EQ(offsetof(qvsCtxVendorConfig, ptNext), at(4));
}

TEST(Layout, qvsCtxAccess)
{
    EXPECT_EQ(sizeof(qvsCtxAccess), at(8));
    EXPECT_EQ(offsetof(qvsCtxAccess, ptRule), at(1));
    EXPECT_EQ(offsetof(qvsCtxAccess, ptAppId), at(2));
    EXPECT_EQ(offsetof(qvsCtxAccess, ptPortNbr), at(3));
    EXPECT_EQ(offsetof(qvsCtxAccess, ptDomain), at(4));
    EXPECT_EQ(offsetof(qvsCtxAccess, ptToNapId), at(5));
    EXPECT_EQ(offsetof(qvsCtxAccess, ptToProxy), at(6));
    EXPECT_EQ(offsetof(qvsCtxAccess, ptNext), at(7));
}

TEST(Layout, qvsCtxWifi)
{
    EXPECT_EQ(sizeof(qvsCtxWifi), at(14));
    EXPECT_EQ(offsetof(qvsCtxWifi, pszNetSsid), at(1));
    EXPECT_EQ(offsetof(qvsCtxWifi, pszSecMode), at(2));
    EXPECT_EQ(offsetof(qvsCtxWifi, pszEapMethod), at(3));
    EXPECT_EQ(offsetof(qvsCtxWifi, pszEapType), at(4));
    EXPECT_EQ(offsetof(qvsCtxWifi, pszUserName), at(5));
    EXPECT_EQ(offsetof(qvsCtxWifi, pszAnonUserName), at(6));
    EXPECT_EQ(offsetof(qvsCtxWifi, pszPassword), at(7));
    EXPECT_EQ(offsetof(qvsCtxWifi, pszCaCert), at(8));
    EXPECT_EQ(offsetof(qvsCtxWifi, pszUserCert), at(9));
    EXPECT_EQ(offsetof(qvsCtxWifi, pszPhase1), at(10));
    EXPECT_EQ(offsetof(qvsCtxWifi, pszAuthAlgorithm), at(11));
    EXPECT_EQ(offsetof(qvsCtxWifi, pszPriority), at(12));
    EXPECT_EQ(offsetof(qvsCtxWifi, ptNext), at(13));
}

TEST(Layout, qvsCtxVoWifi)
{
    EXPECT_EQ(sizeof(qvsCtxVoWifi), at(3));
    EXPECT_EQ(offsetof(qvsCtxVoWifi, pszEpdgFqdn), at(1));
    EXPECT_EQ(offsetof(qvsCtxVoWifi, ptNext), at(2));
}

TEST(Layout, qvsClientProvCtx)
{
    EXPECT_EQ(sizeof(qvsClientProvCtx), at(10));
    EXPECT_EQ(offsetof(qvsClientProvCtx, ptPxLogical), at(1));
    EXPECT_EQ(offsetof(qvsClientProvCtx, ptNapDef), at(2));
    EXPECT_EQ(offsetof(qvsClientProvCtx, ptBootstrap), at(3));
    EXPECT_EQ(offsetof(qvsClientProvCtx, ptClientIdent), at(4));
    EXPECT_EQ(offsetof(qvsClientProvCtx, ptVendorConfig), at(5));
    EXPECT_EQ(offsetof(qvsClientProvCtx, ptApplication), at(6));
    EXPECT_EQ(offsetof(qvsClientProvCtx, ptAccess), at(7));
    EXPECT_EQ(offsetof(qvsClientProvCtx, ptWifi), at(8));
    EXPECT_EQ(offsetof(qvsClientProvCtx, ptVoWifi), at(9));
}

} // namespace
