// The releases of the provisioning context, chain by chain.
#include "qvsClientProvCtx.h"
#include "qvsFields.h"
#include "qvsLeft.h"
#include "qvsmemory.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

using AppAuth = qvsCtxAppAuth;
using Resource = qvsCtxResource;
using PxPhysical = qvsCtxPxPhysical;
using Access = qvsCtxAccess;
using Application = qvsCtxApplication;
using Bootstrap = qvsCtxBootstrap;
using PxLogical = qvsCtxPxLogical;
using Context = qvsClientProvCtx;

// The records of a context, which are known by their numbers.
template <class... Records>
struct RecordList {
    static constexpr uint8_t kCount = sizeof...(Records);

    template <class Record>
    static consteval uint8_t numberOf()
    {
        static_assert((__is_same(Record, Records) || ...), "a kind that is not listed");
        uint8_t number = 0;
        (void)((__is_same(Record, Records) || (++number, false)) || ...);
        return number;
    }
};

using ContextRecords =
    RecordList<qvsCtxStrNode, qvsCtxPort, qvsCtxNapAuthInfo, qvsCtxValidity, qvsCtxAppAddr, AppAuth,
               Resource, qvsCtxPxAuthInfo, PxPhysical, Access, Application, Bootstrap, qvsCtxNapDef,
               PxLogical, qvsCtxVendorConfig, qvsCtxWifi, qvsCtxVoWifi, qvsCtxClientIdent, Context>;

constexpr uint8_t kText = 0xFF;

// A field and what it owns: a text, or the chain of a kind.
struct ReleaseRow {
    constexpr ReleaseRow() = default;
    constexpr ReleaseRow(uint8_t number, char *) : field(number) {}
    template <class Record>
    constexpr ReleaseRow(uint8_t number, Record *)
        : field(number), owns(ContextRecords::numberOf<Record>())
    {
    }

    uint8_t field = 0;
    uint8_t owns = kText;
};

// What a record owns, in the order in which that is released.
template <class Record>
constexpr auto kRelease = inOrder<ReleaseRow, Record>();

template <>
constexpr auto kRelease<PxPhysical> =
    inOrder<ReleaseRow, PxPhysical>().moved(&PxPhysical::ptDomain, &PxPhysical::ptToNapId);
template <>
constexpr auto kRelease<PxLogical> =
    inOrder<ReleaseRow, PxLogical>().moved(&PxLogical::ptPxAuthInfo, &PxLogical::ptPort);
template <>
constexpr auto
    kRelease<AppAuth> = rowsOf<ReleaseRow>(&AppAuth::pszAAuthData, &AppAuth::pszAAuthLevel,
                                           &AppAuth::pszAAuthName, &AppAuth::pszAAuthSecret,
                                           &AppAuth::pszAAuthType);
template <>
constexpr auto
    kRelease<Resource> = rowsOf<ReleaseRow>(&Resource::pszAAccept, &Resource::pszAAuthData,
                                            &Resource::pszAAuthName, &Resource::pszAAuthSecret,
                                            &Resource::pszAAuthType, &Resource::pszName,
                                            &Resource::pszStartPage, &Resource::pszUri);
template <>
constexpr auto kRelease<Access> = rowsOf<ReleaseRow>(&Access::ptAppId, &Access::ptDomain,
                                                     &Access::ptPortNbr, &Access::ptRule,
                                                     &Access::ptToNapId, &Access::ptToProxy);
template <>
constexpr auto kRelease<Application> =
    rowsOf<ReleaseRow>(&Application::pszAAccept, &Application::pszAppId, &Application::pszAProtocol,
                       &Application::pszName, &Application::pszProviderId, &Application::pszFrom,
                       &Application::pszInternet, &Application::ptToAddr, &Application::ptToNapId,
                       &Application::ptToProxy, &Application::ptAppAddr, &Application::ptAppAuth,
                       &Application::ptResource);
template <>
constexpr auto
    kRelease<Bootstrap> = rowsOf<ReleaseRow>(&Bootstrap::pszContextAllow, &Bootstrap::pszCountry,
                                             &Bootstrap::pszName, &Bootstrap::pszProvUrl,
                                             &Bootstrap::ptNetwork, &Bootstrap::ptProxyId);
template <>
constexpr auto kRelease<Context> = rowsOf<ReleaseRow>(&Context::ptAccess, &Context::ptApplication,
                                                      &Context::ptBootstrap,
                                                      &Context::ptClientIdent, &Context::ptNapDef,
                                                      &Context::ptPxLogical,
                                                      &Context::ptVendorConfig, &Context::ptVoWifi);

// One kind of record: what it owns, and where its link is.
struct ChainRelease {
    Rows<ReleaseRow> rows;
    uint8_t link; // kNoField for a kind that forms no chain
};

template <class Record>
consteval ChainRelease releaseOf()
{
    return {allOf<Record>(kRelease<Record>), kLinkOf<Record>};
}

// The releases by the numbers of the kinds.
struct Releases {
    template <class... Records>
    consteval Releases(RecordList<Records...>) : kinds{releaseOf<Records>()...}
    {
    }

    ChainRelease kinds[ContextRecords::kCount];
};

constexpr Releases kReleases = ContextRecords();

// The kinds of record nest a few levels deep, whatever a message holds.
// NOLINTBEGIN(misc-no-recursion)

void releaseKind(void *first, uint8_t number);

// Releases what a record owns.
void releaseRows(void *record, const ChainRelease &kind)
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
            releaseKind(owned, row.owns);
        }
    }
}

// Releases what the records of a chain own, from the first to the last, then the records from the
// last to the first. The links, turned round on the way there, lead the way back.
void releaseKind(void *first, uint8_t number)
{
    const ChainRelease &kind = kReleases.kinds[number];
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

template <class Record>
void releaseChain(Record *first)
{
    releaseKind(first, ContextRecords::numberOf<Record>());
}

} // namespace

void qvsClientProvCtxDelectContext(qvsClientProvCtx *root)
{
    releaseChain(root);
}

void qvsClientProvCtxDelectContextRuleList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextAppIdList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextPortNbrList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextDomainList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextToNapIdList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextToProxyList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextToAddrList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextServiceList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextNetworkList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextProxyIdList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextDnsAddrList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextBearerList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextAuthEntityList(qvsCtxStrNode *node)
{
    releaseChain(node);
}

void qvsClientProvCtxDelectContextPort(qvsCtxPort *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextNapAuthInfo(qvsCtxNapAuthInfo *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextValidity(qvsCtxValidity *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextAppAddr(qvsCtxAppAddr *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextAppAuth(qvsCtxAppAuth *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextResource(qvsCtxResource *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextPxAuthInfo(qvsCtxPxAuthInfo *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextPxPhysical(qvsCtxPxPhysical *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextAccess(qvsCtxAccess *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextApplication(qvsCtxApplication *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextBootstrap(qvsCtxBootstrap *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextClientIdent(qvsCtxClientIdent *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextNapDef(qvsCtxNapDef *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextPxLogical(qvsCtxPxLogical *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextVenderConfig(qvsCtxVendorConfig *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextWifi(qvsCtxWifi *record)
{
    releaseChain(record);
}

void qvsClientProvCtxDelectContextVoWifi(qvsCtxVoWifi *record)
{
    releaseChain(record);
}
