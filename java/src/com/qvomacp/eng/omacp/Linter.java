package com.qvomacp.eng.omacp;

import com.qvomacp.eng.omacp.Deviation.Kind;
import java.util.ArrayList;
import java.util.Collections;
import java.util.EnumMap;
import java.util.HashMap;
import java.util.HashSet;
import java.util.IdentityHashMap;
import java.util.List;
import java.util.Locale;
import java.util.Map;
import java.util.Set;
import java.util.regex.Pattern;

/** Holds a document against the rules, in one walk. What the rows of tables can tell, they tell. */
final class Linter {
    private static final String INTERNET = "INTERNET";
    private static final String PORT_NUMBER = "PORTNBR";
    private static final int LAST_PORT = 65535;
    private static final String NO_ADDRESS = "0.0.0.0";

    /** Parameters whose value is a number. Those of quality of service may be hexadecimal. */
    private static final Map<String, Pattern> NUMBERS = new HashMap<>();

    static {
        numbers("[0-9]+", "PORTNBR", "LINGER", "MAX-NUM-RETRY", "FIRST-RETRY-TIMEOUT",
                "REREG-THRESHOLD", "CONTEXT-ALLOW", "COUNTRY");
        numbers("[0-9]+|AUTOBAUDING", "LINKSPEED", "DNLINKSPEED");
        numbers("[0-9A-Fa-f]+", "DELIVERY-ERR-SDU", "DELIVERY-ORDER", "TRAFFIC-CLASS",
                "MAX-SDU-SIZE", "MAX-BITRATE-UPLINK", "MAX-BITRATE-DNLINK", "RESIDUAL-BER",
                "SDU-ERROR-RATIO", "TRAFFIC-HANDL-PRIO", "TRANSFER-DELAY",
                "GUARANTEED-BITRATE-UPLINK", "GUARANTEED-BITRATE-DNLINK");
    }

    private static void numbers(String pattern, String... names) {
        for (String name : names) {
            NUMBERS.put(name, Pattern.compile(pattern));
        }
    }

    /** What a characteristic of a type is referred to by. */
    private enum Identifier {
        NAPDEF("NAPID", Rule.NAPID_MISSING, Rule.NAPID_TWICE),
        PXLOGICAL("PROXY-ID", Rule.PROXY_ID_MISSING, Rule.PROXY_ID_TWICE),
        PXPHYSICAL("PHYSICAL-PROXY-ID", null, Rule.PHYSICAL_PROXY_ID_TWICE),
        APPLICATION("APPID", Rule.APPID_MISSING, null);

        final String parameter;

        /** Null where it may be missing, or may stand twice. */
        final Rule missing;

        final Rule twice;

        Identifier(String parameter, Rule missing, Rule twice) {
            this.parameter = parameter;
            this.missing = missing;
            this.twice = twice;
        }
    }

    /** Addresses, each with what tells its type; DNS-ADDR is one of IP, whatever stands beside it. */
    private static final String[][] ADDRESSES = {
        {"NAP-ADDRESS", "NAP-ADDRTYPE"},
        {"PXADDR", "PXADDRTYPE"},
        {"LOCAL-ADDR", "LOCAL-ADDRTYPE"},
        {"ADDR", "ADDRTYPE"},
        {"DNS-ADDR", null},
    };

    /** Names that have no token. */
    private static final String[] NAMES_AS_TEXT = {
        "INIT", "FROM", "NETSSID", "EAPMETHOD", "ANONUSERNAME", "CACERT", "USERCERT", "PHASE1",
        "AUTHALGORITHM", "PRIORITY", "SYNC-ALLOWED", "SYNC-DEFAULT", "XCAP_AUID_DCS",
        "XCAP_AUID_PMS", "XCAP_AUID_CDMS", "XCAP_IMEI_HEADER", "XCAP_TID_HEADER", "ePDG FQDN"
    };

    private static final Map<String, String> NAMES = known(Attribute.NAME, NAMES_AS_TEXT);
    private static final Map<String, String> TYPES =
            known(Attribute.TYPE, "ROAMING", "WI-FI", "Vodafone VoWiFi");

    /** What the format has for an attribute, as it is written, by its upper case. */
    private static Map<String, String> known(Attribute attribute, String... others) {
        Map<String, String> known = new HashMap<>();
        for (String other : others) {
            known.put(upper(other), other);
        }
        for (CodePage page : CodePage.all()) {
            for (int token = 0; token < 0x80; ++token) {
                String begin = page.begin(token);
                if (begin != null && page.attribute(token) == attribute) {
                    known.put(begin, begin);
                }
            }
        }
        return known;
    }

    private static String upper(String name) {
        return name.toUpperCase(Locale.ROOT);
    }

    private final List<Finding> findings = new ArrayList<>();

    /** What is the affair of a vendor, or of nobody known: names and values there are free. */
    private final Set<Item> foreign = identities();

    /** The identifiers that stand in the document or, of machines, in the proxy around. */
    private final Map<Identifier, Set<String>> present = new EnumMap<>(Identifier.class);

