package com.qvomacp.eng.omacp;

/**
 * What an application may do while roaming: a ROAMING.
 */
public final class Roaming extends Characteristic {
    private static final String[] NAMES = {"SYNC-ALLOWED", "SYNC-DEFAULT"};

    Roaming(String[] values) {
        super(NAMES, values);
    }

    /**
     * Tells whether synchronisation is allowed.
     *
     * @return SYNC-ALLOWED, or {@code null} when the message does not set it
     */
    public String getSyncAllowed() {
        return value("SYNC-ALLOWED");
    }

    /**
     * Tells whether synchronisation is on unless the user says otherwise.
     *
     * @return SYNC-DEFAULT, or {@code null} when the message does not set it
     */
    public String getSyncDefault() {
        return value("SYNC-DEFAULT");
    }
}
