// The queries of the classes with few natives: layouts and edge cases. qvsJniQueries_test walks all
// of their indexes.
#include "support/handmade.h"

namespace {

using fakevm::Array;
using handmade::Context;
using handmade::expectLayout;
using handmade::LoadedVm;

TEST(Bootstrap, ArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxBootstrap *record = context.add(&context->ptBootstrap);
    expectLayout(context, vm, "qvomacp_GetBootstrapData", {1}, record, 4);
}

TEST(Bootstrap, HasNullsForAnAbsentProvUrlAndTheEnd)
{
    Context context;
    LoadedVm vm;
    qvsCtxBootstrap *record = context.add(&context->ptBootstrap);
    context.fill(record, 4, "field");
    record->pszProvUrl = nullptr;
    EXPECT_EQ(vm.array("qvomacp_GetBootstrapData", {1}),
              (Array{"field.1", "field.2", std::nullopt, "field.4", std::nullopt}));
}

TEST(Bootstrap, CountsNoProxyIdsOfAMissingRecord)
{
    Context context;
    LoadedVm vm;
    context.add(&context.add(&context->ptBootstrap)->ptProxyId, "p1");
    EXPECT_EQ(vm.number("qvomacp_GetPxProxyIdCount", {1}), 1);
    EXPECT_EQ(vm.number("qvomacp_GetPxProxyIdCount", {0}), 0);
    EXPECT_EQ(
        vm.number("qvomacp_GetPxProxyIdCount", {vm.number("qvomacp_GetPxBootstrapCount") + 1}), 0);
}

TEST(ClientIdentity, IsNullWithoutARecordAndWithoutAText)
{
    Context context;
    LoadedVm vm;
    EXPECT_EQ(vm.text("qvomacp_GetPxClientIdentityData"), std::nullopt);
    context->ptClientIdent = context.record<qvsCtxClientIdent>();
    EXPECT_EQ(vm.text("qvomacp_GetPxClientIdentityData"), std::nullopt);
    context->ptClientIdent->pszClientId = context.text("me");
    EXPECT_EQ(vm.text("qvomacp_GetPxClientIdentityData"), "me");
}

TEST(VendorConfig, ArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxVendorConfig *record = context.add(&context->ptVendorConfig);
    expectLayout(context, vm, "qvomacp_GetPxVenderConfigData", {1}, record, 3);
}

TEST(Access, HasNoRuleZero)
{
    Context context;
    LoadedVm vm;
    context.add(&context.add(&context->ptAccess)->ptRule, "allow");
    EXPECT_EQ(vm.text("qvomacp_GetPxRuleData", {1, 1}), "allow");
    EXPECT_EQ(vm.text("qvomacp_GetPxRuleData", {1, 0}), std::nullopt);
}

TEST(Access, AnswersNullForEveryAppIdThatTheListDoesNotHave)
{
    Context context;
    LoadedVm vm;
    qvsCtxAccess *record = context.add(&context->ptAccess);
    EXPECT_EQ(vm.text("qvomacp_GetPxAppIdData", {1, 1}), std::nullopt);
    EXPECT_EQ(vm.text("qvomacp_GetPxAppIdData", {1, 2}), std::nullopt);
    context.add(&record->ptAppId, "w2");
    context.add(&record->ptAppId, "w4");
    EXPECT_EQ(vm.text("qvomacp_GetPxAppIdData", {1, 1}), "w2");
    EXPECT_EQ(vm.text("qvomacp_GetPxAppIdData", {1, 2}), "w4");
    for (jint d : {INT32_MIN, -1, 0, 3, 4, INT32_MAX}) {
        EXPECT_EQ(vm.text("qvomacp_GetPxAppIdData", {1, d}), std::nullopt) << d;
    }
}

TEST(Wifi, ArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxWifi *record = context.add(&context->ptWifi);
    expectLayout(context, vm, "qvomacp_GetPxWifiData", {1}, record, 12);
}

TEST(VoWifi, ArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxVoWifi *record = context.add(&context->ptVoWifi);
    expectLayout(context, vm, "qvomacp_GetPxVoWifiData", {1}, record, 1);
}

} // namespace
