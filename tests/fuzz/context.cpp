// The walk along every chain of a context.
#include "context.h"

#include <cstring>

namespace fuzz {

namespace {

// Walks a context. Every record is made of pointers alone: its texts, then what hangs below it.
class Walk {
public:
    void root(const qvsClientProvCtx *root)
    {
        ++view.blocks;
        chain(root->ptPxLogical);
        chain(root->ptNapDef);
        chain(root->ptBootstrap);
        if (root->ptClientIdent) {
            texts("CLIENTIDENTITY", root->ptClientIdent, 1);
        }
        chain(root->ptVendorConfig);
        chain(root->ptApplication);
        chain(root->ptAccess);
        const std::size_t before = view.blocks;
        chain(root->ptWifi);
        view.kept += view.blocks - before;
        chain(root->ptVoWifi);
    }

    void record(const qvsCtxNapDef *record)
    {
        texts("NAPDEF", record, 28);
        chain(record->ptDnsAddr);
        chain(record->ptBearer);
        chain(record->ptNapAuthInfo);
        chain(record->ptValidity);
        view.kept += record->pszInit != nullptr;
    }

    ContextView view;

private:
    template <class Record>
    void texts(const char *name, const Record *record, std::size_t count)
    {
        ++view.blocks;
        view.text += name;
        for (std::size_t i = 0; i < count; ++i) {
            const char *text = nullptr;
            memcpy(&text, reinterpret_cast<const char *>(record) + i * sizeof text, sizeof text);
            view.blocks += text != nullptr;
            view.text += text ? "=" : "-";
            view.text += text ? text : "";
        }
        view.text += '\n';
    }

    template <class Record>
    void chain(const Record *first)
    {
        view.text += '[';
        for (; first; first = first->ptNext) {
            record(first);
        }
        view.text += ']';
    }

    void record(const qvsCtxStrNode *node) { texts("", node, 1); }
    void record(const qvsCtxPxAuthInfo *record) { texts("PXAUTHINFO", record, 3); }
    void record(const qvsCtxValidity *record) { texts("VALIDITY", record, 5); }
    void record(const qvsCtxAppAuth *record) { texts("APPAUTH", record, 5); }
    void record(const qvsCtxResource *record) { texts("RESOURCE", record, 8); }
    void record(const qvsCtxRoaming *record) { texts("ROAMING", record, 2); }
    void record(const qvsCtxVendorConfig *record) { texts("VENDORCONFIG", record, 3); }
    void record(const qvsCtxWifi *record) { texts("WI-FI", record, 12); }
    void record(const qvsCtxVoWifi *record) { texts("VOWIFI", record, 1); }

    void record(const qvsCtxPort *record)
    {
        texts("PORT", record, 1);
        chain(record->ptService);
    }

    void record(const qvsCtxPxPhysical *record)
    {
        texts("PXPHYSICAL", record, 7);
        chain(record->ptDomain);
        chain(record->ptToNapId);
        chain(record->ptPort);
    }

    void record(const qvsCtxPxLogical *record)
    {
        texts("PXLOGICAL", record, 13);
        chain(record->ptDomain);
        chain(record->ptPxAuthInfo);
        chain(record->ptPort);
        chain(record->ptPxPhysical);
    }

    void record(const qvsCtxNapAuthInfo *record)
    {
        texts("NAPAUTHINFO", record, 4);
        chain(record->ptAuthEntity);
    }

    void record(const qvsCtxAppAddr *record)
    {
        texts("APPADDR", record, 2);
        chain(record->ptPort);
    }

    void record(const qvsCtxApplication *record)
    {
        texts("APPLICATION", record, 12);
        chain(record->ptToProxy);
        chain(record->ptToNapId);
        chain(record->ptToAddr);
        chain(record->ptAppAddr);
        chain(record->ptAppAuth);
        chain(record->ptResource);
        const std::size_t before = view.blocks;
        chain(record->ptRoaming);
        view.kept += view.blocks - before;
        for (const char *text :
             {record->pszXcapAuidDcs, record->pszXcapAuidPms, record->pszXcapAuidCdms,
              record->pszXcapImeiHeader, record->pszXcapTidHeader}) {
            view.kept += text != nullptr;
        }
        if (record->pszFrom) {
            ++view.abandoned;
            ++view.kept;
        }
    }

    void record(const qvsCtxBootstrap *record)
    {
        texts("BOOTSTRAP", record, 4);
        chain(record->ptProxyId);
        chain(record->ptNetwork);
    }

    void record(const qvsCtxAccess *record)
    {
        texts("ACCESS", record, 0);
        chain(record->ptRule);
        chain(record->ptAppId);
        chain(record->ptPortNbr);
        chain(record->ptDomain);
        chain(record->ptToNapId);
        chain(record->ptToProxy);
    }
};

} // namespace

ContextView viewOf(const qvsClientProvCtx *root)
{
    Walk walk;
    walk.root(root);
    return walk.view;
}

std::size_t blocksOf(const qvsCtxNapDef *first, const qvsCtxNapDef *end)
{
    Walk walk;
    for (; first != end; first = first->ptNext) {
        walk.record(first);
    }
    return walk.view.blocks;
}

} // namespace fuzz
