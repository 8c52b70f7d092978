// What is called of libwbxml2, a general WBXML library, beyond the conversions that its installed
// headers offer: its tree and its parser, as its documentation describes them.
#ifndef BENCH_PEER_H
#define BENCH_PEER_H

#include <wbxml/wbxml.h>

extern "C" {

struct WBXMLTree;
struct WBXMLParser;

// The callbacks of an event parse. The last is for processing instructions, of which there are
// none.
struct WBXMLContentHandler {
    void (*startDocument)(void *context, int charset, const void *language);
    void (*endDocument)(void *context);
    void (*startElement)(void *context, void *tag, void **attributes, WB_BOOL empty);
    void (*endElement)(void *context, void *tag, WB_BOOL empty);
    void (*characters)(void *context, WB_UTINY *bytes, WB_ULONG start, WB_ULONG length);
    void (*instruction)(void *context, const WB_UTINY *target, WB_UTINY *data);
};

WBXMLError wbxml_tree_from_wbxml(WB_UTINY *bytes, WB_ULONG length, WBXMLLanguage language,
                                 WBXMLCharsetMIBEnum charset, WBXMLTree **tree);
void wbxml_tree_destroy(WBXMLTree *tree);

WBXMLParser *wbxml_parser_create(void);
void wbxml_parser_destroy(WBXMLParser *parser);
void wbxml_parser_set_user_data(WBXMLParser *parser, void *data);
void wbxml_parser_set_content_handler(WBXMLParser *parser, WBXMLContentHandler *handler);
WBXMLError wbxml_parser_parse(WBXMLParser *parser, WB_UTINY *bytes, WB_ULONG length);
}

#endif
