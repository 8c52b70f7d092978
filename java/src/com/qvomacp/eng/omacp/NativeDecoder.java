package com.qvomacp.eng.omacp;

/** The decoder's own word on a body, which a library of its own asks for. */
final class NativeDecoder {
    private static Boolean loaded;

    /** The result code; 0 for a body that can be decoded. */
    final int code;

    /** How many bytes of the body had been read. */
    final int read;

    private NativeDecoder(int code, int read) {
        this.code = code;
        this.read = read;
    }

    /** Answers result code and bytes read; the bytes may be one more than there are. */
    private static native int[] decode(byte[] body);

    /**
     * Decodes a body, with {@link MessageReader#LOCK} held.
     *
     * @return what became of it; null when the library that asks the decoder is not there
     */
    static NativeDecoder ask(byte[] body) {
        if (loaded == null) {
            loaded = NativeLibrary.loadExplanations();
        }
        if (!loaded) {
            return null;
        }
        int[] answers = decode(body);
        return new NativeDecoder(answers[0], Math.min(answers[1], body.length));
    }
}
