package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/** Puts pushes together from the parts that short messages carry, in whichever order they come. */
final class SmsParts {
    /** The parts of one push. */
    private static final class Push {
        final ShortMessage any;
        final byte[][] parts;
        final Place[] places;
        final List<String> notes = new ArrayList<>();
        boolean isFinished;

        Push(ShortMessage first) {
            any = first;
            parts = new byte[first.total()][];
            places = new Place[first.total()];
        }

        List<Integer> missing() {
            List<Integer> missing = new ArrayList<>();
            for (int i = 0; i < parts.length; ++i) {
                if (parts[i] == null) {
                    missing.add(i + 1);
                }
            }
            return missing;
        }

        /** Where the parts come from, in their order. */
        String name() {
            List<Place> known = new ArrayList<>();
            for (Place place : places) {
                if (place != null) {
                    known.add(place);
                }
            }
            return Place.names(known);
        }
    }

    private final Map<String, Push> pushes = new LinkedHashMap<>();

    /** Takes a short message. Answers the push that is whole with it, an error, or null. */
    Held take(Place place, ShortMessage message) {
        if (!message.isPart()) {
            return Held.message(place.toString(), message.data, true);
        }
        Push push = pushes.computeIfAbsent(message.key(), key -> new Push(message));
        int index = message.number() - 1;
        String part = "part " + message.number() + " of " + message;
        if (push.parts[index] != null) {
            return again(push, place, message, part);
        }
        push.parts[index] = message.data;
        push.places[index] = place;
        if (push.isFinished || !push.missing().isEmpty()) {
            return null;
        }
        push.isFinished = true;
        ByteArrayOutputStream whole = new ByteArrayOutputStream();
        for (byte[] bytes : push.parts) {
            whole.write(bytes, 0, bytes.length);
        }
        return Held.push(push.name(), whole.toByteArray(), push.notes);
    }

    private static Held again(Push push, Place place, ShortMessage message, String part) {
        String name = place.toString();
        String where = ": in " + push.places[message.number() - 1] + " and in " + name;
        if (!Arrays.equals(push.parts[message.number() - 1], message.data)) {
            push.isFinished = true;
            return Held.error(name, part + " is there twice with different bytes" + where);
        }
        if (push.isFinished) {
            return Held.note(name, part + " is there twice" + where);
        }
        push.notes.add(part + " is there twice" + where);
        return null;
    }

    /** Names what is missing of the pushes that are not whole. */
    List<Held> missing() {
        List<Held> errors = new ArrayList<>();
        for (Push push : pushes.values()) {
            List<Integer> missing = push.missing();
            if (!push.isFinished && !missing.isEmpty()) {
                boolean isOne = missing.size() == 1;
                String which = (isOne ? "part " : "parts ") + Place.listed(missing);
                String of = " of " + push.parts.length + " of " + push.any;
                String sentence = which + of + (isOne ? " is" : " are") + " missing";
                errors.add(Held.error(push.name(), sentence));
            }
        }
        return errors;
    }
}
