package com.qvomacp.eng.omacp;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.document;
import static com.qvomacp.support.Document.named;
import static com.qvomacp.support.Document.parm;
import static com.qvomacp.support.Document.token;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.eng.omacp.ProvisioningException.Reason;
import com.qvomacp.support.Document.Element;
import com.qvomacp.support.Everything;
import com.qvomacp.support.Push;
import java.lang.reflect.Method;
import java.lang.reflect.Modifier;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.HexFormat;
import java.util.List;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.function.Executable;

/** What a message tells, and which bytes are none. */
class ProvisioningMessageTest {
    private static final ReadOptions ACCEPTED_ONLY = ReadOptions.DEFAULT.withAcceptedOnly(true);

    private static ProvisioningMessage message(Element... elements) throws Exception {
        return ProvisioningMessage.parseBody(document(elements));
    }

    private static AccessPoint accessPoint(Element... content) throws Exception {
        return message(characteristic("NAPDEF", content)).accessPoints().get(0);
    }

    private static ProvisioningException refusal(Reason reason, Executable parse) {
        ProvisioningException e = assertThrows(ProvisioningException.class, parse);
        assertEquals(reason, e.reason(), e.getMessage());
        assertFalse(e.getMessage().isEmpty());
        return e;
    }

    // ---- Three doors

    @Test
    void isTheSameThroughEachDoor() throws Exception {
        byte[] push = Files.readAllBytes(Path.of("samples/mms.push"));
        ProvisioningMessage whole = ProvisioningMessage.parsePush(push);
        int at = whole.header().length();
        byte[] headers = Arrays.copyOfRange(push, 3, at);
        byte[] body = Arrays.copyOfRange(push, at, push.length);
        ProvisioningMessage apart = ProvisioningMessage.parse(headers, body);
        ProvisioningMessage alone = ProvisioningMessage.parseBody(body);
        assertEquals(whole.document(), apart.document());
        assertEquals(whole.document(), alone.document());
        assertEquals(whole.header().contentType(), apart.header().contentType());
        assertEquals(whole.header().mac(), apart.header().mac());
        assertNull(alone.header());
        assertEquals(-1, apart.header().transactionIdentifier());
        assertEquals("Example MMS", alone.accessPoints().get(0).name());
        assertEquals(MacResult.RIGHT, whole.verifyMac("1234", null));
        assertEquals(MacResult.RIGHT, apart.verifyMac("1234", null));
        assertEquals(MacResult.WRONG, apart.verifyMac("1235", null));
        assertEquals(MacResult.NO_METHOD, alone.verifyMac("1234", null));
    }

    @Test
    void keepsNothingOfTheBytesThatItWasGiven() throws Exception {
        byte[] push = Everything.push();
        ProvisioningMessage message = ProvisioningMessage.parsePush(push);
        Arrays.fill(push, (byte) 0);
        assertEquals(ProvisioningMessage.parsePush(Everything.push()), message);
        assertEquals(Everything.body().length, message.document().body().length);
        assertTrue(Arrays.equals(Everything.body(), message.document().body()));
    }

    @Test
    void isReadAlthoughTheLibraryRefusesIt() throws Exception {
        Element unknown = characteristic("APPLICATION", parm("CALLTYPE", "x"));
        byte[] body = document(characteristic("NAPDEF", named("X-OWN", "1")), unknown);
        ProvisioningMessage message = ProvisioningMessage.parsePush(Push.push(body));
        assertEquals("1", message.accessPoints().get(0).characteristic().value("X-OWN"));
        assertEquals(1, message.applications().size());
    }

    // ---- What is no message

    @Test
    void throwsForInputOverTheLimit() throws Exception {
        byte[] push = Push.push(document());
        int header = push.length - document().length;
        ReadOptions exact = ReadOptions.DEFAULT.withInputLimit(push.length);
        ProvisioningMessage.parsePush(push, exact);
        ReadOptions less = exact.withInputLimit(push.length - 1);
        ProvisioningException e =
                refusal(Reason.INPUT_TOO_LONG, () -> ProvisioningMessage.parsePush(push, less));
        assertEquals(push.length - 1, e.offset());
        assertNull(e.path());
        assertEquals(List.of(), e.expected());

        byte[] headers = Arrays.copyOfRange(push, 3, header);
        ReadOptions both = exact.withInputLimit(push.length - 3);
        ProvisioningMessage.parse(headers, document(), both);
        ReadOptions one = both.withInputLimit(push.length - 4);
        refusal(
                Reason.INPUT_TOO_LONG,
                () -> ProvisioningMessage.parse(headers, document(), one));

        ReadOptions body = exact.withInputLimit(document().length);
        ProvisioningMessage.parseBody(document(), body);
        ReadOptions short1 = body.withInputLimit(document().length - 1);
        refusal(Reason.INPUT_TOO_LONG, () -> ProvisioningMessage.parseBody(document(), short1));
    }

