package com.qvomacp.eng.omacp;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.named;
import static com.qvomacp.support.Document.parm;
import static com.qvomacp.support.Document.token;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Document;
import com.qvomacp.support.Everything;
import com.qvomacp.support.Push;
import java.lang.reflect.Method;
import java.lang.reflect.Modifier;
import java.util.ArrayList;
import java.util.List;
import org.junit.jupiter.api.Test;

/** What a snapshot tells of each characteristic. */
class SnapshotTest {
    private static ProvisioningMessage parse(Document.Element... elements) throws Exception {
        return ProvisioningMessage.parse(Push.push(elements));
    }

    private static ProvisioningMessage everything() throws Exception {
        return ProvisioningMessage.parse(Everything.push());
    }

    private static AccessPoint accessPoint(Document.Element... parms) throws Exception {
        return parse(characteristic("NAPDEF", parms)).getAccessPoints().get(0);
    }

    @Test
    void tellsTheHeader() throws Exception {
        byte[] body = Everything.body();
        PushHeader header = everything().getHeader();
        assertEquals(ContentType.CONNECTIVITY_WBXML, header.getContentType());
        assertEquals(54, header.getContentType().getCode());
        assertEquals(
                "application/vnd.wap.connectivity-wbxml", header.getContentType().getMediaType());
        assertEquals(47, header.getHeaderLength());
        assertEquals(body.length, header.getBodyLength());
        assertEquals(SecurityMethod.USERPIN, header.getSecurityMethod());
        assertEquals(0x81, header.getSec());
        assertEquals(Everything.MAC, header.getMac());
        assertEquals(header, ProvisioningMessage.parseHeader(Everything.push()));
    }

    @Test
    void tellsAHeaderWithoutSecurity() throws Exception {
        PushHeader header = ProvisioningMessage.parseHeader(Push.push(new byte[] {1, 2, 3}));
        assertEquals(SecurityMethod.NONE, header.getSecurityMethod());
        assertEquals(0, header.getSec());
        assertNull(header.getMac());
        assertEquals(3, header.getBodyLength());
        header.getBody()[0] = 9;
        assertEquals(1, header.getBody()[0]);
    }

    @Test
    void tellsEverySecurityMethod() throws Exception {
        SecurityMethod[] expected = {
            SecurityMethod.NETWPIN,
            SecurityMethod.USERPIN,
            SecurityMethod.USERNETWPIN,
            SecurityMethod.USERPINMAC,
            SecurityMethod.UNKNOWN,
        };
        for (int i = 0; i < expected.length; ++i) {
            byte[] message = Push.secured(0x80 + i, "00", new byte[1]);
            PushHeader header = ProvisioningMessage.parseHeader(message);
            assertEquals(expected[i], header.getSecurityMethod());
            assertEquals(0x80 + i, header.getSec());
        }
    }

    @Test
    void tellsEveryContentType() throws Exception {
        for (ContentType type : ContentType.values()) {
            byte[] bytes = Push.withTextType(type.getMediaType(), new byte[1]).bytes();
            assertEquals(type, ProvisioningMessage.parseHeader(bytes).getContentType());
            bytes = Push.withShortType(0x80 | type.getCode(), new byte[1]).bytes();
            assertEquals(type, ProvisioningMessage.parseHeader(bytes).getContentType());
        }
    }

    @Test
    void tellsAProxy() throws Exception {
        assertEquals(1, everything().getProxies().size());
        Proxy proxy = everything().getProxies().get(0);
        assertEquals("p-PROXY-ID", proxy.getProxyId());
        assertEquals("p-PROXY-PW", proxy.getPassword());
        assertEquals("p-PPGAUTH-TYPE", proxy.getPushAuthenticationType());
        assertEquals("p-PROXY-PROVIDER-ID", proxy.getProviderId());
        assertEquals("p-NAME", proxy.getName());
        assertEquals("p-TRUST", proxy.getTrust());
        assertEquals("p-MASTER", proxy.getMaster());
        assertEquals("p-STARTPAGE", proxy.getStartPage());
        assertEquals(List.of("p-DOMAIN"), proxy.getDomains());

        assertEquals(1, proxy.getAuthentications().size());
        ProxyAuthentication authentication = proxy.getAuthentications().get(0);
        assertEquals("pa-PXAUTH-TYPE", authentication.getType());
        assertEquals("pa-PXAUTH-ID", authentication.getId());
        assertEquals("pa-PXAUTH-PW", authentication.getPassword());

        assertEquals(1, proxy.getPorts().size());
        assertEquals("pp-PORTNBR", proxy.getPorts().get(0).getNumber());
        assertEquals(1, proxy.getPorts().get(0).getServiceCount());
        assertEquals(List.of("CO-WSP"), proxy.getPorts().get(0).getServicesByPlace());
    }

