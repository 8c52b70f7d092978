// The kinds of record of the context: each is a copy of the tree's record, field by field, with the
// children that it accepts.
#include "qvsClientProvCtx.h"
#include "qvsCtxCopy.h"
#include "qvstrace.h"

using namespace qvs;

// ---- Copies that differ from the record

// kept[context-pxlogical-twelfth]: pszReserved4 is never copied.
template <>
inline constexpr auto qvs::kCopyRows<qvsWapPxLogical> =
    copyInOrder<qvsWapPxLogical>().without(&qvsWapPxLogical::pszReserved4);

// The context has these two lists the other way round.
template <>
inline constexpr auto qvs::kCopyRows<qvsWapPxPhysical> = copyInOrder<qvsWapPxPhysical>().crossed(
    &qvsWapPxPhysical::ptToNapIdList, &qvsWapPxPhysical::ptDomainList);

template <>
inline constexpr auto qvs::kCopyRows<qvsWapNapDef> =
    copyInOrder<qvsWapNapDef>().moved(&qvsWapNapDef::pszInit, &qvsWapNapDef::pszNapAddrType);

// kept[context-from-twice]: FROM is copied once more, and the first copy stays allocated.
template <>
inline constexpr auto qvs::kCopyRows<qvsWapApplication> = copyInOrder<qvsWapApplication>().again(
    &qvsWapApplication::pszFrom, &qvsWapApplication::pszXcapTidHeader);