    private Item proxy;

    /** Where a port 0 stood last, and whether that is no proxy: many may stand in one. */
    private Item askedFor;

    private boolean isNone;

    private Linter() {
        for (Identifier identifier : Identifier.values()) {
            present.put(identifier, new HashSet<String>());
        }
    }

    private static Set<Item> identities() {
        return Collections.newSetFromMap(new IdentityHashMap<Item, Boolean>());
    }

    /** Everything that is found, in the order of the body; the header is null for a body alone. */
    static List<Finding> lint(PushHeader header, ProvisioningDocument document, Verdict verdict) {
        Linter linter = new Linter();
        if (header != null && header.mac() == null
                && header.securityMethod() != SecurityMethod.USERPINMAC) {
            linter.add(Rule.NO_MAC, null, "the push has no MAC", null);
        }
        // First, for they may be many, and are let go of.
        linter.deviations(document.deviations());
        List<Parameter> references = new ArrayList<>();
        Walk walk = new Walk(document.root());
        for (Item item; (item = walk.next()) != null; ) {
            if (item instanceof Characteristic) {
                linter.characteristic((Characteristic) item);
            } else if (item instanceof Parameter) {
                linter.parameter((Parameter) item, references);
            }
        }
        for (Parameter reference : references) {
            linter.reference(reference);
        }
        linter.verdict(document, verdict);
        Collections.sort(
                linter.findings, (left, right) -> Integer.compare(left.offset(), right.offset()));
        return Collections.unmodifiableList(linter.findings);
    }

    private void add(Rule rule, Item item, String sentence, String remedy) {
        int offset = item == null ? Finding.NO_OFFSET : item.offset();
        findings.add(Finding.of(rule, item, offset, sentence, remedy));
    }

    /** The name that is meant, which one in another case is told about; itself when not known. */
    private String meant(Item item, String what, String name, Map<String, String> known) {
        String meant = known.get(upper(name));
        if (meant == null) {
            add(Rule.UNKNOWN_NAME, item, what + " " + Printable.quoted(name) + " is not known", null);
            return name;
        }
        if (!meant.equals(name)) {
            add(Rule.LETTER_CASE, item, what + " " + Printable.quoted(name) + " should be " + meant, meant);
        }
        return meant;
    }

    private void characteristic(Characteristic characteristic) {
        String type = characteristic.type();
        boolean isForeign = foreign.contains(characteristic.parent());
        if (type != null && !isForeign) {
            type = meant(characteristic, "TYPE", type, TYPES);
        }
        if (isForeign || type != null && !TYPES.containsKey(upper(type)) || "VENDORCONFIG".equals(type)) {
            foreign.add(characteristic);
            return;
        }
        if ("PXLOGICAL".equals(type)) {
            // The machines of a proxy stand in it, and have names of their own.
            proxy = characteristic;
            present.get(Identifier.PXPHYSICAL).clear();
        }
        for (Identifier identifier : present.keySet()) {
            if (identifier.name().equals(type)) {
                identifier(characteristic, identifier);
            }
        }
        addresses(characteristic);
    }

    private void identifier(Characteristic characteristic, Identifier identifier) {
        Set<String> values = present.get(identifier);
        boolean isThere = false;
        for (Item child : characteristic.inside()) {
            String value = valueOf(child, identifier.parameter);
            if (value == null || value.isEmpty()) {
                continue;
            }
            isThere = true;
            boolean isOther =
                    identifier == Identifier.PXPHYSICAL && characteristic.parent() != proxy;
            if (!isOther && !values.add(value) && identifier.twice != null) {
                String shown = identifier.parameter + " " + Printable.quoted(value);
                add(identifier.twice, child, shown + " stands twice", null);
            }
        }
        if (!isThere && identifier.missing != null) {
            String sentence = "the " + identifier + " has no " + identifier.parameter;
            add(identifier.missing, characteristic, sentence, null);
        }
    }

    /** The value of a parameter of a name in any case; null when it has none or is none. */
    private static String valueOf(Item item, String name) {
        boolean is = item instanceof Parameter && name.equalsIgnoreCase(item.called());
        return is ? ((Parameter) item).value() : null;
    }

    private static String firstValue(Item item, String name) {
        String value = null;
        for (Item child : item.inside()) {
            value = value == null ? valueOf(child, name) : value;
        }
        return value;
    }

    private void addresses(Characteristic characteristic) {
        for (String[] row : ADDRESSES) {
            String type = row[1] == null ? null : firstValue(characteristic, row[1]);
            for (Item child : characteristic.inside()) {
                String address = valueOf(child, row[0]);
                if (address != null) {
                    address((Parameter) child, row, address, type);
                }
            }
        }
    }

