/* A program in C that knows the installed headers and nothing else: show MESSAGE prints what access
 * points the message sets. */
#include <qvsClientProvWbxmlDecoder.h>
#include <qvsmemory.h>
#include <qvspushhandler.h>

#include <stdio.h>

static const char *shown(const char *text)
{
    return text ? text : "-";
}

int main(int count, char **arguments)
{
    static uint8_t message[65536];
    FILE *file = count == 2 ? fopen(arguments[1], "rb") : NULL;
    smlpushHdlrInfo *push;
    qvsClientProvCtx *context;
    const qvsCtxNapDef *point;
    uint32_t length;

    if (!file) {
        fprintf(stderr, "usage: show MESSAGE\n");
        return 2;
    }
    length = (uint32_t)fread(message, 1, sizeof(message), file);
    fclose(file);

    push = smlpushHdlrParsingWSPHeader(message, length);
    if (!push) {
        printf("no push\n");
        return 1;
    }
    context = qvsClinetProvWbxmlDecoderMain(push->pBody, push->nBodyLen);
    qvsMemFree_debug(push->pBody);
    qvsMemFree_debug(push);
    if (!context) {
        printf("no document\n");
        return 1;
    }
    for (point = context->ptNapDef; point; point = point->ptNext) {
        const qvsCtxStrNode *server = point->ptDnsAddr;
        printf("%s: %s", shown(point->pszNapId), shown(point->pszNapAddress));
        for (; server; server = server->ptNext) {
            printf(" %s", server->pszValue);
        }
        printf("\n");
    }
    qvsClientProvCtxDelectContext(context);
    return 0;
}
