// What a load registers, and how it fails.
#include "support/fakevm.h"

#include "qvsJni.h"

#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <utility>
#include <vector>

namespace {

using fakevm::Answer;
using fakevm::Native;
using fakevm::Vm;

struct Row {
    const char *name;
    const char *signature;
};

struct JavaClass {
    const char *name;
    std::vector<Row> natives;
};

const std::vector<JavaClass> kClasses = {
    {"XCPCtxParser",
     {
         {"qvomacp_parser", "([BJI)Z"},
         {"qvomacp_parser_del", "()V"},
         {"qvomacp_GetParserContentType", "()I"},
         {"qvomacp_GetParserHeaderLen", "()I"},
         {"qvomacp_GetParserBodyLen", "()I"},
         {"qvomacp_GetParserMACLen", "()I"},
         {"qvomacp_GetParserSEC", "()I"},
         {"qvomacp_GetParserMAC", "()[B"},
         {"qvomacp_GetParserBody", "()[B"},
     }},
    {"XCPCtxPxLogical",
     {
         {"qvomacp_GetPxLogicalCount", "()I"},
         {"qvomacp_GetPxDomainCount", "(I)I"},
         {"qvomacp_GetPxDomainData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetPxAuthInfoCount", "(I)I"},
         {"qvomacp_GetPxAuthInfoData", "(II)[Ljava/lang/String;"},
         {"qvomacp_GetPxPortCount", "(I)I"},
         {"qvomacp_GetPxPortData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetPxPortServiceCount", "(II)I"},
         {"qvomacp_GetPxPortServiceData", "(III)Ljava/lang/String;"},
         {"qvomacp_GetPxPhysicalCount", "(I)I"},
         {"qvomacp_GetPxPhysicalData", "(II)[Ljava/lang/String;"},
         {"qvomacp_GetPxPhysicalDomainCount", "(II)I"},
         {"qvomacp_GetPxPhsicalDomainData", "(III)Ljava/lang/String;"},
         {"qvomacp_GetPxPhsicalNapIdCount", "(II)I"},
         {"qvomacp_GetPxPhysicalNapIdData", "(III)Ljava/lang/String;"},
         {"qvomacp_GetPxPhysicalPortCount", "(II)I"},
         {"qvomacp_GetPxPhysicalPortData", "(III)Ljava/lang/String;"},
         {"qvomacp_GetPxPhysicalPortServiceCount", "(III)I"},
         {"qvomacp_GetPxPhysicalPortServiceData", "(IIII)Ljava/lang/String;"},
         {"qvomacp_GetProxyData", "(I)[Ljava/lang/String;"},
     }},
    {"XCPCtxNapDef",
     {
         {"qvomacp_GetPxNapDefCount", "()I"},
         {"qvomacp_GetPxDnsAddrCount", "(I)I"},
         {"qvomacp_GetPxDnsAddrData", "(II)Ljava/lang/String;"},
         {"qvomacp_SetPxNapDefIndex", "(I)V"},
         {"qvomacp_GetPxBearerCount", "(I)I"},
         {"qvomacp_GetPxBearerData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetPxNapAuthInfoCount", "(I)I"},
         {"qvomacp_GetPxNapAuthInfoData", "(II)[Ljava/lang/String;"},
         {"qvomacp_GetPxNapAuthEntityCount", "(II)I"},
         {"qvomacp_GetPxAuthInfopAuthEntityData", "(III)Ljava/lang/String;"},
         {"qvomacp_GetPxNapValidityCount", "(I)I"},
         {"qvomacp_GetPxValidityData", "(II)[Ljava/lang/String;"},
         {"qvomacp_GetPxNapDefData", "(I)[Ljava/lang/String;"},
     }},
    {"XCPCtxBootstrap",
     {
         {"qvomacp_GetPxBootstrapCount", "()I"},
         {"qvomacp_GetPxProxyIdCount", "(I)I"},
         {"qvomacp_GetPxProxyIdData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetPxNetworkCount", "(I)I"},
         {"qvomacp_GetPxNetworkData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetBootstrapData", "(I)[Ljava/lang/String;"},
     }},
    {"XCPCtxClientIdentity",
     {
         {"qvomacp_GetPxClientIdentityData", "()Ljava/lang/String;"},
     }},
    {"XCPCtxVendorConfig",
     {
         {"qvomacp_GetPxVenderConfigCount", "()I"},
         {"qvomacp_GetPxVenderConfigData", "(I)[Ljava/lang/String;"},
     }},
    {"XCPCtxApplication",
     {
         {"qvomacp_GetPxApplicationCount", "()I"},
         {"qvomacp_GetPxToProxyCount", "(I)I"},
         {"qvomacp_GetPxToProxyData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetPxNapIdCount", "(I)I"},
         {"qvomacp_GetPxNapIdData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetPxToAddrCount", "(I)I"},
         {"qvomacp_GetPxToAddrData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetPxAppAddrCount", "(I)I"},
         {"qvomacp_GetPxAppAddrData", "(II)[Ljava/lang/String;"},
         {"qvomacp_GetPxAppPortCount", "(II)I"},
         {"qvomacp_GetPxAppPortData", "(III)Ljava/lang/String;"},
         {"qvomacp_GetPxServiceCount", "(III)I"},
         {"qvomacp_GetPxServiceData", "(IIII)Ljava/lang/String;"},
         {"qvomacp_GetPxAppAuthCount", "(I)I"},
         {"qvomacp_GetPxAppAuthData", "(II)[Ljava/lang/String;"},
         {"qvomacp_GetPxResourceCount", "(I)I"},
         {"qvomacp_GetPxResourceData", "(II)[Ljava/lang/String;"},
         {"qvomacp_GetApplicationData", "(I)[Ljava/lang/String;"},
         {"qvomacp_GetPxRoamingData", "()[Ljava/lang/String;"},
     }},
    {"XCPCtxAccess",
     {
         {"qvomacp_GetPxCtxAccessCount", "()I"},
         {"qvomacp_GetPxRuleCount", "(I)I"},
         {"qvomacp_GetPxRuleData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetPxAppIdCount", "(I)I"},
         {"qvomacp_GetPxAppIdData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetPxPortNbrCount", "(I)I"},
         {"qvomacp_GetPxPortNbrData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetPxAccessDomainCount", "(I)I"},
         {"qvomacp_GetPxAccessDomainData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetPxAccessToNapIdCount", "(I)I"},
         {"qvomacp_GetPxAccessToNapIdData", "(II)Ljava/lang/String;"},
         {"qvomacp_GetPxAccessToProxyCount", "(I)I"},
         {"qvomacp_GetPxAccessToProxyData", "(II)Ljava/lang/String;"},
     }},
    {"XCPCtxWifi",
     {
         {"qvomacp_GetPxWifiCount", "()I"},
         {"qvomacp_GetPxWifiData", "(I)[Ljava/lang/String;"},
     }},
    {"XCPCtxVoWifi",
     {
         {"qvomacp_GetPxVoWifiCount", "()I"},
         {"qvomacp_GetPxVoWifiData", "(I)[Ljava/lang/String;"},
     }},
};

std::string fullName(const JavaClass &javaClass)
{
    return std::string("com/qvomacp/eng/parser/") + javaClass.name;
}

// Compares what was registered with the natives of the first `classes` classes.
void expectRegistered(const Vm &vm, size_t classes)
{
    size_t next = 0;
    for (size_t i = 0; i < classes; ++i) {
        for (const Row &row : kClasses[i].natives) {
            ASSERT_LT(next, vm.natives().size());
            const Native &native = vm.natives()[next++];
            EXPECT_EQ(native.javaClass, fullName(kClasses[i]));
            EXPECT_EQ(native.name, row.name);
            EXPECT_EQ(native.signature, row.signature);
            EXPECT_NE(native.function, nullptr);
        }
    }
    EXPECT_EQ(vm.natives().size(), next);
}

// A signature is held against the type of its function while compiling.
constexpr jint (*sum)(JNIEnv *, jobject, jint, jlong) = nullptr;
constexpr void (*parse)(JNIEnv *, jobject, jbyteArray) = nullptr;
constexpr jobjectArray (*texts)(JNIEnv *, jobject) = nullptr;

static_assert(qvs::describes("(IJ)I", sum));
static_assert(qvs::describes("([B)V", parse));
static_assert(qvs::describes("()[Ljava/lang/String;", texts));
static_assert(!qvs::describes("", sum));
static_assert(!qvs::describes("IJ)I", sum));
static_assert(!qvs::describes("(I)I", sum));
static_assert(!qvs::describes("(JI)I", sum));
static_assert(!qvs::describes("(IJI)I", sum));
static_assert(!qvs::describes("(IJI", sum));
static_assert(!qvs::describes("(IJ)", sum));
static_assert(!qvs::describes("(IJ)V", sum));
static_assert(!qvs::describes("(IJ)II", sum));
static_assert(!qvs::describes("()Ljava/lang/String;", texts));

TEST(OnLoad, RegistersEveryNativeInOrder)
{
    Vm vm;
    EXPECT_EQ(vm.load(), Answer{.number = 0x10004});
    expectRegistered(vm, kClasses.size());
    EXPECT_EQ(vm.natives().size(), 87u);
}

TEST(OnLoad, GivesEveryNativeAFunctionOfItsOwn)
{
    Vm vm;
    vm.load();
    for (const Native &one : vm.natives()) {
        for (const Native &other : vm.natives()) {
            EXPECT_EQ(one.function == other.function, one.name == other.name)
                << one.name << ' ' << other.name;
        }
    }
}

TEST(OnLoad, RegistersAClassInOneCall)
{
    Vm vm;
    vm.load();
    std::vector<std::string> expected = {"GetEnv"};
    for (size_t i = 0; i < kClasses.size(); ++i) {
        expected.insert(expected.end(), {"FindClass", "RegisterNatives", "DeleteLocalRef"});
    }
    EXPECT_EQ(vm.calls(), expected);
}

TEST(OnLoad, FailsWithoutAnEnvironment)
{
    const std::vector<std::pair<jint, bool>> cases = {
        {JNI_EVERSION, false}, {JNI_EDETACHED, false}, {JNI_ERR, true}, {JNI_OK, false}};
    for (const auto &[result, hasEnvironment] : cases) {
        Vm vm;
        vm.environmentResult = result;
        vm.hasEnvironment = hasEnvironment;
        EXPECT_EQ(vm.load(), Answer{.number = -1});
        expectRegistered(vm, 0);
        EXPECT_EQ(vm.calls(), std::vector<std::string>{"GetEnv"});
    }
}

TEST(OnLoad, StopsAtAMissingClassAndKeepsTheOnesBefore)
{
    for (size_t i = 0; i < kClasses.size(); ++i) {
        Vm vm;
        vm.lackedClass = fullName(kClasses[i]);
        EXPECT_EQ(vm.load(), (Answer{.number = -1, .exception = true})) << vm.lackedClass;
        expectRegistered(vm, i);
        EXPECT_EQ(vm.calls().back(), "FindClass");
    }
}

TEST(OnLoad, StopsAtARefusedRegistrationAndKeepsTheOnesBefore)
{
    for (size_t i = 0; i < kClasses.size(); ++i) {
        Vm vm;
        vm.refusedClass = fullName(kClasses[i]);
        EXPECT_EQ(vm.load(), (Answer{.number = -1, .exception = true})) << vm.refusedClass;
        expectRegistered(vm, i);
    }
}

TEST(OnLoad, FailsWithEveryCallThatFails)
{
    long failures = 0;
    for (;; ++failures) {
        Vm vm;
        vm.failCall(failures);
        const Answer answer = vm.load();
        if (!vm.hasFailed()) {
            EXPECT_EQ(answer.number, 0x10004);
            break;
        }
        EXPECT_EQ(answer, (Answer{.number = -1, .exception = true}));
        expectRegistered(vm, static_cast<size_t>(failures) / 2);
    }
    EXPECT_EQ(failures, 20);
}

} // namespace
