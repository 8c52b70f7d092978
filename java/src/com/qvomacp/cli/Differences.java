package com.qvomacp.cli;

import com.qvomacp.eng.omacp.Characteristic;
import com.qvomacp.eng.omacp.HeaderField;
import com.qvomacp.eng.omacp.Item;
import com.qvomacp.eng.omacp.Other;
import com.qvomacp.eng.omacp.Parameter;
import com.qvomacp.eng.omacp.ProvisioningDocument;
import com.qvomacp.eng.omacp.PushHeader;
import java.util.ArrayDeque;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.Deque;
import java.util.HashMap;
import java.util.HashSet;
import java.util.LinkedHashMap;
import java.util.LinkedHashSet;
import java.util.List;
import java.util.Map;
import java.util.Objects;
import java.util.Set;

/**
 * What differs between two messages, by what they say and not by how it is written. Depth costs no
 * stack, and no two items are compared that are not each other's counterparts.
 */
final class Differences {
    enum Kind { ADDED, REMOVED, CHANGED, MOVED }

    /** One difference. */
    static final class Change {
        final Kind kind;

        /** In the first message; in the second one of what is added. */
        final String path;

        /** What is added, removed or moved as a whole; null for a value. */
        final Item item;

        /** The values of a parameter or header, null without one; the places of what was moved. */
        final String before;

        final String after;

        private Change(Kind kind, String path, Item item, String before, String after) {
            this.kind = kind;
            this.path = path;
            this.item = item;
            this.before = before;
            this.after = after;
        }
    }

    /** What tells characteristics of a type from each other, the first parameter above all. */
    private static final Map<String, List<String>> IDENTIFIERS = new HashMap<>();

    static {
        for (String row :
                new String[] {
                    "NAPDEF NAPID", "PXLOGICAL PROXY-ID", "PXPHYSICAL PHYSICAL-PROXY-ID",
                    "APPLICATION APPID PROVIDER-ID NAME", "PORT PORTNBR", "RESOURCE URI",
                    "VENDORCONFIG NAME", "BOOTSTRAP NAME", "APPADDR ADDR", "WI-FI NETSSID",
                    "NAPAUTHINFO AUTHTYPE AUTHNAME", "PXAUTHINFO PXAUTH-TYPE PXAUTH-ID",
                    "APPAUTH AAUTHLEVEL AAUTHNAME", "VALIDITY COUNTRY NETWORK"
                }) {
            List<String> words = Arrays.asList(row.split(" "));
            IDENTIFIERS.put(words.get(0), words.subList(1, words.size()));
        }
    }

    /** Those that others refer to by their identifier: with another one it is another thing. */
    private static final List<String> NAMED =
            Arrays.asList("NAPDEF", "PXLOGICAL", "PXPHYSICAL", "APPLICATION");

    /** Counterparts are sought by all identifiers, then by fewer, and at last by their order. */
    private static final int BY_ORDER = 3;

    private static final int NONE = -1;

    private final ProvisioningDocument left;
    private final ProvisioningDocument right;
    private final List<Change> changes = new ArrayList<>();

    /** Pairs of lists of items that are still to be compared. */
    private final Deque<List<Item>> open = new ArrayDeque<>();

    private Differences(ProvisioningDocument left, ProvisioningDocument right) {
        this.left = left;
        this.right = right;
    }

    /** The differences of two messages that were read; headers count where both have one. */
    static List<Change> of(Reading left, Reading right) {
        Differences differences = new Differences(left.document, right.document);
        if (left.header != null && right.header != null) {
            differences.named("push header", fields(left.header), fields(right.header));
        }
        differences.named("wap-provisioningdoc", version(left.document), version(right.document));
        differences.open.push(right.document.children());
        differences.open.push(left.document.children());
        while (!differences.open.isEmpty()) {
            differences.compare(differences.open.pop(), differences.open.pop());
        }
        return differences.changes;
    }

    private static Map<String, List<String>> version(ProvisioningDocument document) {
        return Collections.singletonMap("version", Collections.singletonList(document.version()));
    }

    private static Map<String, List<String>> fields(PushHeader header) {
        Map<String, List<String>> values = new LinkedHashMap<>();
        String identifier = Integer.toString(header.transactionIdentifier());
        values.computeIfAbsent("transaction identifier", name -> new ArrayList<>()).add(identifier);
        String type = header.contentType().mediaType();
        values.computeIfAbsent("content type", name -> new ArrayList<>()).add(type);
        List<HeaderField> fields = new ArrayList<>(header.contentType().parameters());
        fields.addAll(header.fields());
        for (HeaderField field : fields) {
            values.computeIfAbsent(field.name(), name -> new ArrayList<>()).add(field.value());
        }
        return values;
    }

    /** Compares values by their names and, of one name, by their order. */
    private void named(
            String path, Map<String, List<String>> before, Map<String, List<String>> after) {
        Set<String> names = new LinkedHashSet<>(before.keySet());
        names.addAll(after.keySet());
        for (String name : names) {
            List<String> old = before.getOrDefault(name, Collections.emptyList());
            List<String> now = after.getOrDefault(name, Collections.emptyList());
            for (int i = 0; i < Math.max(old.size(), now.size()); ++i) {
                boolean isOld = i < old.size();
                boolean isNow = i < now.size();
                Kind kind = !isNow ? Kind.REMOVED : isOld ? Kind.CHANGED : Kind.ADDED;
                String first = isOld ? old.get(i) : null;
                String second = isNow ? now.get(i) : null;
                if (isOld != isNow || !Objects.equals(first, second)) {
                    changes.add(new Change(kind, path + " / " + name, null, first, second));
                }
            }
        }
    }