    @Test
    void tellsAPhysicalProxy() throws Exception {
        assertEquals(1, everything().getProxies().get(0).getPhysicalProxies().size());
        PhysicalProxy proxy = everything().getProxies().get(0).getPhysicalProxies().get(0);
        assertEquals("h-PHYSICAL-PROXY-ID", proxy.getPhysicalProxyId());
        assertEquals("h-PXADDR", proxy.getAddress());
        assertEquals(ProxyAddressType.IPV4, proxy.getAddressType());
        assertEquals("h-PXADDR-FQDN", proxy.getHostName());
        assertEquals("h-WSP-VERSION", proxy.getWspVersion());
        assertEquals("h-PUSHENABLED", proxy.getPushEnabled());
        assertEquals("h-PULLENABLED", proxy.getPullEnabled());
        assertEquals(List.of("h-DOMAIN"), proxy.getDomains());
        assertEquals(List.of("h-TO-NAPID"), proxy.getToNapIds());
        assertEquals(1, proxy.getPorts().size());
        assertEquals("hp-PORTNBR", proxy.getPorts().get(0).getNumber());
        assertEquals(1, proxy.getPorts().get(0).getServiceCount());
    }

    @Test
    void tellsApartTheTypesOfAProxyAddress() throws Exception {
        Proxy proxy =
                parse(
                                characteristic(
                                        "PXLOGICAL",
                                        characteristic(
                                                "PXPHYSICAL", parm("PXADDRTYPE", token(0x86))),
                                        characteristic(
                                                "PXPHYSICAL", parm("PXADDRTYPE", token(0x87))),
                                        characteristic("PXPHYSICAL", parm("PXADDR", "a"))))
                        .getProxies()
                        .get(0);
        List<ProxyAddressType> types = new ArrayList<>();
        proxy.getPhysicalProxies().forEach(physical -> types.add(physical.getAddressType()));
        List<ProxyAddressType> expected = new ArrayList<>();
        expected.add(ProxyAddressType.IPV6);
        expected.add(ProxyAddressType.IPV4);
        expected.add(null);
        assertEquals(expected, types);
    }

    @Test
    void countsMoreServicesThanHaveNames() throws Exception {
        Document.Element[] services = new Document.Element[13];
        services[0] = parm("PORTNBR", "80");
        for (int i = 1; i < services.length; ++i) {
            services[i] = parm("SERVICE", "s" + i);
        }
        ProxyPort port =
                parse(characteristic("PXLOGICAL", characteristic("PORT", services)))
                        .getProxies()
                        .get(0)
                        .getPorts()
                        .get(0);
        assertEquals(12, port.getServiceCount());
        assertEquals(10, port.getServicesByPlace().size());
        assertEquals("CO-WSP", port.getServicesByPlace().get(0));
        assertEquals("Unkown Service", port.getServicesByPlace().get(9));
    }

    @Test
    void tellsAnAccessPointWithAHiddenAddressType() throws Exception {
        assertEquals(1, everything().getAccessPoints().size());
        AccessPoint accessPoint = everything().getAccessPoints().get(0);
        assertTrue(accessPoint.isAddressTypeHidden());
        assertNull(accessPoint.getAddressType());
        assertEveryOtherParameter(accessPoint);
    }

