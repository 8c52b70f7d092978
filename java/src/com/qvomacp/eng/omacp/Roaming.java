package com.qvomacp.eng.omacp;

/**
 * What an application may do while roaming: a ROAMING.
 *
 * <pre>{@code
 * for (Roaming roaming : message.applications().get(0).roamings()) {
 *     System.out.println(roaming.syncAllowed() + ", unless told " + roaming.syncDefault());
 * }
 * }</pre>
 */
public final class Roaming extends TypedCharacteristic {
    Roaming(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return SYNC-ALLOWED: whether synchronisation is allowed} */
    public String syncAllowed() {
        return value("SYNC-ALLOWED");
    }

    /** {@return SYNC-DEFAULT: whether synchronisation is on unless the user says otherwise} */
    public String syncDefault() {
        return value("SYNC-DEFAULT");
    }
}
