// The queries of XCPCtxNapDef: layouts, names, the chosen start and edge cases. qvsJniQueries_test
// walks all of their indexes.
#include "support/handmade.h"

namespace {

using fakevm::Array;
using fakevm::Text;
using handmade::Context;
using handmade::expectLayout;
using handmade::LoadedVm;

// The byte of a token as a text.
std::string token(int value)
{
    return std::string(1, static_cast<char>(value));
}

TEST(NapDef, ArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxNapDef *record = context.add(&context->ptNapDef);
    expectLayout(context, vm, "qvomacp_GetPxNapDefData", {1}, record, 28, {{5, {"\x87", "0x87"}}});
}

TEST(NapDef, AuthInfoArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxNapAuthInfo *record = context.add(&context.add(&context->ptNapDef)->ptNapAuthInfo);
    expectLayout(context, vm, "qvomacp_GetPxNapAuthInfoData", {1, 1}, record, 4,
                 {{1, {"\x9B", "CHAP"}}});
}

TEST(NapDef, ValidityArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxValidity *record = context.add(&context.add(&context->ptNapDef)->ptValidity);
    expectLayout(context, vm, "qvomacp_GetPxValidityData", {1, 1}, record, 5);
}

TEST(NapDef, ShowsTheCodeOfAnAddressType)
{
    const std::map<int, std::string> codes = {
        {0x85, "0x85"}, {0x86, "0x86"}, {0x87, "0x87"}, {0x88, "0x88"},
        {0x89, "0x89"}, {0x8A, "0x8a"}, {0x8B, "0x8b"}, {0x8C, "0x8c"},
    };
    Context context;
    LoadedVm vm;
    qvsCtxNapDef *record = context.add(&context->ptNapDef);
    context.fill(record, 28, "field");
    for (const auto &[value, code] : codes) {
        for (const char *tail : {"", "tail"}) {
            record->pszNapAddrType = context.text(token(value) + tail);
            const Array array = vm.array("qvomacp_GetPxNapDefData", {1}).value();
            EXPECT_EQ(array.size(), 29u);
            EXPECT_EQ(array[3], "field.4");
            EXPECT_EQ(array[4], code);
            EXPECT_EQ(array[5], "field.6");
            EXPECT_EQ(array[27], "field.28");
            EXPECT_EQ(array[28], std::nullopt);
        }
    }
}

TEST(NapDef, NamesAnAuthType)
{
    const std::vector<std::pair<int, const char *>> names = {
        {0x9A, "PAP"},         {0x9B, "CHAP"},    {0x9C, "HTTP-BASIC"},
        {0x9D, "HTTP-DIGEST"}, {0x9E, "WTLS-SS"}, {0x9F, "MD5"},
    };
    Context context;
    LoadedVm vm;
    qvsCtxNapAuthInfo *record = context.add(&context.add(&context->ptNapDef)->ptNapAuthInfo);
    const auto nameOf = [&](const std::string &type) {
        record->pszAuthType = context.text(type);
        return vm.array("qvomacp_GetPxNapAuthInfoData", {1, 1})->at(0);
    };
    for (const auto &[value, name] : names) {
        EXPECT_EQ(nameOf(name), name);
        EXPECT_EQ(nameOf(token(value)), name);
        EXPECT_EQ(nameOf(token(value) + "MD5"), name);
    }
    const std::vector<std::string> others = {"",     "chap",      "CHAPS",    "PA",
                                             "NONE", token(0x99), token(0xA0)};
    for (const std::string &other : others) {
        EXPECT_EQ(nameOf(other), "NONE") << other;
    }
}

TEST(NapDef, NamesABearer)
{
    const std::vector<std::string> names = {
        "GSM-USSD",
        "GSM-SMS",
        "ANSI-136-GUTS",
        "IS-95-CDMA-SMS",
        "IS-95-CDMA-CSD",
        "IS-95-CDMA-PACKET",
        "ANSI-136-CSD",
        "ANSI-136-GPRS",
        "GSM-CSD",
        "GSM-GPRS",
        "AMPS-CDPD",
        "PDC-CSD",
        "PDC-PACKET",
        "IDEN-SMS",
        "IDEN-CSD",
        "IDEN-PACKET",
        "FLEX/REFLEX",
        "PHS-SMS",
        "PHS-CSD",
        "TETRA-SDS",
        "TETRA-PACKET",
        "ANSI-136-GHOST",
        "MOBITEX-MPAK",
        "CDMA2000-1X-SIMPLE-IP",
        "CDMA2000-1X-MOBILE-IP",
        "3G-GSM",
        "WLAN",
    };
    Context context;
    LoadedVm vm;
    qvsCtxNapDef *record = context.add(&context->ptNapDef);
    context.add(&record->ptBearer, "");
    const auto nameOf = [&](const std::string &bearer) {
        record->ptBearer->pszValue = context.text(bearer);
        return vm.text("qvomacp_GetPxBearerData", {1, 1});
    };
    for (int value = 1; value <= 0xFF; ++value) {
        const bool known = value >= 0xA2 && value <= 0xBC;
        const bool ascii = value >= 0x20 && value <= 0x7E; // answered without a name
        const Text expected =
            known ? Text(names[static_cast<size_t>(value - 0xA2)]) : Text("Unkown Bearer");
        EXPECT_EQ(nameOf(token(value)), ascii ? std::nullopt : expected) << value;
        EXPECT_EQ(nameOf(token(value) + token(0xA2)), ascii ? std::nullopt : expected) << value;
    }
    EXPECT_EQ(nameOf(""), "Unkown Bearer");
}

TEST(NapDef, AnswersNullForABearerWithoutAText)
{
    Context context;
    LoadedVm vm;
    qvsCtxNapDef *record = context.add(&context->ptNapDef);
    record->pszNapAddress = context.text("internet");
    context.add(&record->ptBearer);
    EXPECT_EQ(vm.text("qvomacp_GetPxBearerData", {1, 1}), std::nullopt);
    EXPECT_EQ(vm.number("qvomacp_GetPxBearerCount", {1}), 1);
}

TEST(NapDef, ChoosesNothingWithoutAContext)
{
    LoadedVm vm;
    vm.call("qvomacp_SetPxNapDefIndex", {1});
    EXPECT_EQ(ptCtx, nullptr);
}

TEST(NapDef, LeavesAnEmptyChainAndTheFirstIndexAlone)
{
    Context context;
    LoadedVm vm;
    vm.call("qvomacp_SetPxNapDefIndex", {2});
    EXPECT_EQ(context->ptNapDef, nullptr);
    qvsCtxNapDef *first = context.add(&context->ptNapDef);
    context.add(&context->ptNapDef);
    vm.call("qvomacp_SetPxNapDefIndex", {1});
    EXPECT_EQ(context->ptNapDef, first);
    EXPECT_TRUE(vm.calls().empty());
}

TEST(Kept, napdef_start)
{
    Context context;
    LoadedVm vm;
    for (int i = 1; i <= 4; ++i) {
        context.fill(context.add(&context->ptNapDef), 28, "nap" + std::to_string(i));
    }
    const auto idOfFirst = [&] { return vm.array("qvomacp_GetPxNapDefData", {1})->at(0); };
    vm.call("qvomacp_SetPxNapDefIndex", {2});
    EXPECT_EQ(vm.number("qvomacp_GetPxNapDefCount"), 3);
    EXPECT_EQ(idOfFirst(), "nap2.1");
    vm.call("qvomacp_SetPxNapDefIndex", {2});
    EXPECT_EQ(vm.number("qvomacp_GetPxNapDefCount"), 2);
    EXPECT_EQ(idOfFirst(), "nap3.1");
    vm.call("qvomacp_SetPxNapDefIndex", {5});
    EXPECT_EQ(vm.number("qvomacp_GetPxNapDefCount"), 0);
    EXPECT_EQ(context->ptNapDef, nullptr);
    for (jint n : {0, -1}) {
        context.add(&context->ptNapDef);
        vm.call("qvomacp_SetPxNapDefIndex", {n});
        EXPECT_EQ(context->ptNapDef, nullptr) << n;
    }
}

TEST(Kept, napdef_shift)
{
    Context context;
    LoadedVm vm;
    qvsCtxNapDef *record = context.add(&context->ptNapDef);
    context.fill(record, 28, "field");
    for (const char *type : {"IPV4", "", "\x84", "\x8D", "0x85"}) {
        record->pszNapAddrType = context.text(type);
        Array expected;
        for (int field = 1; field <= 28; ++field) {
            if (field != 5) {
                expected.push_back("field." + std::to_string(field));
            }
        }
        expected.push_back(std::nullopt);
        expected.push_back("");
        EXPECT_EQ(vm.array("qvomacp_GetPxNapDefData", {1}), expected) << type;
    }
    // Absent fields keep their places in a shifted array.
    record->pszCallType = nullptr;
    record->pszInit = nullptr;
    const Array array = vm.array("qvomacp_GetPxNapDefData", {1}).value();
    EXPECT_EQ(array[3], "field.4");
    EXPECT_EQ(array[4], std::nullopt);
    EXPECT_EQ(array[5], "field.7");
    EXPECT_EQ(array[25], "field.27");
    EXPECT_EQ(array[26], std::nullopt);
    EXPECT_EQ(array[28], "");
}

TEST(Kept, bearer_count_clamps)
{
    Context context;
    LoadedVm vm;
    EXPECT_EQ(vm.number("qvomacp_GetPxBearerCount", {0}), 0);
    qvsCtxNapDef *first = context.add(&context->ptNapDef);
    context.add(&first->ptBearer, "\xAB");
    context.add(&first->ptBearer, "\xAA");
    context.add(&context->ptNapDef);
    for (jint n : {INT32_MIN, -1, 0, 1}) {
        EXPECT_EQ(vm.number("qvomacp_GetPxBearerCount", {n}), 2) << n;
    }
    EXPECT_EQ(vm.number("qvomacp_GetPxBearerCount", {2}), 0);
    EXPECT_EQ(vm.number("qvomacp_GetPxDnsAddrCount", {0}), 0);
    EXPECT_EQ(vm.text("qvomacp_GetPxBearerData", {0, 1}), std::nullopt);
}

TEST(Kept, bearer_text)
{
    Context context;
    LoadedVm vm;
    qvsCtxNapDef *record = context.add(&context->ptNapDef);
    context.add(&record->ptBearer, "GSM-GPRS");
    EXPECT_EQ(vm.text("qvomacp_GetPxBearerData", {1, 1}), std::nullopt);
    const std::string address(1000, 'a');
    record->pszNapAddress = context.text(address);
    EXPECT_EQ(vm.text("qvomacp_GetPxBearerData", {1, 1}), address);
    for (const char *bearer : {" ", "~", "GSM-CSD"}) {
        record->ptBearer->pszValue = context.text(bearer);
        EXPECT_EQ(vm.text("qvomacp_GetPxBearerData", {1, 1}), address) << bearer;
    }
    for (const char *bearer : {"\x1F", "\x7F", "\x99"}) {
        record->ptBearer->pszValue = context.text(bearer);
        EXPECT_EQ(vm.text("qvomacp_GetPxBearerData", {1, 1}), "Unkown Bearer") << bearer;
    }
}

} // namespace
