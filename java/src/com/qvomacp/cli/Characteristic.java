package com.qvomacp.cli;

import java.util.ArrayList;
import java.util.List;
import java.util.function.IntFunction;

/** A characteristic of the message: its type, what it sets, and the characteristics inside it. */
final class Characteristic {
    /** One parameter that is set. */
    static final class Parm {
        final String name;

        /** Null when the parameter is set and the library answers no value for it. */
        final String value;

        Parm(String name, String value) {
            this.name = name;
            this.value = value;
        }
    }

    final String type;
    final List<Parm> parms = new ArrayList<>();
    final List<Characteristic> characteristics = new ArrayList<>();

    Characteristic(String type) {
        this.type = type;
    }

    Characteristic add(String name, String value) {
        parms.add(new Parm(name, value));
        return this;
    }

    /** Adds what an answered array sets: a name per element, null for an element without one. */
    Characteristic addAll(String[] names, String[] values) {
        for (int i = 0; i < names.length; ++i) {
            if (names[i] != null && values[i] != null) {
                add(names[i], values[i]);
            }
        }
        return this;
    }

    /** Adds a parameter that may occur several times; indexes count from 1. */
    Characteristic addList(String name, int count, IntFunction<String> valueAt) {
        for (int i = 1; i <= count; ++i) {
            add(name, valueAt.apply(i));
        }
        return this;
    }

    /** Adds the characteristics of one kind that stand inside this one; indexes count from 1. */
    Characteristic nest(int count, IntFunction<Characteristic> characteristicAt) {
        for (int i = 1; i <= count; ++i) {
            characteristics.add(characteristicAt.apply(i));
        }
        return this;
    }
}
