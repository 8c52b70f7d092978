// The queries of XCPCtxPxLogical: layouts, names and edge cases. qvsJniQueries_test walks all of
// their indexes.
#include "support/handmade.h"

namespace {

using fakevm::Array;
using fakevm::Text;
using handmade::Context;
using handmade::expectLayout;
using handmade::LoadedVm;

const std::vector<std::string> kServices = {
    "CL-WSP",      "CO-WSP",          "CL-SEC-WSP",     "CO-SEC-WSP",
    "CL-SEC-WTA",  "CO-SEC-WTA",      "OTA-HTTP-TO",    "OTA-HTTP-TLS-TO",
    "OTA-HTTP-PO", "OTA-HTTP-TLS-PO", "Unkown Service",
};

TEST(PxLogical, ProxyArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxPxLogical *record = context.add(&context->ptPxLogical);
    expectLayout(context, vm, "qvomacp_GetProxyData", {1}, record, 13);
}

TEST(PxLogical, AuthInfoArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxPxAuthInfo *record = context.add(&context.add(&context->ptPxLogical)->ptPxAuthInfo);
    expectLayout(context, vm, "qvomacp_GetPxAuthInfoData", {1, 1}, record, 3);
}

TEST(PxLogical, PhysicalArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxPxPhysical *record = context.add(&context.add(&context->ptPxLogical)->ptPxPhysical);
    expectLayout(context, vm, "qvomacp_GetPxPhysicalData", {1, 1}, record, 7,
                 {{3, {"IPV6", "NET_ADDR_IPV6"}}});
}

TEST(PxLogical, CountsThreeProxiesAndHasNoFourth)
{
    Context context;
    LoadedVm vm;
    for (int i = 0; i < 3; ++i) {
        context.add(&context->ptPxLogical);
    }
    EXPECT_EQ(vm.number("qvomacp_GetPxLogicalCount"), 3);
    EXPECT_EQ(vm.array("qvomacp_GetProxyData", {3}), Array(14, std::nullopt));
    EXPECT_EQ(vm.array("qvomacp_GetProxyData", {4}), Array(14, ""));
}

TEST(PxLogical, HasNoSecondAuthInfo)
{
    Context context;
    LoadedVm vm;
    context.add(&context.add(&context->ptPxLogical)->ptPxAuthInfo);
    EXPECT_EQ(vm.array("qvomacp_GetPxAuthInfoData", {1, 1}), Array(4, std::nullopt));
    EXPECT_EQ(vm.array("qvomacp_GetPxAuthInfoData", {1, 2}), std::nullopt);
}

TEST(PxLogical, NamesAnAddressType)
{
    Context context;
    LoadedVm vm;
    qvsCtxPxPhysical *record = context.add(&context.add(&context->ptPxLogical)->ptPxPhysical);
    const auto nameOf = [&](const char *type) {
        record->pszPxAddrType = context.text(type);
        return vm.array("qvomacp_GetPxPhysicalData", {1, 1})->at(2);
    };
    EXPECT_EQ(nameOf("IPV4"), "NET_ADDR_IPV4");
    EXPECT_EQ(nameOf("\x85"), "NET_ADDR_IPV4");
    EXPECT_EQ(nameOf("\x85tail"), "NET_ADDR_IPV4");
    EXPECT_EQ(nameOf("IPV6"), "NET_ADDR_IPV6");
    EXPECT_EQ(nameOf("\x86"), "NET_ADDR_IPV6");
    EXPECT_EQ(nameOf("\x86tail"), "NET_ADDR_IPV6");
}

TEST(PxLogical, NamesServicesUpToTheLastRow)
{
    Context context;
    LoadedVm vm;
    qvsCtxPxLogical *proxy = context.add(&context->ptPxLogical);
    qvsCtxPort *port = context.add(&proxy->ptPort);
    qvsCtxPort *physicalPort = context.add(&context.add(&proxy->ptPxPhysical)->ptPort);
    for (int s = 0; s < 12; ++s) {
        context.add(&port->ptService, "wta");
        context.add(&physicalPort->ptService, "ota");
    }
    for (jint s = 1; s <= 10; ++s) {
        const Text expected = kServices[static_cast<size_t>(s)];
        EXPECT_EQ(vm.text("qvomacp_GetPxPortServiceData", {1, 1, s}), expected);
        EXPECT_EQ(vm.text("qvomacp_GetPxPhysicalPortServiceData", {1, 1, 1, s}), expected);
    }
    for (jint s : {-1, 0, 11, 12, 13}) {
        EXPECT_EQ(vm.text("qvomacp_GetPxPortServiceData", {1, 1, s}), std::nullopt) << s;
        EXPECT_EQ(vm.text("qvomacp_GetPxPhysicalPortServiceData", {1, 1, 1, s}), std::nullopt) << s;
    }
    EXPECT_EQ(vm.number("qvomacp_GetPxPortServiceCount", {1, 1}), 12);
    EXPECT_EQ(vm.number("qvomacp_GetPxPhysicalPortServiceCount", {1, 1, 1}), 12);
}

TEST(PxLogical, HasNoDomainBelowAMissingProxy)
{
    Context context;
    LoadedVm vm;
    context.add(&context.add(&context->ptPxLogical)->ptDomain, "wap.example");
    EXPECT_EQ(vm.text("qvomacp_GetPxDomainData", {1, 1}), "wap.example");
    EXPECT_EQ(vm.text("qvomacp_GetPxDomainData", {2, 1}), std::nullopt);
    EXPECT_EQ(vm.text("qvomacp_GetPxDomainData", {0, 1}), std::nullopt);
}

TEST(PxLogical, AnswersNullForAPortWithoutANumber)
{
    Context context;
    LoadedVm vm;
    qvsCtxPxLogical *proxy = context.add(&context->ptPxLogical);
    context.add(&proxy->ptPort);
    context.add(&context.add(&proxy->ptPxPhysical)->ptPort);
    EXPECT_EQ(vm.text("qvomacp_GetPxPortData", {1, 1}), std::nullopt);
    EXPECT_EQ(vm.text("qvomacp_GetPxPhysicalPortData", {1, 1, 1}), std::nullopt);
}

TEST(Kept, proxy_blank)
{
    Context context;
    LoadedVm vm;
    EXPECT_EQ(vm.array("qvomacp_GetProxyData", {1}), Array(14, ""));
    context.add(&context->ptPxLogical);
    for (jint p : {-1, 0, 2}) {
        EXPECT_EQ(vm.array("qvomacp_GetProxyData", {p}), Array(14, "")) << p;
    }
}

TEST(Kept, service_by_index)
{
    Context context;
    LoadedVm vm;
    qvsCtxPxLogical *proxy = context.add(&context->ptPxLogical);
    qvsCtxPort *port = context.add(&proxy->ptPort);
    context.add(&port->ptService);
    EXPECT_EQ(vm.text("qvomacp_GetPxPortServiceData", {1, 1, 1}), "CO-WSP");
    EXPECT_EQ(vm.text("qvomacp_GetPxPortServiceData", {1, 1, 2}), std::nullopt);
    for (const char *value : {"", "\xCA", "\xCB", "\xD3", "OTA-HTTP-PO", "CL-WSP"}) {
        port->ptService->pszValue = context.text(value);
        EXPECT_EQ(vm.text("qvomacp_GetPxPortServiceData", {1, 1, 1}), "CO-WSP") << value;
    }
}

TEST(Kept, pxaddrtype_ipv4)
{
    Context context;
    LoadedVm vm;
    qvsCtxPxPhysical *record = context.add(&context.add(&context->ptPxLogical)->ptPxPhysical);
    for (const char *type : {"E164", "ALPHA", "\x87", "\x88", "ipv6", "IPV66", "IPV", ""}) {
        record->pszPxAddrType = context.text(type);
        EXPECT_EQ(vm.array("qvomacp_GetPxPhysicalData", {1, 1})->at(2), "NET_ADDR_IPV4") << type;
    }
}

TEST(Kept, last_element_null)
{
    Context context;
    LoadedVm vm;
    qvsCtxPxLogical *record = context.add(&context->ptPxLogical);
    context.fill(record, 13, "field");
    const std::optional<Array> array = vm.array("qvomacp_GetProxyData", {1});
    ASSERT_TRUE(array);
    EXPECT_EQ(array->size(), 14u);
    EXPECT_EQ(array->at(12), "field.13");
    EXPECT_EQ(array->at(13), std::nullopt);
}

} // namespace
