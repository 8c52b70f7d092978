package com.qvomacp.eng.omacp;

/**
 * What a vendor's own software is told: a VENDORCONFIG of the message.
 *
 * <p>The library keeps the last parameter with a name of the vendor's own. When that one has no
 * value, the value is that of the one before.
 */
public final class VendorConfiguration extends Characteristic {
    private static final String[] NAMES = {"NAME", "name", "value"};

    VendorConfiguration(String[] values) {
        super(NAMES, values);
    }

    /**
     * Names the vendor or what the configuration is for.
     *
     * @return NAME, or {@code null} when the message does not set it
     */
    public String getName() {
        return value("NAME");
    }

    /**
     * Tells the name of the vendor's own parameter.
     *
     * @return the name; {@code null} when the message gives no parameter of the vendor's own
     */
    public String getParameterName() {
        return value("name");
    }

    /**
     * Tells the value of the vendor's own parameter.
     *
     * @return the value; {@code null} when the message gives none
     */
    public String getParameterValue() {
        return value("value");
    }
}
