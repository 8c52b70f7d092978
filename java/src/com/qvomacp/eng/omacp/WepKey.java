package com.qvomacp.eng.omacp;

/**
 * A key of WEP: a WEPKEY.
 *
 * <pre>{@code
 * for (WepKey key : message.accessPoints().get(0).wlans().get(0).wepKeys()) {
 *     System.out.println(key.index() + " of length " + key.keyLength());
 * }
 * }</pre>
 */
public final class WepKey extends TypedCharacteristic {
    /** The type of such a characteristic. */
    static final String TYPE = "WEPKEY";

    WepKey(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Tells the length of the key.
     *
     * @return LENGTH; {@code null} when it is not set
     */
    public String keyLength() {
        return value("LENGTH");
    }

    /**
     * Tells the number of the key.
     *
     * @return INDEX; {@code null} when it is not set
     */
    public String index() {
        return value("INDEX");
    }

    /**
     * Tells the key.
     *
     * @return DATA; {@code null} when it is not set
     */
    public String data() {
        return value("DATA");
    }
}