    @Test
    void throwsForMoreThan64KiBUnlessAskedOtherwise() throws Exception {
        byte[] body = Arrays.copyOf(document(), (64 << 10) + 1);
        refusal(Reason.INPUT_TOO_LONG, () -> ProvisioningMessage.parseBody(body));
        ProvisioningMessage.parseBody(Arrays.copyOf(body, 64 << 10));
        ProvisioningMessage.parseBody(body, ReadOptions.DEFAULT.withInputLimit(body.length));
    }

    @Test
    void throwsForTextsOverTheLimit() throws Exception {
        byte[] body = document(characteristic("NAPDEF", parm("NAPID", "12345678")));
        ProvisioningMessage.parseBody(body, ReadOptions.DEFAULT.withTextLimit(100));
        refusal(
                Reason.TEXT_TOO_LONG,
                () ->
                        ProvisioningMessage.parseBody(
                                body, ReadOptions.DEFAULT.withTextLimit(7)));
    }

    @Test
    void throwsForWhatIsNoPush() {
        byte[] notPush = {1, 7, 1, (byte) 0xB6, 3, 11, 106, 0, 5};
        refusal(Reason.NO_PUSH_HEADER, () -> ProvisioningMessage.parsePush(notPush));
        refusal(Reason.NO_PUSH_HEADER, () -> ProvisioningMessage.parsePush(new byte[0]));
        refusal(
                Reason.NO_PUSH_HEADER,
                () -> ProvisioningMessage.parse(new byte[0], document()));
    }

    @Test
    void throwsForWhatIsNoWbxml() {
        refusal(Reason.NO_WBXML, () -> ProvisioningMessage.parseBody(new byte[0]));
        refusal(Reason.NO_WBXML, () -> ProvisioningMessage.parsePush(Push.push(new byte[0])));
    }

    @Test
    void throwsForAnotherDocumentType() {
        byte[] serviceIndication = {2, 5, 106, 0, 0x45, 1};
        refusal(
                Reason.OTHER_DOCUMENT_TYPE,
                () -> ProvisioningMessage.parseBody(serviceIndication));
    }

    @Test
    void throwsForWhatTheLibraryRefusesWhenAskedTo() throws Exception {
        // A NAPDEF with a parm whose NAME token is none.
        byte[] body = HexFormat.of().parseHex("030b6a0045c65501877001" + "0101");
        byte[] push = Push.push(body);
        Verdict verdict = ProvisioningMessage.parsePush(push).verdict();
        assertFalse(verdict.isAccepted());
        assertEquals(4101, verdict.code());
        assertFalse(verdict.expected().isEmpty());
        ProvisioningException e =
                refusal(Reason.REFUSED, () -> ProvisioningMessage.parsePush(push, ACCEPTED_ONLY));
        assertEquals(verdict.code(), e.code());
        assertEquals(verdict.offset(), e.offset());
        assertEquals(verdict.path(), e.path());
        assertEquals(verdict.expected(), e.expected());
        assertThrows(UnsupportedOperationException.class, () -> e.expected().add(""));
        refusal(Reason.REFUSED, () -> ProvisioningMessage.parseBody(body, ACCEPTED_ONLY));
        byte[] headers = {(byte) 0xB6};
        refusal(Reason.REFUSED, () -> ProvisioningMessage.parse(headers, body, ACCEPTED_ONLY));
        refusal(Reason.REFUSED, () -> ProvisioningDocument.parse(body, ACCEPTED_ONLY));
    }

    @Test
    void isReadWhenTheLibraryTakesItAsAskedTo() throws Exception {
        byte[] push = Everything.push();
        ProvisioningMessage message = ProvisioningMessage.parsePush(push, ACCEPTED_ONLY);
        assertTrue(message.verdict().isAccepted());
        byte[] headers = Arrays.copyOfRange(push, 3, message.header().length());
        ProvisioningMessage apart =
                ProvisioningMessage.parse(headers, Everything.body(), ACCEPTED_ONLY);
        assertTrue(apart.verdict().isAccepted());
        ProvisioningMessage.parseBody(Everything.body(), ACCEPTED_ONLY);
    }

    @Test
    void tellsAHeaderThatTheLibraryRefuses() throws Exception {
        byte[] headers = {(byte) 0xAE};
        ProvisioningMessage message = ProvisioningMessage.parse(headers, document());
        assertTrue(message.verdict().isHeaderRefused());
        assertFalse(message.verdict().isAccepted());
        refusal(
                Reason.REFUSED,
                () -> ProvisioningMessage.parse(headers, document(), ACCEPTED_ONLY));
    }

