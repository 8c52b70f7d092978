// Which characteristics of a document reach the context, and where: the top level, and the children
// of the five kinds of record that have some.
#include "qvsClientProvCtx.h"
#include "qvsCtxChain.h"
#include "qvslist.h"
#include "qvstrace.h"

using namespace qvs;

namespace {

// Builds the record of one kind, if the node carries one, into the chain kept for that kind.
template <class Wap, class Node>
bool attach(Wap *record, Node *(*build)(Wap *record), ChainEnd<Node> *chain)
{
    if (record) {
        chain->append(build(record));
    }
    return record != nullptr;
}

// Hands every node of a child list to `attachChild`, which answers whether the parent accepts it.
template <class AttachChild>
qvsResult walkChildren(qvsList *children, AttachChild attachChild)
{
    void *item = nullptr;
    qvsResult result = firstItem(children, &item);
    while (result == QVS_OK && item) {
        if (attachChild(*static_cast<const qvsWapCharacter *>(item))) {
            (void)qvsListGetItemNext(children, &item); // refuses only a list that is not there
        } else {
            // kept[context-misfit-ends-walk]: the children behind one that does not fit are lost.
            trace("[WARNING] Not Support Context");
            result = QVS_ERROR_FAILED;
        }
    }
    traceError(result);
    return result;
}

// hardened: nothing can be attached to a parent that is not there.
qvsResult refuseParent()
{
    traceError(QVS_ERROR_BAD_ARGUMENT);
    return QVS_ERROR_BAD_ARGUMENT;
}

// The root with the ends of its chains.
struct RootChains {
    explicit RootChains(qvsClientProvCtx *of)
        : root(of), pxLogicals(&of->ptPxLogical), napDefs(&of->ptNapDef),
          bootstraps(&of->ptBootstrap), vendorConfigs(&of->ptVendorConfig),
          applications(&of->ptApplication), accesses(&of->ptAccess), wifis(&of->ptWifi),
          voWifis(&of->ptVoWifi)
    {
    }

    // Every record that the node carries goes into its chain.
    // kept[context-top-level-dropped]: the kinds that are not named here are left out silently.
    void attachNode(const qvsWapCharacter &node)
    {
        attach(node.ptPxLogical, qvsClientProvCtxVerifyContextPxLogical, &pxLogicals);
        attach(node.ptNapDef, qvsClientProvCtxVerifyContextNapdef, &napDefs);
        attach(node.ptBootstrap, qvsClientProvCtxVerifyContextBootstrap, &bootstraps);
        if (node.ptClientIdentity) {
            if (root->ptClientIdent) {
                // kept[context-second-clientidentity]: the kinds below are lost with it.
                trace("[WARNING] Already Have ClientIdent Context");
                return;
            }
            root->ptClientIdent = qvsClientProvCtxVerifyContextClientIdent(node.ptClientIdentity);
        }
        attach(node.ptVendorConfig, qvsClientProvCtxVerifyContextVenderConfig, &vendorConfigs);
        attach(node.ptWifi, qvsClientProvCtxVerifyContextWifi, &wifis);
        attach(node.ptVoWifi, qvsClientProvCtxVerifyContextVoWifi, &voWifis);
        attach(node.ptApplication, qvsClientProvCtxVerifyContextApplication, &applications);
        attach(node.ptAccess, qvsClientProvCtxVerifyContextAccess, &accesses);
    }

    qvsClientProvCtx *root;
    ChainEnd<qvsCtxPxLogical> pxLogicals;
    ChainEnd<qvsCtxNapDef> napDefs;
    ChainEnd<qvsCtxBootstrap> bootstraps;
    ChainEnd<qvsCtxVendorConfig> vendorConfigs;
    ChainEnd<qvsCtxApplication> applications;
    ChainEnd<qvsCtxAccess> accesses;
    ChainEnd<qvsCtxWifi> wifis;
    ChainEnd<qvsCtxVoWifi> voWifis;
};

} // namespace

