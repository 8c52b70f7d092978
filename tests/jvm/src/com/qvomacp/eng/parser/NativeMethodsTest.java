package com.qvomacp.eng.parser;

import static org.junit.jupiter.api.Assertions.assertEquals;

import com.qvomacp.support.Natives;
import java.io.DataInputStream;
import java.io.IOException;
import java.io.InputStream;
import java.lang.invoke.MethodType;
import java.lang.reflect.Method;
import java.lang.reflect.Modifier;
import java.util.Arrays;
import java.util.List;
import java.util.Set;
import java.util.TreeSet;
import java.util.stream.Collectors;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.ValueSource;

/** The ten classes declare what the library registers, no more and no less. */
class NativeMethodsTest extends Natives {
    private static final String REGISTERED =
            """
            XCPCtxParser qvomacp_parser ([BJI)Z
            XCPCtxParser qvomacp_parser_del ()V
            XCPCtxParser qvomacp_GetParserContentType ()I
            XCPCtxParser qvomacp_GetParserHeaderLen ()I
            XCPCtxParser qvomacp_GetParserBodyLen ()I
            XCPCtxParser qvomacp_GetParserMACLen ()I
            XCPCtxParser qvomacp_GetParserSEC ()I
            XCPCtxParser qvomacp_GetParserMAC ()[B
            XCPCtxParser qvomacp_GetParserBody ()[B
            XCPCtxPxLogical qvomacp_GetPxLogicalCount ()I
            XCPCtxPxLogical qvomacp_GetPxDomainCount (I)I
            XCPCtxPxLogical qvomacp_GetPxDomainData (II)Ljava/lang/String;
            XCPCtxPxLogical qvomacp_GetPxAuthInfoCount (I)I
            XCPCtxPxLogical qvomacp_GetPxAuthInfoData (II)[Ljava/lang/String;
            XCPCtxPxLogical qvomacp_GetPxPortCount (I)I
            XCPCtxPxLogical qvomacp_GetPxPortData (II)Ljava/lang/String;
            XCPCtxPxLogical qvomacp_GetPxPortServiceCount (II)I
            XCPCtxPxLogical qvomacp_GetPxPortServiceData (III)Ljava/lang/String;
            XCPCtxPxLogical qvomacp_GetPxPhysicalCount (I)I
            XCPCtxPxLogical qvomacp_GetPxPhysicalData (II)[Ljava/lang/String;
            XCPCtxPxLogical qvomacp_GetPxPhysicalDomainCount (II)I
            XCPCtxPxLogical qvomacp_GetPxPhsicalDomainData (III)Ljava/lang/String;
            XCPCtxPxLogical qvomacp_GetPxPhsicalNapIdCount (II)I
            XCPCtxPxLogical qvomacp_GetPxPhysicalNapIdData (III)Ljava/lang/String;
            XCPCtxPxLogical qvomacp_GetPxPhysicalPortCount (II)I
            XCPCtxPxLogical qvomacp_GetPxPhysicalPortData (III)Ljava/lang/String;
            XCPCtxPxLogical qvomacp_GetPxPhysicalPortServiceCount (III)I
            XCPCtxPxLogical qvomacp_GetPxPhysicalPortServiceData (IIII)Ljava/lang/String;
            XCPCtxPxLogical qvomacp_GetProxyData (I)[Ljava/lang/String;
            XCPCtxNapDef qvomacp_GetPxNapDefCount ()I
            XCPCtxNapDef qvomacp_GetPxDnsAddrCount (I)I
            XCPCtxNapDef qvomacp_GetPxDnsAddrData (II)Ljava/lang/String;
            XCPCtxNapDef qvomacp_SetPxNapDefIndex (I)V
            XCPCtxNapDef qvomacp_GetPxBearerCount (I)I
            XCPCtxNapDef qvomacp_GetPxBearerData (II)Ljava/lang/String;
            XCPCtxNapDef qvomacp_GetPxNapAuthInfoCount (I)I
            XCPCtxNapDef qvomacp_GetPxNapAuthInfoData (II)[Ljava/lang/String;
            XCPCtxNapDef qvomacp_GetPxNapAuthEntityCount (II)I
            XCPCtxNapDef qvomacp_GetPxAuthInfopAuthEntityData (III)Ljava/lang/String;
            XCPCtxNapDef qvomacp_GetPxNapValidityCount (I)I
            XCPCtxNapDef qvomacp_GetPxValidityData (II)[Ljava/lang/String;
            XCPCtxNapDef qvomacp_GetPxNapDefData (I)[Ljava/lang/String;
            XCPCtxBootstrap qvomacp_GetPxBootstrapCount ()I
            XCPCtxBootstrap qvomacp_GetPxProxyIdCount (I)I
            XCPCtxBootstrap qvomacp_GetPxProxyIdData (II)Ljava/lang/String;
            XCPCtxBootstrap qvomacp_GetPxNetworkCount (I)I
            XCPCtxBootstrap qvomacp_GetPxNetworkData (II)Ljava/lang/String;
            XCPCtxBootstrap qvomacp_GetBootstrapData (I)[Ljava/lang/String;
            XCPCtxClientIdentity qvomacp_GetPxClientIdentityData ()Ljava/lang/String;
            XCPCtxVendorConfig qvomacp_GetPxVenderConfigCount ()I
            XCPCtxVendorConfig qvomacp_GetPxVenderConfigData (I)[Ljava/lang/String;
            XCPCtxApplication qvomacp_GetPxApplicationCount ()I
            XCPCtxApplication qvomacp_GetPxToProxyCount (I)I
            XCPCtxApplication qvomacp_GetPxToProxyData (II)Ljava/lang/String;
            XCPCtxApplication qvomacp_GetPxNapIdCount (I)I
            XCPCtxApplication qvomacp_GetPxNapIdData (II)Ljava/lang/String;
            XCPCtxApplication qvomacp_GetPxToAddrCount (I)I
            XCPCtxApplication qvomacp_GetPxToAddrData (II)Ljava/lang/String;
            XCPCtxApplication qvomacp_GetPxAppAddrCount (I)I
            XCPCtxApplication qvomacp_GetPxAppAddrData (II)[Ljava/lang/String;
            XCPCtxApplication qvomacp_GetPxAppPortCount (II)I
            XCPCtxApplication qvomacp_GetPxAppPortData (III)Ljava/lang/String;
            XCPCtxApplication qvomacp_GetPxServiceCount (III)I
            XCPCtxApplication qvomacp_GetPxServiceData (IIII)Ljava/lang/String;
            XCPCtxApplication qvomacp_GetPxAppAuthCount (I)I
            XCPCtxApplication qvomacp_GetPxAppAuthData (II)[Ljava/lang/String;
            XCPCtxApplication qvomacp_GetPxResourceCount (I)I
            XCPCtxApplication qvomacp_GetPxResourceData (II)[Ljava/lang/String;
            XCPCtxApplication qvomacp_GetApplicationData (I)[Ljava/lang/String;
            XCPCtxApplication qvomacp_GetPxRoamingData ()[Ljava/lang/String;
            XCPCtxAccess qvomacp_GetPxCtxAccessCount ()I
            XCPCtxAccess qvomacp_GetPxRuleCount (I)I
            XCPCtxAccess qvomacp_GetPxRuleData (II)Ljava/lang/String;
            XCPCtxAccess qvomacp_GetPxAppIdCount (I)I
            XCPCtxAccess qvomacp_GetPxAppIdData (II)Ljava/lang/String;
            XCPCtxAccess qvomacp_GetPxPortNbrCount (I)I
            XCPCtxAccess qvomacp_GetPxPortNbrData (II)Ljava/lang/String;
            XCPCtxAccess qvomacp_GetPxAccessDomainCount (I)I
            XCPCtxAccess qvomacp_GetPxAccessDomainData (II)Ljava/lang/String;
            XCPCtxAccess qvomacp_GetPxAccessToNapIdCount (I)I
            XCPCtxAccess qvomacp_GetPxAccessToNapIdData (II)Ljava/lang/String;
            XCPCtxAccess qvomacp_GetPxAccessToProxyCount (I)I
            XCPCtxAccess qvomacp_GetPxAccessToProxyData (II)Ljava/lang/String;
            XCPCtxWifi qvomacp_GetPxWifiCount ()I
            XCPCtxWifi qvomacp_GetPxWifiData (I)[Ljava/lang/String;
            XCPCtxVoWifi qvomacp_GetPxVoWifiCount ()I
            XCPCtxVoWifi qvomacp_GetPxVoWifiData (I)[Ljava/lang/String;
            """;

