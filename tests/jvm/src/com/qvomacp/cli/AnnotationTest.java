package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertArrayEquals;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Natives;
import java.io.ByteArrayOutputStream;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.Arrays;
import java.util.HexFormat;
import java.util.List;
import java.util.Random;
import java.util.function.Consumer;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;
import org.junit.jupiter.params.provider.ValueSource;

/** The notes on the bytes of a message cover each once, and stop where the library stops. */
class AnnotationTest extends Natives {
    private static final int CHANGES = 3000;

    static List<Path> pushes() throws Exception {
        return SamplesTest.pushes();
    }

    private static byte[] sample(String name) throws Exception {
        return Files.readAllBytes(Path.of("samples", name + ".push"));
    }

    /** The notes stand for the message's bytes, each once and in order; no line is too wide. */
    static void assertCovers(byte[] message) {
        for (boolean isPush : new boolean[] {true, false}) {
            Annotation annotation =
                    isPush ? Annotation.ofPush(message) : Annotation.ofBody(message);
            ByteArrayOutputStream covered = new ByteArrayOutputStream();
            int end = 0;
            if (annotation.header != null) {
                end = cover(annotation.header, message, 0, covered);
            }
            if (annotation.body != null) {
                end = cover(annotation.body, message, end, covered);
            }
            assertEquals(message.length, end);
            assertArrayEquals(message, covered.toByteArray());
        }
    }

    private static int cover(
            Annotation.Section section, byte[] message, int start, ByteArrayOutputStream covered) {
        int end = 0;
        for (Note note : section.notes) {
            assertEquals(end, note.offset, note.text);
            assertTrue(note.length >= 0 && note.depth >= 0, note.text);
            covered.write(message, start + note.offset, note.length);
            end += note.length;
        }
        return start + end;
    }

    /** The bytes that a listing prints, read back from it. */
    private static byte[] listed(byte[] message) {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        Listing.write(Annotation.ofPush(message), Palette.NONE)
                .lines()
                .skip(1)
                .forEach(
                        line -> {
                            assertTrue(Visible.columns(line) <= 80, line);
                            String column = line.substring(11, Math.min(line.length(), 35));
                            String digits = column.replace(" ", "");
                            bytes.writeBytes(HexFormat.of().parseHex(digits));
                        });
        return bytes.toByteArray();
    }

    /** Whether, why and where the message is refused is as the library has it. */
    static void assertAgrees(byte[] message) {
        Annotation annotation = Annotation.ofPush(message);
        String hex = HexFormat.of().formatHex(message);
        boolean headerTaken = parse(message, HEADER_ONLY);
        assertEquals(headerTaken, annotation.body != null, () -> "header of " + hex);
        parser.qvomacp_parser_del();
        if (headerTaken) {
            assertBodyAgrees(annotation.bodyBytes(), annotation.body);
        }
    }

    static void assertBodyAgrees(byte[] body, Annotation.Section section) {
        Verdict verdict = Verdict.of(Source.push(body));
        assertNotNull(verdict, "libomacp_explain.so cannot be loaded");
        Stop stop = section.stop;
        String own =
                stop == null
                        ? "taken"
                        : stop.code + " at " + stop.read + ": " + stop.getMessage();
        assertTrue(
                Explanation.agrees(section, verdict),
                () ->
                        own
                                + ", but the library says "
                                + verdict.code
                                + " at "
                                + verdict.read
                                + " of "
                                + HexFormat.of().formatHex(body));
    }

    /** Every message that differs from this one in one byte. */
    private static void changeEachByte(byte[] message, Consumer<byte[]> check) {
        for (int i = 0; i < message.length; ++i) {
            byte[] changed = message.clone();
            for (int value = 0; value < 256; ++value) {
                changed[i] = (byte) value;
                check.accept(changed);
            }
        }
    }

    @ParameterizedTest
    @MethodSource("pushes")
    void coversEveryByteOfASample(Path push) throws Exception {
        byte[] message = Files.readAllBytes(push);
        assertCovers(message);
        assertArrayEquals(message, listed(message));
        assertAgrees(message);
    }

    @ParameterizedTest
    @MethodSource("pushes")
    void coversEveryPrefixAndStopsWhereTheLibraryStops(Path push) throws Exception {
        byte[] message = Files.readAllBytes(push);
        for (int length = 0; length < message.length; ++length) {
            byte[] prefix = Arrays.copyOf(message, length);
            assertCovers(prefix);
            if (length % 32 == 0) {
                assertArrayEquals(prefix, listed(prefix));
            }
            assertAgrees(prefix);
        }
    }

