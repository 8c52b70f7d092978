package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;
import java.util.TreeMap;

/** Puts pushes together from the parts that short messages carry, in whichever order they come. */
final class SmsParts {
    /** The parts of one push by their numbers, and where each comes from. */
    private static final class Push {
        final Map<Integer, ShortMessage> parts = new TreeMap<>();
        final Map<Integer, Place> places = new TreeMap<>();
        final List<String> notes = new ArrayList<>();
        boolean isFinished;
    }

    private final Map<String, Push> pushes = new LinkedHashMap<>();

    /** Takes a short message. Answers the push that is whole with it, an error, or null. */
    Held take(Place place, ShortMessage message) {
        if (!message.isPart()) {
            return Held.message(place.toString(), message.data, true);
        }
        Push push = pushes.computeIfAbsent(message.key(), key -> new Push());
        if (push.parts.containsKey(message.number)) {
            return again(push, place, message);
        }
        push.parts.put(message.number, message);
        push.places.put(message.number, place);
        if (push.isFinished || push.parts.size() < message.total) {
            return null;
        }
        push.isFinished = true;
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        for (ShortMessage part : push.parts.values()) {
            bytes.write(part.data, 0, part.data.length);
        }
        String name = Place.names(push.places.values());
        return new Held(name, bytes.toByteArray(), true, null, push.notes);
    }

    private static Held again(Push push, Place place, ShortMessage message) {
        boolean isSame = Arrays.equals(push.parts.get(message.number).data, message.data);
        String what = "part " + message.number + " of " + message + " is there twice";
        String where = ": in " + push.places.get(message.number) + " and in " + place;
        if (!isSame) {
            push.isFinished = true;
            return Held.error(place.toString(), null, what + " with different bytes" + where);
        }
        if (push.isFinished) {
            List<String> note = Collections.singletonList(what + where);
            return new Held(place.toString(), null, false, null, note);
        }
        push.notes.add(what + where);
        return null;
    }

    /** Names what is missing of the pushes that are not whole. */
    List<Held> missing() {
        List<Held> errors = new ArrayList<>();
        for (Push push : pushes.values()) {
            ShortMessage any = push.parts.values().iterator().next();
            List<Integer> missing = new ArrayList<>();
            for (int number = 1; number <= any.total && !push.isFinished; ++number) {
                if (!push.parts.containsKey(number)) {
                    missing.add(number);
                }
            }
            if (!missing.isEmpty()) {
                boolean isOne = missing.size() == 1;
                String which = (isOne ? "part " : "parts ") + Place.listed(missing);
                String sentence = which + " of " + any.total + " of " + any;
                String name = Place.names(push.places.values());
                String are = isOne ? " is missing" : " are missing";
                errors.add(Held.error(name, null, sentence + are));
            }
        }
        return errors;
    }
}
