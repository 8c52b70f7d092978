// The releases of the provisioning context, chain by chain.
#include "qvsClientProvCtx.h"
#include "qvsFields.h"
#include "qvsmemory.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

// The kinds of record, and of what a field owns: a text, or the chain of a kind.
enum Kind : uint8_t {
    kStrNode,
    kPort,
    kNapAuthInfo,
    kValidity,
    kAppAddr,
    kAppAuth,
    kResource,
    kPxAuthInfo,
    kPxPhysical,
    kAccess,
    kApplication,
    kBootstrap,
    kNapDef,
    kPxLogical,
    kVendorConfig,
    kWifi,
    kVoWifi,
    kClientIdent,
    kContext,
    kText,
};

struct ReleaseRow {
    consteval ReleaseRow(TextField f) : field(f.number), owns(kText) {}
    consteval ReleaseRow(RecordField f, Kind chain) : field(f.number), owns(chain) {}

    uint8_t field;
    Kind owns;
};

// One kind of record: what it owns, in the order in which that is released.
struct ReleaseKind {
    Rows<ReleaseRow> rows;
    uint8_t link; // the last field, ptNext; kNoField for a kind that forms no chain
};

template <class Record, size_t N, size_t L = 0>
consteval ReleaseKind releaseOf(const ReleaseRow (&rows)[N], Left<L> = {})
{
    static_assert(N + L + (kLinkOf<Record> == kNoField ? 0 : 1) == kFieldsOf<Record>,
                  "a field is neither released nor left on purpose");
    return {rows, kLinkOf<Record>};
}

namespace strNode {
using R = qvsCtxStrNode;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszValue)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace strNode

namespace port {
using R = qvsCtxPort;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszPortNbr)},
    {QVS_FIELD(R, ptService), kStrNode},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace port

namespace napAuthInfo {
using R = qvsCtxNapAuthInfo;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszAuthType)},
    {QVS_FIELD(R, pszAuthName)},
    {QVS_FIELD(R, pszAuthSecret)},
    {QVS_FIELD(R, pszReserved)},
    {QVS_FIELD(R, ptAuthEntity), kStrNode},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace napAuthInfo

namespace validity {
using R = qvsCtxValidity;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszCountry)}, {QVS_FIELD(R, pszNetwork)},    {QVS_FIELD(R, pszSid)},
    {QVS_FIELD(R, pszSoc)},     {QVS_FIELD(R, pszValidUntil)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace validity

namespace appAddr {
using R = qvsCtxAppAddr;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszAddr)},
    {QVS_FIELD(R, pszAddrType)},
    {QVS_FIELD(R, ptPort), kPort},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace appAddr

namespace appAuth {
using R = qvsCtxAppAuth;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszAAuthData)},   {QVS_FIELD(R, pszAAuthLevel)}, {QVS_FIELD(R, pszAAuthName)},
    {QVS_FIELD(R, pszAAuthSecret)}, {QVS_FIELD(R, pszAAuthType)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace appAuth

namespace resource {
using R = qvsCtxResource;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszAAccept)},     {QVS_FIELD(R, pszAAuthData)}, {QVS_FIELD(R, pszAAuthName)},
    {QVS_FIELD(R, pszAAuthSecret)}, {QVS_FIELD(R, pszAAuthType)}, {QVS_FIELD(R, pszName)},
    {QVS_FIELD(R, pszStartPage)},   {QVS_FIELD(R, pszUri)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace resource

namespace pxAuthInfo {
using R = qvsCtxPxAuthInfo;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszPxAuthType)},
    {QVS_FIELD(R, pszPxAuthId)},
    {QVS_FIELD(R, pszPxAuthPw)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace pxAuthInfo

namespace pxPhysical {
using R = qvsCtxPxPhysical;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszPhysicalProxyId)}, {QVS_FIELD(R, pszPxAddr)},
    {QVS_FIELD(R, pszPxAddrType)},      {QVS_FIELD(R, pszPxAddrFqdn)},
    {QVS_FIELD(R, pszWspVersion)},      {QVS_FIELD(R, pszPushEnabled)},
    {QVS_FIELD(R, pszPullEnabled)},     {QVS_FIELD(R, ptToNapId), kStrNode},
    {QVS_FIELD(R, ptDomain), kStrNode}, {QVS_FIELD(R, ptPort), kPort},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace pxPhysical

