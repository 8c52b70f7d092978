// The document element, and what a body may be instead.
#include "qvsDecoding.h"

#include "kinds.h"

using namespace parms;
using kinds::characteristic;
using kinds::Document;

namespace {

class DocumentElement : public blocks::BlockTest {};
class DocumentBody : public blocks::BlockTest {};

// The document element, read into a document of the test's own.
struct Root {
    explicit Root(const Bytes &bytes) : decoder(bytes), size(bytes.size())
    {
        result = qvsClientProvWbxmlDecoderWapDocVersion(decoder, document);
    }
    Root(const Root &) = delete;
    Root &operator=(const Root &) = delete;
    ~Root() { (void)qvsClientProvWbxmlDeleteWapDoc(document); }
    size_t left() const { return size - decoder.position(); }

    decoding::Decoder decoder;
    size_t size;
    qvsWapDoc *document = records::blank<qvsWapDoc>();
    qvsResult result;
};

// PXLOGICAL with nothing in it.
const Bytes kLogical = characteristic({0x51});

} // namespace

// ---- The document element

TEST_F(DocumentElement, HoldsCharacteristicsBetweenStringsAndSwitches)
{
    const Bytes text = {0x03, 'x', 0x00};
    const Bytes versions[] = {{0x45}, {0xC5, 0x46, 0x01}, {0xC5, 0x45, 0x03, '1', 0x00, 0x01}};
    for (const Bytes &start : versions) {
        const Root root(join({start, text, {0x00, 0x01}, text, kLogical, text, kLogical, {0x01}}));
        EXPECT_EQ(root.result, 0U);
        EXPECT_EQ(root.left(), 0U);
        EXPECT_EQ(root.decoder->nCodePage, 0);
        ASSERT_TRUE(root.document->ptCharacterList);
        EXPECT_EQ(root.document->ptCharacterList->nCount, 2U);
    }
}

TEST_F(DocumentElement, MayBeEmpty)
{
    for (const Bytes &bytes : {Bytes{0x05}, Bytes{0x05, 0x01}, Bytes{0x85, 0x01}, Bytes{0x45, 0x01},
                               Bytes{0xC5, 0x46, 0x01, 0x81}}) {
        const Root root(bytes);
        EXPECT_EQ(root.result, 0U);
        EXPECT_EQ(root.left(), 0U);
        EXPECT_EQ(root.document->ptCharacterList, nullptr);
    }
}

TEST_F(DocumentElement, NeedsADocumentForItsContent)
{
    decoding::Decoder content({0x45, 0x01});
    EXPECT_EQ(qvsClientProvWbxmlDecoderWapDocVersion(content, nullptr), 2U);
    EXPECT_EQ(content.position(), 1U);
    decoding::Decoder none({0x05, 0x01});
    EXPECT_EQ(qvsClientProvWbxmlDecoderWapDocVersion(none, nullptr), 0U);
}

TEST_F(DocumentElement, IsNoOtherElement)
{
    for (const uint8_t tag : {0x46, 0x47, 0x41, 0x40, 0x44}) {
        const Root root({tag, 0x01});
        EXPECT_EQ(root.result, 4101U);
        EXPECT_EQ(root.decoder.position(), 1U);
    }
    qvsWapDoc document{};
    EXPECT_EQ(qvsClientProvWbxmlDecoderWapDocVersion(nullptr, &document), 1U);
}

TEST_F(DocumentElement, EndsWithTheFailureOfItsVersion)
{
    Traces traces;
    EXPECT_EQ(Root({0xC5, 0x47, 0x01, 0x01}).result, 4101U);
    EXPECT_EQ(traces.texts,
              lines({"[Error] [qvsClientProvWbxmlDecoderCheckAttrVersion] nId [0x47]"}));
    EXPECT_EQ(Root({0xC5, 0x46, 0x85, 0x01, 0x01}).result, 4101U);
    EXPECT_EQ(traces.texts.back(), "Tag Code = QVS_ERROR_WBXML_UNKNOWN_ELEMENT\n");
    EXPECT_EQ(Root({0xC5}).result, 4103U);
    EXPECT_EQ(Root({0xC5, 0x46}).result, 4103U);
    EXPECT_EQ(Root({0xC5, 0x46, 0x03}).result, 4103U) << "when the next tag is looked at";
}

