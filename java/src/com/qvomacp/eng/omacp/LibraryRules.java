package com.qvomacp.eng.omacp;

import java.util.Arrays;

/** Asks the native library's rules, as they are stated here, about a message. */
final class LibraryRules {
    private LibraryRules() {}

    /**
     * Finds out whether the library takes a body.
     *
     * @param body the body, which is not copied
     * @param document what it says; null when it could not be read
     */
    static Verdict verdictOnBody(byte[] body, ProvisioningDocument document) {
        return verdictOn(body, document, 0);
    }

    /**
     * Finds out whether the library takes a push.
     *
     * @param push the push, which is not copied
     * @param bodyAt where the body of the document begins in it
     * @param document what the body says; null when it could not be read
     */
    static Verdict verdictOnPush(byte[] push, int bodyAt, ProvisioningDocument document) {
        LibraryHeader header = LibraryHeader.of(push);
        if (!header.isTaken()) {
            return new Verdict(null, 0, 0, header.refusal, null, 0);
        }
        if (header.bodyAt == bodyAt && document != null) {
            return document.verdict();
        }
        // The library reads the length of the headers from one byte, whatever its form.
        byte[] body = Arrays.copyOfRange(push, header.bodyAt, push.length);
        return verdictOn(body, document, bodyAt - header.bodyAt);
    }

    /** The same of a body, in which the document begins so many bytes from its start. */
    private static Verdict verdictOn(byte[] body, ProvisioningDocument document, int shift) {
        LibraryWalk walk = new LibraryWalk(body, LibraryTrace.NONE);
        Refusal refusal = null;
        int code = 0;
        try {
            walk.run();
            if (!walk.hasList) {
                refusal = Refusal.ofEmpty(walk);
            }
        } catch (LibraryStop stop) {
            code = stop.code;
            refusal = Refusal.of(walk, stop);
        }
        if (refusal != null && shift != 0) {
            refusal = refusal.ofShiftedBody(shift);
        }
        return new Verdict(body, code, walk.at, refusal, document, shift);
    }
}
