package com.qvomacp.support;

import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;

/** Writes pushed messages: a push header in front of a body. */
public final class Push {
    public static final int SEC_USERPIN = 0x81;

    private static final int TRANSACTION = 0x01;
    private static final int PDU_PUSH = 0x06;
    private static final int LENGTH_QUOTE = 0x1F;
    private static final int CONTENT_TYPE_PROVISIONING = 0xB6;

    private final ByteArrayOutputStream headers = new ByteArrayOutputStream();
    private final byte[] body;

    private Push(byte[] body) {
        this.body = body;
    }

    /** A push without SEC and MAC. */
    public static byte[] push(byte[] body) {
        return withShortType(CONTENT_TYPE_PROVISIONING, body).bytes();
    }

    /** A push with a document of the given elements. */
    public static byte[] push(Document.Element... elements) {
        return push(Document.document(elements));
    }

    /** A push as provisioning servers send it: length-quoted type, SEC and MAC as tokens. */
    public static byte[] secured(int sec, String mac, byte[] body) {
        Push push = new Push(body);
        int valueLength = 1 + 2 + 1 + mac.length() + 1;
        push.headers.write(LENGTH_QUOTE);
        push.headers.write(valueLength);
        push.headers.write(CONTENT_TYPE_PROVISIONING);
        return push.sec(sec).mac(mac).bytes();
    }

    public static Push withShortType(int type, byte[] body) {
        Push push = new Push(body);
        push.headers.write(type);
        return push;
    }

    public static Push withTextType(String type, byte[] body) {
        Push push = new Push(body);
        push.text(type);
        return push;
    }

    public Push sec(int sec) {
        headers.write(0x91);
        headers.write(sec);
        return this;
    }

    public Push mac(String mac) {
        headers.write(0x92);
        return text(mac);
    }

    public Push secNamed(String name, int sec) {
        text(name);
        headers.write(sec);
        return this;
    }

    public Push macNamed(String name, String mac) {
        return text(name).text(mac);
    }

    public byte[] bytes() {
        ByteArrayOutputStream message = new ByteArrayOutputStream();
        message.write(TRANSACTION);
        message.write(PDU_PUSH);
        message.write(headers.size());
        message.writeBytes(headers.toByteArray());
        message.writeBytes(body);
        return message.toByteArray();
    }

    private Push text(String text) {
        headers.writeBytes(text.getBytes(StandardCharsets.ISO_8859_1));
        headers.write(0);
        return this;
    }
}
