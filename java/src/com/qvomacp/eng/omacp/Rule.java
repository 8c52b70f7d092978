package com.qvomacp.eng.omacp;

/**
 * What is looked for in a message, beyond whether it can be read: {@link ProvisioningMessage#lint}.
 *
 * <pre>{@code
 * for (Rule rule : Rule.values()) {
 *     System.out.println(rule.ruleName() + " (" + rule.severity() + "): " + rule.reference());
 * }
 * }</pre>
 */
public enum Rule {
    /** A number that is none. */
    NUMBER(Severity.ERROR, "decimal digits alone", "the parameter's definition"),
    /** A port outside 1 to 65535. */
    PORT(Severity.ERROR, "a number from 1 to 65535", "PORTNBR of PORT and of ACCESS"),
    /** A characteristic without TYPE. */
    TYPE_MISSING(Severity.ERROR, "TYPE, such as NAPDEF",
            "the document type: TYPE of characteristic is required"),
    /** A parm without NAME. */
    NAME_MISSING(Severity.ERROR, "NAME, such as NAPID",
            "the document type: NAME of parm is required"),
    /** A NAPDEF without NAPID. */
    NAPID_MISSING(Severity.ERROR, "a NAPID that no other NAPDEF has", "NAPID of NAPDEF"),
    /** A PXLOGICAL without PROXY-ID. */
    PROXY_ID_MISSING(Severity.ERROR, "a PROXY-ID that no other PXLOGICAL has",
            "PROXY-ID of PXLOGICAL"),
    /** An APPLICATION without APPID. */
    APPID_MISSING(Severity.ERROR, "an APPID that is registered, such as w2",
            "APPID of APPLICATION"),
    /** A NAPID that stands twice. */
    NAPID_TWICE(Severity.ERROR, "a NAPID that no other NAPDEF has", "NAPID of NAPDEF"),
    /** A PROXY-ID that stands twice. */
    PROXY_ID_TWICE(Severity.ERROR, "a PROXY-ID that no other PXLOGICAL has",
            "PROXY-ID of PXLOGICAL"),
    /** A PHYSICAL-PROXY-ID that stands twice in a PXLOGICAL. */
    PHYSICAL_PROXY_ID_TWICE(Severity.ERROR,
            "a PHYSICAL-PROXY-ID that no other PXPHYSICAL of the PXLOGICAL has",
            "PHYSICAL-PROXY-ID of PXPHYSICAL"),

    /** A TO-NAPID that leads to no NAPDEF of the document. */
    TO_NAPID(Severity.WARNING, "the NAPID of a NAPDEF in this document, or INTERNET",
            "TO-NAPID of PXPHYSICAL, APPLICATION and ACCESS"),
    /** A TO-PROXY that leads to no PXLOGICAL of the document. */
    TO_PROXY(Severity.WARNING, "the PROXY-ID of a PXLOGICAL in this document",
            "TO-PROXY of APPLICATION and ACCESS"),
    /** An address unlike its type, or a type that is none. */
    ADDRESS(Severity.WARNING, "an address of the type that is stated",
            "the addresses and their types"),
    /** An address where its type should stand, and the type where the address should. */
    ADDRESS_EXCHANGED(Severity.WARNING, "the other way round", "the addresses and their types"),
    /** Port 0 at the address 0.0.0.0, by which some senders say that there is no proxy. */
    NO_PROXY(Severity.WARNING, "no PXLOGICAL, and TO-NAPID in place of TO-PROXY",
            "PORTNBR of PORT"),
    /** A type or name that is not in upper and lower case as OMA writes it. */
    LETTER_CASE(Severity.WARNING, "the name as OMA writes it",
            "the names of characteristics and parameters"),
    /** Bytes that depart from the format. */
    FORMAT(Severity.WARNING, "what the format has in its place",
            "WAP-192-WBXML, and OMA-WAP-TS-ProvCont, ", "the document type and the tokens"),
    /** What the native library skips or reads as something else. */
    LIBRARY_DROPS(Severity.WARNING, "a form that the library reads, such as encode writes",
            "the library's own rules, ", "which no OMA document has"),
    /** What the native library refuses. */
    LIBRARY_REFUSES(Severity.WARNING, "what the library takes there",
            "the library's own rules, ", "which no OMA document has"),

    /** A push without MAC, but for USERPINMAC, whose MAC the user types. */
    NO_MAC(Severity.NOTE, "SEC and MAC behind the content type",
            "OMA-WAP-TS-ProvBoot, ", "the security of the bootstrap message"),
    /** A type or name that the OMA documents do not have. */
    UNKNOWN_NAME(Severity.NOTE, "a name of the OMA documents, or VENDORCONFIG around it",
            "the characteristics and their parameters");

    /** How much a finding weighs. */
    public enum Severity {
        /** The message cannot work as it is. */
        ERROR,
        /** The message may not work, or not everywhere. */
        WARNING,
        /** Something worth knowing. */
        NOTE
    }

    private final Severity severity;
    private final String remedy;
    private final String reference;

    Rule(Severity severity, String remedy, String place) {
        this(severity, remedy, "OMA-WAP-TS-ProvCont, ", place);
    }

    Rule(Severity severity, String remedy, String source, String place) {
        this.severity = severity;
        this.remedy = remedy;
        this.reference = source + place;
    }

    /** {@return the name for people and programs, such as {@code napid-missing}} */
    public String ruleName() {
        return Printable.nameOf(this);
    }

    /** {@return how much its findings weigh: the severity} */
    public Severity severity() {
        return severity;
    }

    /** {@return where the OMA documents say so: document and characteristic or parameter} */
    public String reference() {
        return reference;
    }

    /** What would be right, where a finding does not tell it better. */
    String remedy() {
        return remedy;
    }

    /**
     * {@return the rule of a name; {@code null} when there is none}
     * @param name as {@link #ruleName} tells it
     */
    public static Rule named(String name) {
        for (Rule rule : values()) {
            if (rule.ruleName().equals(name)) {
                return rule;
            }
        }
        return null;
    }
}