    /** Compares what stands in one element with what stands in its counterpart. */
    private void compare(List<Item> before, List<Item> after) {
        int[] matches = matches(before, after);
        boolean[] stay = inOrder(matches);
        boolean[] isThere = new boolean[after.size()];
        for (int i = 0; i < matches.length; ++i) {
            Item item = before.get(i);
            String path = left.path(item);
            if (matches[i] == NONE) {
                changes.add(new Change(Kind.REMOVED, path, item, TextWriter.value(item), null));
                continue;
            }
            isThere[matches[i]] = true;
            Item counterpart = after.get(matches[i]);
            if (!stay[i]) {
                // Counted from 1, among what stands in the same element.
                String from = Integer.toString(i + 1);
                String to = Integer.toString(matches[i] + 1);
                changes.add(new Change(Kind.MOVED, path, item, from, to));
            }
            String old = TextWriter.value(item);
            String now = TextWriter.value(counterpart);
            if (!Objects.equals(old, now)) {
                changes.add(new Change(Kind.CHANGED, path, null, old, now));
            }
        }
        for (int j = 0; j < isThere.length; ++j) {
            if (!isThere[j]) {
                Item item = after.get(j);
                String path = right.path(item);
                changes.add(new Change(Kind.ADDED, path, item, null, TextWriter.value(item)));
            }
        }
        for (int i = matches.length - 1; i >= 0; --i) {
            if (matches[i] != NONE) {
                open.push(after.get(matches[i]).children());
                open.push(before.get(i).children());
            }
        }
    }

    /** The counterpart of each item by its place; {@link #NONE} for none. */
    private static int[] matches(List<Item> before, List<Item> after) {
        int[] matches = new int[before.size()];
        Arrays.fill(matches, NONE);
        boolean[] taken = new boolean[after.size()];
        for (int tier = 0; tier <= BY_ORDER; ++tier) {
            Map<List<Object>, Deque<Integer>> waiting = new HashMap<>();
            for (int j = 0; j < taken.length; ++j) {
                List<Object> key = taken[j] ? null : key(after.get(j), tier);
                if (key != null) {
                    waiting.computeIfAbsent(key, none -> new ArrayDeque<>()).add(j);
                }
            }
            for (int i = 0; i < matches.length && !waiting.isEmpty(); ++i) {
                List<Object> key = matches[i] == NONE ? key(before.get(i), tier) : null;
                Deque<Integer> left = waiting.get(key);
                Integer j = left == null ? null : left.poll();
                if (j != null && (tier < BY_ORDER || isLike(before.get(i), after.get(j)))) {
                    matches[i] = j;
                    taken[j] = true;
                }
            }
        }
        return matches;
    }

    /** What an item and its counterpart have in common; null for what has nothing to seek by. */
    private static List<Object> key(Item item, int tier) {
        if (item instanceof Parameter) {
            Parameter parameter = (Parameter) item;
            String value = tier == 0 ? parameter.value() : null;
            return Arrays.asList(Parameter.class, parameter.name(), value);
        }
        if (item instanceof Other) {
            Other other = (Other) item;
            return Arrays.asList(other.kind(), other.name(), other.text());
        }
        Characteristic characteristic = (Characteristic) item;
        List<Object> key = new ArrayList<>();
        key.add(characteristic.type());
        if (tier == BY_ORDER) {
            return key;
        }
        List<String> identifiers = identifiers(characteristic);
        if (tier >= identifiers.size() || characteristic.value(identifiers.get(0)) == null) {
            return null;
        }
        for (String identifier : identifiers.subList(0, identifiers.size() - tier)) {
            key.add(characteristic.value(identifier));
        }
        return key;
    }

    private static List<String> identifiers(Characteristic characteristic) {
        return IDENTIFIERS.getOrDefault(characteristic.type(), Collections.emptyList());
    }

    /**
     * Whether two items of one type, or one name, can be each other's counterparts by their order
     * alone: of those with another identifier half of the other parameters have to be the same.
     */
    private static boolean isLike(Item before, Item after) {
        boolean isOne = before instanceof Characteristic;
        if (!isOne || !NAMED.contains(((Characteristic) before).type())) {
            return true;
        }
        Set<Parameter> old = others((Characteristic) before);
        Set<Parameter> now = others((Characteristic) after);
        int most = Math.max(old.size(), now.size());
        now.retainAll(old);
        return 2 * now.size() >= most;
    }

    private static Set<Parameter> others(Characteristic characteristic) {
        Set<Parameter> others = new HashSet<>(characteristic.parameters());
        others.removeIf(parameter -> identifiers(characteristic).contains(parameter.name()));
        return others;
    }

    /** Which of the counterparts follow each other on both sides: as many as can be. */
    private static boolean[] inOrder(int[] matches) {
        // The least counterpart that ends a row of each length, and whose it is.
        int[] ends = new int[matches.length];
        int[] last = new int[matches.length];
        int[] previous = new int[matches.length];
        int longest = 0;
        for (int i = 0; i < matches.length; ++i) {
            if (matches[i] != NONE) {
                int length = -1 - Arrays.binarySearch(ends, 0, longest, matches[i]);
                ends[length] = matches[i];
                last[length] = i;
                previous[i] = length == 0 ? NONE : last[length - 1];
                longest = Math.max(longest, length + 1);
            }
        }
        boolean[] stay = new boolean[matches.length];
        for (int i = longest == 0 ? NONE : last[longest - 1]; i != NONE; i = previous[i]) {
            stay[i] = true;
        }
        return stay;
    }
}
