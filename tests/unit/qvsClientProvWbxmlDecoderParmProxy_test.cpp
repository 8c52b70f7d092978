// The parameters of proxies: PXLOGICAL, PXAUTHINFO, PORT, PXPHYSICAL.
#include "qvsDecoding.h"
#include "qvsParm.h"

#include "parms.h"

#include <algorithm>
#include <optional>

using namespace parms;

namespace {

struct PxLogical : Usual<qvsWapPxLogical, qvsClientProvWbxmlDecoderParamPxlogical,
                         qvsClientProvWbxmlDeletePxlogical> {
    using R = Record;
    static constexpr char kCharacteristic[] = "PXLOGICAL";

    static std::vector<Row<R>> rows()
    {
        return {
            {0x07, "NAME", &R::pszName},
            {0x15, "PROXY-ID", &R::pszProxyId},
            {0x16, "PROXY-PROVIDER-ID", &R::pszProxyProviderId},
            {0x17, "DOMAIN", &R::ptDomainList},
            {0x1C, "STARTPAGE", &R::pszStartPage},
            {0x2A, "TRUST", &R::pszTrust},
            {0x2B, "MASTER", &R::pszMaster},
            {0x3E, "PROXY-PW", &R::pszProxyPw},
            {0x3F, "PPGAUTH-TYPE", &R::pszPpgAuthType},
        };
    }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamPxlogical", token) +
               lines({"qvsClientProvWbxmlDecoderParamPxlogical Error Code:4101"});
    }
};

struct PxAuthInfo : Usual<qvsWapPxAuthInfo, qvsClientProvWbxmlDecoderParamPxAuthInfo,
                          qvsClientProvWbxmlDeletePxAuthInfo> {
    using R = Record;
    static constexpr char kCharacteristic[] = "PXAUTHINFO";

    static std::vector<Row<R>> rows()
    {
        return {
            {0x19, "PXAUTH-TYPE", &R::pszPxAuthType},
            {0x1A, "PXAUTH-ID", &R::pszPxAuthId},
            {0x1B, "PXAUTH-PW", &R::pszPxAuthPw},
        };
    }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamPxAuthInfo", token) +
               lines({format("DecoderParam : nId = [0x%02x]", token),
                      format("DecoderParam : QVS_WBXML_DECODER_ERROR nId = [0x%02x]", token),
                      "return ErrorCode[4101]"});
    }
};

struct Port : Usual<qvsWapPort, qvsClientProvWbxmlDecoderParamPort, qvsClientProvWbxmlDeletePort> {
    using R = Record;
    static constexpr char kCharacteristic[] = "PORT";

    static std::vector<Row<R>> rows()
    {
        return {
            {0x23, "PORTNBR", &R::pszPortNbr},
            {0x24, "SERVICE", &R::ptServiceList},
        };
    }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamPort", token);
    }
};

struct PxPhysical : Usual<qvsWapPxPhysical, qvsClientProvWbxmlDecoderParamPxPhysical,
                          qvsClientProvWbxmlDeletePxphysical> {
    using R = Record;
    static constexpr char kCharacteristic[] = "PXPHYSICAL";

    static std::vector<Row<R>> rows()
    {
        return {
            {0x17, "DOMAIN", &R::ptDomainList},
            {0x1F, "PUSHENABLED", &R::pszPushEnabled},
            {0x20, "PXADDR", &R::pszPxAddr},
            {0x21, "PXADDRTYPE", &R::pszPxAddrType},
            {0x22, "TO-NAPID", &R::ptToNapIdList},
            {0x2E, "WSP-VERSION", &R::pszWspVersion},
            {0x2F, "PHYSICAL-PROXY-ID", &R::pszPhysicalProxyId},
            {0x3D, "PXADDR-FQDN", &R::pszPxAddrFqdn},
            {0x47, "PULLENABLED", &R::pszPullEnabled},
        };
    }
    static bool goesOn(uint8_t token) { return token == 0x17; }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamPxPhysical", token);
    }
};

INSTANTIATE_TEST_SUITE_P(Proxies, ParmLoop, (decoders<PxLogical, PxAuthInfo, Port, PxPhysical>()),
                         nameOf);