namespace access {
using R = qvsCtxAccess;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, ptAppId), kStrNode},   {QVS_FIELD(R, ptDomain), kStrNode},
    {QVS_FIELD(R, ptPortNbr), kStrNode}, {QVS_FIELD(R, ptRule), kStrNode},
    {QVS_FIELD(R, ptToNapId), kStrNode}, {QVS_FIELD(R, ptToProxy), kStrNode},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace access

namespace application {
using R = qvsCtxApplication;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszAAccept)},
    {QVS_FIELD(R, pszAppId)},
    {QVS_FIELD(R, pszAProtocol)},
    {QVS_FIELD(R, pszName)},
    {QVS_FIELD(R, pszProviderId)},
    {QVS_FIELD(R, pszFrom)},
    {QVS_FIELD(R, pszInternet)},
    {QVS_FIELD(R, ptToAddr), kStrNode},
    {QVS_FIELD(R, ptToNapId), kStrNode},
    {QVS_FIELD(R, ptToProxy), kStrNode},
    {QVS_FIELD(R, ptAppAddr), kAppAddr},
    {QVS_FIELD(R, ptAppAuth), kAppAuth},
    {QVS_FIELD(R, ptResource), kResource},
};
// kept[context-application-left]: the XCAP texts and the ROAMING records stay allocated.
constexpr ReleaseKind kRelease =
    releaseOf<R>(kRows, leave(&R::pszXcapAuidDcs, &R::pszXcapAuidPms, &R::pszXcapAuidCdms,
                              &R::pszXcapImeiHeader, &R::pszXcapTidHeader, &R::ptRoaming));
} // namespace application

namespace bootstrap {
using R = qvsCtxBootstrap;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszContextAllow)},
    {QVS_FIELD(R, pszCountry)},
    {QVS_FIELD(R, pszName)},
    {QVS_FIELD(R, pszProvUrl)},
    {QVS_FIELD(R, ptNetwork), kStrNode},
    {QVS_FIELD(R, ptProxyId), kStrNode},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace bootstrap

namespace napDef {
using R = qvsCtxNapDef;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszNapId)},
    {QVS_FIELD(R, pszName)},
    {QVS_FIELD(R, pszInternet)},
    {QVS_FIELD(R, pszNapAddress)},
    {QVS_FIELD(R, pszNapAddrType)},
    {QVS_FIELD(R, pszCallType)},
    {QVS_FIELD(R, pszLocalAddr)},
    {QVS_FIELD(R, pszLocalAddrType)},
    {QVS_FIELD(R, pszLinkSpeed)},
    {QVS_FIELD(R, pszDnLinkSpeed)},
    {QVS_FIELD(R, pszLinger)},
    {QVS_FIELD(R, pszDeliveryErrSdu)},
    {QVS_FIELD(R, pszDeliveryOrder)},
    {QVS_FIELD(R, pszTrafficClass)},
    {QVS_FIELD(R, pszMaxSduSize)},
    {QVS_FIELD(R, pszMaxBitrateUplink)},
    {QVS_FIELD(R, pszMaxBitrateDnlink)},
    {QVS_FIELD(R, pszReserved1)},
    {QVS_FIELD(R, pszReserved2)},
    {QVS_FIELD(R, pszReserved3)},
    {QVS_FIELD(R, pszReserved4)},
    {QVS_FIELD(R, pszReserved5)},
    {QVS_FIELD(R, pszReserved6)},
    {QVS_FIELD(R, pszMaxNumRetry)},
    {QVS_FIELD(R, pszFirstRetryTimeout)},
    {QVS_FIELD(R, pszReregThreshold)},
    {QVS_FIELD(R, pszTBit)},
    {QVS_FIELD(R, ptDnsAddr), kStrNode},
    {QVS_FIELD(R, ptBearer), kStrNode},
    {QVS_FIELD(R, ptNapAuthInfo), kNapAuthInfo},
    {QVS_FIELD(R, ptValidity), kValidity},
};
// kept[context-init-left]: the copy of INIT stays allocated.
constexpr ReleaseKind kRelease = releaseOf<R>(kRows, leave(&R::pszInit));
} // namespace napDef