    @Test
    void tellsAnAccessPointWithoutAnAddressType() throws Exception {
        AccessPoint accessPoint =
                parse(Everything.withoutNapAddrType()).getAccessPoints().get(0);
        assertFalse(accessPoint.isAddressTypeHidden());
        assertNull(accessPoint.getAddressType());
        assertEveryOtherParameter(accessPoint);
    }

    private static void assertEveryOtherParameter(AccessPoint accessPoint) {
        assertEquals("n-NAPID", accessPoint.getNapId());
        assertEquals("n-NAME", accessPoint.getName());
        assertEquals("n-INTERNET", accessPoint.getInternet());
        assertEquals("n-NAP-ADDRESS", accessPoint.getAddress());
        assertEquals("n-CALLTYPE", accessPoint.getCallType());
        assertEquals("n-LOCAL-ADDR", accessPoint.getLocalAddress());
        assertEquals("n-LOCAL-ADDRTYPE", accessPoint.getLocalAddressType());
        assertEquals("n-LINKSPEED", accessPoint.getLinkSpeed());
        assertEquals("n-DNLINKSPEED", accessPoint.getDownlinkSpeed());
        assertEquals("n-LINGER", accessPoint.getLinger());
        assertEquals("n-DELIVERY-ERR-SDU", accessPoint.getDeliveryOfErroneousSdus());
        assertEquals("n-DELIVERY-ORDER", accessPoint.getDeliveryOrder());
        assertEquals("n-TRAFFIC-CLASS", accessPoint.getTrafficClass());
        assertEquals("n-MAX-SDU-SIZE", accessPoint.getMaxSduSize());
        assertEquals("n-MAX-BITRATE-UPLINK", accessPoint.getMaxBitrateUplink());
        assertEquals("n-MAX-BITRATE-DNLINK", accessPoint.getMaxBitrateDownlink());
        assertEquals("n-MAX-NUM-RETRY", accessPoint.getMaxRetries());
        assertEquals("n-FIRST-RETRY-TIMEOUT", accessPoint.getFirstRetryTimeout());
        assertEquals("n-REREG-THRESHOLD", accessPoint.getReregistrationThreshold());
        assertEquals("n-T-BIT", accessPoint.getTBit());
        assertTrue(accessPoint.isInit());
        assertEquals(1, accessPoint.getBearerCount());
        assertEquals(List.of("GSM-GPRS"), accessPoint.getBearers());
        assertEquals(List.of("n-DNS-ADDR"), accessPoint.getDnsAddresses());

        assertEquals(1, accessPoint.getAuthentications().size());
        AccessPointAuthentication authentication = accessPoint.getAuthentications().get(0);
        assertEquals("NONE", authentication.getType());
        assertEquals("na-AUTHNAME", authentication.getName());
        assertEquals("na-AUTHSECRET", authentication.getSecret());
        assertEquals(List.of("na-AUTH-ENTITY"), authentication.getEntities());

        assertEquals(1, accessPoint.getValidities().size());
        Validity validity = accessPoint.getValidities().get(0);
        assertEquals("nv-COUNTRY", validity.getCountry());
        assertEquals("nv-NETWORK", validity.getNetwork());
        assertEquals("nv-SID", validity.getSystemId());
        assertEquals("nv-SOC", validity.getSystemOperatorCode());
        assertEquals("nv-VALIDUNTIL", validity.getValidUntil());
    }

    @Test
    void keepsAnAddressTypeThatIsAnswered() throws Exception {
        // A text that begins with the byte of a token is answered as that token.
        AccessPoint accessPoint =
                accessPoint(
                        parm("NAP-ADDRTYPE", new byte[] {(byte) 0x89}), parm("CALLTYPE", "call"));
        assertFalse(accessPoint.isAddressTypeHidden());
        assertEquals("0x89", accessPoint.getAddressType());
        assertEquals("call", accessPoint.getCallType());
    }

    @Test
    void leavesOutABearerThatIsGivenAsText() throws Exception {
        AccessPoint accessPoint =
                accessPoint(
                        parm("NAP-ADDRESS", "apn.example.com"),
                        parm("BEARER", "GSM-GPRS"),
                        parm("BEARER", token(0xBC)));
        assertEquals(2, accessPoint.getBearerCount());
        assertEquals(List.of("WLAN"), accessPoint.getBearers());
    }

