// The parameters of BOOTSTRAP, CLIENTIDENTITY, VENDORCONFIG and ACCESS.
#include "parms.h"

using namespace parms;

namespace {

struct Bootstrap : Usual<qvsWapBootstrap, qvsClientProvWbxmlDecoderParamBootstrap,
                         qvsClientProvWbxmlDeleteBootstrap> {
    using R = Record;
    static constexpr char kCharacteristic[] = "BOOTSTRAP";

    static std::vector<Row<R>> rows()
    {
        return {
            {0x07, "NAME", &R::pszName},          {0x12, "COUNTRY", &R::pszCountry},
            {0x13, "NETWORK", &R::ptNetworkList}, {0x15, "PROXY-ID", &R::ptProxyIdList},
            {0x18, "PROVURL", &R::pszProvUrl},    {0x29, "CONTEXT-ALLOW", &R::pszContextAllow},
        };
    }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamBootstrap", token);
    }
};

struct ClientIdentity : Usual<qvsWapClientIdentity, qvsClientProvWbxmlDecoderParamClientIdentity,
                              qvsClientProvWbxmlDeleteClientIdentity> {
    using R = Record;
    static constexpr char kCharacteristic[] = "CLIENTIDENTITY";

    static std::vector<Row<R>> rows() { return {{0x30, "CLIENT-ID", &R::pszClientId}}; }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamClientIdentity", token);
    }
};

struct VendorConfig : Usual<qvsWapVendorConfig, qvsClientProvWbxmlDecoderParamVendorConfig,
                            qvsClientProvWbxmlDeleteVendorConfig> {
    using R = Record;
    static constexpr char kCharacteristic[] = "VENDORCONFIG";

    // The named parameter stays allocated when the tree is released.
    static void release(R *record)
    {
        records::release({record->pszParamName, record->pszParamValue});
        Usual::release(record);
    }
    static bool hasOtherMeaning(uint8_t token) { return token == 0x05; }

    static std::vector<Row<R>> rows() { return {{0x07, "NAME", &R::pszName}}; }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamVendorConfig", token);
    }
};

struct Access
    : Usual<qvsWapAccess, qvsClientProvWbxmlDecoderParamAccess, qvsClientProvWbxmlDeleteAccess> {
    using R = Record;
    static constexpr char kCharacteristic[] = "ACCESS";

    static std::vector<Row<R>> rows()
    {
        return {
            {0x17, "DOMAIN", &R::ptDomainList},    {0x22, "TO-NAPID", &R::ptToNapIdList},
            {0x23, "PORTNBR", &R::ptPortNbrList},  {0x36, "APPID", &R::ptAppIdList},
            {0x39, "TO-PROXY", &R::ptToProxyList}, {0x3B, "RULE", &R::ptRuleList},
        };
    }
    static Strings refused(uint8_t token)
    {
        return refusal("qvsClientProvWbxmlDecoderParamAccess", token);
    }
};

INSTANTIATE_TEST_SUITE_P(Others, ParmLoop,
                         (decoders<Bootstrap, ClientIdentity, VendorConfig, Access>()), nameOf);
INSTANTIATE_TEST_SUITE_P(Others, TokenParm,
                         (decoders<Bootstrap, ClientIdentity, VendorConfig, Access>()), nameOf);
INSTANTIATE_TEST_SUITE_P(Others, TextParm, (decoders<Bootstrap, ClientIdentity, VendorConfig>()),
                         nameOf);
INSTANTIATE_TEST_SUITE_P(Others, ListParm, (decoders<Bootstrap, Access>()), nameOf);

class AccessParm : public blocks::BlockTest {};
class VendorParm : public blocks::BlockTest {};

constexpr char kLabel[] = "[qvsClientProvWbxmlDecoderParamVendorNameString]";

Strings vendorSteps(const std::string &name, const std::string &token)
{
    const std::string label = kLabel;
    return lines({label + " nTagID [0x5]", "qvsClientProvWbxmlDecoderContent Error:0",
                  label + " pszName [" + name + "]", label + " nID [" + token + "]"});
}

} // namespace