namespace pxLogical {
using R = qvsCtxPxLogical;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszProxyId)},
    {QVS_FIELD(R, pszProxyPw)},
    {QVS_FIELD(R, pszPpgAuthType)},
    {QVS_FIELD(R, pszProxyProviderId)},
    {QVS_FIELD(R, pszName)},
    {QVS_FIELD(R, pszTrust)},
    {QVS_FIELD(R, pszMaster)},
    {QVS_FIELD(R, pszStartPage)},
    {QVS_FIELD(R, pszReserved1)},
    {QVS_FIELD(R, pszReserved2)},
    {QVS_FIELD(R, pszReserved3)},
    {QVS_FIELD(R, pszReserved4)},
    {QVS_FIELD(R, pszReserved5)},
    {QVS_FIELD(R, ptDomain), kStrNode},
    {QVS_FIELD(R, ptPort), kPort},
    {QVS_FIELD(R, ptPxAuthInfo), kPxAuthInfo},
    {QVS_FIELD(R, ptPxPhysical), kPxPhysical},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace pxLogical

namespace vendorConfig {
using R = qvsCtxVendorConfig;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszName)},
    {QVS_FIELD(R, pszParamName)},
    {QVS_FIELD(R, pszParamValue)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace vendorConfig

namespace wifi {
using R = qvsCtxWifi;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszNetSsid)},  {QVS_FIELD(R, pszSecMode)},       {QVS_FIELD(R, pszEapMethod)},
    {QVS_FIELD(R, pszEapType)},  {QVS_FIELD(R, pszUserName)},      {QVS_FIELD(R, pszAnonUserName)},
    {QVS_FIELD(R, pszPassword)}, {QVS_FIELD(R, pszCaCert)},        {QVS_FIELD(R, pszUserCert)},
    {QVS_FIELD(R, pszPhase1)},   {QVS_FIELD(R, pszAuthAlgorithm)}, {QVS_FIELD(R, pszPriority)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace wifi

namespace voWifi {
using R = qvsCtxVoWifi;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszEpdgFqdn)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace voWifi

namespace clientIdent {
using R = qvsCtxClientIdent;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, pszClientId)},
};
constexpr ReleaseKind kRelease = releaseOf<R>(kRows);
} // namespace clientIdent

namespace context {
using R = qvsClientProvCtx;
constexpr ReleaseRow kRows[] = {
    {QVS_FIELD(R, ptAccess), kAccess},
    {QVS_FIELD(R, ptApplication), kApplication},
    {QVS_FIELD(R, ptBootstrap), kBootstrap},
    {QVS_FIELD(R, ptClientIdent), kClientIdent},
    {QVS_FIELD(R, ptNapDef), kNapDef},
    {QVS_FIELD(R, ptPxLogical), kPxLogical},
    {QVS_FIELD(R, ptVendorConfig), kVendorConfig},
    {QVS_FIELD(R, ptVoWifi), kVoWifi},
};
// kept[context-wifi-left]: the WIFI records stay allocated when the context is gone.
// kept[context-napdef-skipped]: NAPDEF records before the one that ptNapDef was moved to stay
// allocated too.
constexpr ReleaseKind kRelease = releaseOf<R>(kRows, leave(&R::ptWifi));
} // namespace context

// In the order of Kind.
constexpr ReleaseKind kReleases[] = {
    strNode::kRelease,    port::kRelease,        napAuthInfo::kRelease,  validity::kRelease,
    appAddr::kRelease,    appAuth::kRelease,     resource::kRelease,     pxAuthInfo::kRelease,
    pxPhysical::kRelease, access::kRelease,      application::kRelease,  bootstrap::kRelease,
    napDef::kRelease,     pxLogical::kRelease,   vendorConfig::kRelease, wifi::kRelease,
    voWifi::kRelease,     clientIdent::kRelease, context::kRelease,
};
static_assert(sizeof kReleases / sizeof *kReleases == kText);

// The kinds of record nest a few levels deep, whatever a message holds.
// NOLINTBEGIN(misc-no-recursion)

void releaseChain(void *first, Kind of);