    @Test
    void knowsTheNameOfEveryBearer() throws Exception {
        for (int bearer = 0xA2; bearer <= 0xBD; ++bearer) {
            AccessPoint accessPoint =
                    accessPoint(
                            parm("NAP-ADDRESS", "apn.example.com"), parm("BEARER", token(bearer)));
            assertEquals(1, accessPoint.getBearers().size(), "bearer " + bearer);
        }
    }

    @Test
    void tellsABootstrap() throws Exception {
        assertEquals(1, everything().getBootstraps().size());
        Bootstrap bootstrap = everything().getBootstraps().get(0);
        assertEquals("b-NAME", bootstrap.getName());
        assertEquals("b-COUNTRY", bootstrap.getCountry());
        assertEquals("b-PROVURL", bootstrap.getProvisioningUrl());
        assertEquals("b-CONTEXT-ALLOW", bootstrap.getContextAllow());
        assertEquals(List.of("b-PROXY-ID"), bootstrap.getProxyIds());
        assertEquals(List.of("b-NETWORK"), bootstrap.getNetworks());
    }

    @Test
    void tellsIdentityAndVendorConfiguration() throws Exception {
        assertEquals("c-CLIENT-ID", everything().getClientId());
        assertEquals(1, everything().getVendorConfigurations().size());
        VendorConfiguration vendor = everything().getVendorConfigurations().get(0);
        assertEquals("v-NAME", vendor.getName());
        assertEquals("Vendor's own", vendor.getParameterName());
        assertEquals("v-Vendor's own", vendor.getParameterValue());
    }

    @Test
    void tellsAnApplication() throws Exception {
        assertEquals(1, everything().getApplications().size());
        Application application = everything().getApplications().get(0);
        assertEquals("a-APPID", application.getAppId());
        assertEquals("a-PROVIDER-ID", application.getProviderId());
        assertEquals("a-FROM", application.getFrom());
        assertEquals("a-NAME", application.getName());
        assertEquals("a-AACCEPT", application.getAccept());
        assertEquals("a-APROTOCOL", application.getProtocol());
        assertEquals("a-INTERNET", application.getInternet());
        assertEquals("a-XCAP_AUID_DCS", application.getXcapAuidDcs());
        assertEquals("a-XCAP_AUID_PMS", application.getXcapAuidPms());
        assertEquals("a-XCAP_AUID_CDMS", application.getXcapAuidCdms());
        assertEquals("a-XCAP_IMEI_HEADER", application.getXcapImeiHeader());
        assertEquals("a-XCAP_TID_HEADER", application.getXcapTidHeader());
        assertEquals(List.of("a-TO-PROXY"), application.getToProxies());
        assertEquals(List.of("a-TO-NAPID"), application.getToNapIds());
        assertEquals(List.of("a-ADDR"), application.getSimpleAddresses());
        assertEquals("am-SYNC-ALLOWED", application.getRoaming().getSyncAllowed());
        assertEquals("am-SYNC-DEFAULT", application.getRoaming().getSyncDefault());
    }

    @Test
    void tellsWhatStandsInAnApplication() throws Exception {
        Application application = everything().getApplications().get(0);
        assertEquals(1, application.getAddresses().size());
        ApplicationAddress address = application.getAddresses().get(0);
        assertEquals("aa-ADDR", address.getAddress());
        assertEquals("aa-ADDRTYPE", address.getAddressType());
        assertEquals(1, address.getPorts().size());
        assertEquals("ap-PORTNBR", address.getPorts().get(0).getNumber());
        assertEquals(List.of("ap-SERVICE"), address.getPorts().get(0).getServices());

        assertEquals(1, application.getAuthentications().size());
        ApplicationAuthentication authentication = application.getAuthentications().get(0);
        assertEquals("CLIENT", authentication.getLevel());
        assertEquals("au-AAUTHTYPE", authentication.getType());
        assertEquals("au-AAUTHNAME", authentication.getName());
        assertEquals("au-AAUTHSECRET", authentication.getSecret());
        assertEquals("au-AAUTHDATA", authentication.getData());

        assertEquals(1, application.getResources().size());
        Resource resource = application.getResources().get(0);
        assertEquals("ar-URI", resource.getUri());
        assertEquals("ar-NAME", resource.getName());
        assertEquals("ar-AACCEPT", resource.getAccept());
        assertEquals("ar-AAUTHTYPE", resource.getAuthenticationType());
        assertEquals("ar-AAUTHNAME", resource.getAuthenticationName());
        assertEquals("ar-AAUTHSECRET", resource.getAuthenticationSecret());
        assertEquals("ar-AAUTHDATA", resource.getAuthenticationData());
        assertEquals("ar-STARTPAGE", resource.getStartPage());
    }

