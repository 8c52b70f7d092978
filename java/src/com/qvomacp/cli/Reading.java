package com.qvomacp.cli;

import com.qvomacp.eng.omacp.ProvisioningDocument;
import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningMessage;
import com.qvomacp.eng.omacp.PushHeader;
import com.qvomacp.eng.omacp.ReadOptions;
import com.qvomacp.eng.omacp.Verdict;

/** What could be read of a message, and what the native library makes of it. */
final class Reading {
    final Held held;

    /** Null for a body alone, and for a message that does not begin with the header of a push. */
    final PushHeader header;

    /** Null when the message cannot be read. */
    final ProvisioningMessage message;

    /** Null when the body cannot be read. */
    final ProvisioningDocument document;

    final Verdict verdict;

    /** Why the message cannot be read; null when it can. */
    final ProvisioningException failure;

    private Reading(
            Held held,
            PushHeader header,
            ProvisioningMessage message,
            Verdict verdict,
            ProvisioningException failure) {
        this.held = held;
        this.header = header;
        this.message = message;
        this.document = message == null ? null : message.document();
        this.verdict = verdict;
        this.failure = failure;
    }

    static Reading of(Held held, int limit) {
        ReadOptions options = ReadOptions.DEFAULT.withInputLimit(limit);
        try {
            ProvisioningMessage message =
                    held.isPush
                            ? ProvisioningMessage.parsePush(held.bytes, options)
                            : ProvisioningMessage.parseBody(held.bytes, options);
            return new Reading(held, message.header(), message, message.verdict(), null);
        } catch (ProvisioningException failure) {
            Verdict verdict =
                    held.isPush ? Verdict.ofPush(held.bytes) : Verdict.ofBody(held.bytes);
            return new Reading(held, headerOf(held), null, verdict, failure);
        }
    }

    /** Reads the push header alone, whatever stands behind it. */
    static PushHeader headerOf(Held held) {
        try {
            return held.isPush ? PushHeader.parse(held.bytes) : null;
        } catch (ProvisioningException none) {
            return null;
        }
    }

    /** Where the body begins. */
    int bodyAt() {
        return header == null ? 0 : header.length();
    }

    /** Whether the message can be read, and the library takes it. */
    boolean isAccepted() {
        return failure == null && verdict.isAccepted();
    }

    /** The exit status that the message stands for. */
    int status() {
        if (failure != null) {
            switch (failure.reason()) {
                case INPUT_TOO_LONG:
                case TEXT_TOO_LONG:
                    return Console.FAILED;
                default:
                    return Console.REFUSED;
            }
        }
        return verdict.isAccepted() ? Console.DONE : Console.REFUSED;
    }
}