    private void address(Parameter parameter, String[] row, String address, String type) {
        String shown = row[0] + " " + Printable.quoted(address);
        if (row[1] == null) {
            if (!AddressSyntax.isIpv4(address) && !AddressSyntax.isIpv6(address)) {
                String right = AddressSyntax.withoutZeros(address);
                add(Rule.ADDRESS, parameter, shown + " is no address of IP", right);
            }
        } else if (type != null && !AddressSyntax.isType(type)) {
            if (AddressSyntax.isType(address)) {
                String right = row[0] + " " + Printable.quoted(type) + ", " + row[1] + " " + address;
                add(Rule.ADDRESS_EXCHANGED, parameter, shown + " is a type of addresses", right);
            } else {
                String right = "IPV4, IPV6, E164, ALPHA, APN, SCODE, TETRA-ITSI or MAN";
                String sentence = row[1] + " " + Printable.quoted(type) + " is no type of addresses";
                add(Rule.ADDRESS, parameter, sentence, right);
            }
        } else if (!AddressSyntax.fits(address, type)) {
            boolean isNumbers = AddressSyntax.looksLikeIpv4(address);
            String right = isNumbers && !"APN".equals(type) ? AddressSyntax.withoutZeros(address) : null;
            add(Rule.ADDRESS, parameter, shown + " is no address of " + (type == null ? "IPV4" : type), right);
        }
    }

    private void parameter(Parameter parameter, List<Parameter> references) {
        String name = parameter.name();
        if (name == null || foreign.contains(parameter.parent())) {
            return;
        }
        name = meant(parameter, "NAME", name, NAMES);
        Pattern number = NUMBERS.get(name);
        if (number != null) {
            number(parameter, name, number);
        } else if (name.equals("TO-NAPID") || name.equals("TO-PROXY")) {
            references.add(parameter);
        }
    }

    private void number(Parameter parameter, String name, Pattern pattern) {
        String value = parameter.value();
        String shown = name + " " + (value == null ? "without a value" : Printable.quoted(value));
        if (value == null || !pattern.matcher(value).matches()) {
            add(Rule.NUMBER, parameter, shown + " is no number", null);
        } else if (name.equals(PORT_NUMBER)) {
            String digits = value.replaceFirst("^0+", "");
            if (digits.isEmpty() && isNoProxy(parameter.parent())) {
                add(Rule.NO_PROXY, parameter, shown + " at " + NO_ADDRESS + " is no proxy", null);
            } else if (digits.isEmpty() || digits.length() > 5 || Integer.parseInt(digits) > LAST_PORT) {
                add(Rule.PORT, parameter, shown + " is no port", null);
            }
        }
    }

    /** Whether the machine around a PORT has the address 0.0.0.0, or every machine beside it has. */
    private boolean isNoProxy(Item port) {
        Item outer = port.parent();
        if (outer == null || outer == askedFor) {
            return outer != null && isNone;
        }
        askedFor = outer;
        String address = firstValue(outer, "PXADDR");
        isNone = NO_ADDRESS.equals(address);
        if (address == null) {
            List<Characteristic> machines = outer.children(Characteristic.class, "PXPHYSICAL");
            isNone = !machines.isEmpty();
            for (Characteristic machine : machines) {
                isNone &= NO_ADDRESS.equals(firstValue(machine, "PXADDR"));
            }
        }
        return isNone;
    }

    private void reference(Parameter reference) {
        boolean isProxy = "TO-PROXY".equalsIgnoreCase(reference.name());
        Identifier identifier = isProxy ? Identifier.PXLOGICAL : Identifier.NAPDEF;
        String value = reference.value();
        if (!present.get(identifier).contains(value) && (isProxy || !INTERNET.equals(value))) {
            String shown = value == null ? "without a value" : Printable.quoted(value);
            String sentence = reference.name() + " " + shown + " leads to no " + identifier;
            add(isProxy ? Rule.TO_PROXY : Rule.TO_NAPID, reference, sentence, null);
        }
    }

    private void deviations(List<Deviation> deviations) {
        for (Deviation deviation : deviations) {
            boolean isName = deviation.kind() == Kind.NAME_MISSING;
            if (isName || deviation.kind() == Kind.TYPE_MISSING) {
                Rule rule = isName ? Rule.NAME_MISSING : Rule.TYPE_MISSING;
                add(rule, deviation.item(), deviation.sentence(), null);
            } else {
                findings.add(Finding.of(Rule.FORMAT, deviation.item(), deviation.offset(),
                        deviation.sentence(), null));
            }
        }
    }

    private void verdict(ProvisioningDocument document, Verdict verdict) {
        // What stands in something that is told about is not told again.
        Set<Item> told = identities();
        for (Item item : verdict.readOtherwise()) {
            if (!told.contains(item.parent())) {
                add(Rule.LIBRARY_DROPS, item, "the library skips this, or reads it otherwise", null);
            }
            told.add(item);
        }
        if (!verdict.isAccepted()) {
            Item item = verdict.isHeaderRefused() ? null : document.itemAt(verdict.offset());
            String expected = verdict.expected().toString();
            String right = expected.substring(1, expected.length() - 1);
            findings.add(Finding.of(Rule.LIBRARY_REFUSES, item, verdict.offset(),
                    "the library refuses this: " + verdict.reason(), right.isEmpty() ? null : right));
        }
    }
}
