// The parameters of network access points: NAPDEF, NAPAUTHINFO, VALIDITY.
#include "parms.h"

using namespace parms;

namespace {

struct NapDef
    : Usual<qvsWapNapDef, qvsClientProvWbxmlDecoderParamNapDef, qvsClientProvWbxmlDeleteNapDef> {
    using R = Record;
    static constexpr char kCharacteristic[] = "NAPDEF";
    static constexpr char kLabel[] = "[qvsClientProvWbxmlDecoderParamNameString]";
    static constexpr bool kReadsAnyValue = true;

    static qvsResult readName(qvsWbxmlDecoder *decoder, R **record, uint8_t tag)
    {
        return qvsClientProvWbxmlDecoderParamNapNameString(decoder, record, tag);
    }
    static bool hasOtherMeaning(uint8_t token) { return token == 0x05; }

    static std::vector<Row<R>> rows()
    {
        return {
            {0x07, "NAME", &R::pszName},
            {0x08, "NAP-ADDRESS", &R::pszNapAddress},
            {0x09, "NAP-ADDRTYPE", &R::pszNapAddrType},
            {0x0A, "CALLTYPE", &R::pszCallType},
            {0x0F, "LINGER", &R::pszLinger},
            {0x10, "BEARER", &R::ptBearerList},
            {0x11, "NAPID", &R::pszNapId},
            {0x14, "INTERNET", &R::pszInternet},
            {0x25, "LINKSPEED", &R::pszLinkSpeed},
            {0x26, "DNLINKSPEED", &R::pszDnLinkSpeed},
            {0x27, "LOCAL-ADDR", &R::pszLocalAddr},
            {0x28, "LOCAL-ADDRTYPE", &R::pszLocalAddrType},
            {0x31, "DELIVERY-ERR-SDU", &R::pszDeliveryErrSdu},
            {0x32, "DELIVERY-ORDER", &R::pszDeliveryOrder},
            {0x33, "TRAFFIC-CLASS", &R::pszTrafficClass},
            {0x34, "MAX-SDU-SIZE", &R::pszMaxSduSize},
            {0x35, "MAX-BITRATE-UPLINK", &R::pszMaxBitrateUplink},
            {0x36, "MAX-BITRATE-DNLINK", &R::pszMaxBitrateDnlink},
            {0x48, "DNS-ADDR", &R::ptDnsAddrList},
            {0x49, "MAX-NUM-RETRY", &R::pszMaxNumRetry},
            {0x4A, "FIRST-RETRY-TIMEOUT", &R::pszFirstRetryTimeout},
            {0x4B, "REREG-THRESHOLD", &R::pszReregThreshold},
            {0x4C, "T-BIT", &R::pszTBit},
        };
    }
    // One text in place of the usual two; it brings a line end of its own.
    static Strings refused(uint8_t token)
    {
        return lines({format("qvsClientProvWbxmlDecoderParamNapDef : Tag Code [%d] = "
                             "QVS_ERROR_WBXML_UNKNOWN_ELEMENT\n",
                             token)});
    }
};

struct NapAuthInfo : Usual<qvsWapNapAuthInfo, qvsClientProvWbxmlDecoderParamNapAuthInfo,
                           qvsClientProvWbxmlDeleteNapAuthInfo> {
    using R = Record;
    static constexpr char kCharacteristic[] = "NAPAUTHINFO";

    static std::vector<Row<R>> rows()
    {
        return {
            {0x0C, "AUTHTYPE", &R::pszAuthType},
            {0x0D, "AUTHNAME", &R::pszAuthName},
            {0x0E, "AUTHSECRET", &R::pszAuthSecret},
            {0x4E, "AUTH-ENTITY", &R::ptAuthEntityList},
        };
    }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamNapAuthInfo", token);
    }
};

struct Validity : Usual<qvsWapValidity, qvsClientProvWbxmlDecoderParamValidity,
                        qvsClientProvWbxmlDeleteValidity> {
    using R = Record;
    static constexpr char kCharacteristic[] = "VALIDITY";

    static std::vector<Row<R>> rows()
    {
        return {
            {0x0B, "VALIDUNTIL", &R::pszValidUntil},
            {0x12, "COUNTRY", &R::pszCountry},
            {0x13, "NETWORK", &R::pszNetwork},
            {0x2C, "SID", &R::pszSid},
            {0x2D, "SOC", &R::pszSoc},
        };
    }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamValidity", token);
    }
};

INSTANTIATE_TEST_SUITE_P(AccessPoints, ParmLoop, (decoders<NapDef, NapAuthInfo, Validity>()),
                         nameOf);
INSTANTIATE_TEST_SUITE_P(AccessPoints, TokenParm, (decoders<NapDef, NapAuthInfo, Validity>()),
                         nameOf);
