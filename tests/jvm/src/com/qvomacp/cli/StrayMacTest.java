package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertEquals;

import java.nio.charset.StandardCharsets;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;

/** A MAC that stands behind the header. */
class StrayMacTest {
    private static final String MAC = "0BB3BB551F0A93359EC29E6CEAC1440E4A617489";

    @ParameterizedTest
    @CsvSource({
        "%M_, 0, 1", "%M, 0, -1", "%Mx_, 0, -1", "%M0_, 0, -1", "x%M_, 1, 2", "%M_, 2, -1",
        "%123_%M_, 0, 6", "%MAC_M_, 0, 5", "'', 0, -1"
    })
    void isFortyDigitsWithANulBehindThem(String form, int from, int expected) {
        String text =
                form.replace("MAC", "\u0001").replace("M", MAC).replace("\u0001", "MAC")
                        .replace('_', '\0')
                        .replace('%', '\u0092');
        byte[] message = text.getBytes(StandardCharsets.ISO_8859_1);
        assertEquals(expected, StrayMac.find(message, from));
    }
}
