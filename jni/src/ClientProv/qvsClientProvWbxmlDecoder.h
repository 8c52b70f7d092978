// From the bytes of a WBXML body to a provisioning context, in layers: bytes, tokens, values,
// parameters, characteristics, document. Valid C and C++.
//
// Every function takes the decoder first. Texts handed out belong to the caller. What a failing
// function has read stays read; a text that it was given stays valid.
#ifndef QVSCLIENTPROVWBXMLDECODER_H
#define QVSCLIENTPROVWBXMLDECODER_H

#include "qvsClientProvCtx.h"
#include "qvsClientProvWbxml.h"
#include "qvsresult.h"

#include <stdint.h>

QVS_BEGIN_DECLS

// ---- Whole bodies

// qvsClinetProvWbxmlDecoderMain decodes `length` bytes at `data` into a new context, which the
// caller owns; null on any failure, a single block that could not be had included.
QVS_API qvsClientProvCtx *qvsClinetProvWbxmlDecoderMain(const uint8_t *data, uint32_t length);

// qvsClientProvWbxmlDecoder reads header and body into a new document, which the caller owns.
// QVS_ERROR_BAD_ARGUMENT without data, QVS_ERROR_WBXML_DOCUMENT_TYPE for another document type,
// otherwise the result of the body.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoder(qvsWbxmlDecoder *decoder,
                                                          qvsWapDoc **document);

// ---- WBXML header and bytes

// qvsClientProvWbxmlDecoderWbxmlHeader reads version, public identifier, charset and string table
// (WBXML 1.x, section 5.3). An item that could not be read leaves its output alone:
// QVS_ERROR_WBXML_NO_DATA for the version, QVS_ERROR_WBXML_UNKNOWN_ELEMENT for an integer.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderWbxmlHeader(qvsWbxmlDecoder *decoder,
                                                                     uint8_t *version,
                                                                     uint32_t *publicId,
                                                                     uint32_t *charset);

// qvsClientProvWbxmlDecoderDecodingSize answers the bytes read so far.
QVS_API uint32_t qvsClientProvWbxmlDecoderDecodingSize(const qvsWbxmlDecoder *decoder);

// The readers up to GetStrExtension answer 1 when they read something and 0 when they could not.

// qvsClientProvWbxmlDecoderBufferReadByte reads one byte.
QVS_NODISCARD QVS_API uint32_t qvsClientProvWbxmlDecoderBufferReadByte(qvsWbxmlDecoder *decoder,
                                                                       uint8_t *byte);

// qvsClientProvWbxmlDecoderBufferReadUint32 reads an mb_u_int32 (WBXML 1.x, section 5.1) of at most
// five bytes, in 32-bit arithmetic.
QVS_NODISCARD QVS_API uint32_t qvsClientProvWbxmlDecoderBufferReadUint32(qvsWbxmlDecoder *decoder,
                                                                         uint32_t *value);

// qvsClientProvWbxmlDecoderMakeStrTable reads length and bytes of the string table into a new block
// and answers the length, or -1. *table is written whenever a block was made, also on failure.
QVS_NODISCARD QVS_API int32_t qvsClientProvWbxmlDecoderMakeStrTable(qvsWbxmlDecoder *decoder,
                                                                    char **table);

// qvsClientProvWbxmlDecoderGetStr reads an inline string up to its NUL. Like the next two it
// appends to the text that *text already holds.
QVS_NODISCARD QVS_API uint32_t qvsClientProvWbxmlDecoderGetStr(qvsWbxmlDecoder *decoder,
                                                               char **text);

// qvsClientProvWbxmlDecoderGetStrTable reads a reference into the string table.
QVS_NODISCARD QVS_API uint32_t qvsClientProvWbxmlDecoderGetStrTable(qvsWbxmlDecoder *decoder,
                                                                    char **text);

// qvsClientProvWbxmlDecoderGetStrExtension reads opaque data of *length bytes behind an OPAQUE
// token; any other token answers 1 and reads nothing.
QVS_NODISCARD QVS_API uint32_t qvsClientProvWbxmlDecoderGetStrExtension(qvsWbxmlDecoder *decoder,
                                                                        uint8_t token, char **data,
                                                                        uint32_t *length);

// ---- Tokens

// qvsClientProvWbxmlDecoderReadElement reads an element token: *tag without its flags, which the
// decoder keeps. QVS_ERROR_WBXML_NO_DATA at the end, as for all readers and peeks of a token.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderReadElement(qvsWbxmlDecoder *decoder,
                                                                     uint8_t *tag);

// qvsClientProvWbxmlDecoderCurElement peeks at an element token, *tag without its flags.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderCurElement(qvsWbxmlDecoder *decoder,
                                                                    uint8_t *tag);

