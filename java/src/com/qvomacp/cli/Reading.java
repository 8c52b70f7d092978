package com.qvomacp.cli;

import com.qvomacp.eng.omacp.ProvisioningDocument;
import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningException.Reason;
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

    Reading(Held held, int limit) {
        ReadOptions options = ReadOptions.DEFAULT.withInputLimit(limit);
        byte[] bytes = held.bytes;
        ProvisioningMessage read = null;
        ProvisioningException none = null;
        try {
            read = held.isPush ? ProvisioningMessage.parsePush(bytes, options)
                    : ProvisioningMessage.parseBody(bytes, options);
        } catch (ProvisioningException unreadable) {
            none = unreadable;
        }
        this.held = held;
        this.message = read;
        this.failure = none;
        this.document = read == null ? null : read.document();
        this.header = read == null ? held.header() : read.header();
        this.verdict = read != null ? read.verdict()
                : held.isPush ? Verdict.ofPush(bytes) : Verdict.ofBody(bytes);
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
        Reason reason = failure == null ? null : failure.reason();
        boolean isTooLong = reason != null
                && (reason == Reason.INPUT_TOO_LONG || reason == Reason.TEXT_TOO_LONG);
        return isTooLong ? Console.FAILED : isAccepted() ? Console.DONE : Console.REFUSED;
    }
}