namespace {

using Node = qvsWapCharacter;

// ---- Kinds without children

constexpr CopyOf<qvsWapPort, qvsCtxPort> kPort;
constexpr CopyOf<qvsWapPxAuthInfo, qvsCtxPxAuthInfo> kPxAuthInfo;
constexpr CopyOf<qvsWapValidity, qvsCtxValidity> kValidity;
constexpr CopyOf<qvsWapRoaming, qvsCtxRoaming> kRoaming;
constexpr CopyOf<qvsWapAppAuth, qvsCtxAppAuth> kAppAuth;
constexpr CopyOf<qvsWapResource, qvsCtxResource> kResource;
constexpr CopyOf<qvsWapBootstrap, qvsCtxBootstrap> kBootstrap;
constexpr CopyOf<qvsWapClientIdentity, qvsCtxClientIdent> kClientIdent;
constexpr CopyOf<qvsWapVendorConfig, qvsCtxVendorConfig> kVendorConfig;
constexpr CopyOf<qvsWapAccess, qvsCtxAccess> kAccess;
constexpr CopyOf<qvsWapWifi, qvsCtxWifi> kWifi;
constexpr CopyOf<qvsWapVoWifi, qvsCtxVoWifi> kVoWifi;

constexpr OnCopied<qvsCtxNapAuthInfo> kTraceEntity = {[](const void *copy) {
    const qvsCtxStrNode *entity = static_cast<const qvsCtxNapAuthInfo *>(copy)->ptAuthEntity;
    // hardened: an entity without memory for its text is left out of the trace.
    if (entity && entity->pAuthEntity) {
        trace("NAP:ptCtx->ptAuthEntity->pAuthEntity[%s]", entity->pAuthEntity);
    }
}};
constexpr CopyOf<qvsWapNapAuthInfo, qvsCtxNapAuthInfo> kNapAuthInfo = kTraceEntity;

// ---- Kinds with children, and the kinds that they accept

constexpr bool kTraced = true;
// kept[context-misfit-ignored]: a child that is not accepted is not even traced.
constexpr bool kIgnored = false;

constexpr auto kPxPhysicalChildren = tableOf<Child<qvsCtxPxPhysical>>({
    {&Node::ptPort, &qvsCtxPxPhysical::ptPort, kPort},
});
constexpr CopyOf<qvsWapPxPhysical, qvsCtxPxPhysical> kPxPhysical = {kPxPhysicalChildren, kIgnored};

constexpr auto kPxLogicalChildren = tableOf<Child<qvsCtxPxLogical>>({
    {&Node::ptPxAuthInfo, &qvsCtxPxLogical::ptPxAuthInfo, kPxAuthInfo},
    {&Node::ptPxPhysical, &qvsCtxPxLogical::ptPxPhysical, kPxPhysical},
    {&Node::ptPort, &qvsCtxPxLogical::ptPort, kPort},
});
constexpr CopyOf<qvsWapPxLogical, qvsCtxPxLogical> kPxLogical = {kPxLogicalChildren, kTraced};

constexpr auto kNapDefChildren = tableOf<Child<qvsCtxNapDef>>({
    {&Node::ptNapAuthInfo, &qvsCtxNapDef::ptNapAuthInfo, kNapAuthInfo},
    {&Node::ptValidity, &qvsCtxNapDef::ptValidity, kValidity},
});
constexpr CopyOf<qvsWapNapDef, qvsCtxNapDef> kNapDef = {kNapDefChildren, kTraced};

constexpr auto kAppAddrChildren = tableOf<Child<qvsCtxAppAddr>>({
    {&Node::ptPort, &qvsCtxAppAddr::ptPort, kPort},
});
constexpr CopyOf<qvsWapAppAddr, qvsCtxAppAddr> kAppAddr = {kAppAddrChildren, kIgnored};

constexpr auto kApplicationChildren = tableOf<Child<qvsCtxApplication>>({
    {&Node::ptRoaming, &qvsCtxApplication::ptRoaming, kRoaming},
    {&Node::ptAppAddr, &qvsCtxApplication::ptAppAddr, kAppAddr},
    {&Node::ptAppAuth, &qvsCtxApplication::ptAppAuth, kAppAuth},
    {&Node::ptResource, &qvsCtxApplication::ptResource, kResource},
});
constexpr CopyOf<qvsWapApplication, qvsCtxApplication> kApplication = {kApplicationChildren,
                                                                       kTraced};

constexpr auto kAtTheTop = tableOf<Child<qvsClientProvCtx>>({
    {&Node::ptPxLogical, &qvsClientProvCtx::ptPxLogical, kPxLogical},
    {&Node::ptNapDef, &qvsClientProvCtx::ptNapDef, kNapDef},
    {&Node::ptBootstrap, &qvsClientProvCtx::ptBootstrap, kBootstrap},
    // kept[context-second-clientidentity]: with a second one the kinds below are lost.
    {&Node::ptClientIdentity, &qvsClientProvCtx::ptClientIdent, kClientIdent},
    {&Node::ptVendorConfig, &qvsClientProvCtx::ptVendorConfig, kVendorConfig},
    {&Node::ptWifi, &qvsClientProvCtx::ptWifi, kWifi},
    {&Node::ptVoWifi, &qvsClientProvCtx::ptVoWifi, kVoWifi},
    {&Node::ptApplication, &qvsClientProvCtx::ptApplication, kApplication},
    {&Node::ptAccess, &qvsClientProvCtx::ptAccess, kAccess},
    // kept[context-top-level-dropped]: the kinds that are not named here are left out silently.
});

static_assert(countOf(kAtTheTop.rows) <= kMostChildRows);

} // namespace

constexpr Rows<ChildRow> qvs::kRootRows = rowsFor<qvsClientProvCtx>(kAtTheTop);

qvsCtxPxLogical *qvsClientProvCtxVerifyContextPxLogical(qvsWapPxLogical *record)
{
    return copyRecord(record, kPxLogical);
}

qvsCtxPxAuthInfo *qvsClientProvCtxVerifyContextPxAuthInfo(qvsWapPxAuthInfo *record)
{
    return copyRecord(record, kPxAuthInfo);
}

qvsCtxPxPhysical *qvsClientProvCtxVerifyContextPxPhysical(qvsWapPxPhysical *record)
{
    return copyRecord(record, kPxPhysical);
}

