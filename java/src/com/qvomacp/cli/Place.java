package com.qvomacp.cli;

import java.util.ArrayList;
import java.util.Collection;
import java.util.LinkedHashMap;
import java.util.LinkedHashSet;
import java.util.List;
import java.util.Map;
import java.util.Set;

/** Where something stands: in an input, or on a line of it. */
final class Place {
    private static final int NO_LINE = 0;

    private final String input;
    private final int line;

    Place(String input) {
        this(input, NO_LINE);
    }

    /** A line, counted from 1. */
    Place(String input, int line) {
        this.input = input;
        this.line = line;
    }

    /** For people. */
    @Override
    public String toString() {
        return line == NO_LINE ? input : input + ", line " + line;
    }

    /** Several places for people: each input once, with its lines. */
    static String names(Collection<Place> places) {
        Map<String, Set<Integer>> lines = new LinkedHashMap<>();
        for (Place place : places) {
            Set<Integer> known = lines.computeIfAbsent(place.input, input -> new LinkedHashSet<>());
            if (place.line != NO_LINE) {
                known.add(place.line);
            }
        }
        List<String> names = new ArrayList<>();
        for (Map.Entry<String, Set<Integer>> entry : lines.entrySet()) {
            Set<Integer> known = entry.getValue();
            String which = known.size() == 1 ? ", line " : ", lines ";
            names.add(entry.getKey() + (known.isEmpty() ? "" : which + listed(known)));
        }
        return String.join(" + ", names);
    }

    /** Numbers with commas and a word between the last two. */
    static String listed(Collection<Integer> numbers) {
        String text = numbers.toString();
        String all = text.substring(1, text.length() - 1);
        int last = all.lastIndexOf(", ");
        return last < 0 ? all : all.substring(0, last) + " and " + all.substring(last + 2);
    }
}
