package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.HashMap;
import java.util.List;
import java.util.Map;

/**
 * A document on its way into another form: the elements in their order, as steps that can be taken
 * any number of times. Text by text, it holds no more than the document does.
 */
final class DocumentSource {
    /** Takes the steps, and knows where it stands. */
    abstract static class Steps {
        private final List<Level> open = new ArrayList<>();

        Steps() {
            open.add(new Level("wap-provisioningdoc"));
        }

        /** A characteristic begins; the type is null for none, as may be in XML that is looked at. */
        abstract void characteristic(String type) throws EncodingException;

        /** A parameter; the value is null for none, and the name where a type may be. */
        abstract void parameter(String name, String value) throws EncodingException;

        /** The characteristic that began last, of those that have not ended, ends. */
        abstract void end() throws EncodingException;

        /** The type of the innermost characteristic; the name of the document element outside any. */
        final String innermost() {
            return open.get(open.size() - 1).step;
        }

        /** How many characteristics are open. */
        final int depth() {
            return open.size() - 1;
        }

        /** Where the walk stands, as {@link Deviation#path} tells it. */
        final String path() {
            int from = Math.max(0, open.size() - LONGEST_PATH);
            StringBuilder path = new StringBuilder(from > 0 ? "..." : "");
            for (Level level : open.subList(from, open.size())) {
                path.append(path.length() > 0 ? " / " : "").append(level);
            }
            return path.toString();
        }

        private void begin(String type) {
            Level outer = open.get(open.size() - 1);
            Level inner = new Level(type == null ? Element.CHARACTERISTIC.text : type);
            Integer before = outer.counts.get(type);
            inner.ordinal = before == null ? 1 : before + 1;
            outer.counts.put(type, inner.ordinal);
            open.add(inner);
        }
    }

    /** An element that is open. */
    private static final class Level {
        final String step;

        /** Among those of its type in the same element, counted from 1; 0 for the document. */
        int ordinal;

        /** How many of each type have begun in it. */
        final Map<String, Integer> counts = new HashMap<>();

        Level(String step) {
            this.step = step;
        }

        @Override
        public String toString() {
            return ordinal == 0 ? step : Printable.of(step) + " " + ordinal;
        }
    }

    private static final int LONGEST_PATH = 8;

    private enum Step {
        CHARACTERISTIC,
        PARAMETER,
        END
    }

    final String version;
    private final List<Step> steps = new ArrayList<>();

    /** A type for each characteristic, name and value for each parameter. */
    private final List<String> texts = new ArrayList<>();

    /** Line and column of each tag that begins, that of the document first; empty without XML. */
    final List<int[]> places = new ArrayList<>();

    DocumentSource(String version) {
        this.version = version;
    }

    void characteristic(String type) {
        steps.add(Step.CHARACTERISTIC);
        texts.add(type);
    }

    void parameter(String name, String value) {
        steps.add(Step.PARAMETER);
        texts.add(name);
        texts.add(value);
    }

    void end() {
        steps.add(Step.END);
    }

    void take(Steps taker) throws EncodingException {
        int text = 0;
        for (Step step : steps) {
            switch (step) {
                case CHARACTERISTIC:
                    taker.begin(texts.get(text));
                    taker.characteristic(texts.get(text++));
                    break;
                case PARAMETER:
                    taker.parameter(texts.get(text), texts.get(text + 1));
                    text += 2;
                    break;
                default:
                    taker.end();
                    taker.open.remove(taker.open.size() - 1);
            }
        }
    }
}
