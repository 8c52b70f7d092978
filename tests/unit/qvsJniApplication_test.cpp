// The queries of XCPCtxApplication: layouts, names and edge cases. qvsJniQueries_test walks all of
// their indexes.
#include "support/handmade.h"

namespace {

using fakevm::Array;
using handmade::Context;
using handmade::expectLayout;
using handmade::LoadedVm;

TEST(Application, ArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxApplication *record = context.add(&context->ptApplication);
    expectLayout(context, vm, "qvomacp_GetApplicationData", {1}, record, 12);
    EXPECT_EQ(vm.array("qvomacp_GetApplicationData", {0}), std::nullopt);
}

TEST(Application, AppAddrArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxAppAddr *record = context.add(&context.add(&context->ptApplication)->ptAppAddr);
    expectLayout(context, vm, "qvomacp_GetPxAppAddrData", {1, 1}, record, 2);
    record->pszAddrType = context.text("\x86"); // unconverted
    EXPECT_EQ(vm.array("qvomacp_GetPxAppAddrData", {1, 1})->at(1), "\x86");
}

TEST(Application, AppAuthArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxAppAuth *record = context.add(&context.add(&context->ptApplication)->ptAppAuth);
    expectLayout(context, vm, "qvomacp_GetPxAppAuthData", {1, 1}, record, 5,
                 {{1, {"APPSRV", "APPSRV"}}});
}

TEST(Application, ResourceArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxResource *record = context.add(&context.add(&context->ptApplication)->ptResource);
    expectLayout(context, vm, "qvomacp_GetPxResourceData", {1, 1}, record, 8);
}

TEST(Application, RoamingArrayShowsEveryField)
{
    Context context;
    LoadedVm vm;
    qvsCtxRoaming *record = context.add(&context.add(&context->ptApplication)->ptRoaming);
    expectLayout(context, vm, "qvomacp_GetPxRoamingData", {}, record, 2);
}

TEST(Application, HasNoRoamingWithoutARecordOfIt)
{
    Context context;
    LoadedVm vm;
    EXPECT_EQ(vm.array("qvomacp_GetPxRoamingData"), std::nullopt);
    context.add(&context->ptApplication);
    EXPECT_EQ(vm.array("qvomacp_GetPxRoamingData"), std::nullopt);
}

TEST(Application, ShowsAServiceAsItIsStored)
{
    Context context;
    LoadedVm vm;
    qvsCtxAppAddr *address = context.add(&context.add(&context->ptApplication)->ptAppAddr);
    qvsCtxPort *port = context.add(&address->ptPort);
    for (const char *value : {"STARTTLS", "\xCB", ""}) {
        context.add(&port->ptService, value);
    }
    EXPECT_EQ(vm.text("qvomacp_GetPxServiceData", {1, 1, 1, 1}), "STARTTLS");
    EXPECT_EQ(vm.text("qvomacp_GetPxServiceData", {1, 1, 1, 2}), "\xCB");
    EXPECT_EQ(vm.text("qvomacp_GetPxServiceData", {1, 1, 1, 3}), "");
}

TEST(Kept, aauthlevel_name)
{
    Context context;
    LoadedVm vm;
    qvsCtxAppAuth *record = context.add(&context.add(&context->ptApplication)->ptAppAuth);
    const auto nameOf = [&](const char *level) {
        record->pszAAuthLevel = context.text(level);
        return vm.array("qvomacp_GetPxAppAuthData", {1, 1})->at(0);
    };
    for (const char *level : {"APPSRV", "\x8D",
                              "\x8D"
                              "client"}) {
        EXPECT_EQ(nameOf(level), "APPSRV") << level;
    }
    for (const char *level : {"CLIENT", "client", "ClIeNt"}) {
        EXPECT_EQ(nameOf(level), "CLIENT") << level;
    }
    for (const char *level :
         {"appsrv", "AppSrv", "APPSRV2", "CLIENTS", "CLIEN", "", "\x8E", "OBEX"}) {
        EXPECT_EQ(nameOf(level), std::nullopt) << level;
    }
}

TEST(Kept, roaming_first)
{
    Context context;
    LoadedVm vm;
    qvsCtxApplication *first = context.add(&context->ptApplication);
    qvsCtxApplication *second = context.add(&context->ptApplication);
    context.fill(context.add(&second->ptRoaming), 2, "second");
    EXPECT_EQ(vm.array("qvomacp_GetPxRoamingData"), std::nullopt);
    context.fill(context.add(&first->ptRoaming), 2, "first");
    context.fill(context.add(&first->ptRoaming), 2, "behind");
    EXPECT_EQ(vm.array("qvomacp_GetPxRoamingData"), (Array{"first.1", "first.2", std::nullopt}));
}

} // namespace