// Releases what a record owns.
void releaseRows(void *record, const ReleaseKind &kind)
{
    for (const ReleaseRow &row : kind.rows) {
        void *owned = pointerAt(record, row.field);
        if (!owned) {
            continue;
        }
        if (row.owns == kText) {
            freeBlock(owned);
            setPointer(record, row.field, nullptr);
        } else {
            releaseChain(owned, row.owns);
        }
    }
}

// Releases the records of a chain with what they own.
// Strips every record from the first to the last, then releases the records from the
// last to the first. The links, turned round on the way there, lead the way back.
void releaseChain(void *first, Kind of)
{
    const ReleaseKind &kind = kReleases[of];
    if (!first) {
        traceError(QVS_ERROR_BAD_ARGUMENT);
        return;
    }
    if (kind.link == kNoField) {
        releaseRows(first, kind);
        freeBlock(first);
        return;
    }
    void *stripped = nullptr;
    for (void *record = first; record;) {
        releaseRows(record, kind);
        void *next = pointerAt(record, kind.link);
        setPointer(record, kind.link, stripped);
        stripped = record;
        record = next;
    }
    while (stripped) {
        void *record = stripped;
        stripped = pointerAt(record, kind.link);
        freeBlock(record);
    }
}

// NOLINTEND(misc-no-recursion)

} // namespace

void qvsClientProvCtxDelectContext(qvsClientProvCtx *root)
{
    releaseChain(root, kContext);
}

void qvsClientProvCtxDelectContextRuleList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextAppIdList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextPortNbrList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextDomainList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextToNapIdList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextToProxyList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextToAddrList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextServiceList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextNetworkList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextProxyIdList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextDnsAddrList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextBearerList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextAuthEntityList(qvsCtxStrNode *node)
{
    releaseChain(node, kStrNode);
}

void qvsClientProvCtxDelectContextPort(qvsCtxPort *record)
{
    releaseChain(record, kPort);
}

void qvsClientProvCtxDelectContextNapAuthInfo(qvsCtxNapAuthInfo *record)
{
    releaseChain(record, kNapAuthInfo);
}

void qvsClientProvCtxDelectContextValidity(qvsCtxValidity *record)
{
    releaseChain(record, kValidity);
}

void qvsClientProvCtxDelectContextAppAddr(qvsCtxAppAddr *record)
{
    releaseChain(record, kAppAddr);
}

void qvsClientProvCtxDelectContextAppAuth(qvsCtxAppAuth *record)
{
    releaseChain(record, kAppAuth);
}

void qvsClientProvCtxDelectContextResource(qvsCtxResource *record)
{
    releaseChain(record, kResource);
}

void qvsClientProvCtxDelectContextPxAuthInfo(qvsCtxPxAuthInfo *record)
{
    releaseChain(record, kPxAuthInfo);
}

void qvsClientProvCtxDelectContextPxPhysical(qvsCtxPxPhysical *record)
{
    releaseChain(record, kPxPhysical);
}

void qvsClientProvCtxDelectContextAccess(qvsCtxAccess *record)
{
    releaseChain(record, kAccess);
}

void qvsClientProvCtxDelectContextApplication(qvsCtxApplication *record)
{
    releaseChain(record, kApplication);
}

void qvsClientProvCtxDelectContextBootstrap(qvsCtxBootstrap *record)
{
    releaseChain(record, kBootstrap);
}

void qvsClientProvCtxDelectContextClientIdent(qvsCtxClientIdent *record)
{
    releaseChain(record, kClientIdent);
}

void qvsClientProvCtxDelectContextNapDef(qvsCtxNapDef *record)
{
    releaseChain(record, kNapDef);
}

void qvsClientProvCtxDelectContextPxLogical(qvsCtxPxLogical *record)
{
    releaseChain(record, kPxLogical);
}

void qvsClientProvCtxDelectContextVenderConfig(qvsCtxVendorConfig *record)
{
    releaseChain(record, kVendorConfig);
}

void qvsClientProvCtxDelectContextWifi(qvsCtxWifi *record)
{
    releaseChain(record, kWifi);
}

void qvsClientProvCtxDelectContextVoWifi(qvsCtxVoWifi *record)
{
    releaseChain(record, kVoWifi);
}