    @Test
    void givesTheFirstApplicationAloneARoaming() throws Exception {
        Document.Element roaming = characteristic("ROAMING", named("SYNC-ALLOWED", "1"));
        ProvisioningMessage message =
                parse(
                        characteristic("APPLICATION", parm("APPID", "w2"), roaming),
                        characteristic("APPLICATION", parm("APPID", "w4"), roaming));
        assertEquals("1", message.getApplications().get(0).getRoaming().getSyncAllowed());
        assertNull(message.getApplications().get(0).getRoaming().getSyncDefault());
        assertNull(message.getApplications().get(1).getRoaming());
    }

    @Test
    void tellsAnAccessRule() throws Exception {
        assertEquals(1, everything().getAccessRules().size());
        AccessRule rule = everything().getAccessRules().get(0);
        assertEquals(List.of("x-RULE"), rule.getRules());
        assertEquals(List.of("x-APPID"), rule.getAppIds());
        assertEquals(List.of("x-PORTNBR"), rule.getPortNumbers());
        assertEquals(List.of("x-DOMAIN"), rule.getDomains());
        assertEquals(List.of("x-TO-NAPID"), rule.getToNapIds());
        assertEquals(List.of("x-TO-PROXY"), rule.getToProxies());
    }

    @Test
    void tellsWifiAndVoWifi() throws Exception {
        assertEquals(1, everything().getWifis().size());
        Wifi wifi = everything().getWifis().get(0);
        assertEquals("w-NETSSID", wifi.getSsid());
        assertEquals("w-SECMODE", wifi.getSecurityMode());
        assertEquals("w-EAPMETHOD", wifi.getEapMethod());
        assertEquals("w-EAPTYPE", wifi.getEapType());
        assertEquals("w-USERNAME", wifi.getUserName());
        assertEquals("w-ANONUSERNAME", wifi.getAnonymousUserName());
        assertEquals("w-PASSWORD", wifi.getPassword());
        assertEquals("w-CACERT", wifi.getCaCertificate());
        assertEquals("w-USERCERT", wifi.getUserCertificate());
        assertEquals("w-PHASE1", wifi.getPhase1());
        assertEquals("w-AUTHALGORITHM", wifi.getAuthenticationAlgorithm());
        assertEquals("w-PRIORITY", wifi.getPriority());
        assertEquals(1, everything().getVoWifis().size());
        assertEquals("o-ePDG FQDN", everything().getVoWifis().get(0).getEpdgHostName());
    }

    /** Texts and single snapshots are null, lists empty, but for what is never absent. */
    @Test
    void tellsWhatIsAbsentAsNullOrEmpty() throws Exception {
        ProvisioningMessage message =
                parse(
                        characteristic(
                                "PXLOGICAL", characteristic("PXPHYSICAL"), characteristic("PORT")),
                        characteristic(
                                "NAPDEF",
                                characteristic("NAPAUTHINFO"),
                                characteristic("VALIDITY")),
                        characteristic("BOOTSTRAP"),
                        characteristic("VENDORCONFIG"),
                        characteristic(
                                "APPLICATION",
                                characteristic("APPADDR", characteristic("PORT")),
                                characteristic("APPAUTH"),
                                characteristic("RESOURCE")),
                        characteristic("ACCESS"),
                        characteristic("WI-FI"),
                        characteristic("Vodafone VoWiFi"));
        assertNull(message.getClientId());
        int getters = 0;
        for (Object snapshot : all(message)) {
            for (Method getter : getters(snapshot)) {
                Object answer = getter.invoke(snapshot);
                if (getter.getReturnType() == String.class) {
                    assertNull(answer, getter.toString());
                    ++getters;
                } else if (getter.getReturnType() == List.class) {
                    for (Object element : (List<?>) answer) {
                        assertTrue(element instanceof Characteristic, getter.toString());
                    }
                } else if (getter.getReturnType() == boolean.class) {
                    assertEquals(false, answer, getter.toString());
                }
            }
        }
        assertTrue(getters > 80, getters + " texts");
    }