TEST_F(AccessParm, CollectsTheTokensOfBothPages)
{
    Reading<Access> run(join({parm(0x3B, "rule 1"), parm(0x36, "w2"), parm(0x3B, "rule 2"),
                              parm(0x17, "example.com"), parm(0x39, "proxy"), parm(0x22, "nap"),
                              parm(0x23, "80")}));
    while (run.left()) {
        ASSERT_EQ(run.read(), 0U);
    }
    EXPECT_EQ(shown(run.record->ptRuleList), "[rule 1, rule 2]");
    EXPECT_EQ(shown(run.record->ptAppIdList), "[w2]");
    EXPECT_EQ(shown(run.record->ptDomainList), "[example.com]");
    EXPECT_EQ(shown(run.record->ptToProxyList), "[proxy]");
    EXPECT_EQ(shown(run.record->ptToNapIdList), "[nap]");
    EXPECT_EQ(shown(run.record->ptPortNbrList), "[80]");
}

TEST_F(VendorParm, KeepsAnyNameAndItsValue)
{
    Reading<VendorConfig> run(named("maker's own", "value"));
    Traces traces;
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.left(), 0U);
    EXPECT_EQ(run.record->pszName, nullptr);
    EXPECT_STREQ(run.record->pszParamName, "maker's own");
    EXPECT_STREQ(run.record->pszParamValue, "value");
    EXPECT_EQ(traces.texts,
              vendorSteps("maker's own", "0x6") + lines({"qvsClientProvWbxmlDecoderContent Error:0",
                                                         "--------------------------[value]"}));
}

TEST_F(VendorParm, KeepsANameWithoutAValue)
{
    Reading<VendorConfig> run(named("name"));
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.left(), 0U);
    EXPECT_STREQ(run.record->pszParamName, "name");
    EXPECT_EQ(run.record->pszParamValue, nullptr);
}

TEST_F(VendorParm, KeepsANameThatIsEmptyOrWasNotRead)
{
    Reading<VendorConfig> empty(named("", "value"));
    EXPECT_EQ(empty.read(), 0U);
    EXPECT_STREQ(empty.record->pszParamName, "");
    EXPECT_STREQ(empty.record->pszParamValue, "value");

    Reading<VendorConfig> unread(parm({0x05, 0x60}));
    EXPECT_EQ(unread.read(), 0U);
    EXPECT_EQ(unread.left(), 0U);
    EXPECT_EQ(fieldsSet(unread.record.get()), records::Numbers{});
}

TEST_F(VendorParm, LeavesTheValueAsItWasWithoutAnother)
{
    Reading<VendorConfig> run(join({named("first", "value"), named("second")}));
    EXPECT_EQ(run.read(), 0U);
    char *first = run.record->pszParamName;
    char *value = run.record->pszParamValue;
    EXPECT_EQ(run.read(), 0U);
    EXPECT_STREQ(run.record->pszParamName, "second");
    EXPECT_EQ(run.record->pszParamValue, value);
    EXPECT_STREQ(value, "value");
    qvsMemFree_debug(first);
}

TEST_F(VendorParm, StoresAVALUEThatCarriesNothing)
{
    Reading<VendorConfig> run(
        join({named("n", "value"), parm(join({{0x05}, message::Value("n").bytes, {0x06}}))}));
    EXPECT_EQ(run.read(), 0U);
    char *name = run.record->pszParamName;
    char *value = run.record->pszParamValue;
    Traces traces;
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.record->pszParamValue, nullptr);
    EXPECT_EQ(traces.texts.back(), "--------------------------[]\n");
    records::release({name, value});
}

TEST_F(VendorParm, LeavesAnyOtherTokenToTheLoop)
{
    Reading<VendorConfig> run(parm(join({{0x05, 0xC3, 0x01, 'n', 0x07}, value("maker")})));
    Traces traces;
    EXPECT_EQ(run.read(), 0U);
    EXPECT_STREQ(run.record->pszParamName, "n");
    EXPECT_EQ(run.record->pszParamValue, nullptr);
    EXPECT_STREQ(run.record->pszName, "maker");
    EXPECT_EQ(traces.texts, vendorSteps("n", "0x7") +
                                lines({"qvsClientProvWbxmlDecoderContent Error:0",
                                       "qvsClientProvWbxmlDecoderParamString Error Code:0"}));

    Reading<VendorConfig> refused(parm({0x05, 0xC3, 0x01, 'n', 0x08}));
    EXPECT_EQ(refused.read(), 4101U);
    EXPECT_STREQ(refused.record->pszParamName, "n");
}

