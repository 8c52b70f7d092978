package com.qvomacp.eng.omacp;

import java.util.EnumMap;
import java.util.Map;
import java.util.regex.Pattern;

/** Whether a text can be an address of a type. */
final class AddressSyntax {
    /** What ADDRTYPE has beyond the others: whatever the application takes. */
    private static final String APPLICATION = "APPSRV";

    private static final Pattern QUAD = Pattern.compile("[0-9]{1,9}(\\.[0-9]{1,9}){3}");
    private static final String IPV4_PART = "(25[0-5]|2[0-4][0-9]|1[0-9][0-9]|[1-9]?[0-9])";
    private static final Pattern IPV6_PART = Pattern.compile("[0-9A-Fa-f]{1,4}");

    /** What an address of a type looks like; IPV6 takes more than that. */
    private static final Map<AddressType, Pattern> FORMS = new EnumMap<>(AddressType.class);

    static {
        form(AddressType.IPV4, IPV4_PART + "(\\." + IPV4_PART + "){3}");
        form(AddressType.E164, "\\+?[0-9]{1,20}");
        form(AddressType.ALPHA, "(?s).+");
        form(AddressType.APN, "(?!" + QUAD + "$)[A-Za-z0-9._-]+");
        form(AddressType.SCODE, "[0-9*#]+");
        form(AddressType.TETRA_ITSI, "[0-9A-Fa-f]+");
        form(AddressType.MAN, "[0-9A-Fa-f]+");
    }

    private static void form(AddressType type, String pattern) {
        FORMS.put(type, Pattern.compile(pattern));
    }

    private AddressSyntax() {}

    /** Whether a text names a type of addresses. */
    static boolean isType(String text) {
        return AddressType.of(text) != AddressType.UNKNOWN || APPLICATION.equals(text);
    }

    /**
     * Whether an address is one of the type that is named, or may be one where none is: then only
     * four numbers with dots between have to be what they look like.
     */
    static boolean fits(String address, String typeName) {
        AddressType type = AddressType.of(typeName);
        if (type == null || type == AddressType.UNKNOWN) {
            return !looksLikeIpv4(address) || isIpv4(address);
        }
        return type == AddressType.IPV6
                ? isIpv6(address)
                : FORMS.get(type).matcher(address).matches();
    }

    static boolean looksLikeIpv4(String address) {
        return QUAD.matcher(address).matches();
    }

    static boolean isIpv4(String address) {
        return FORMS.get(AddressType.IPV4).matcher(address).matches();
    }

    /** The same four numbers without zeros in front of them; null where that is none either. */
    static String withoutZeros(String address) {
        String stripped = address.replaceAll("(^|\\.)0+(?=[0-9])", "$1");
        return isIpv4(stripped) ? stripped : null;
    }

    static boolean isIpv6(String address) {
        int gap = address.indexOf("::");
        if (gap < 0) {
            return groups(address, true) == 8;
        }
        int before = groups(address.substring(0, gap), false);
        int behind = groups(address.substring(gap + 2), true);
        return before >= 0 && behind >= 0 && before + behind < 8;
    }

    /** How many groups of 16 bits stand between colons, IPv4 at the end being two; -1 for none. */
    private static int groups(String text, boolean isEnd) {
        if (text.isEmpty()) {
            return 0;
        }
        String[] parts = text.split(":", -1);
        int groups = parts.length;
        for (int i = 0; i < parts.length; ++i) {
            if (isEnd && i == parts.length - 1 && isIpv4(parts[i])) {
                ++groups;
            } else if (!IPV6_PART.matcher(parts[i]).matches()) {
                return -1;
            }
        }
        return groups;
    }
}
