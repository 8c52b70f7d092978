package com.qvomacp.eng.parser;

/**
 * The parse session and the facts of the push header.
 *
 * <p>Calling order: {@link #qvomacp_parser}, then (if it answered {@code true}) queries, then
 * {@link #qvomacp_parser_del}. See the package description for loading and for threads.
 *
 * <pre>{@code
 * XCPCtxParser parser = new XCPCtxParser();
 * if (parser.qvomacp_parser(push, push.length, 0)) {
 *     System.out.println(parser.qvomacp_GetParserBodyLen());
 * }
 * parser.qvomacp_parser_del();
 * }</pre>
 */
public class XCPCtxParser {
    /**
     * Parses a pushed message: its push header and, unless only the header is wanted, its body.
     *
     * <p>A header that is refused leaves an earlier context as it was; so does mode 1. After a body
     * that cannot be decoded neither a header nor a context is there.
     *
     * @param message the push as it was received, from its transaction identifier on
     * @param length how many bytes of {@code message} to read; the low 32 bits count. A message is
     *     refused when they are more than the array has
     * @param mode 1 to read the header only; every other value for the whole message
     * @return {@code true} when header and (unless mode is 1) body were understood; {@code false}
     *     when the push is refused (not a connectionless push, an unknown content type) or its body
     *     is not a provisioning document that can be decoded
     */
    public native boolean qvomacp_parser(byte[] message, long length, int mode);

    /**
     * Releases what the last parse left. Harmless when there is nothing, and when called twice.
     */
    public native void qvomacp_parser_del();

    /**
     * {@return the content type of the push, as its well-known number: 54 {@code
     * application/vnd.wap.connectivity-wbxml}, 53 {@code application/vnd.wap.connectivity-xml}, 68
     * {@code application/vnd.syncml.notification}, 78 {@code
     * application/vnd.syncml.ds.notification}, 66 {@code application/vnd.syncml.dm+wbxml}; -1
     * without a parsed header}
     */
    public native int qvomacp_GetParserContentType();

    /**
     * {@return the length of the push's headers: bytes, 0 to 255, as the message states them; -1
     * without a parsed header}
     */
    public native int qvomacp_GetParserHeaderLen();

    /** {@return the length of the body: bytes behind the headers; -1 without a parsed header} */
    public native int qvomacp_GetParserBodyLen();

    /**
     * {@return the length of the MAC: characters of the MAC text, 0 when the message has none; -1
     * without a parsed header}
     */
    public native int qvomacp_GetParserMACLen();

    /**
     * {@return the security method SEC: the byte as sent, high bit included: 0x80 NETWPIN, 0x81
     * USERPIN, 0x82 USERNETWPIN, 0x83 USERPINMAC; 0 when the message has none; -1 without a parsed
     * header}
     */
    public native int qvomacp_GetParserSEC();

    /**
     * {@return the text of the MAC, which is carried and not verified: a new array of the MAC's
     * characters without a terminator, empty when the message has none; {@code null} without a
     * parsed header}
     */
    public native byte[] qvomacp_GetParserMAC();

    /**
     * {@return the bytes behind the headers, which are the body: a new array, empty when the
     * message ends with its headers; {@code null} without a parsed header}
     */
    public native byte[] qvomacp_GetParserBody();
}
