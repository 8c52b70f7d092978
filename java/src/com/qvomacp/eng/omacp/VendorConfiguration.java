package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * What a vendor's own software is told: a VENDORCONFIG. But for NAME its parameters are the
 * vendor's own.
 *
 * <pre>{@code
 * for (VendorConfiguration configuration : message.vendorConfigurations()) {
 *     for (Parameter parameter : configuration.parameters()) {
 *         System.out.println(parameter.name() + ": " + parameter.value());
 *     }
 * }
 * }</pre>
 */
public final class VendorConfiguration extends TypedCharacteristic {
    VendorConfiguration(Characteristic characteristic) {
        super(characteristic);
    }

    /** {@return NAME: the name of the vendor or what the configuration is for} */
    public String name() {
        return value("NAME");
    }

    /** {@return every parameter, NAME included, in the order of the message; not modifiable} */
    public List<Parameter> parameters() {
        return characteristic().parameters();
    }

    /**
     * {@return the first parameter of a name; {@code null} when there is none}
     * @param name what NAME is, in exactly this case
     */
    public Parameter parameter(String name) {
        return characteristic().parameter(name);
    }
}
