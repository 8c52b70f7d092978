package com.qvomacp.cli;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.HashMap;
import java.util.List;
import java.util.Map;

/** What a command line says behind its command: the values of options, and files. */
final class Arguments {
    final Map<Option<?>, Object> values = new HashMap<>();
    final List<String> files = new ArrayList<>();

    boolean has(Option<?> option) {
        return values.containsKey(option);
    }

    /**
     * Reads a plain command line, each option of which is known, whole and there once. That takes a
     * fraction of the time that picocli needs.
     *
     * @return null for any other, which picocli reads or refuses
     */
    static Arguments plain(List<Option<?>> options, String[] arguments, int from) {
        Arguments plain = new Arguments();
        for (int i = from; i < arguments.length; ++i) {
            String argument = arguments[i];
            if (!isOption(argument)) {
                plain.files.add(argument);
                continue;
            }
            int equals = argument.indexOf('=');
            String name = equals < 0 ? argument : argument.substring(0, equals);
            Option<?> option = named(options, name);
            Object value = null;
            if (option != null && option.label == null) {
                value = equals < 0 ? true : null;
            } else if (option != null && (equals >= 0 || i + 1 < arguments.length)) {
                String text = equals < 0 ? arguments[++i] : argument.substring(equals + 1);
                value = isOption(text) ? null : option.value(text);
            }
            if (value == null || plain.values.put(option, value) != null) {
                return null;
            }
        }
        return plain;
    }

    private static boolean isOption(String argument) {
        return argument.length() > 1 && argument.charAt(0) == '-';
    }

    private static Option<?> named(List<Option<?>> options, String name) {
        for (Option<?> option : options) {
            if (Arrays.asList(option.names).contains(name)) {
                return option;
            }
        }
        return null;
    }
}
