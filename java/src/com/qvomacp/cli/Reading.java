package com.qvomacp.cli;

import com.qvomacp.eng.omacp.ProvisioningDocument;
import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningMessage;
import com.qvomacp.eng.omacp.PushHeader;
import com.qvomacp.eng.omacp.ReadOptions;
import com.qvomacp.eng.omacp.Verdict;
import java.util.Arrays;

/** What could be read of a message, and what the native library makes of it. */
final class Reading {
    final Source source;

    /** Null for a body alone, and for a message that does not begin with the header of a push. */
    final PushHeader header;

    /** Null when the body cannot be read. */
    final ProvisioningDocument document;

    /** Null when the message cannot be read. */
    final Verdict verdict;

    /** Why the message cannot be read; null when it can. */
    final ProvisioningException failure;

    private Reading(
            Source source,
            PushHeader header,
            ProvisioningDocument document,
            Verdict verdict,
            ProvisioningException failure) {
        this.source = source;
        this.header = header;
        this.document = document;
        this.verdict = verdict;
        this.failure = failure;
    }

    static Reading of(Source source, int limit) {
        ReadOptions options = ReadOptions.DEFAULT.withInputLimit(limit);
        try {
            ProvisioningMessage message =
                    source.isPush
                            ? ProvisioningMessage.parsePush(source.bytes, options)
                            : ProvisioningMessage.parseBody(source.bytes, options);
            return new Reading(
                    source, message.header(), message.document(), message.verdict(), null);
        } catch (ProvisioningException failure) {
            return new Reading(source, headerOf(source), null, null, failure);
        }
    }

    /** Reads the push header alone, whatever stands behind it. */
    static PushHeader headerOf(Source source) {
        try {
            return source.isPush ? PushHeader.parse(source.bytes) : null;
        } catch (ProvisioningException none) {
            return null;
        }
    }

    /** Where the body begins. */
    int bodyAt() {
        return header == null ? 0 : header.length();
    }

    byte[] body() {
        return Arrays.copyOfRange(source.bytes, bodyAt(), source.bytes.length);
    }

    /** Whether the library takes the message. */
    boolean isAccepted() {
        return verdict != null && verdict.isAccepted();
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