INSTANTIATE_TEST_SUITE_P(Proxies, TokenParm, (decoders<PxLogical, PxAuthInfo, Port, PxPhysical>()),
                         nameOf);
INSTANTIATE_TEST_SUITE_P(Proxies, TextParm, (decoders<PxLogical, PxAuthInfo, Port, PxPhysical>()),
                         nameOf);
INSTANTIATE_TEST_SUITE_P(Proxies, ListParm, (decoders<PxLogical, Port, PxPhysical>()), nameOf);

class PxLogicalParm : public blocks::BlockTest {};
class PxAuthInfoParm : public blocks::BlockTest {};
class PxPhysicalParm : public blocks::BlockTest {};

// Those that begin as the decoder's own do.
Strings own(const Strings &texts)
{
    Strings out;
    for (const std::string &text : texts) {
        if (text.rfind("DecoderParam", 0) == 0 || text.rfind("return", 0) == 0) {
            out.push_back(text);
        }
    }
    return out;
}

} // namespace

TEST_F(PxLogicalParm, TracesTheResultAtItsEnd)
{
    EXPECT_EQ(tracesOf<PxLogical>(parm(0x15, "proxy")),
              lines({"qvsClientProvWbxmlDecoderContent Error:0",
                     "qvsClientProvWbxmlDecoderParamString Error Code:0",
                     "qvsClientProvWbxmlDecoderParamPxlogical Error Code:0"}));
}

TEST_F(PxLogicalParm, TracesTheResultOfAParmThatCannotBeRead)
{
    EXPECT_EQ(tracesOf<PxLogical>({0x87, 0x15, 0x06, 0x03, 'p'}, 4103),
              lines({"qvsClientProvWbxmlDecoderContent Error:4103",
                     "qvsClientProvWbxmlDecoderParamString Error Code:4103",
                     "qvsClientProvWbxmlDecoderParamPxlogical Error Code:4103"}));
}

TEST_F(PxLogicalParm, TracesNoResultWhenTheTokenCannotBeRead)
{
    EXPECT_EQ(tracesOf<PxLogical>({0x87, 0x15, 0x06, 0x85}, 4103),
              lines({"qvsClientProvWbxmlDecoderContent Error:0",
                     "qvsClientProvWbxmlDecoderParamString Error Code:0"}));
    EXPECT_EQ(tracesOf<PxLogical>({0x87}, 4103), Strings{});
}

TEST_F(PxAuthInfoParm, TracesEachTokenAndTheLastOneAsAnError)
{
    EXPECT_EQ(
        own(tracesOf<PxAuthInfo>(
            parm(join({{0x19}, opaque("type"), {0x00, 0x01, 0x1A}, opaque("id")})))),
        lines({"DecoderParam : nId = [0x19]", "DecoderParam : nId = [0x1a]",
               "DecoderParam : nId = [0x01]", "DecoderParam : QVS_WBXML_DECODER_ERROR nId = [0x01]",
               "return ErrorCode[0]"}));
}

TEST_F(PxAuthInfoParm, TracesTheTokenOfAParmThatCannotBeRead)
{
    EXPECT_EQ(
        own(tracesOf<PxAuthInfo>({0x87, 0x1B, 0x06, 0x03, 'p'}, 4103)),
        lines({"DecoderParam : nId = [0x1b]", "DecoderParam : QVS_WBXML_DECODER_ERROR nId = [0x1b]",
               "return ErrorCode[4103]"}));
}

TEST_F(PxAuthInfoParm, TracesNoErrorWhenTheTokenCannotBeRead)
{
    EXPECT_EQ(own(tracesOf<PxAuthInfo>({0x87, 0x19, 0x06, 0x85}, 4103)),
              lines({"DecoderParam : nId = [0x19]"}));
    EXPECT_EQ(tracesOf<PxAuthInfo>({0x87}, 4103), Strings{});
}