TEST_F(VendorParm, TracesANameThatCannotBeRead)
{
    for (const Bytes &cut : {Bytes{0x87, 0x05}, Bytes{0x87, 0x05, 0x03, 'n'}}) {
        Reading<VendorConfig> run(cut);
        Traces traces;
        EXPECT_EQ(run.read(), 4103U);
        EXPECT_EQ(traces.texts, lines({std::string(kLabel) + " nTagID [0x5]",
                                       "qvsClientProvWbxmlDecoderContent Error:4103",
                                       std::string(kLabel) + " pszName NULL"}));
    }
}

TEST_F(VendorParm, ReadsBehindTheTokenThatItIsGiven)
{
    decoding::OwnText name;
    decoding::OwnText content;
    const auto read = [&](const Bytes &bytes, uint8_t tag) {
        decoding::Decoder decoder(bytes);
        return qvsClientProvWbxmlDecoderParamVendorNameString(decoder, &name, &content, tag);
    };
    Traces traces;
    EXPECT_EQ(read({0x05, 0x03, 'n', 0x00, 0x01}, 0x06), 4101U);
    EXPECT_EQ(traces.texts, lines({std::string(kLabel) + " nTagID [0x6]", "nId:6, nTemp:5"}));
    EXPECT_EQ(read({}, 0x06), 4103U);
    EXPECT_TRUE(name.isNull());
    EXPECT_EQ(read({0x33, 0x03, 'n', 0x00, 0x06, 0x85}, 0x33), 0U);
    EXPECT_EQ(name.str(), "n");
    EXPECT_EQ(content.str(), "IPV4");
}

// A token below 0x80 stands for no text, and is skipped with what follows.
TEST_F(VendorParm, TracesANameWithoutTextAsAnEmptyOne)
{
    Reading<VendorConfig> run({0x87, 0x05, 0x10, 0x01, 0x01});
    Traces traces;
    EXPECT_EQ(run.read(), 0U);
    EXPECT_TRUE(traces.has(std::string(kLabel) + " pszName []\n"));
    EXPECT_EQ(run.record->pszParamName, nullptr);
}

TEST_F(VendorParm, LeavesBothFieldsAloneWhereverTheDataEnds)
{
    const Bytes whole = named("new", "new");
    for (size_t count = 0; count < whole.size(); ++count) {
        SCOPED_TRACE(count);
        Reading<VendorConfig> run(join({named("old", "value"), prefix(whole, count)}));
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.read(), 4103U);
        EXPECT_STREQ(run.record->pszParamName, "old");
        EXPECT_STREQ(run.record->pszParamValue, "value");
    }
}

TEST_F(VendorParm, FailsCleanlyWithoutMemory)
{
    failEachAllocation(anyParm<VendorConfig>(), named("name", "value"));
}

TEST(Kept, vendor_name_trace)
{
    blocks::BlockCheck check;
    Reading<VendorConfig> run(named("name"));
    Traces traces;
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(traces.texts, vendorSteps("name", "0x1") +
                                lines({"[qvsClientProvWbxmlDecoderParamNameString] nID [0x1]"}));
}

TEST(Kept, vendor_any_name)
{
    blocks::BlockCheck check;
    Reading<VendorConfig> run(join({named("first", "1"), named("second", "2")}));
    EXPECT_EQ(run.read(), 0U);
    char *name = run.record->pszParamName;
    char *value = run.record->pszParamValue;
    EXPECT_EQ(run.read(), 0U);
    EXPECT_STREQ(run.record->pszParamName, "second");
    EXPECT_STREQ(run.record->pszParamValue, "2");
    EXPECT_STREQ(name, "first");
    EXPECT_STREQ(value, "1");
    records::release({name, value});
}