    @Test
    void letsNoListBeModified() throws Exception {
        int lists = 0;
        for (ProvisioningMessage message :
                List.of(everything(), parse(characteristic("PXLOGICAL")))) {
            for (Object snapshot : all(message)) {
                for (Method getter : getters(snapshot)) {
                    if (getter.getReturnType() == List.class) {
                        List<?> list = (List<?>) getter.invoke(snapshot);
                        assertThrows(
                                UnsupportedOperationException.class,
                                () -> list.add(null),
                                getter.toString());
                        ++lists;
                    }
                }
            }
        }
        assertTrue(lists > 40, lists + " lists");
    }

    @Test
    void showsNoFieldAndNoConstructor() throws Exception {
        for (Object snapshot : all(everything())) {
            assertEquals(0, snapshot.getClass().getFields().length);
            assertEquals(0, snapshot.getClass().getConstructors().length);
            assertTrue(Modifier.isFinal(snapshot.getClass().getModifiers()));
        }
    }

    @Test
    void isEqualWhenTheMessageIs() throws Exception {
        ProvisioningMessage first = everything();
        assertEquals(first, everything());
        assertEquals(first.hashCode(), everything().hashCode());
        assertNotEquals(first, ProvisioningMessage.parse(Push.push(Everything.body())));
        AccessPoint one = accessPoint(parm("NAPID", "1"));
        assertEquals(one, accessPoint(parm("NAPID", "1")));
        assertNotEquals(one, accessPoint(parm("NAPID", "2")));
        assertNotEquals(one, accessPoint(parm("NAPID", "1"), parm("DNS-ADDR", "a")));
        assertNotEquals(one, accessPoint(parm("NAPID", "1"), parm("BEARER", "a")));
        assertNotEquals(one, accessPoint(parm("NAPID", "1"), parm("NAP-ADDRTYPE", "a")));
        assertNotEquals(one, accessPoint(parm("NAME", "1")));
        assertFalse(one.equals(null));
    }

    @Test
    void showsWhatIsSetButNoSecret() throws Exception {
        String text = everything().toString();
        for (String shown : List.of("p-PROXY-ID", "n-NAP-ADDRESS", "w-NETSSID", "USERPIN")) {
            assertTrue(text.contains(shown), shown);
        }
        for (String secret :
                List.of("p-PROXY-PW", "PXAUTH-PW=p", "a-AUTHSECRET", "a-AAUTHS", "w-PASSWORD")) {
            assertFalse(text.contains(secret), secret);
        }
        assertTrue(text.contains("AUTHSECRET=***"));
    }

    /** A message and every snapshot in it. */
    private static List<Object> all(Object snapshot) throws Exception {
        List<Object> all = new ArrayList<>();
        all.add(snapshot);
        for (Method getter : getters(snapshot)) {
            if (getter.getReturnType() == List.class) {
                for (Object element : (List<?>) getter.invoke(snapshot)) {
                    if (element instanceof Characteristic) {
                        all.addAll(all(element));
                    }
                }
            }
        }
        return all;
    }

    private static List<Method> getters(Object snapshot) {
        List<Method> getters = new ArrayList<>();
        for (Method method : snapshot.getClass().getDeclaredMethods()) {
            if (Modifier.isPublic(method.getModifiers())
                    && !Modifier.isStatic(method.getModifiers())
                    && method.getParameterCount() == 0) {
                getters.add(method);
            }
        }
        return getters;
    }
}
