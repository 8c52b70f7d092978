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

    /** {@return the parameters by their names, NAME included: every parameter} */
    public List<Parameter> parameters() {
        return characteristic().parameters();
    }

    /**
     * Finds a parameter.
     *
     * @param name what NAME is, in exactly this case
     * @return the first parameter of that name; {@code null} when there is none
     */
    public Parameter parameter(String name) {
        return characteristic().parameter(name);
    }
}
