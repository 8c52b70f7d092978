package com.qvomacp.cli;

import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/** Where something stands: in an input, or on a line of it. */
final class Place {
    private static final int NO_LINE = 0;

    private final String input;
    private final int line;

    private Place(String input, int line) {
        this.input = input;
        this.line = line;
    }

    static Place in(String input) {
        return new Place(input, NO_LINE);
    }

    /** A line, counted from 1. */
    Place line(int number) {
        return new Place(input, number);
    }

    /** For people. */
    @Override
    public String toString() {
        return line == NO_LINE ? input : input + ", line " + line;
    }

    /** Several places for people: each input once, with its lines; null is none. */
    static String names(Place... places) {
        Map<String, List<Integer>> lines = new LinkedHashMap<>();
        for (Place place : places) {
            if (place == null) {
                continue;
            }
            List<Integer> known = lines.computeIfAbsent(place.input, input -> new ArrayList<>());
            if (place.line != NO_LINE && !known.contains(place.line)) {
                known.add(place.line);
            }
        }
        StringBuilder text = new StringBuilder();
        for (Map.Entry<String, List<Integer>> entry : lines.entrySet()) {
            text.append(text.length() == 0 ? "" : " + ").append(entry.getKey());
            List<Integer> numbers = entry.getValue();
            if (!numbers.isEmpty()) {
                text.append(numbers.size() == 1 ? ", line " : ", lines ").append(listed(numbers));
            }
        }
        return text.toString();
    }

    /** Numbers with commas and a word between the last two. */
    static String listed(List<Integer> numbers) {
        StringBuilder text = new StringBuilder();
        for (int i = 0; i < numbers.size(); ++i) {
            String separator = i + 1 < numbers.size() ? ", " : " and ";
            text.append(i == 0 ? "" : separator).append(numbers.get(i));
        }
        return text.toString();
    }
}