    @Test
    void hasTheVerdictOfItsPushWhenHeadersAndBodyWereReadApart() throws Exception {
        // The library reads the length of the headers from one byte, which 128 bytes do not fit.
        for (int filler : new int[] {0, 125, 126, 127, 300}) {
            byte[] headers = new byte[2 + filler + 1];
            headers[0] = (byte) 0xB6;
            headers[1] = (byte) 0x84;
            Arrays.fill(headers, 2, 2 + filler, (byte) 'a');
            ProvisioningMessage message = ProvisioningMessage.parse(headers, Everything.body());
            boolean fits = headers.length < 128;
            assertEquals(fits, message.verdict().isAccepted(), "filler " + filler);
            assertEquals(!fits, message.verdict().isHeaderRefused(), "filler " + filler);
        }
    }

    // ---- What a message says

    @Test
    void tellsServicesByTheirNames() throws Exception {
        Element port =
                characteristic(
                        "PORT",
                        parm("PORTNBR", "9201"),
                        parm("SERVICE", "HTTPS"),
                        parm("SERVICE", token(0xCA)),
                        parm("SERVICE", token(0xCB)));
        Proxy proxy = message(characteristic("PXLOGICAL", port)).proxies().get(0);
        assertEquals(List.of("HTTPS", "CL-WSP", "CO-WSP"), proxy.ports().get(0).services());
    }

    @Test
    void tellsEveryBearerAndSpeed() throws Exception {
        AccessPoint accessPoint =
                accessPoint(
                        parm("NAP-ADDRESS", "apn.example.com"),
                        parm("BEARER", "LTE"),
                        parm("BEARER", token(0xAB)),
                        parm("LINKSPEED", token(0xC5)));
        assertEquals(List.of("LTE", "GSM-GPRS"), accessPoint.bearers());
        assertEquals("AUTOBAUDING", accessPoint.linkSpeed());
    }

    @Test
    void tellsEachTypeOfAddressAndItsText() throws Exception {
        AddressType[] types = AddressType.values();
        for (int i = 0; i < 8; ++i) {
            AccessPoint accessPoint = accessPoint(parm("NAP-ADDRTYPE", token(0x85 + i)));
            assertEquals(types[i], accessPoint.addressType());
            assertEquals(types[i].name().replace('_', '-'), accessPoint.addressTypeText());
        }
        AccessPoint other = accessPoint(parm("NAP-ADDRTYPE", "ipv4"));
        assertEquals(AddressType.UNKNOWN, other.addressType());
        assertEquals("ipv4", other.addressTypeText());
        assertNull(accessPoint(parm("NAP-ADDRTYPE")).addressType());
        assertNull(accessPoint().addressType());
        Element physical = characteristic("PXPHYSICAL", parm("PXADDRTYPE", token(0x87)));
        Proxy proxy = message(characteristic("PXLOGICAL", physical)).proxies().get(0);
        assertEquals(AddressType.E164, proxy.physicalProxies().get(0).addressType());
    }

    @Test
    void tellsTheRoamingOfEachApplication() throws Exception {
        Element first = characteristic("ROAMING", named("SYNC-ALLOWED", "1"));
        Element second = characteristic("ROAMING", named("SYNC-ALLOWED", "0"));
        ProvisioningMessage message =
                message(
                        characteristic("APPLICATION", parm("APPID", "w2"), first),
                        characteristic("APPLICATION", parm("APPID", "w4"), first, second));
        assertEquals("1", message.applications().get(0).roamings().get(0).syncAllowed());
        List<Roaming> roamings = message.applications().get(1).roamings();
        assertEquals(2, roamings.size());
        assertEquals("0", roamings.get(1).syncAllowed());
    }

    @Test
    void tellsEveryParameterOfAVendor() throws Exception {
        VendorConfiguration vendor =
                message(
                                characteristic(
                                        "VENDORCONFIG",
                                        parm("NAME", "example.com"),
                                        named("one", "1"),
                                        named("two"),
                                        named("one", "3")))
                        .vendorConfigurations()
                        .get(0);
        List<String> parameters = new ArrayList<>();
        for (Parameter parameter : vendor.parameters()) {
            parameters.add(parameter.name() + "=" + parameter.value());
        }
        assertEquals(List.of("NAME=example.com", "one=1", "two=null", "one=3"), parameters);
        assertEquals("1", vendor.parameter("one").value());
        assertNull(vendor.parameter("two").value());
        assertNull(vendor.parameter("three"));
    }

