package com.qvomacp.cli;

import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.PushHeader;
import java.util.Collections;
import java.util.List;

/** What came of something that people hold: a push, a body, or why there is no message. */
final class Held {
    private static final List<String> NONE = Collections.emptyList();

    /** Where it comes from, for people: the input, its line, or all the parts of an SMS. */
    final String name;

    /** The push or the body, or what is neither; null when there is nothing of all. */
    final byte[] bytes;

    /** False for a body alone. */
    final boolean isPush;

    /** Why there is no message, as a sentence without a full stop; null when there is one. */
    final String error;

    /** What is worth a remark, each a sentence without a full stop. */
    final List<String> notes;

    Held(String name, byte[] bytes, boolean isPush, String error, List<String> notes) {
        this.name = name;
        this.bytes = bytes;
        this.isPush = isPush;
        this.error = error;
        this.notes = notes;
    }

    static Held message(String name, byte[] bytes, boolean isPush) {
        return new Held(name, bytes, isPush, null, NONE);
    }

    /** No message; the bytes are null where there are none of all. */
    static Held error(String name, byte[] bytes, String sentence) {
        return new Held(name, bytes, true, sentence, NONE);
    }

    /** What the push header says, whatever stands behind it; null when there is none. */
    PushHeader header() {
        return isPush ? header(bytes) : null;
    }

    static PushHeader header(byte[] bytes) {
        try {
            return Intake.isPush(bytes) ? PushHeader.parse(bytes) : null;
        } catch (ProvisioningException none) {
            return null;
        }
    }
}
