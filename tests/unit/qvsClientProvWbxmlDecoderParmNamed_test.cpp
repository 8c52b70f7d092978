// The parameters of the characteristics that are named by text: ROAMING, WI-FI, Vodafone VoWiFi.
#include "parms.h"
#include "qvsParm.h"

using namespace parms;

namespace {

// What the three have in common: no token names a parameter, a token that is refused is traced
// under another decoder's name, and so is one behind an unknown name.
template <class R, qvsResult (*Decode)(qvsWbxmlDecoder *, R *),
          qvsResult (*ReadName)(qvsWbxmlDecoder *, R **, uint8_t),
          qvsResult (*Release)(R *) = nullptr>
struct NamedByText : Usual<R, Decode, Release> {
    static constexpr bool kReadsAnyValue = false;

    static qvsResult readName(qvsWbxmlDecoder *decoder, R **record, uint8_t tag)
    {
        return ReadName(decoder, record, tag);
    }
    static std::vector<Row<R>> rows() { return {}; }
    static bool hasOtherMeaning(uint8_t token) { return token == 0x05; }
};

struct Roaming : NamedByText<qvsWapRoaming, qvsClientProvWbxmlDecoderParamRoaming,
                             qvsClientProvWbxmlDecoderParamRoamingNameString> {
    using R = Record;
    static constexpr char kCharacteristic[] = "ROAMING";
    static constexpr char kLabel[] = "[qvsClientProvWbxmlDecoderParamRoamingNameString]";
    static constexpr char kStart[] = "qvsClientProvWbxmlDecoderParamRoming";

    // The tree has no release for it.
    static void release(R *record)
    {
        records::release({record->pszSyncAllowed, record->pszSyncDefault, record});
    }
    static std::vector<NamedRow<R>> names()
    {
        return {
            {"SYNC-ALLOWED", &R::pszSyncAllowed},
            {"SYNC-DEFAULT", &R::pszSyncDefault},
        };
    }
    static Strings refused(uint8_t token)
    {
        return lines({kStart}) + refusal("qvsClientProvWbxmlDecoderParamAccess", token);
    }
};

struct Wifi
    : NamedByText<qvsWapWifi, qvsClientProvWbxmlDecoderParamWifi,
                  qvsClientProvWbxmlDecoderParamWifiNameString, qvsClientProvWbxmlDeleteWifi> {
    using R = Record;
    static constexpr char kCharacteristic[] = "WIFI";
    static constexpr char kLabel[] = "[qvsClientProvWbxmlDecoderParamNameString]";
    static constexpr char kStart[] = "qvsClientProvWbxmlDecoderParamWifi";

    static std::vector<NamedRow<R>> names()
    {
        return {
            {"NETSSID", &R::pszNetSsid},
            {"SECMODE", &R::pszSecMode},
            {"EAPMETHOD", &R::pszEapMethod},
            {"EAPTYPE", &R::pszEapType},
            {"USERNAME", &R::pszUserName},
            {"ANONUSERNAME", &R::pszAnonUserName},
            {"PASSWORD", &R::pszPassword},
            {"CACERT", &R::pszCaCert},
            {"USERCERT", &R::pszUserCert},
            {"PHASE1", &R::pszPhase1},
            {"AUTHALGORITHM", &R::pszAuthAlgorithm},
            {"PRIORITY", &R::pszPriority},
        };
    }
    static Strings refused(uint8_t token)
    {
        return lines({kStart}) + refusal("qvsClientProvWbxmlDecoderParamAccess", token);
    }
};

struct VoWifi
    : NamedByText<qvsWapVoWifi, qvsClientProvWbxmlDecoderParamVoWifi,
                  qvsClientProvWbxmlDecoderParamVoWifiNameString, qvsClientProvWbxmlDeleteVoWifi> {
    using R = Record;
    static constexpr char kCharacteristic[] = "VOWIFI";
    static constexpr char kLabel[] = "[qvsClientProvWbxmlDecoderParamNameString]";
    static constexpr char kStart[] = "qvsClientProvWbxmlDecoderParamVoWifi";

    static std::vector<NamedRow<R>> names() { return {{"ePDG FQDN", &R::pszEpdgFqdn}}; }
    static Strings refused(uint8_t token)
    {
        return lines({kStart}) + refusal("qvsClientProvWbxmlDecoderParamAccess", token);
    }
};

using Decoders = testing::Types<Roaming, Wifi, VoWifi>;
INSTANTIATE_TEST_SUITE_P(Named, ParmLoop, (decoders<Roaming, Wifi, VoWifi>()), nameOf);
INSTANTIATE_TEST_SUITE_P(Named, NameReader, (decoders<Roaming, Wifi, VoWifi>()), nameOf);
INSTANTIATE_TEST_SUITE_P(Named, NamedParm, (decoders<Roaming, Wifi, VoWifi>()), nameOf);

template <class D>
class TextCharacteristic : public blocks::BlockTest {
};
TYPED_TEST_SUITE(TextCharacteristic, Decoders, TypeNames);

class WifiParm : public blocks::BlockTest {};

} // namespace

