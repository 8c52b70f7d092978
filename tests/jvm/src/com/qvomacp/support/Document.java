package com.qvomacp.support;

import static java.util.Map.entry;

import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.util.Map;

/**
 * Writes provisioning documents as WBXML, one call per element:
 *
 * <pre>{@code
 * byte[] body = document(
 *         characteristic("NAPDEF", parm("NAPID", "NAP1"), parm("BEARER", token(0xAB))));
 * }</pre>
 */
public final class Document {
    /** Something that stands in the document: a characteristic or a parm. */
    public interface Element {
        void write(Document document);
    }

    /** An attribute value token. */
    public record Token(int value) {}

    private static final int SWITCH_PAGE = 0x00;
    private static final int END = 0x01;
    private static final int STR_I = 0x03;
    private static final int HAS_ATTRIBUTES = 0x80;
    private static final int HAS_CONTENT = 0x40;
    private static final int TAG_DOCUMENT = 0x05;
    private static final int TAG_CHARACTERISTIC = 0x06;
    private static final int TAG_PARM = 0x07;
    private static final int TYPE_AS_TEXT = 0x50;
    private static final int NAME_AS_TEXT = 0x05;
    private static final int VALUE = 0x06;
    private static final int VERSION_1_0 = 0x46;

    /** Version 1.3, public identifier PROV 1.0, UTF-8, no string table. */
    private static final byte[] HEADER = {0x03, 0x0B, 0x6A, 0x00};

    /** The TYPE tokens that mean the same on both code pages. */
    private static final Map<String, Integer> TYPES =
            Map.ofEntries(
                    entry("PXLOGICAL", 0x51),
                    entry("PXPHYSICAL", 0x52),
                    entry("PORT", 0x53),
                    entry("VALIDITY", 0x54),
                    entry("CLIENTIDENTITY", 0x58),
                    entry("NAPAUTHINFO", 0x5A),
                    entry("ACCESS", 0x5B));

    private static final Map<String, Integer> TYPES_OF_PAGE_0 =
            Map.of("NAPDEF", 0x55, "BOOTSTRAP", 0x56, "VENDORCONFIG", 0x57, "PXAUTHINFO", 0x59);

    private static final Map<String, Integer> TYPES_OF_PAGE_1 =
            Map.of("APPLICATION", 0x55, "APPADDR", 0x56, "APPAUTH", 0x57, "RESOURCE", 0x59);

    private static final Map<String, Integer> NAMES =
            Map.ofEntries(
                    entry("NAME", 0x07),
                    entry("NAP-ADDRESS", 0x08),
                    entry("NAP-ADDRTYPE", 0x09),
                    entry("CALLTYPE", 0x0A),
                    entry("VALIDUNTIL", 0x0B),
                    entry("AUTHTYPE", 0x0C),
                    entry("AUTHNAME", 0x0D),
                    entry("AUTHSECRET", 0x0E),
                    entry("LINGER", 0x0F),
                    entry("BEARER", 0x10),
                    entry("NAPID", 0x11),
                    entry("COUNTRY", 0x12),
                    entry("NETWORK", 0x13),
                    entry("INTERNET", 0x14),
                    entry("PROXY-ID", 0x15),
                    entry("PROXY-PROVIDER-ID", 0x16),
                    entry("DOMAIN", 0x17),
                    entry("PROVURL", 0x18),
                    entry("PXAUTH-TYPE", 0x19),
                    entry("PXAUTH-ID", 0x1A),
                    entry("PXAUTH-PW", 0x1B),
                    entry("STARTPAGE", 0x1C),
                    entry("PUSHENABLED", 0x1F),
                    entry("PXADDR", 0x20),
                    entry("PXADDRTYPE", 0x21),
                    entry("TO-NAPID", 0x22),
                    entry("PORTNBR", 0x23),
                    entry("SERVICE", 0x24),
                    entry("LINKSPEED", 0x25),
                    entry("DNLINKSPEED", 0x26),
                    entry("LOCAL-ADDR", 0x27),
                    entry("LOCAL-ADDRTYPE", 0x28),
                    entry("CONTEXT-ALLOW", 0x29),
                    entry("TRUST", 0x2A),
                    entry("MASTER", 0x2B),
                    entry("SID", 0x2C),
                    entry("SOC", 0x2D),
                    entry("WSP-VERSION", 0x2E),
                    entry("PHYSICAL-PROXY-ID", 0x2F),
                    entry("CLIENT-ID", 0x30),
                    entry("DELIVERY-ERR-SDU", 0x31),
                    entry("DELIVERY-ORDER", 0x32),
                    entry("TRAFFIC-CLASS", 0x33),
                    entry("MAX-SDU-SIZE", 0x34),
                    entry("MAX-BITRATE-UPLINK", 0x35),
                    entry("MAX-BITRATE-DNLINK", 0x36),
                    entry("PXADDR-FQDN", 0x3D),
                    entry("PROXY-PW", 0x3E),
                    entry("PPGAUTH-TYPE", 0x3F),
                    entry("PULLENABLED", 0x47),
                    entry("DNS-ADDR", 0x48),
                    entry("MAX-NUM-RETRY", 0x49),
                    entry("FIRST-RETRY-TIMEOUT", 0x4A),
                    entry("REREG-THRESHOLD", 0x4B),
                    entry("T-BIT", 0x4C),
                    entry("AUTH-ENTITY", 0x4E),
                    entry("AACCEPT", 0x2E),
                    entry("AAUTHDATA", 0x2F),
                    entry("AAUTHLEVEL", 0x30),
                    entry("AAUTHNAME", 0x31),
                    entry("AAUTHSECRET", 0x32),
                    entry("AAUTHTYPE", 0x33),
                    entry("ADDR", 0x34),
                    entry("ADDRTYPE", 0x35),
                    entry("APPID", 0x36),
                    entry("APROTOCOL", 0x37),
                    entry("PROVIDER-ID", 0x38),
                    entry("TO-PROXY", 0x39),
                    entry("URI", 0x3A),
                    entry("RULE", 0x3B));