TEST_F(PxPhysicalParm, GoesOnWithWhatFollowsADomainThatCannotBeRead)
{
    Reading<PxPhysical> run(parm(join({{0x17, 0x20}, value("10.0.0.1")})));
    Traces traces;
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.left(), 0U);
    EXPECT_EQ(run.record->ptDomainList, nullptr);
    EXPECT_STREQ(run.record->pszPxAddr, "10.0.0.1");
    EXPECT_EQ(traces.texts,
              lines({"DecoderParam : Tag Code [32] = QVS_ERROR_WBXML_UNKNOWN_ELEMENT\n",
                     "qvsClientProvWbxmlDecoderParamString Error Code:4101",
                     "[ERROR] qvsClientProvWbxmlDecoderParamListString Fail",
                     "qvsClientProvWbxmlDecoderContent Error:0",
                     "qvsClientProvWbxmlDecoderParamString Error Code:0"}));
}

TEST_F(PxPhysicalParm, EndsBehindADomainThatCannotBeRead)
{
    // The run of strings is broken by a token without a text; the END behind it ends the parm.
    Reading<PxPhysical> run(
        join({parm(0x17, "kept"), {0x87, 0x17, 0x06, 0x03, 'd', 0x00, 0x60, 0x01}}));
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.left(), 0U);
    EXPECT_EQ(shown(run.record->ptDomainList), "[kept]");
}

TEST_F(PxPhysicalParm, KeepsWhatAListGotBeforeItsDomainCouldNotBeRead)
{
    Reading<PxPhysical> run(
        join({parm(0x17, "first"), parm({0x17, 0x06, 0x85, 0x17, 0x47, 0x06, 0x86})}));
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(shown(run.record->ptDomainList), "[first, IPV4]");
    EXPECT_STREQ(run.record->pszPullEnabled, "IPV6");
}

TEST_F(PxPhysicalParm, FailsAtTheNextTokenWhenTheDataEndsInADomain)
{
    Reading<PxPhysical> run({0x87, 0x17});
    Traces traces;
    EXPECT_EQ(run.read(), 4103U);
    EXPECT_EQ(traces.texts, lines({"qvsClientProvWbxmlDecoderParamString Error Code:4103",
                                   "[ERROR] qvsClientProvWbxmlDecoderParamListString Fail"}));
}

TEST_F(PxPhysicalParm, TakesADomainThatFoundNoMemoryForOneThatCannotBeRead)
{
    const Bytes bytes = parm(0x17, "value");
    EXPECT_GT(blocks::failEach([&] {
                  const long failAt = std::exchange(blocks::failAt, -1);
                  Reading<PxPhysical> run(bytes);
                  blocks::failAt = failAt;
                  Traces traces;
                  // Without memory for the text it is not read, and its first letter is refused.
                  EXPECT_EQ(run.read(), failAt == 0 ? 4101U : 0U);
                  const bool failed = blocks::failAt < 0;
                  EXPECT_EQ(shown(run.record->ptDomainList), failed ? "(null)" : "[value]");
                  EXPECT_EQ(traces.has("[ERROR] qvsClientProvWbxmlDecoderParamListString Fail\n"),
                            failed);
              }),
              1);
}

TEST_F(PxPhysicalParm, FailsBehindAReferenceWithoutMemoryForItsText)
{
    for (const bool traced : {false, true}) {
        Reading<PxPhysical> run(parm(Bytes{0x20, 0x06, 0x83, 0x00}));
        run.decoder->pStringTable = static_cast<char *>(records::blank(1));
        std::optional<Traces> traces;
        if (traced) {
            traces.emplace();
        }
        blocks::failAt = 0;
        EXPECT_EQ(run.read(), 4103U);
        blocks::reset();
        EXPECT_EQ(run.left(), 1U) << "the END stays";
        EXPECT_EQ(run.record->pszPxAddr, nullptr);
    }
}

TEST_F(PxPhysicalParm, EndsAtADomainThatPassesTheLimitOfAllTexts)
{
    Reading<PxPhysical> run(parm(0x17, "one more"));
    qvs::OpenRecord open = {};
    qvs::DecodeState state = {.textLeft = 0, .open = &open};
    Traces traces;
    EXPECT_EQ(qvs::readParms(run.decoder, &state, run.record, qvs::kPxPhysicalParms.table), 4111U);
    EXPECT_EQ(run.record->ptDomainList, nullptr);
    EXPECT_EQ(traces.texts.back(), "[ERROR] qvsClientProvWbxmlDecoderParamListString Fail\n");
}

