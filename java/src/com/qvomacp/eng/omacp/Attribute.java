package com.qvomacp.eng.omacp;

/** The attributes of provisioning documents. */
enum Attribute {
    NAME,
    VALUE,
    TYPE,
    VERSION,

    /** One that the format does not have. */
    OTHER;

    private static final Attribute[] ALL = values();

    /** The attribute of a name that the document writes as text. */
    static Attribute of(String name) {
        for (Attribute attribute : ALL) {
            if (attribute != OTHER && attribute.name().equalsIgnoreCase(name)) {
                return attribute;
            }
        }
        return OTHER;
    }

    /** The name, which for one that the format does not have is {@code other}. */
    String name(String other) {
        return this == OTHER ? other : name();
    }
}