TEST_F(DocumentElement, RefusesEveryOtherElement)
{
    for (unsigned byte = 0; byte < 256; ++byte) {
        const uint8_t tag = byte & 0x3F;
        if (tag == 0x00 || tag == 0x01 || tag == 0x03 || tag == 0x06) {
            continue;
        }
        SCOPED_TRACE(byte);
        Traces traces;
        const Root root({0x45, static_cast<uint8_t>(byte), 0x01, 0x01});
        EXPECT_EQ(root.result, 4101U);
        EXPECT_EQ(root.decoder.position(), 1U);
        // The text brings a line end of its own.
        EXPECT_EQ(traces.texts,
                  lines({format("Tag Code [%d] = QVS_ERROR_WBXML_UNKNOWN_ELEMENT\n", tag)}));
    }
}

TEST_F(DocumentElement, RefusesAParmOutsideACharacteristic)
{
    for (const Bytes &bytes : {join({{0x45}, parm(0x15, "v"), {0x01}}),
                               join({{0x45}, kLogical, parm(0x15, "v"), {0x01}})}) {
        const Document document(bytes);
        EXPECT_EQ(document.result, 4101U);
        EXPECT_EQ(document.document, nullptr);
    }
}

TEST_F(DocumentElement, KeepsTheCharacteristicsInFrontOfAFailure)
{
    // They belong to the run, which is not handed out.
    const Root root(join({{0x45}, kLogical, {0x07, 0x01}}));
    EXPECT_EQ(root.result, 4101U);
    EXPECT_EQ(root.document->ptCharacterList, nullptr);
}

TEST_F(DocumentElement, EndsAtAStringThatPassesTheLimitOfAllTexts)
{
    for (const Bytes &bytes :
         {Bytes{0x45, 0x03, 'x', 0x00, 0x01}, join({{0x45}, kLogical, {0x03, 'x', 0x00, 0x01}})}) {
        decoding::Decoder decoder(bytes);
        qvs::DecodeState state = {.textLeft = 0};
        qvsWapDoc *document = nullptr;
        EXPECT_EQ(qvs::decodeBody(decoder, &state, &document), 4111U);
        EXPECT_EQ(document, nullptr);
    }
}

// ---- The body

TEST_F(DocumentBody, IsADocumentElement)
{
    const Document document(join({{0xC5, 0x46, 0x01}, kLogical, {0x01, 0x77}}));
    EXPECT_EQ(document.result, 0U);
    EXPECT_EQ(document.left(), 1U) << "nothing is read behind it";
    ASSERT_TRUE(document.nodes());
    EXPECT_EQ(document.nodes()->nCount, 1U);
}

TEST_F(DocumentBody, IsARunOfCharacteristicsWithoutADocumentElement)
{
    const Document document(join({kLogical, characteristic({0x55}), {0x01}}));
    EXPECT_EQ(document.result, 0U);
    EXPECT_EQ(document.left(), 1U) << "the END behind the run stays";
    ASSERT_TRUE(document.nodes());
    EXPECT_EQ(document.nodes()->nCount, 2U);
    EXPECT_TRUE(kinds::nodeAt(document.nodes(), 0)->ptPxLogical);
    EXPECT_TRUE(kinds::nodeAt(document.nodes(), 1)->ptNapDef);
    EXPECT_EQ(Document(kLogical).result, 4103U) << "the run has no end";
}

TEST_F(DocumentBody, RefusesEveryOtherElement)
{
    for (unsigned byte = 0; byte < 256; ++byte) {
        const uint8_t tag = byte & 0x3F;
        if (tag <= 0x01 || (tag >= 0x05 && tag <= 0x07)) {
            continue;
        }
        SCOPED_TRACE(byte);
        Traces traces;
        const Document document({static_cast<uint8_t>(byte), 0x01});
        EXPECT_EQ(document.result, 4101U);
        EXPECT_EQ(document.document, nullptr);
        EXPECT_EQ(document.decoder.position(), 0U);
        EXPECT_EQ(traces.texts,
                  lines({format("Unknown Element[%x]", tag), "WBXML Decode Error[1005]"}));
    }
}