qvsResult qvsClientProvCtxVerifyContext(qvsList *list, qvsClientProvCtx **root)
{
    void *item = nullptr;
    // hardened: without a place to put it no context is made.
    const qvsResult result =
        list && root ? firstItem(list, &item) : qvsResult{QVS_ERROR_BAD_ARGUMENT};
    if (result != QVS_OK) {
        traceError(result);
        return result;
    }
    qvsClientProvCtx *made = newCtxRecord<qvsClientProvCtx>();
    if (!made) {
        traceError(QVS_ERROR_FAILED);
        return QVS_ERROR_FAILED;
    }
    RootChains chains(made);
    while (item) {
        chains.attachNode(*static_cast<const qvsWapCharacter *>(item));
        (void)qvsListGetItemNext(list, &item); // refuses only a list that is not there
    }
    *root = made;
    return QVS_OK;
}

qvsResult qvsClientProvCtxVerifyCharacterPxLogical(qvsList *children, qvsCtxPxLogical *parent)
{
    if (!parent) {
        return refuseParent();
    }
    ChainEnd authInfos(&parent->ptPxAuthInfo);
    ChainEnd physicals(&parent->ptPxPhysical);
    ChainEnd ports(&parent->ptPort);
    return walkChildren(children, [&](const qvsWapCharacter &node) {
        return attach(node.ptPxAuthInfo, qvsClientProvCtxVerifyContextPxAuthInfo, &authInfos) ||
               attach(node.ptPxPhysical, qvsClientProvCtxVerifyContextPxPhysical, &physicals) ||
               attach(node.ptPort, qvsClientProvCtxVerifyContextPort, &ports);
    });
}

qvsResult qvsClientProvCtxVerifyCharacterPxPhysical(qvsList *children, qvsCtxPxPhysical *parent)
{
    if (!parent) {
        return refuseParent();
    }
    ChainEnd ports(&parent->ptPort);
    return walkChildren(children, [&](const qvsWapCharacter &node) {
        return attach(node.ptPort, qvsClientProvCtxVerifyContextPort, &ports);
    });
}

qvsResult qvsClientProvCtxVerifyCharacterNapDef(qvsList *children, qvsCtxNapDef *parent)
{
    if (!parent) {
        return refuseParent();
    }
    ChainEnd authInfos(&parent->ptNapAuthInfo);
    ChainEnd validities(&parent->ptValidity);
    return walkChildren(children, [&](const qvsWapCharacter &node) {
        return attach(node.ptNapAuthInfo, qvsClientProvCtxVerifyContextNapAuthInfo, &authInfos) ||
               attach(node.ptValidity, qvsClientProvCtxVerifyContextValidity, &validities);
    });
}

qvsResult qvsClientProvCtxVerifyCharacterApplication(qvsList *children, qvsCtxApplication *parent)
{
    if (!parent) {
        return refuseParent();
    }
    ChainEnd roamings(&parent->ptRoaming);
    ChainEnd addresses(&parent->ptAppAddr);
    ChainEnd auths(&parent->ptAppAuth);
    ChainEnd resources(&parent->ptResource);
    return walkChildren(children, [&](const qvsWapCharacter &node) {
        return attach(node.ptRoaming, qvsClientProvCtxVerifyContextRoaming, &roamings) ||
               attach(node.ptAppAddr, qvsClientProvCtxVerifyContextAppAddr, &addresses) ||
               attach(node.ptAppAuth, qvsClientProvCtxVerifyContextAppAuth, &auths) ||
               attach(node.ptResource, qvsClientProvCtxVerifyContextResource, &resources);
    });
}

qvsResult qvsClientProvCtxVerifyCharacterAppAddr(qvsList *children, qvsCtxAppAddr *parent)
{
    if (!parent) {
        return refuseParent();
    }
    ChainEnd ports(&parent->ptPort);
    return walkChildren(children, [&](const qvsWapCharacter &node) {
        return attach(node.ptPort, qvsClientProvCtxVerifyContextPort, &ports);
    });
}
