package com.qvomacp.support;

import java.io.ByteArrayOutputStream;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.HexFormat;
import java.util.List;

/** Writes short messages by 3GPP TS 23.040. */
public final class Sms {
    public static final String PORTS = "05040B8423F0";

    private String centre = "07915348006000F0";
    private String sender = "0B915348000000F0";
    private String first = "44";
    private String protocol = "00";
    private String coding = "04";
    private String stamp = "51101021430000";

    public static byte[] bytes(String... digits) {
        return HexFormat.of().parseHex(String.join("", digits).replace(" ", ""));
    }

    public static String hex(byte[] bytes) {
        return HexFormat.of().withUpperCase().formatHex(bytes);
    }

    /** The address of the service centre with its length; empty for none. */
    public Sms centre(String digits) {
        centre = digits;
        return this;
    }

    /** The address of the sender with its length in digits. */
    public Sms sender(String digits) {
        sender = digits;
        return this;
    }

    public Sms first(String digits) {
        first = digits;
        return this;
    }

    public Sms coding(String digits) {
        coding = digits;
        return this;
    }

    public byte[] deliver(byte[] userData) {
        return deliver(userData, userData.length);
    }

    public byte[] deliver(byte[] userData, int length) {
        return bytes(
                centre,
                first,
                sender,
                protocol,
                coding,
                stamp,
                String.format("%02X", length),
                hex(userData));
    }

    /** User data with a header of the elements given. */
    public static byte[] userData(byte[] data, String... elements) {
        String header = String.join("", elements);
        return bytes(String.format("%02X", header.length() / 2), header, hex(data));
    }

    public static String concatenated(int reference, int total, int number) {
        return String.format("0003%02X%02X%02X", reference, total, number);
    }

    public static String concatenatedWide(int reference, int total, int number) {
        return String.format("0804%04X%02X%02X", reference, total, number);
    }

    /** The user data of a push in parts of at most so many bytes. */
    public static List<byte[]> parts(byte[] push, int most, boolean isWide, int reference) {
        int total = (push.length + most - 1) / most;
        List<byte[]> parts = new ArrayList<>();
        for (int i = 0; i < total; ++i) {
            byte[] data = Arrays.copyOfRange(push, i * most, Math.min(push.length, (i + 1) * most));
            String concatenation =
                    isWide
                            ? concatenatedWide(reference, total, i + 1)
                            : concatenated(reference, total, i + 1);
            parts.add(userData(data, PORTS, concatenation));
        }
        return parts;
    }

    /** Lines of text, as a file holds them. */
    public static byte[] lines(List<byte[]> messages) {
        ByteArrayOutputStream text = new ByteArrayOutputStream();
        for (byte[] message : messages) {
            text.writeBytes((hex(message) + "\n").getBytes());
        }
        return text.toByteArray();
    }
}