TEST_F(DocumentBody, TracesTheFailureOfItsContent)
{
    Traces traces;
    EXPECT_EQ(Document({0x45}).result, 4103U);
    EXPECT_EQ(traces.texts, lines({"WBXML Decode Error[1007]"}));
    EXPECT_EQ(Document({0xC6}).result, 4103U);
    EXPECT_EQ(traces.texts.back(), "WBXML Decode Error[1007]\n");
}

TEST_F(DocumentBody, TracesNothingOfItsOwnWithoutAFailure)
{
    Traces traces;
    EXPECT_EQ(Document({0x45, 0x01}).result, 0U);
    EXPECT_EQ(traces.texts, Strings{});
}

TEST_F(DocumentBody, TracesThatItsContentFoundNoMemory)
{
    decoding::Decoder decoder(join({{0x45}, kLogical, {0x01}}));
    qvsWapDoc *document = nullptr;
    Traces traces;
    blocks::failAt = 1; // the first one is for the document
    EXPECT_EQ(qvsClientProvWbxmlDecoderWbxmlBody(decoder, &document), 1U);
    blocks::reset();
    EXPECT_EQ(document, nullptr);
    EXPECT_EQ(traces.texts, lines({"WBXML Decode Error[1]"}));
}

TEST_F(DocumentBody, FailsWithoutData)
{
    Traces traces;
    const Document document({});
    EXPECT_EQ(document.result, 4103U);
    EXPECT_EQ(document.document, nullptr);
    EXPECT_EQ(traces.texts, Strings{}) << "nothing was decoded";
}

TEST_F(DocumentBody, FailsWithoutABuffer)
{
    qvsWapDoc *document = nullptr;
    EXPECT_EQ(qvsClientProvWbxmlDecoderWbxmlBody(nullptr, &document), 4106U);
    qvsWbxmlDecoder decoder{};
    EXPECT_EQ(qvsClientProvWbxmlDecoderWbxmlBody(&decoder, &document), 4106U);
    EXPECT_EQ(document, nullptr);
}

TEST_F(DocumentBody, FailsWithoutMemoryForTheDocument)
{
    decoding::Decoder decoder({0x45, 0x01});
    qvsWapDoc *document = nullptr;
    Traces traces;
    blocks::failAt = 0;
    EXPECT_EQ(qvsClientProvWbxmlDecoderWbxmlBody(decoder, &document), 1U);
    blocks::reset();
    EXPECT_EQ(document, nullptr);
    EXPECT_EQ(decoder.position(), 0U);
    EXPECT_EQ(traces.texts,
              lines({"[Error] [qvsClientProvWbxmlDecoderWbxmlBody] ptTmpWapDoc NULL"}));
}

TEST(Kept, body_switch)
{
    blocks::BlockCheck check;
    for (const uint8_t page : {0x00, 0x40, 0x80, 0xC0}) {
        const Document document(join({{page, 0x01, 0x45}, kLogical, {0x01}}));
        EXPECT_EQ(document.result, 0U);
        ASSERT_TRUE(document.document);
        EXPECT_EQ(document.nodes(), nullptr);
        EXPECT_EQ(document.decoder.position(), 2U);
        EXPECT_EQ(document.decoder->nCodePage, 0);
    }
    const Document cut({0x00});
    EXPECT_EQ(cut.result, 0U);
    EXPECT_TRUE(cut.document);
}

TEST(Kept, body_parm)
{
    blocks::BlockCheck check;
    for (const uint8_t tag : {0x07, 0x47, 0x87, 0xC7}) {
        const Document document({tag, 0x15, 0x06, 0x85, 0x01});
        EXPECT_EQ(document.result, 0U);
        ASSERT_TRUE(document.document);
        EXPECT_EQ(document.nodes(), nullptr);
        EXPECT_EQ(document.decoder.position(), 0U);
    }
}

TEST(Kept, body_end)
{
    blocks::BlockCheck check;
    for (const uint8_t end : {0x01, 0x41, 0x81, 0xC1}) {
        const Document document({end, 0x45, 0x01});
        EXPECT_EQ(document.result, 0U);
        EXPECT_EQ(document.document, nullptr);
        EXPECT_EQ(document.decoder.position(), 1U);
    }
}
