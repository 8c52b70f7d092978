package com.qvomacp.cli;

/** Looks for a MAC that stands where no reader of push headers looks for one: in the body. */
final class StrayMac {
    private static final int DIGITS = 40;

    private StrayMac() {}

    /**
     * Finds 40 hexadecimal digits that stand alone, behind the token or the name of the parameter
     * or behind any octet that is no digit, with a NUL behind them.
     *
     * @param message a push
     * @param from where the header ends
     * @return where the digits begin, bytes from the start of the message; -1 when there are none
     */
    static int find(byte[] message, int from) {
        int digits = 0;
        for (int at = Math.max(from, 0); at < message.length; ++at) {
            boolean isDigit = message[at] > 0 && Character.digit(message[at], 16) >= 0;
            if (message[at] == 0 && digits == DIGITS) {
                return at - DIGITS;
            }
            digits = isDigit ? digits + 1 : 0;
        }
        return -1;
    }
}
