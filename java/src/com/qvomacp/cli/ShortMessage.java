package com.qvomacp.cli;

import java.util.Arrays;
import java.util.Locale;

/**
 * A short message by 3GPP TS 23.040: an SMS-DELIVER, or user data with its header alone. It is one
 * only when all its lengths come out exactly.
 */
final class ShortMessage {
    private static final int LONGEST_CENTRE = 12;
    private static final int LONGEST_ADDRESS = 20;
    private static final int TYPE = 0x03;
    static final int SUBMIT = 0x01;
    static final int HAS_HEADER = 0x40;
    private static final int TIME_STAMP = 7;

    /** How long the validity period of an SMS-SUBMIT is, by its format. */
    private static final int[] VALIDITIES = {0, TIME_STAMP, 1, TIME_STAMP};

    private static final int ALPHANUMERIC = 0xD0;
    static final int INTERNATIONAL = 0x90;
    private static final int KIND = 0xF0;
    private static final String DIGITS = "0123456789*#abc";

    private static final String SEVEN_BIT = "7-bit text";
    private static final String[] ALPHABETS = {SEVEN_BIT, "8-bit data", "UCS-2 text", SEVEN_BIT};

    private static final int NO_PORT = -1;

    static final int CONCATENATED_8 = 0x00;
    private static final int PORTS_8 = 0x04;
    static final int PORTS_16 = 0x05;
    private static final int CONCATENATED_16 = 0x08;

    /** The number or name of the sender; empty for user data alone. */
    final String sender;

    /** What comes behind the header; empty where {@link #other} says why it is of no use. */
    final byte[] data;

    /** Why it carries no data to a port, whichever; null when it does. */
    final String other;

    private int port = NO_PORT;
    private int senderPort = NO_PORT;

    /** How many bits the reference of a concatenation has; 0 without one. */
    private int width;

    private int reference;
    int total = 1;
    int number = 1;

    private ShortMessage(String sender, byte[] data, String other) {
        this.sender = sender;
        this.data = data;
        this.other = other;
    }

    /** Bytes from a place on; -1 behind the last. */
    private static int at(byte[] bytes, int index) {
        return index < bytes.length ? bytes[index] & 0xFF : -1;
    }

    /** Reads an SMS with the address of the service centre in front; null when it is none. */
    static ShortMessage withCentre(byte[] bytes) {
        int centre = at(bytes, 0);
        boolean isAddress = centre > 1 && centre <= LONGEST_CENTRE && at(bytes, 1) >= 0x80;
        return centre == 0 || isAddress ? withoutCentre(bytes, centre + 1) : null;
    }

    /** Reads an SMS from its first octet on; null when it is none. */
    static ShortMessage withoutCentre(byte[] bytes, int from) {
        int first = at(bytes, from);
        boolean isSubmit = (first & TYPE) == SUBMIT;
        if (first < 0 || (first & TYPE) > SUBMIT) {
            return null;
        }
        int address = from + (isSubmit ? 2 : 1);
        int digits = at(bytes, address);
        int kind = at(bytes, address + 1);
        if (digits < 0 || digits > LONGEST_ADDRESS || kind < 0x80) {
            return null;
        }
        int codingAt = address + 2 + (digits + 1) / 2 + 1;
        int validity = VALIDITIES[first >> 3 & 0x03];
        int lengthAt = codingAt + 1 + (isSubmit ? validity : TIME_STAMP);
        int length = at(bytes, lengthAt);
        int coding = at(bytes, codingAt);
        String alphabet = alphabet(coding);
        int octets = alphabet.equals(SEVEN_BIT) ? (7 * length + 7) / 8 : length;
        if (length < 0 || octets != bytes.length - lengthAt - 1) {
            return null;
        }
        String other = null;
        if (isSubmit) {
            other = "an SMS-SUBMIT, which is on its way from a handset;"
                    + " one that is received is an SMS-DELIVER";
        } else if (coding != 0x04 && (coding & 0xFC) != 0xF4) {
            String why = "an SMS with %s (coding scheme %02X),"
                    + " and not with data for a port (04, F4 to F7)";
            other = String.format(Locale.ROOT, why, alphabet, coding);
        } else if ((first & HAS_HEADER) == 0) {
            other = "an SMS without a user data header, and so without a port";
        } else {
            String sender = address(bytes, address + 2, digits, kind);
            ShortMessage message = userData(bytes, lengthAt + 1, sender);
            if (message != null) {
                return message;
            }
            other = "an SMS whose user data header does not end where its length says";
        }
        return new ShortMessage("", new byte[0], other);
    }