    @Test
    void declareExactlyWhatIsRegistered() {
        Set<String> registered = REGISTERED.lines().collect(Collectors.toCollection(TreeSet::new));
        Set<String> declared =
                ALL.stream()
                        .flatMap(object -> Arrays.stream(object.getClass().getDeclaredMethods()))
                        .map(NativeMethodsTest::described)
                        .collect(Collectors.toCollection(TreeSet::new));
        assertEquals(87, registered.size());
        assertEquals(String.join("\n", registered), String.join("\n", declared));
    }

    @Test
    void declareNothingButPublicNativesOfObjects() {
        for (Object object : ALL) {
            assertEquals(0, object.getClass().getDeclaredFields().length, object.toString());
            for (Method method : object.getClass().getDeclaredMethods()) {
                int modifiers = method.getModifiers();
                assertEquals(Modifier.PUBLIC | Modifier.NATIVE, modifiers, method.toString());
            }
        }
    }

    @Test
    void areTenClassesOfThePackageThatIsLookedUp() {
        List<String> names = ALL.stream().map(object -> object.getClass().getName()).toList();
        List<String> registered =
                REGISTERED
                        .lines()
                        .map(line -> "com.qvomacp.eng.parser." + line.split(" ")[0])
                        .distinct()
                        .toList();
        assertEquals(registered, names);
    }

    @ParameterizedTest
    @ValueSource(
            strings = {
                "/com/qvomacp/eng/parser/XCPCtxParser.class",
                "/com/qvomacp/cli/Main.class",
                "/com/qvomacp/eng/omacp/ProvisioningMessage.class"
            })
    void areJava8ByteCode(String resource) throws IOException {
        try (InputStream in = getClass().getResourceAsStream(resource);
                DataInputStream data = new DataInputStream(in)) {
            assertEquals(0xCAFEBABE, data.readInt());
            assertEquals(0, data.readUnsignedShort(), "minor version");
            assertEquals(52, data.readUnsignedShort(), "major version");
        }
    }

    private static String described(Method method) {
        MethodType type = MethodType.methodType(method.getReturnType(), method.getParameterTypes());
        return String.join(
                " ",
                method.getDeclaringClass().getSimpleName(),
                method.getName(),
                type.toMethodDescriptorString());
    }
}