// qvsClientProvWbxmlDecoderCurElementNotAND peeks at the next byte as it stands.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderCurElementNotAND(qvsWbxmlDecoder *decoder,
                                                                          uint8_t *byte);

// qvsClientProvWbxmlDecoderCheckElement reads an element token, which must be `tag`
// (QVS_ERROR_WBXML_UNKNOWN_ELEMENT), and the END of an element without content. A null decoder is
// QVS_ERROR_FAILED.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderCheckElement(qvsWbxmlDecoder *decoder,
                                                                      uint8_t tag);

// qvsClientProvWbxmlDecoderElement reads a whole element with one value as its content.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderElement(qvsWbxmlDecoder *decoder,
                                                                 uint8_t tag, char **text);

// qvsClientProvWbxmlDecoderReadAttr reads an attribute token.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderReadAttr(qvsWbxmlDecoder *decoder,
                                                                  uint8_t *byte);

// qvsClientProvWbxmlDecoderCurAttr peeks at an attribute token.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderCurAttr(qvsWbxmlDecoder *decoder,
                                                                 uint8_t *byte);

// qvsClientProvWbxmlDecoderCheckAttr reads an attribute token, which must be `token`
// (QVS_ERROR_WBXML_UNKNOWN_ELEMENT).
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderCheckAttr(qvsWbxmlDecoder *decoder,
                                                                   uint8_t token);

// qvsClientProvWbxmlDecoderCheckAttrVersion reads one of the two tokens of the document version.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderCheckAttrVersion(qvsWbxmlDecoder *decoder);

// qvsClientProvWbxmlDecoderAttributeWapDocVersion reads the attributes of the document element.
QVS_NODISCARD QVS_API qvsResult
qvsClientProvWbxmlDecoderAttributeWapDocVersion(qvsWbxmlDecoder *decoder);

// qvsClientProvWbxmlDecoderSkipAttribute reads up to and with the next END, LITERAL or EXT_I_0.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderSkipAttribute(qvsWbxmlDecoder *decoder);

// qvsClientProvWbxmlDecoderCheckCodePage reads a SWITCH_PAGE and its page, 0 or 1.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderCheckCodePage(qvsWbxmlDecoder *decoder);

// qvsClientProvWbxmlDecoderContent reads one value in any encoding onto *text.
// QVS_ERROR_WBXML_NO_DATA when there is none or it could not be read.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderContent(qvsWbxmlDecoder *decoder,
                                                                 char **text);

// qvsClientProvWbxmlDecoderGetString reads a run of strings and value tokens onto *text, from one
// byte before the read position to an END or VALUE, which stays. Answers 1 when the run was
// complete, else 0.
QVS_NODISCARD QVS_API uint32_t qvsClientProvWbxmlDecoderGetString(qvsWbxmlDecoder *decoder,
                                                                  char **text);

// qvsClientProvWbxmlDecoderSkipElement skips to the END that closes the nesting, which stays.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderSkipElement(qvsWbxmlDecoder *decoder);

// ---- Values

// qvsClientProvWbxmlDecoderGetParamTokenVal joins the text of a value token to *text.
// QVS_ERROR_WBXML_UNKNOWN_ELEMENT for a token that has none.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderGetParamTokenVal(uint8_t token,
                                                                          char **text);

// qvsClientProvWbxmlDecoderParamValue reads a VALUE and what it carries onto *text, which stays as
// it is when that is nothing.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamValue(qvsWbxmlDecoder *decoder,
                                                                    char **text);

// qvsClientProvWbxmlDecoderParamString reads the NAME attribute `token` and its value, which takes
// the place of what *text held (not released); null when there is none. On failure *text stays.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamString(qvsWbxmlDecoder *decoder,
                                                                     char **text, uint8_t token);

// qvsClientProvWbxmlDecoderParamListString reads the attributes up to END into the list of texts
// *list, which is made when there is none. Any NAME attribute is taken. On failure a new list is
// released; one that was there keeps what it got.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamListString(qvsWbxmlDecoder *decoder,
                                                                         qvsList **list,
                                                                         uint8_t token);

// qvsCommaAdd skips one byte and joins the value behind it to *text with a comma.
QVS_NODISCARD QVS_API qvsResult qvsCommaAdd(qvsWbxmlDecoder *decoder, char **text);

// ---- Parameters: each reads one parm element into the record. QVS_ERROR_BAD_ARGUMENT for a null
// record, QVS_ERROR_WBXML_UNKNOWN_ELEMENT for a parameter that the characteristic does not have.

QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamPxlogical(qvsWbxmlDecoder *decoder,
                                                                        qvsWapPxLogical *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamPxAuthInfo(qvsWbxmlDecoder *decoder,
                                                                         qvsWapPxAuthInfo *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamPort(qvsWbxmlDecoder *decoder,
                                                                   qvsWapPort *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamPxPhysical(qvsWbxmlDecoder *decoder,
                                                                         qvsWapPxPhysical *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamNapDef(qvsWbxmlDecoder *decoder,
                                                                     qvsWapNapDef *record);
QVS_NODISCARD QVS_API qvsResult
qvsClientProvWbxmlDecoderParamNapAuthInfo(qvsWbxmlDecoder *decoder, qvsWapNapAuthInfo *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamValidity(qvsWbxmlDecoder *decoder,
                                                                       qvsWapValidity *record);
QVS_NODISCARD QVS_API qvsResult
qvsClientProvWbxmlDecoderParamApplication(qvsWbxmlDecoder *decoder, qvsWapApplication *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamAppAddr(qvsWbxmlDecoder *decoder,
                                                                      qvsWapAppAddr *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamAppAuth(qvsWbxmlDecoder *decoder,
                                                                      qvsWapAppAuth *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamResource(qvsWbxmlDecoder *decoder,
                                                                       qvsWapResource *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamBootstrap(qvsWbxmlDecoder *decoder,
                                                                        qvsWapBootstrap *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamClientIdentity(
    qvsWbxmlDecoder *decoder, qvsWapClientIdentity *record);
QVS_NODISCARD QVS_API qvsResult
qvsClientProvWbxmlDecoderParamVendorConfig(qvsWbxmlDecoder *decoder, qvsWapVendorConfig *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamAccess(qvsWbxmlDecoder *decoder,
                                                                     qvsWapAccess *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamRoaming(qvsWbxmlDecoder *decoder,
                                                                      qvsWapRoaming *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamWifi(qvsWbxmlDecoder *decoder,
                                                                   qvsWapWifi *record);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamVoWifi(qvsWbxmlDecoder *decoder,
                                                                     qvsWapVoWifi *record);

// The readers of a parameter whose NAME (attribute token `tag`) is given as text. They take the
// address of the record's pointer. QVS_ERROR_FAILED when the name is empty or was not read.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamNapNameString(
    qvsWbxmlDecoder *decoder, qvsWapNapDef **record, uint8_t tag);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamAppNameString(
    qvsWbxmlDecoder *decoder, qvsWapApplication **record, uint8_t tag);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamRoamingNameString(
    qvsWbxmlDecoder *decoder, qvsWapRoaming **record, uint8_t tag);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamWifiNameString(
    qvsWbxmlDecoder *decoder, qvsWapWifi **record, uint8_t tag);
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamVoWifiNameString(
    qvsWbxmlDecoder *decoder, qvsWapVoWifi **record, uint8_t tag);

// qvsClientProvWbxmlDecoderParamVendorNameString reads any name and its value into *name and
// *value, in place of what they held (not released). Without a value *value stays; on failure both
// stay.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderParamVendorNameString(
    qvsWbxmlDecoder *decoder, char **name, char **value, uint8_t tag);

// ---- Body

// qvsClientProvWbxmlDecoderWbxmlBody decodes the body into a new document, which the caller owns;
// null for a body that is only an END. On failure nothing is handed out and all that was read is
// released.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderWbxmlBody(qvsWbxmlDecoder *decoder,
                                                                   qvsWapDoc **document);

// qvsClientProvWbxmlDecoderWapDocVersion reads the wap-provisioningdoc element into `document`.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderWapDocVersion(qvsWbxmlDecoder *decoder,
                                                                       qvsWapDoc *document);

// qvsClientProvWbxmlDecoderCharacterList reads a run of characteristics up to an END, which stays,
// into *list, which is made when there is none. On failure a new list is released; one that was
// there keeps what it got.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderCharacterList(qvsWbxmlDecoder *decoder,
                                                                       qvsList **list);

// qvsClientProvWbxmlDecoderCharacter reads one characteristic with all that is nested in it into a
// new node, which the caller owns; null for an element without content.
QVS_NODISCARD QVS_API qvsResult qvsClientProvWbxmlDecoderCharacter(qvsWbxmlDecoder *decoder,
                                                                   qvsWapCharacter **node);

// qvsClientProvWbxmlDecoderCharacterAttribute reads the attributes of a characteristic and makes
// the records that they name in the node's slots. *attrId is the last token before END, *codePage
// the page in force behind it, *name the last type given as text, the caller's on failure too.
QVS_NODISCARD QVS_API qvsResult
qvsClientProvWbxmlDecoderCharacterAttribute(qvsWbxmlDecoder *decoder, qvsWapCharacter *node,
                                            uint8_t *attrId, uint8_t *codePage, char **name);

QVS_END_DECLS

#endif