    /** What user data is written in, by its coding scheme. */
    private static String alphabet(int coding) {
        if (coding >= 0x80) {
            return ALPHABETS[coding >= 0xF0 ? coding >> 2 & 0x01 : coding >= 0xE0 ? 2 : 0];
        }
        return (coding & 0x20) != 0 ? "compressed text" : ALPHABETS[coding >> 2 & 0x03];
    }

    /** Reads user data from the length of its header on; null when it is none. */
    static ShortMessage ofUserData(byte[] bytes) {
        ShortMessage message = userData(bytes, 0, "");
        return message == null || message.port == NO_PORT && message.width == 0 ? null : message;
    }

    private static ShortMessage userData(byte[] bytes, int from, String sender) {
        int end = from + 1 + at(bytes, from);
        if (at(bytes, from) < 0 || end > bytes.length) {
            return null;
        }
        byte[] data = Arrays.copyOfRange(bytes, end, bytes.length);
        ShortMessage message = new ShortMessage(sender, data, null);
        for (int element = from + 1, next; element < end; element = next) {
            next = element + 1 < end ? element + 2 + at(bytes, element + 1) : end + 1;
            if (next > end) {
                return null;
            }
            message.take(at(bytes, element), bytes, element + 2, next - element - 2);
        }
        return message;
    }

    /** Takes an element of the header; of two of a kind the last one counts. */
    private void take(int element, byte[] bytes, int from, int length) {
        if (element == PORTS_16 && length == 4 || element == PORTS_8 && length == 2) {
            int octets = length / 2;
            port = number(bytes, from, octets);
            senderPort = number(bytes, from + octets, octets);
        } else if (element == CONCATENATED_8 && length == 3
                || element == CONCATENATED_16 && length == 4) {
            int octets = length - 2;
            width = 8 * octets;
            reference = number(bytes, from, octets);
            total = at(bytes, from + octets);
            number = at(bytes, from + octets + 1);
        }
    }

    private static int number(byte[] bytes, int from, int octets) {
        return octets == 1 ? at(bytes, from) : at(bytes, from) << 8 | at(bytes, from + 1);
    }

    private static String address(byte[] bytes, int from, int digits, int kind) {
        StringBuilder text = new StringBuilder();
        if ((kind & KIND) == ALPHANUMERIC) {
            int letters = digits * 4 / 7;
            for (int i = 0; i < letters; ++i) {
                int low = from + 7 * i / 8;
                int pair = at(bytes, low) | Math.max(at(bytes, low + 1), 0) << 8;
                int letter = pair >> 7 * i % 8 & 0x7F;
                text.append(letter > ' ' && letter < 0x7F ? (char) letter : '?');
            }
            return text.toString();
        }
        text.append((kind & KIND) == INTERNATIONAL ? "+" : "");
        for (int i = 0; i < digits; ++i) {
            int digit = at(bytes, from + i / 2) >> i % 2 * 4 & 0xF;
            text.append(digit < DIGITS.length() ? DIGITS.substring(digit, digit + 1) : "");
        }
        return text.toString();
    }

    /** Why it carries no push: by what it is, its place among the parts, or its port; or null. */
    String fault() {
        if (other != null) {
            return other;
        }
        if (number == 0 || total == 0 || number > total) {
            return "the SMS says that it is part " + number + " of " + total;
        }
        return port == NO_PORT || port == 2948 || port == 2949
                ? null
                : "an SMS for port " + port + ", and not for pushes (2948, 2949)";
    }

    boolean hasPort() {
        return port != NO_PORT;
    }

    boolean isPart() {
        return width != 0;
    }

    /** The same for all parts of a message, and for no others. */
    String key() {
        return sender + ' ' + width + ' ' + reference + ' ' + total + ' ' + port + ' ' + senderPort;
    }

    /** For people. */
    @Override
    public String toString() {
        return "the SMS with reference " + reference + (sender.isEmpty() ? "" : " from " + sender);
    }
}
