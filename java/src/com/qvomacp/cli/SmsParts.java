package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/** Puts pushes together from the parts that short messages carry, in whichever order they come. */
final class SmsParts {
    /** The parts of one push, and where each comes from. */
    private static final class Push {
        final ShortMessage[] parts;
        final Place[] places;
        final List<String> notes = new ArrayList<>();
        boolean isFinished;

        Push(int total) {
            parts = new ShortMessage[total];
            places = new Place[total];
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

        byte[] bytes() {
            ByteArrayOutputStream bytes = new ByteArrayOutputStream();
            for (ShortMessage part : parts) {
                bytes.write(part.data, 0, part.data.length);
            }
            return bytes.toByteArray();
        }
    }

    private final Map<String, Push> pushes = new LinkedHashMap<>();

    /** Takes a short message. Answers the push that is whole with it, an error, or null. */
    Held take(Place place, ShortMessage message) {
        if (!message.isPart()) {
            return Held.message(place.toString(), message.data, true);
        }
        Push push = pushes.computeIfAbsent(message.key(), key -> new Push(message.total()));
        int index = message.number() - 1;
        if (push.parts[index] != null) {
            return again(push, index, place, message);
        }
        push.parts[index] = message;
        push.places[index] = place;
        if (push.isFinished || !push.missing().isEmpty()) {
            return null;
        }
        push.isFinished = true;
        return Held.push(Place.names(push.places), push.bytes(), push.notes);
    }

    private static Held again(Push push, int index, Place place, ShortMessage message) {
        boolean isSame = Arrays.equals(push.parts[index].data, message.data);
        String what = "part " + message.number() + " of " + message + " is there twice";
        String where = ": in " + push.places[index] + " and in " + place;
        if (!isSame) {
            push.isFinished = true;
            return Held.error(place.toString(), what + " with different bytes" + where);
        }
        if (push.isFinished) {
            return Held.note(place.toString(), what + where);
        }
        push.notes.add(what + where);
        return null;
    }

    /** Names what is missing of the pushes that are not whole. */
    List<Held> missing() {
        List<Held> errors = new ArrayList<>();
        for (Push push : pushes.values()) {
            List<Integer> missing = push.missing();
            if (push.isFinished || missing.isEmpty()) {
                continue;
            }
            ShortMessage any = null;
            for (ShortMessage part : push.parts) {
                any = part != null ? part : any;
            }
            boolean isOne = missing.size() == 1;
            String which = (isOne ? "part " : "parts ") + Place.listed(missing);
            String sentence = which + " of " + push.parts.length + " of " + any;
            errors.add(Held.error(Place.names(push.places), sentence + (isOne ? " is missing" : " are missing")));
        }
        return errors;
    }
}