TYPED_TEST(TextCharacteristic, TracesItsStepsAndTheTokenBehindTheNameTwice)
{
    const std::string label = TypeParam::kLabel;
    const std::string name = TypeParam::names()[0].name;
    const auto steps = [&](const std::string &text, const char *token) {
        return lines({TypeParam::kStart, label + " nTagID [0x5]",
                      "qvsClientProvWbxmlDecoderContent Error:0", label + " pszName [" + text + "]",
                      label + " nID [" + token + "]"});
    };
    EXPECT_EQ(tracesOf<TypeParam>(named(name), 0),
              steps(name, "0x1") + lines({label + " nID [0x1]"}));
    EXPECT_EQ(tracesOf<TypeParam>(named(name, "value"), 0),
              steps(name, "0x6") +
                  lines({"qvsClientProvWbxmlDecoderContent Error:0", label + " nID [0x6]"}));
    EXPECT_EQ(tracesOf<TypeParam>(named("x", "value"), 4101),
              steps("x", "0x6") + lines({label + " nID [0x6]"}) +
                  refusal("qvsClientProvWbxmlDecoderParamAccess", 0x06));
    EXPECT_EQ(tracesOf<TypeParam>(parm({0x05, 0xC3, 0x01, 'x', 0x7F}), 4101),
              steps("x", "0x7f") + lines({label + " nID [0x7f]"}) +
                  refusal("qvsClientProvWbxmlDecoderParamAccess", 0x7F));
}

TYPED_TEST(TextCharacteristic, TracesTheTokenOnceWhenTheValueCannotBeRead)
{
    const std::string label = TypeParam::kLabel;
    const std::string name = TypeParam::names()[0].name;
    const Bytes whole = named(name, "value");
    EXPECT_EQ(tracesOf<TypeParam>(prefix(whole, whole.size() - 1), 4103),
              lines({TypeParam::kStart, label + " nTagID [0x5]",
                     "qvsClientProvWbxmlDecoderContent Error:0", label + " pszName [" + name + "]",
                     label + " nID [0x6]", "qvsClientProvWbxmlDecoderContent Error:4103"}));
}

TYPED_TEST(TextCharacteristic, TracesNoTokenWhereTheDataEndsBehindTheName)
{
    // Opaque data ends by its length; a string would need the token behind it.
    EXPECT_EQ(tracesOf<TypeParam>({0x87, 0x05, 0xC3, 0x01, 'x'}, 4103),
              lines({TypeParam::kStart, std::string(TypeParam::kLabel) + " nTagID [0x5]",
                     "qvsClientProvWbxmlDecoderContent Error:0",
                     std::string(TypeParam::kLabel) + " pszName [x]"}));
}

TYPED_TEST(TextCharacteristic, TracesThatItWasEnteredBeforeAnythingElse)
{
    EXPECT_EQ(tracesOf<TypeParam>({0x06}, 4101), lines({TypeParam::kStart}));
}

TYPED_TEST(TextCharacteristic, RefusesTheNameToken)
{
    Reading<TypeParam> run(parm(0x07, "name"));
    EXPECT_EQ(run.read(), 4101U);
    EXPECT_EQ(fieldsSet(run.record.get()), records::Numbers{});
}

TEST_F(WifiParm, TakesSeveralNamesInOneElement)
{
    const Bytes ssid = message::Value("NETSSID").bytes;
    const Bytes priority = message::Value("PRIORITY").bytes;
    Reading<Wifi> run(parm(join({{0x05}, ssid, opaque("home"), {0x05}, priority, opaque("1")})));
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.left(), 0U);
    EXPECT_STREQ(run.record->pszNetSsid, "home");
    EXPECT_STREQ(run.record->pszPriority, "1");
}

TEST_F(WifiParm, EndsAtANameOrAValueThatPassesTheLimitOfAllTexts)
{
    for (const size_t left : {11U, 10U, 7U, 6U}) {
        Reading<Wifi> run(named("NETSSID", "home"));
        qvs::DecodeState state = {.textLeft = left};
        EXPECT_EQ(qvs::readParms(run.decoder, &state, run.record, qvs::kWifiParms.table),
                  left < 11 ? 4111U : 0U);
        EXPECT_EQ(state.textLimit, left < 11);
    }
}

TEST_F(WifiParm, ReadsTheElementsThatFollowInADecode)
{
    Reading<Wifi> run(join({named("NETSSID", "home"), named("PRIORITY", "1"), {0x47, 0x01}}));
    qvs::DecodeState state;
    EXPECT_EQ(qvs::readParms(run.decoder, &state, run.record, qvs::kWifiParms.table), 0U);
    EXPECT_EQ(run.left(), 2U) << "an element of another shape is left";
    EXPECT_STREQ(run.record->pszNetSsid, "home");
    EXPECT_STREQ(run.record->pszPriority, "1");
}

TEST_F(WifiParm, ReadsOnAcrossInlineStringsInADecodeUntilTheTextsPassTheirLimit)
{
    const Bytes gap = {0x03, '\r', '\n', 0};
    for (const size_t left : {26U, 25U, 16U, 13U}) {
        Reading<Wifi> run(
            join({named("NETSSID", "home"), gap, gap, named("PRIORITY", "1"), {0x01}}));
        qvs::DecodeState state = {.textLeft = left};
        EXPECT_EQ(qvs::readParms(run.decoder, &state, run.record, qvs::kWifiParms.table),
                  left < 26 ? 4111U : 0U);
        EXPECT_EQ(run.record->pszPriority != nullptr, left >= 26);
        EXPECT_STREQ(run.record->pszNetSsid, "home");
        EXPECT_EQ(run.left() == 1, left >= 26);
    }
}

TEST(Kept, named_refusal)
{
    blocks::BlockCheck check;
    EXPECT_EQ(tracesOf<Wifi>(parm({0x2A}), 4101).back(),
              "qvsClientProvWbxmlDecoderParamAccess[2a]\n");
}

TEST(Kept, named_unknown_refused)
{
    blocks::BlockCheck check;
    Reading<Wifi> run(named("netssid", "home"));
    EXPECT_EQ(run.read(), 4101U);
    EXPECT_EQ(run.left(), 8U) << "VALUE, string token, four letters, NUL, END";
    EXPECT_EQ(run.record->pszNetSsid, nullptr);
}