TEST_F(PxPhysicalParm, EndsAtATextOrAValueTokenThatPassesTheLimitOfAllTexts)
{
    constexpr uint64_t kLimit = 8 * 1024 * 1024;
    const Bytes four = parm(0x21, "four");
    const Bytes token = parm(Bytes{0x21, 0x06, 0x85}); // IPV4
    for (Bytes bytes : {four, token}) {
        // In a message so long that 100 times its length is more, and in a short one.
        for (const size_t size : {bytes.size(), size_t{100000}}) {
            bytes.resize(size, 0x55);
            const uint64_t limit = std::max(kLimit, uint64_t{100} * size);
            for (const uint64_t left : {5U, 4U, 3U}) {
                Reading<PxPhysical> run(bytes);
                qvs::DecodeState state = qvs::wholeDecode(run.decoder);
                EXPECT_EQ(state.textLeft, limit);
                state.textLeft = left;
                EXPECT_EQ(
                    qvs::readParms(run.decoder, &state, run.record, qvs::kPxPhysicalParms.table),
                    left < 4 ? 4111U : 0U);
                EXPECT_EQ(state.textLimit, left < 4);
            }
        }
    }
}

TEST_F(PxPhysicalParm, ReadsNothingBehindTheData)
{
    // What would be the END lies in the block, but behind the last byte of the data.
    const Bytes bytes = parm(0x21, "x");
    Reading<PxPhysical> run(bytes);
    run.decoder->ptBuffer->nSize -= 1;
    Reading<PxPhysical> cut(prefix(bytes, bytes.size() - 1));
    EXPECT_EQ(run.read(), 4103U);
    EXPECT_EQ(cut.read(), 4103U);
    EXPECT_EQ(run.decoder.position(), cut.decoder.position());
    EXPECT_EQ(shown(run.record->pszPxAddrType), shown(cut.record->pszPxAddrType));
}

TEST(Kept, parm_switch_ignored)
{
    blocks::BlockCheck check;
    Reading<PxLogical> run(parm(join({{0x00, 0x3F, 0x15}, value("proxy")})));
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.decoder->nCodePage, 0U);
    EXPECT_STREQ(run.record->pszProxyId, "proxy");
}

TEST(Kept, parm_switch_masked)
{
    blocks::BlockCheck check;
    // PULLENABLED, seen as NAME behind the switch, is refused under that token.
    Reading<PxPhysical> refused(parm(join({{0x00, 0x00, 0x47}, value("1")})));
    Traces traces;
    EXPECT_EQ(refused.read(), 4101U);
    EXPECT_EQ(traces.texts.back(), "qvsClientProvWbxmlDecoderParamPxPhysical[7]\n");

    // A list is chosen by the token as it is seen, and takes any as it stands.
    Reading<PxPhysical> taken(parm(join({{0x00, 0x00, 0xE2}, value("nap")})));
    EXPECT_EQ(taken.read(), 0U);
    EXPECT_EQ(shown(taken.record->ptToNapIdList), "[nap]");

    // What looks like an END is one.
    Reading<PxPhysical> ended({0x87, 0x00, 0x00, 0x81});
    EXPECT_EQ(ended.read(), 0U);
    EXPECT_EQ(ended.left(), 0U);
}

TEST(Kept, pxphysical_domain)
{
    blocks::BlockCheck check;
    const Bytes unreadable = {0x87, 0x17, 0x06, 0x03, 'd', 0x00, 0x60, 0x01};
    Reading<PxPhysical> physical(unreadable);
    EXPECT_EQ(physical.read(), 0U);
    Reading<PxLogical> logical(unreadable);
    EXPECT_EQ(logical.read(), 4103U) << "everywhere else";
}

TEST(Kept, pxauthinfo_error_trace)
{
    blocks::BlockCheck check;
    const Strings texts = tracesOf<PxAuthInfo>(parm(0x19, "type"));
    ASSERT_GE(texts.size(), 2U);
    EXPECT_EQ(texts[texts.size() - 2], "DecoderParam : QVS_WBXML_DECODER_ERROR nId = [0x01]\n");
    EXPECT_EQ(texts[texts.size() - 1], "return ErrorCode[0]\n");
}
