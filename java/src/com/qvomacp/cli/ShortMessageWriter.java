package com.qvomacp.cli;

import java.io.ByteArrayOutputStream;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;

/** Puts a push into short messages, by 3GPP TS 23.040. */
final class ShortMessageWriter {
    private static final int LONGEST = 140;
    private static final int MOST_PARTS = 255;
    private static final int WAP_PUSH = 2948;
    private static final int SENDER = 9200;

    private static final int NATIONAL = 0x81;
    private static final int INTERNATIONAL = ShortMessage.INTERNATIONAL | 1;

    /** Data, for the handset itself. */
    private static final int CODING = 0xF5;

    private ShortMessageWriter() {}

    /** The user data of a push, in as many parts as it needs; null when it needs too many. */
    static List<byte[]> userData(byte[] push) {
        int header = 7;
        boolean isWhole = push.length <= LONGEST - header;
        int most = isWhole ? push.length : LONGEST - header - 5;
        int total = (push.length + most - 1) / most;
        if (total > MOST_PARTS) {
            return null;
        }
        // The same parts every time, and seldom the reference of another push.
        int reference = Arrays.hashCode(push);
        List<byte[]> parts = new ArrayList<>();
        for (int number = 1; number <= total; ++number) {
            ByteArrayOutputStream part = new ByteArrayOutputStream();
            octets(part, isWhole ? 6 : 11, ShortMessage.PORTS_16, 4);
            octets(part, WAP_PUSH >> 8, WAP_PUSH, SENDER >> 8, SENDER);
            if (!isWhole) {
                octets(part, ShortMessage.CONCATENATED_8, 3, reference, total, number);
            }
            int from = (number - 1) * most;
            part.write(push, from, Math.min(most, push.length - from));
            parts.add(part.toByteArray());
        }
        return parts;
    }

    /** An SMS-SUBMIT with user data, to a number of digits that may begin with a plus sign. */
    static byte[] submit(String number, byte[] userData) {
        boolean isInternational = number.startsWith("+");
        String digits = isInternational ? number.substring(1) : number;
        ByteArrayOutputStream message = new ByteArrayOutputStream();
        octets(message, ShortMessage.SUBMIT | ShortMessage.HAS_HEADER, 0);
        octets(message, digits.length(), isInternational ? INTERNATIONAL : NATIONAL);
        for (int i = 0; i < digits.length(); i += 2) {
            int high = i + 1 < digits.length() ? digits.charAt(i + 1) - '0' : 0xF;
            message.write(high << 4 | digits.charAt(i) - '0');
        }
        octets(message, 0, CODING, userData.length);
        message.write(userData, 0, userData.length);
        return message.toByteArray();
    }

    private static void octets(ByteArrayOutputStream to, int... octets) {
        for (int octet : octets) {
            to.write(octet);
        }
    }
}
