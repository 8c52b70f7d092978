package com.qvomacp.eng.omacp;

/**
 * The identity that the client gets: a CLIENTIDENTITY.
 *
 * <pre>{@code
 * for (ClientIdentity identity : message.clientIdentities()) {
 *     System.out.println(identity.clientId());
 * }
 * }</pre>
 */
public final class ClientIdentity extends TypedCharacteristic {
    ClientIdentity(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return CLIENT-ID: the identity} */
    public String clientId() {
        return value("CLIENT-ID");
    }
}