INSTANTIATE_TEST_SUITE_P(AccessPoints, TextParm, (decoders<NapDef, NapAuthInfo, Validity>()),
                         nameOf);
INSTANTIATE_TEST_SUITE_P(AccessPoints, ListParm, (decoders<NapDef, NapAuthInfo>()), nameOf);
INSTANTIATE_TEST_SUITE_P(AccessPoints, NameReader, decoders<NapDef>(), nameOf);

class NapDefNamedParm : public blocks::BlockTest {};
class NapAuthInfoParm : public blocks::BlockTest {};

} // namespace

TEST_F(NapDefNamedParm, RemembersInitWithoutAValue)
{
    Reading<NapDef> run(named("INIT"));
    Traces traces;
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.left(), 0U);
    EXPECT_STREQ(run.record->pszInit, "empty");
    EXPECT_EQ(fieldsSet(run.record.get()),
              records::Numbers{numberOf(run.record.get(), &qvsWapNapDef::pszInit)});
    EXPECT_EQ(traces.texts,
              lines({"[qvsClientProvWbxmlDecoderParamNameString] nTagID [0x5]",
                     "qvsClientProvWbxmlDecoderContent Error:0",
                     "[qvsClientProvWbxmlDecoderParamNameString] pszName [INIT]",
                     "[qvsClientProvWbxmlDecoderParamNameString] nID [0x1]",
                     "[qvsClientProvWbxmlDecoderParamNameString] INIT Value is NULL!!!!!!!!"}));
}

TEST_F(NapDefNamedParm, RemembersInitAgain)
{
    Reading<NapDef> run(join({named("INIT"), named("INIT"), named("INIT", "1")}));
    while (run.left()) {
        ASSERT_EQ(run.read(), 0U);
    }
    EXPECT_STREQ(run.record->pszInit, "empty");
}

TEST_F(NapDefNamedParm, DropsAValueWhateverTheName)
{
    for (const char *name : {"INIT", "init", "APN", "NAPID"}) {
        SCOPED_TRACE(name);
        Reading<NapDef> run(named(name, "value"));
        Traces traces;
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.left(), 0U);
        EXPECT_EQ(fieldsSet(run.record.get()), records::Numbers{});
        EXPECT_EQ(
            traces.texts,
            lines({"[qvsClientProvWbxmlDecoderParamNameString] nTagID [0x5]",
                   "qvsClientProvWbxmlDecoderContent Error:0",
                   std::string("[qvsClientProvWbxmlDecoderParamNameString] pszName [") + name + "]",
                   "[qvsClientProvWbxmlDecoderParamNameString] nID [0x6]",
                   "qvsClientProvWbxmlDecoderContent Error:0"}));
    }
    Reading<NapDef> nothing(parm(join({{0x05}, message::Value("INIT").bytes, {0x06}})));
    EXPECT_EQ(nothing.read(), 0U);
    EXPECT_EQ(nothing.record->pszInit, nullptr) << "a VALUE that carries nothing is one";
}

TEST_F(NapDefNamedParm, RemembersNoOtherName)
{
    for (const char *name : {"init", "Init", "INI", "INIT ", " INIT", "INITX"}) {
        SCOPED_TRACE(name);
        Reading<NapDef> run(named(name));
        Traces traces;
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.left(), 0U);
        EXPECT_EQ(fieldsSet(run.record.get()), records::Numbers{});
        EXPECT_EQ(traces.texts.back(), "[qvsClientProvWbxmlDecoderParamNameString] nID [0x1]\n");
    }
}

TEST_F(NapDefNamedParm, LeavesAnotherParameterBehindTheNameToTheLoop)
{
    Reading<NapDef> run(parm(join({{0x05, 0xC3, 0x04, 'I', 'N', 'I', 'T', 0x11}, value("nap")})));
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.record->pszInit, nullptr);
    EXPECT_STREQ(run.record->pszNapId, "nap");
}

TEST_F(NapAuthInfoParm, TakesAuthEntityForAuthSecretBehindAPageSwitchAndRefusesIt)
{
    Reading<NapAuthInfo> run(parm(join({{0x00, 0x00, 0x4E}, value("entity")})));
    Traces traces;
    EXPECT_EQ(run.read(), 4101U);
    EXPECT_EQ(fieldsSet(run.record.get()), records::Numbers{});
    EXPECT_EQ(traces.texts.back(), "nId:e, nTemp:4e\n");
}

TEST(Kept, napdef_init)
{
    blocks::BlockCheck check;
    Reading<NapDef> run(join({named("INIT", "1"), named("INIT")}));
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.record->pszInit, nullptr);
    const size_t before = blocks::live();
    EXPECT_EQ(run.read(), 0U);
    EXPECT_STREQ(run.record->pszInit, "empty");
    EXPECT_EQ(blocks::live(), before) << "constant text";
}