qvsCtxPort *qvsClientProvCtxVerifyContextPort(qvsWapPort *record)
{
    return copyRecord(record, kPort);
}

qvsCtxNapDef *qvsClientProvCtxVerifyContextNapdef(qvsWapNapDef *record)
{
    return copyRecord(record, kNapDef);
}

qvsCtxNapAuthInfo *qvsClientProvCtxVerifyContextNapAuthInfo(qvsWapNapAuthInfo *record)
{
    return copyRecord(record, kNapAuthInfo);
}

qvsCtxValidity *qvsClientProvCtxVerifyContextValidity(qvsWapValidity *record)
{
    return copyRecord(record, kValidity);
}

qvsCtxApplication *qvsClientProvCtxVerifyContextApplication(qvsWapApplication *record)
{
    return copyRecord(record, kApplication);
}

qvsCtxAppAddr *qvsClientProvCtxVerifyContextAppAddr(qvsWapAppAddr *record)
{
    return copyRecord(record, kAppAddr);
}

qvsCtxAppAuth *qvsClientProvCtxVerifyContextAppAuth(qvsWapAppAuth *record)
{
    return copyRecord(record, kAppAuth);
}

qvsCtxResource *qvsClientProvCtxVerifyContextResource(qvsWapResource *record)
{
    return copyRecord(record, kResource);
}

qvsCtxRoaming *qvsClientProvCtxVerifyContextRoaming(qvsWapRoaming *record)
{
    return copyRecord(record, kRoaming);
}

qvsCtxBootstrap *qvsClientProvCtxVerifyContextBootstrap(qvsWapBootstrap *record)
{
    return copyRecord(record, kBootstrap);
}

qvsCtxClientIdent *qvsClientProvCtxVerifyContextClientIdent(qvsWapClientIdentity *record)
{
    return copyRecord(record, kClientIdent);
}

qvsCtxVendorConfig *qvsClientProvCtxVerifyContextVenderConfig(qvsWapVendorConfig *record)
{
    return copyRecord(record, kVendorConfig);
}

qvsCtxAccess *qvsClientProvCtxVerifyContextAccess(qvsWapAccess *record)
{
    return copyRecord(record, kAccess);
}

qvsCtxWifi *qvsClientProvCtxVerifyContextWifi(qvsWapWifi *record)
{
    return copyRecord(record, kWifi);
}

qvsCtxVoWifi *qvsClientProvCtxVerifyContextVoWifi(qvsWapVoWifi *record)
{
    return copyRecord(record, kVoWifi);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextToAddrList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextToProxyList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextPortNbrList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextAppIdList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextRuleList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextNetworkList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextProxyIdList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextAuthEntityList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextBearerList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextDnsAddrList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextToNapIdList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextServiceList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsCtxStrNode *qvsClientProvCtxVerifyContextDomainList(qvsList *texts)
{
    return copyTexts(texts);
}

qvsResult qvsClientProvCtxVerifyCharacterPxLogical(qvsList *children, qvsCtxPxLogical *parent)
{
    return copyChildren(children, parent, kPxLogical);
}

qvsResult qvsClientProvCtxVerifyCharacterPxPhysical(qvsList *children, qvsCtxPxPhysical *parent)
{
    return copyChildren(children, parent, kPxPhysical);
}

qvsResult qvsClientProvCtxVerifyCharacterNapDef(qvsList *children, qvsCtxNapDef *parent)
{
    return copyChildren(children, parent, kNapDef);
}

qvsResult qvsClientProvCtxVerifyCharacterApplication(qvsList *children, qvsCtxApplication *parent)
{
    return copyChildren(children, parent, kApplication);
}

qvsResult qvsClientProvCtxVerifyCharacterAppAddr(qvsList *children, qvsCtxAppAddr *parent)
{
    return copyChildren(children, parent, kAppAddr);
}
