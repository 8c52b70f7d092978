package com.qvomacp.cli;

/** The decoder's own word on a body. */
final class NativeDecoder {
    /** Answers result code and bytes read. */
    private static native int[] decode(byte[] body);

    private static Boolean loaded;

    private NativeDecoder() {}

    /** The decoder's verdict; null when the library that asks it cannot be loaded. */
    static Verdict verdict(byte[] body) {
        if (loaded == null) {
            loaded = load();
        }
        if (!loaded) {
            return null;
        }
        int[] answers = decode(body);
        return new Verdict(answers[0], answers[1]);
    }

    private static boolean load() {
        try {
            System.loadLibrary("omacp_explain");
            return true;
        } catch (UnsatisfiedLinkError missing) {
            return false;
        }
    }

    /** What became of a body. */
    static final class Verdict {
        final int code;

        /** May be one more than the body has, behind a string without an end. */
        final int read;

        Verdict(int code, int read) {
            this.code = code;
            this.read = read;
        }
    }
}