    private final ByteArrayOutputStream out = new ByteArrayOutputStream();
    private int page;

    private Document() {}

    /** The body of a message: header and document element around the given elements. */
    public static byte[] document(Element... elements) {
        Document document = new Document();
        document.out.writeBytes(HEADER);
        document.bytes(TAG_DOCUMENT | HAS_ATTRIBUTES | HAS_CONTENT, VERSION_1_0, END);
        document.content(elements);
        document.bytes(END);
        return document.out.toByteArray();
    }

    /** A characteristic; a type without a token of its own is written as text. */
    public static Element characteristic(String type, Element... content) {
        return document -> {
            document.bytes(TAG_CHARACTERISTIC | HAS_ATTRIBUTES | HAS_CONTENT);
            document.type(type);
            document.bytes(END);
            document.content(content);
            document.bytes(END);
        };
    }

    /**
     * A parm. Its values follow each other: Strings and byte[] as inline texts, Tokens as they are.
     * None at all is no VALUE.
     */
    public static Element parm(String name, Object... values) {
        int token = NAMES.get(name);
        return document -> {
            document.bytes(TAG_PARM | HAS_ATTRIBUTES, token);
            document.values(values);
            document.bytes(END);
        };
    }

    /** A parm whose name is written as text. */
    public static Element named(String name, Object... values) {
        return document -> {
            document.bytes(TAG_PARM | HAS_ATTRIBUTES, NAME_AS_TEXT);
            document.text(name);
            document.values(values);
            document.bytes(END);
        };
    }

    /** Several elements in a row, each parm set to {@code prefix} and its own name. */
    public static Element parms(String prefix, String... names) {
        return document -> {
            for (String name : names) {
                Element element =
                        NAMES.containsKey(name)
                                ? parm(name, prefix + name)
                                : named(name, prefix + name);
                element.write(document);
            }
        };
    }

    public static Token token(int value) {
        return new Token(value);
    }

    private void type(String type) {
        Integer token = TYPES.get(type);
        if (token == null && TYPES_OF_PAGE_0.containsKey(type)) {
            switchPage(0);
            token = TYPES_OF_PAGE_0.get(type);
        }
        if (token == null && TYPES_OF_PAGE_1.containsKey(type)) {
            switchPage(1);
            token = TYPES_OF_PAGE_1.get(type);
        }
        if (token == null) {
            bytes(TYPE_AS_TEXT);
            text(type);
        } else {
            bytes(token);
        }
    }

    private void switchPage(int wanted) {
        if (page != wanted) {
            bytes(SWITCH_PAGE, wanted);
            page = wanted;
        }
    }

    private void content(Element... elements) {
        for (Element element : elements) {
            element.write(this);
        }
    }

    private void values(Object... values) {
        if (values.length > 0) {
            bytes(VALUE);
        }
        for (Object value : values) {
            if (value instanceof Token token) {
                bytes(token.value());
            } else if (value instanceof byte[] bytes) {
                text(bytes);
            } else {
                text((String) value);
            }
        }
    }

    private void text(String text) {
        text(text.getBytes(StandardCharsets.UTF_8));
    }

    private void text(byte[] text) {
        bytes(STR_I);
        out.writeBytes(text);
        bytes(0);
    }

    private void bytes(int... bytes) {
        for (int b : bytes) {
            out.write(b);
        }
    }
}
