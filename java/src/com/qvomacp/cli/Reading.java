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

    private Reading(Held held, ProvisioningMessage message, ProvisioningException failure) {
        this.held = held;
        this.message = message;
        this.failure = failure;
        boolean isRead = message != null;
        this.document = isRead ? message.document() : null;
        this.header = isRead ? message.header() : held.header();
        Verdict ofBytes = isRead ? null : held.isPush ? Verdict.ofPush(held.bytes) : Verdict.ofBody(held.bytes);
        this.verdict = isRead ? message.verdict() : ofBytes;
    }

    static Reading of(Held held, int limit) {
        ReadOptions options = ReadOptions.DEFAULT.withInputLimit(limit);
        try {
            ProvisioningMessage message =
                    held.isPush
                            ? ProvisioningMessage.parsePush(held.bytes, options)
                            : ProvisioningMessage.parseBody(held.bytes, options);
            return new Reading(held, message, null);
        } catch (ProvisioningException failure) {
            return new Reading(held, null, failure);
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
        boolean isTooLong =
                failure != null
                        && (failure.reason() == ProvisioningException.Reason.INPUT_TOO_LONG
                                || failure.reason() == ProvisioningException.Reason.TEXT_TOO_LONG);
        return isTooLong ? Console.FAILED : isAccepted() ? Console.DONE : Console.REFUSED;
    }
}