    @ParameterizedTest
    @ValueSource(strings = {"internet", "string-table"})
    void stopsWhereTheLibraryStopsWhicheverByteIsChanged(String sample) throws Exception {
        changeEachByte(sample(sample), AnnotationTest::assertAgrees);
    }

    @ParameterizedTest
    @MethodSource("pushes")
    void coversEveryByteAndAgreesWhenBytesAreChanged(Path push) throws Exception {
        byte[] message = Files.readAllBytes(push);
        Random random = new Random(push.toString().hashCode());
        for (int i = 0; i < CHANGES; ++i) {
            byte[] changed = message.clone();
            for (int n = 1 + i % 3; n > 0; --n) {
                changed[random.nextInt(changed.length)] = (byte) random.nextInt(256);
            }
            assertCovers(changed);
            assertAgrees(changed);
            if (i % 10 == 0) {
                assertArrayEquals(changed, listed(changed));
            }
        }
    }

    /** Bytes of the decoder's own vocabulary, so that it comes far. */
    @Test
    void agreesOnTokensInAnyOrder() {
        int[] tokens = {
            0x00, 0x00, 0x01, 0x01, 0x01, 0x03, 0x06, 0x07, 0x05, 0x17, 0x33, 0x50, 0x52, 0x55, 0x57,
            0x83, 0x86, 0x87, 0x90, 0x92, 0xAB, 0xC3, 0xC6, 0xC6, 0x46, 0x45, 0x41, 0x34, 0x02, 0x80
        };
        byte[] start = HexFormat.of().parseHex("030b6a0561620063000545c6");
        Random random = new Random(7);
        for (int i = 0; i < 20 * CHANGES; ++i) {
            byte[] body = Arrays.copyOf(start, start.length + random.nextInt(24));
            for (int k = start.length; k < body.length; ++k) {
                body[k] = (byte) tokens[random.nextInt(tokens.length)];
            }
            body[10] = (byte) (i % 2 == 0 ? 0x45 : 0xC5);
            Annotation annotation = Annotation.ofBody(body);
            assertEquals(body.length, cover(annotation.body, body, 0, new ByteArrayOutputStream()));
            assertBodyAgrees(body, annotation.body);
        }
    }

    @Test
    void agreesWhichStringsATableHas() {
        for (int length = 0; length < 4; ++length) {
            for (int index = 0; index < 6; ++index) {
                String table = "0" + length + "61".repeat(length);
                String hex = "030b6a" + table + "45c65501870706" + "830" + index + "01010101";
                byte[] body = HexFormat.of().parseHex(hex);
                Annotation annotation = Annotation.ofBody(body);
                int strings = length == 0 ? 2 : length;
                assertEquals(index < strings, annotation.body.stop == null, hex);
                assertBodyAgrees(body, annotation.body);
            }
        }
    }

    @Test
    void agreesThatTooMuchTextIsRefused() {
        byte[] table = new byte[60000];
        Arrays.fill(table, (byte) 'x');
        ByteArrayOutputStream body = new ByteArrayOutputStream();
        body.writeBytes(HexFormat.of().parseHex("030b6a83d460"));
        body.writeBytes(table);
        body.writeBytes(HexFormat.of().parseHex("45c65501870706"));
        for (int i = 0; i < 200; ++i) {
            body.writeBytes(HexFormat.of().parseHex("8300"));
        }
        body.writeBytes(HexFormat.of().parseHex("01010101"));
        Annotation annotation = Annotation.ofBody(body.toByteArray());
        assertNotNull(annotation.body.stop);
        assertEquals(4111, annotation.body.stop.code);
        assertBodyAgrees(body.toByteArray(), annotation.body);
    }

    @Test
    void costsNoStackHoweverDeepTheElementsNest() {
        ByteArrayOutputStream body = new ByteArrayOutputStream();
        body.writeBytes(HexFormat.of().parseHex("030b6a0045"));
        for (int i = 0; i < 50000; ++i) {
            body.writeBytes(HexFormat.of().parseHex("c65101"));
        }
        Annotation annotation = Annotation.ofBody(body.toByteArray());
        assertEquals(4103, annotation.body.stop.code);
        assertTrue(annotation.body.stop.path.contains("(49992 more)"), annotation.body.stop.path);
        assertBodyAgrees(body.toByteArray(), annotation.body);
    }
}
