package com.qvomacp.cli;

import java.util.Arrays;
import java.util.List;

/** A message with a note on each of its bytes. */
final class Annotation {
    /** The push header or the body. */
    static final class Section {
        /** In the order of the bytes, which they cover once, but for notes without a length. */
        final List<Note> notes;

        final int length;

        /** Where it is refused; null when it is taken. */
        final Stop stop;

        Section(List<Note> notes, int length, Stop stop) {
            this.notes = notes;
            this.length = length;
            this.stop = stop;
        }
    }

    final byte[] message;

    /** Null when the message is a body alone. */
    final Section header;

    /** Null when the header is refused. */
    final Section body;

    private Annotation(byte[] message, Section header, Section body) {
        this.message = message;
        this.header = header;
        this.body = body;
    }

    static Annotation ofPush(byte[] push) {
        Section header = HeaderAnnotator.annotate(push);
        if (header.stop != null) {
            return new Annotation(push, header, null);
        }
        byte[] body = Arrays.copyOfRange(push, header.length, push.length);
        return new Annotation(push, header, BodyAnnotator.annotate(body));
    }

    static Annotation ofBody(byte[] body) {
        return new Annotation(body, null, BodyAnnotator.annotate(body));
    }

    /** Where the body starts in the message. */
    int bodyAt() {
        return header == null ? 0 : header.length;
    }

    byte[] bodyBytes() {
        return Arrays.copyOfRange(message, bodyAt(), message.length);
    }
}
