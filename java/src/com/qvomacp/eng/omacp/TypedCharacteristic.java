package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.Collections;
import java.util.List;

/**
 * A characteristic of a kind that is known, with accessors for what messages set in it. It is a view
 * of the tree and holds nothing of its own: what it has no accessor for is within reach by {@link
 * #value}, {@link #values}, {@link #has} and {@link #characteristic}.
 *
 * <p>An accessor for one value answers that of the first parameter of its name, {@code null} when
 * there is none and when it has no value. Those that begin with {@code has} are of flags, which by
 * the standard have no value. One for several answers all, in the order of the message, in a list
 * that cannot be modified and is empty when there is none. What stands in inner characteristics is
 * theirs.
 *
 * <pre>{@code
 * for (AccessPoint accessPoint : message.accessPoints()) {
 *     System.out.println(accessPoint.name() + ": " + accessPoint.value("TRAFFIC-CLASS"));
 * }
 * }</pre>
 */
public abstract class TypedCharacteristic {
    private final Characteristic characteristic;

    TypedCharacteristic(Characteristic characteristic) {
        this.characteristic = characteristic;
    }

    /** The kinds that there are views of. */
    enum Kind {
        NAPDEF, NAPAUTHINFO, ACCESS, APPLICATION, APPADDR, APPAUTH, BOOTSTRAP, CLIENTIDENTITY,
        PXPHYSICAL, PORT, PXLOGICAL, PXAUTHINFO, RESOURCE, ROAMING, VALIDITY, VENDORCONFIG,
        VODAFONE_VOWIFI("Vodafone VoWiFi"), WI_FI("WI-FI");

        /** What TYPE is. */
        final String type;

        Kind() {
            type = name();
        }

        Kind(String type) {
            this.type = type;
        }

        /**
         * The view of a characteristic. A switch: for the first method reference a new virtual
         * machine takes longer than for everything else of a message; and not of the classes' own
         * type, for which it would load them all.
         */
        private Object of(Characteristic in) {
            switch (this) {
                case NAPDEF: return new AccessPoint(in);
                case NAPAUTHINFO: return new AccessPointAuthentication(in);
                case ACCESS: return new AccessRule(in);
                case APPLICATION: return new Application(in);
                case APPADDR: return new ApplicationAddress(in);
                case APPAUTH: return new ApplicationAuthentication(in);
                case BOOTSTRAP: return new Bootstrap(in);
                case CLIENTIDENTITY: return new ClientIdentity(in);
                case PXPHYSICAL: return new PhysicalProxy(in);
                case PORT: return new Port(in);
                case PXLOGICAL: return new Proxy(in);
                case PXAUTHINFO: return new ProxyAuthentication(in);
                case RESOURCE: return new Resource(in);
                case ROAMING: return new Roaming(in);
                case VALIDITY: return new Validity(in);
                case VENDORCONFIG: return new VendorConfiguration(in);
                case VODAFONE_VOWIFI: return new VoWifi(in);
                case WI_FI: return new Wifi(in);
                default: throw new AssertionError(this);
            }
        }
    }

    /** A view of each characteristic of a kind directly in an item, in a list that stays so. */
    static <V> List<V> views(Item item, Class<V> view, Kind kind) {
        // Most messages lack most kinds.
        Item[] inside = item.inside();
        int first = next(inside, item.beforeCharacteristics(), kind);
        return first == inside.length
                ? Collections.<V>emptyList()
                : Collections.unmodifiableList(viewsFrom(inside, first, view, kind));
    }

    private static <V> List<V> viewsFrom(Item[] inside, int first, Class<V> view, Kind kind) {
        List<V> views = new ArrayList<>(Math.min(inside.length - first, 8));
        for (int i = first; i < inside.length; i = next(inside, i + 1, kind)) {
            views.add(view.cast(kind.of((Characteristic) inside[i])));
        }
        return views;
    }

    /** The place of the next characteristic of a kind; behind the last item when there is none. */
    private static int next(Item[] items, int from, Kind kind) {
        int i = from;
        while (i < items.length
                && !(items[i] instanceof Characteristic
                        && kind.type.equals(((Characteristic) items[i]).type()))) {
            ++i;
        }
        return i;
    }

    /** {@return the characteristic of the tree, with everything in it; never {@code null}} */
    public final Characteristic characteristic() {
        return characteristic;
    }

    /**
     * {@return whether a parameter of a name stands here, with or without a value}
     * @param name what NAME is, in exactly this case
     */
    public final boolean has(String name) {
        return characteristic.parameter(name) != null;
    }

    /**
     * {@return the value of the first parameter of a name; {@code null} for none, and without a value}
     * @param name what NAME is, in exactly this case
     */
    public final String value(String name) {
        return characteristic.value(name);
    }

    /**
     * {@return the values of all parameters of a name that have one; not modifiable}
     * @param name what NAME is, in exactly this case
     */
    public final List<String> values(String name) {
        return characteristic.values(name);
    }

    final <V> List<V> views(Class<V> view, Kind kind) {
        return views(characteristic, view, kind);
    }

    /**
     * {@return whether the other object is of the same class and its characteristic equal}
     * @param other what to compare with
     */
    @Override
    public final boolean equals(Object other) {
        return other != null
                && other.getClass() == getClass()
                && ((TypedCharacteristic) other).characteristic.equals(characteristic);
    }

    @Override
    public final int hashCode() {
        return characteristic.hashCode();
    }

    /** {@return how much is set, in one line without any value, which may go to a log} */
    @Override
    public final String toString() {
        int parameters = characteristic.parameters().size();
        int inner = characteristic.characteristics().size();
        String kind = getClass().getSimpleName();
        return kind + "{parameters=" + parameters + ", characteristics=" + inner + "}";
    }
}
