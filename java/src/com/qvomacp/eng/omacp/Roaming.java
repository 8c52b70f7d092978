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
    /** The type of such a characteristic. */
    static final String TYPE = "ROAMING";

    Roaming(Characteristic characteristic) {
        super(characteristic);
    }

    /**
     * Tells whether synchronisation is allowed.
     *
     * @return SYNC-ALLOWED; {@code null} when it is not set
     */
    public String syncAllowed() {
        return value("SYNC-ALLOWED");
    }

    /**
     * Tells whether synchronisation is on unless the user says otherwise.
     *
     * @return SYNC-DEFAULT; {@code null} when it is not set
     */
    public String syncDefault() {
        return value("SYNC-DEFAULT");
    }
}
