package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertArrayEquals;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.ChildVm;
import com.qvomacp.support.Document;
import com.qvomacp.support.Push;
import java.io.ByteArrayOutputStream;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.Arrays;
import java.util.HexFormat;
import java.util.List;
import java.util.Random;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;
import org.junit.jupiter.params.provider.ValueSource;

/** The listing has each byte of a message once, whatever the message is. */
class BytesTest {
    private static final int CHANGES = 500;
    private static final int MIB = 1 << 20;

    @TempDir Path directory;

    static List<Path> pushes() throws Exception {
        return SamplesTest.pushes();
    }

    /** The bytes that a listing prints, read back from it. */
    private static byte[] listed(byte[] message) {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        Program program = Program.run(message, "--bytes");
        assertTrue(program.status() < 2, program.errors());
        int column = program.output().startsWith("msg") ? 11 : 6;
        for (String line : program.output().lines().skip(1).toList()) {
            assertTrue(Visible.columns(line) <= 80, line);
            if (line.isEmpty()) {
                break;
            }
            int end = Math.min(line.length(), column + 24);
            bytes.writeBytes(
                    HexFormat.of().parseHex(line.substring(Math.min(column, end), end).replace(" ", "")));
        }
        return bytes.toByteArray();
    }

    private static void assertLists(byte[] message) {
        assertArrayEquals(message, listed(message), () -> HexFormat.of().formatHex(message));
    }

    @ParameterizedTest
    @MethodSource("pushes")
    void listsEveryPrefixOfASample(Path push) throws Exception {
        byte[] message = Files.readAllBytes(push);
        for (int length = 1; length <= message.length; ++length) {
            assertLists(Arrays.copyOf(message, length));
        }
    }

    @ParameterizedTest
    @MethodSource("pushes")
    void listsEveryByteWhenSomeAreChanged(Path push) throws Exception {
        byte[] message = Files.readAllBytes(push);
        Random random = new Random(push.toString().hashCode());
        for (int i = 0; i < CHANGES; ++i) {
            byte[] changed = message.clone();
            for (int n = 1 + i % 3; n > 0; --n) {
                changed[random.nextInt(changed.length)] = (byte) random.nextInt(256);
            }
            assertLists(changed);
        }
    }

    @Test
    void listsEveryByteOfABodyAlone() {
        Random random = new Random(11);
        for (int i = 0; i < CHANGES; ++i) {
            byte[] body = new byte[8 + random.nextInt(64)];
            random.nextBytes(body);
            System.arraycopy(new byte[] {3, 0x0B, 0x6A, 0, 0x45}, 0, body, 0, 5);
            assertLists(body);
        }
    }

    /** A megabyte that asks for as much as it can. */
    private static byte[] hostile(String family) {
        ByteArrayOutputStream body = new ByteArrayOutputStream(MIB);
        body.writeBytes(new byte[] {3, 0x0B, 0x6A, 0, 0x45});
        byte[] piece =
                switch (family) {
                    case "one-byte elements" -> new byte[] {0x05};
                    case "nesting" -> new byte[] {0x46};
                    case "characteristics" -> new byte[] {(byte) 0xC6, 0x55, 1};
                    case "unknown tokens" -> new byte[] {(byte) 0x87, (byte) 0x99, 1};
                    case "page switches" -> new byte[] {0, 1};
                    case "types unknown to the library" ->
                            new byte[] {(byte) 0xC6, 0x50, 3, 'a', 0, 1, 1};
                    case "names of another page" ->
                            new byte[] {(byte) 0xC6, 0x5B, 1, (byte) 0x87, 0x36, 1, 1};
                    default -> new byte[] {3, 'a', 0};
                };
        while (body.size() + piece.length <= MIB) {
            body.writeBytes(piece);
        }
        return body.toByteArray();
    }

    private void assertListsWith(String heap, byte[] message) throws Exception {
        Path file = Files.write(directory.resolve("message"), message);
        ChildVm.Result result =
                ChildVm.run(
                        List.of("-Xmx" + heap),
                        new byte[0],
                        BytesTest.ToNowhere.class,
                        "--bytes",
                        "--limit=2M",
                        file.toString());
        assertTrue(result.status() < 2, result.toString());
        assertEquals("", result.errors());
    }

    /** The program, but for the output, which would be a hundred megabytes. */
    static final class ToNowhere {
        public static void main(String[] arguments) {
            System.exit(
                    Main.run(
                            System.in,
                            java.io.OutputStream.nullOutputStream(),
                            System.err,
                            Terminal.NONE,
                            arguments));
        }
    }

    @ParameterizedTest
    @ValueSource(
            strings = {
                "one-byte elements",
                "nesting",
                "characteristics",
                "unknown tokens",
                "page switches",
                "types unknown to the library",
                "names of another page",
                "texts"
            })
    void listsAMegabyteOfAnything(String family) throws Exception {
        assertListsWith("160m", hostile(family));
    }

    @Test
    void listsAnOrdinaryMegabyteInLittleMemory() throws Exception {
        Document.Element[] elements = new Document.Element[13000];
        Arrays.fill(
                elements,
                Document.characteristic(
                        "NAPDEF",
                        Document.parm("NAPID", "internet.example.com"),
                        Document.parm("BEARER", Document.token(0xAB)),
                        Document.parm("NAP-ADDRESS", "internet.example.com")));
        byte[] push = Push.push(elements);
        assertTrue(push.length > MIB * 3 / 4 && push.length < 2 * MIB);
        assertListsWith("64m", push);
    }
}
