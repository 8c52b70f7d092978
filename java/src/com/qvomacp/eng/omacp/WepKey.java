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
    WepKey(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return LENGTH: the length of the key} */
    public String keyLength() {
        return value("LENGTH");
    }

    /** {@return INDEX: the number of the key} */
    public String index() {
        return value("INDEX");
    }

    /** {@return DATA: the key} */
    public String data() {
        return value("DATA");
    }
}
