package com.qvomacp.eng.omacp;

/** The elements of provisioning documents. */
enum Element {
    DOCUMENT("wap-provisioningdoc", null, Attribute.VERSION),
    CHARACTERISTIC("characteristic", Attribute.TYPE, null),
    PARM("parm", Attribute.NAME, Attribute.VALUE),

    /** A processing instruction, which is written like an element with attributes. */
    INSTRUCTION(null, null, null),

    /** One that the format does not have. */
    OTHER(null, null, null);

    private static final Element[] ALL = values();

    /** The name that XML has for it; {@code null} where there is none. */
    final String text;

    /** The attribute that says what the element is; {@code null} without one. */
    final Attribute name;

    /** The attribute that says more; {@code null} without one. */
    final Attribute value;

    Element(String text, Attribute name, Attribute value) {
        this.text = text;
        this.name = name;
        this.value = value;
    }

    /** The element of a name that the document writes as text. */
    static Element of(String text) {
        for (Element element : ALL) {
            if (text.equals(element.text)) {
                return element;
            }
        }
        return OTHER;
    }
}