    @Test
    void tellsTheFirstClientIdentity() throws Exception {
        Element first = characteristic("CLIENTIDENTITY", parm("CLIENT-ID", "1"));
        Element second = characteristic("CLIENTIDENTITY", parm("CLIENT-ID", "2"));
        ProvisioningMessage message = message(first, second);
        assertEquals("1", message.clientId());
        assertEquals("2", message.clientIdentities().get(1).clientId());
        assertNull(message().clientId());
        assertNull(message(characteristic("CLIENTIDENTITY"), first).clientId());
    }

    @Test
    void listsWhatStandsDirectlyInTheDocumentInItsOrder() throws Exception {
        ProvisioningMessage message =
                message(
                        characteristic("NAPDEF", parm("NAPID", "1")),
                        characteristic("BOOTSTRAP", characteristic("NAPDEF", parm("NAPID", "2"))),
                        characteristic("NAPDEF", parm("NAPID", "3")));
        List<String> napIds = new ArrayList<>();
        message.accessPoints().forEach(accessPoint -> napIds.add(accessPoint.napId()));
        assertEquals(List.of("1", "3"), napIds);
        Characteristic bootstrap = message.bootstraps().get(0).characteristic();
        assertEquals("2", bootstrap.characteristics("NAPDEF").get(0).value("NAPID"));
    }

    @Test
    void comparesNamesExactly() throws Exception {
        ProvisioningMessage message = message(characteristic("napdef"), characteristic("NAPDEF"));
        assertEquals(1, message.accessPoints().size());
        assertNull(accessPoint(named("napid", "1")).napId());
    }

    // ---- Values

    @Test
    void isEqualWhenHeaderAndDocumentAre() throws Exception {
        ProvisioningMessage everything = ProvisioningMessage.parsePush(Everything.push());
        ProvisioningMessage again = ProvisioningMessage.parsePush(Everything.push());
        assertEquals(everything, again);
        assertEquals(everything.hashCode(), again.hashCode());
        assertNotEquals(everything, ProvisioningMessage.parseBody(Everything.body()));
        assertNotEquals(everything, ProvisioningMessage.parsePush(Push.push(Everything.body())));
        AccessPoint one = accessPoint(parm("NAPID", "1"));
        assertEquals(one, accessPoint(parm("NAPID", "1")));
        assertEquals(one.hashCode(), accessPoint(parm("NAPID", "1")).hashCode());
        assertNotEquals(one, accessPoint(parm("NAPID", "2")));
        assertNotEquals(one, accessPoint(parm("NAPID", "1"), parm("BEARER", "a")));
        assertNotEquals(one, accessPoint(parm("NAME", "1")));
        assertFalse(one.equals(null));
    }

    @Test
    void showsNoValueAndNoMacInOneLine() throws Exception {
        ProvisioningMessage message = ProvisioningMessage.parsePush(Everything.push());
        for (Object shown : all(message)) {
            String text = shown.toString();
            assertFalse(text.contains("-N"), text);
            assertFalse(text.contains("0123456789ABCDEF"), text);
            assertFalse(text.contains("\n"), text);
        }
        String text = message.toString();
        assertTrue(text.startsWith("ProvisioningMessage{securityMethod=USERPIN, proxies=1"), text);
    }

    @Test
    void letsNoListBeModified() throws Exception {
        int lists = 0;
        for (Object view : all(ProvisioningMessage.parsePush(Everything.push()))) {
            for (Method accessor : accessors(view)) {
                if (accessor.getReturnType() == List.class) {
                    List<?> list = (List<?>) accessor.invoke(view);
                    assertThrows(
                            UnsupportedOperationException.class,
                            () -> list.add(null),
                            accessor.toString());
                    ++lists;
                }
            }
        }
        assertTrue(lists > 30, lists + " lists");
    }

    @Test
    void showsNoFieldAndNoConstructor() throws Exception {
        for (Object view : all(ProvisioningMessage.parsePush(Everything.push()))) {
            assertEquals(0, view.getClass().getFields().length);
            assertEquals(0, view.getClass().getConstructors().length);
            assertTrue(Modifier.isFinal(view.getClass().getModifiers()));
        }
    }

    /** A message and every view in it. */
    private static List<Object> all(Object view) throws Exception {
        List<Object> all = new ArrayList<>();
        all.add(view);
        for (Method accessor : accessors(view)) {
            if (accessor.getReturnType() == List.class) {
                for (Object element : (List<?>) accessor.invoke(view)) {
                    if (element instanceof TypedCharacteristic) {
                        all.addAll(all(element));
                    }
                }
            }
        }
        return all;
    }

    private static List<Method> accessors(Object view) {
        List<Method> accessors = new ArrayList<>();
        for (Method method : view.getClass().getDeclaredMethods()) {
            if (Modifier.isPublic(method.getModifiers())
                    && !Modifier.isStatic(method.getModifiers())
                    && method.getParameterCount() == 0) {
                accessors.add(method);
            }
        }
        return accessors;
    }
}
