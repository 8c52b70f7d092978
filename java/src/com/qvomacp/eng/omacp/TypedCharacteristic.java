package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.Collections;
import java.util.List;

/**
 * A characteristic of a kind that is known, with an accessor for each parameter of its kind. It is a
 * view of the tree and holds nothing of its own: what it has no accessor for is within reach by
 * {@link #characteristic}.
 *
 * <p>An accessor for one value answers that of the first parameter of its name, {@code null} when there
 * is none and when it has no value. One for several answers all, in the order of the message, in a list
 * that cannot be modified and is empty when there is none.
 *
 * <pre>{@code
 * for (AccessPoint accessPoint : message.accessPoints()) {
 *     System.out.println(accessPoint.name() + ": " + accessPoint.characteristic().parameters());
 * }
 * }</pre>
 */
public abstract class TypedCharacteristic {
    private final Characteristic characteristic;

    TypedCharacteristic(Characteristic characteristic) {
        this.characteristic = characteristic;
    }

    /**
     * The view of a characteristic of a type. A switch: for the first method reference a new virtual
     * machine takes longer than for everything else of a message; and not of the classes' own type,
     * for which it would load them all.
     */
    private static Object of(String type, Characteristic characteristic) {
        switch (type) {
            case AccessPoint.TYPE:
                return new AccessPoint(characteristic);
            case AccessPointAuthentication.TYPE:
                return new AccessPointAuthentication(characteristic);
            case AccessRule.TYPE:
                return new AccessRule(characteristic);
            case Application.TYPE:
                return new Application(characteristic);
            case ApplicationAddress.TYPE:
                return new ApplicationAddress(characteristic);
            case ApplicationAuthentication.TYPE:
                return new ApplicationAuthentication(characteristic);
            case Bootstrap.TYPE:
                return new Bootstrap(characteristic);
            case ClientIdentity.TYPE:
                return new ClientIdentity(characteristic);
            case Eap.TYPE:
                return new Eap(characteristic);
            case EapCertificate.TYPE:
                return new EapCertificate(characteristic);
            case PhysicalProxy.TYPE:
                return new PhysicalProxy(characteristic);
            case Port.TYPE:
                return new Port(characteristic);
            case Proxy.TYPE:
                return new Proxy(characteristic);
            case ProxyAuthentication.TYPE:
                return new ProxyAuthentication(characteristic);
            case Resource.TYPE:
                return new Resource(characteristic);
            case Roaming.TYPE:
                return new Roaming(characteristic);
            case SecondarySsid.TYPE:
                return new SecondarySsid(characteristic);
            case Validity.TYPE:
                return new Validity(characteristic);
            case VendorConfiguration.TYPE:
                return new VendorConfiguration(characteristic);
            case VoWifi.TYPE:
                return new VoWifi(characteristic);
            case WepKey.TYPE:
                return new WepKey(characteristic);
            case Wifi.TYPE:
                return new Wifi(characteristic);
            case Wlan.TYPE:
                return new Wlan(characteristic);
            default:
                throw new AssertionError(type);
        }
    }

    /** A view of each characteristic of a type directly in an item, in a list that stays as it is. */
    static <V> List<V> views(Item item, Class<V> kind, String type) {
        // Most messages lack most kinds: the list is made for the first.
        List<V> views = Collections.emptyList();
        for (Item child : item.inside()) {
            if (child instanceof Characteristic && type.equals(((Characteristic) child).type())) {
                if (views.isEmpty()) {
                    views = new ArrayList<>();
                }
                views.add(kind.cast(of(type, (Characteristic) child)));
            }
        }
        return views.isEmpty() ? views : Collections.unmodifiableList(views);
    }

    /**
     * {@return the characteristic, with everything that stands in it: the characteristic of the
     * tree, never {@code null}}
     */
    public final Characteristic characteristic() {
        return characteristic;
    }

    final boolean has(String name) {
        return characteristic.parameter(name) != null;
    }

    final String value(String name) {
        return characteristic.value(name);
    }

    final List<String> values(String name) {
        return characteristic.values(name);
    }

    final <V> List<V> views(Class<V> kind, String type) {
        return views(characteristic, kind, type);
    }

    /**
     * Compares what is set.
     *
     * @param other what to compare with
     * @return true for an object of the same class whose characteristic is equal
     */
    @Override
    public final boolean equals(Object other) {
        return other != null
                && other.getClass() == getClass()
                && ((TypedCharacteristic) other).characteristic.equals(characteristic);
    }

    /** {@return a number that fits {@link #equals}: the same number for equal objects} */
    @Override
    public final int hashCode() {
        return characteristic.hashCode();
    }

    /**
     * Shows how much is set, in one line without any value, which may go to a log.
     *
     * @return one line of text
     */
    @Override
    public final String toString() {
        return getClass().getSimpleName()
                + "{parameters="
                + characteristic.parameters().size()
                + ", characteristics="
                + characteristic.characteristics().size()
                + "}";
    }
}
