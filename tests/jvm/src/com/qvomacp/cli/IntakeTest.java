package com.qvomacp.cli;

import static java.nio.charset.StandardCharsets.ISO_8859_1;
import static java.nio.charset.StandardCharsets.UTF_16;
import static org.junit.jupiter.api.Assertions.assertArrayEquals;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Sms;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Base64;
import java.util.Collections;
import java.util.List;
import java.util.Random;
import java.util.stream.Collectors;
import java.util.stream.IntStream;
import java.util.stream.Stream;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;
import org.junit.jupiter.params.provider.MethodSource;
import org.junit.jupiter.params.provider.ValueSource;

/** Messages in what people hold: raw, as text, as dumps, in short messages. */
class IntakeTest {
    /** A push of 71 bytes with a document in it. */
    private static final byte[] PUSH =
            Sms.bytes(
                    "2A 06 2F 1F2D B6 9181 92",
                    "3042423342423535314630413933333539454332394536434541433134343045",
                    "3441363137343839 00",
                    "03 0B 6A 00 45 C6 55 01 87 11 06 83 00 01 87 07 06 03 41 00 01 01 01");

    private static final byte[] BODY = Arrays.copyOfRange(PUSH, 50, PUSH.length);

    static List<Path> samples() throws Exception {
        try (Stream<Path> files = Files.list(Path.of("samples"))) {
            return files.filter(file -> file.toString().endsWith(".push")).sorted().toList();
        }
    }

    private static List<Held> take(byte[]... inputs) {
        return take(null, inputs);
    }

    private static List<Held> take(Form form, byte[]... inputs) {
        Intake intake = new Intake(form);
        List<Held> held = new ArrayList<>();
        for (int i = 0; i < inputs.length; ++i) {
            held.addAll(intake.take("input " + (i + 1), inputs[i]));
        }
        held.addAll(intake.finish());
        return held;
    }

    private static List<Held> takeText(String text) {
        return take(text.getBytes(ISO_8859_1));
    }

    private static Held only(List<Held> held) {
        List<String> shown = held.stream().map(h -> h.name + ": " + h.error + h.notes).toList();
        assertEquals(1, held.size(), shown.toString());
        return held.get(0);
    }

    private static void assertMessage(byte[] expected, boolean isPush, List<Held> held) {
        Held message = only(held);
        assertNull(message.error);
        assertEquals(Sms.hex(expected), Sms.hex(message.bytes));
        assertEquals(isPush, message.isPush);
    }

    private static void assertPush(List<Held> held) {
        assertMessage(PUSH, true, held);
    }

    private static void assertRefused(String sentence, List<Held> held) {
        Held refused = only(held);
        assertNotNull(refused.error);
        assertTrue(refused.error.contains(sentence), refused.error);
    }

    private static byte[] oneSms() {
        return Sms.userData(PUSH, Sms.PORTS);
    }

    // Raw bytes

    @Test
    void takesAPushAndABodyAsTheyAre() {
        assertPush(take(PUSH));
        assertMessage(BODY, false, take(BODY));
    }

    @ParameterizedTest
    @MethodSource("samples")
    void takesNoSampleForAnSmsBehindAnyTransactionIdentifier(Path file) throws Exception {
        byte[] push = Files.readAllBytes(file);
        for (int transaction = 0; transaction < 256; ++transaction) {
            push[0] = (byte) transaction;
            assertMessage(push, true, take(push));
            assertMessage(push, true, takeText(Sms.hex(push)));
        }
    }

    /** A string table that reads as the ports of a push, behind elements 06 and 03. */
    @Test
    void takesAPushForNoUserDataWhereTheLengthsOfBothComeOut() {
        byte[] push =
                Sms.bytes(
                        "16 06 01 B6 030B6A0F 616263646566676869 05040B8423F0",
                        "45 C6 55 01 87 11 06 83 00 01 01 01");
        assertNotNull(ShortMessage.ofUserData(push));
        assertMessage(push, true, take(push));
    }

    @ParameterizedTest
    @CsvSource({
        "0B915348000000F0", "05812143F5", "0681214365", "06912143F5", "0B8153480000 00F0",
        "0AD04D61724A00", "0ED0E2B23C3CA6D701", "00D0", "1481214365870921436587F9"
    })
    void readsAnSmsFromAnySender(String sender) {
        Sms sms = new Sms().sender(sender.replace(" ", ""));
        assertPush(take(sms.deliver(oneSms())));
        assertPush(take(sms.centre("").deliver(oneSms())));
        assertPush(take(sms.centre("00").deliver(oneSms())));
        assertPush(take(sms.centre("0B915348006000534800600F").deliver(oneSms())));
    }

    @Test
    void takesASixDigitSendersSmsForNoPush() {
        byte[] sms = new Sms().centre("").first("40").sender("0681214365").deliver(oneSms());
        assertEquals(0x06, sms[1]);
        assertPush(take(sms));
    }

    @Test
    void readsUserDataAlone() {
        assertPush(take(oneSms()));
        assertPush(take(Form.UD, oneSms()));
        assertPush(take(Sms.userData(PUSH, "05040B8523F0")));
    }

    @ParameterizedTest
    @ValueSource(
            strings = {
                "05040B8423F0|000305 0101",
                "000305 0101|05040B8423F0",
                "08040005 0101|05040B8423F0",
                "060180|05040B8423F0",
                "05040B8423F0|7F03010203",
                "7F00|05040B8423F0|000305 0101",
                "000305 0101|7F0101|05040B8423F0",
            })
    void takesTheElementsInAnyOrder(String elements) {
        byte[] data = Sms.userData(PUSH, elements.replace(" ", "").split("\\|"));
        assertPush(take(data));
        assertPush(take(new Sms().deliver(data)));
        assertPush(take(Form.SMS, new Sms().centre("").deliver(data)));
    }

    @ParameterizedTest
    @ValueSource(strings = {"04", "F4", "F5", "F6", "F7"})
    void takesEightBitData(String coding) {
        assertPush(take(new Sms().coding(coding).deliver(oneSms())));
    }

    @ParameterizedTest
    @CsvSource({
        "00, 7-bit text", "F0, 7-bit text", "F3, 7-bit text", "C0, 7-bit text", "0C, 7-bit text",
        "08, UCS-2 text", "E0, UCS-2 text", "24, compressed text", "05, 8-bit data", "06, 8-bit data",
        "07, 8-bit data", "14, 8-bit data", "15, 8-bit data", "44, 8-bit data", "FC, 8-bit data"
    })
    void namesOtherCodings(String coding, String name) {
        byte[] data = oneSms();
        boolean isSeptets = name.startsWith("7");
        int length = isSeptets ? data.length * 8 / 7 : data.length;
        byte[] sms = new Sms().coding(coding).deliver(data, length);
        assertRefused(name, take(sms));
        assertRefused("(coding scheme " + coding + ")", take(sms));
    }

    @Test
    void namesWhatIsNoPushInAnSms() {
        assertRefused("an SMS for port 5505,", take(Sms.userData(PUSH, "0504158123F0")));
        assertRefused("an SMS for port 226,", take(Sms.userData(PUSH, "0402E200", "0003010101")));
        assertRefused("without a user data header", take(new Sms().first("04").deliver(PUSH)));
        assertRefused(
                "without a port",
                take(new Sms().deliver(Sms.userData("hello".getBytes(), "0003010101"))));
        byte[] submit =
                Sms.bytes(
                        "00 51 00 0B915348000000F0 00 04 A7",
                        String.format("%02X", oneSms().length),
                        Sms.hex(oneSms()));
        assertRefused("an SMS-SUBMIT", take(submit));
        assertRefused("an SMS-SUBMIT", take(Arrays.copyOfRange(submit, 1, submit.length)));
    }

    @Test
    void takesAPushOfPartsWithoutAPort() {
        assertPush(take(new Sms().deliver(Sms.userData(PUSH, "0003010101"))));
    }

    @Test
    void isNoSmsWhenALengthDoesNotComeOut() {
        byte[] sms = new Sms().deliver(oneSms());
        for (byte[] changed :
                List.of(
                        Arrays.copyOf(sms, sms.length - 1),
                        Arrays.copyOf(sms, sms.length + 1),
                        new Sms().deliver(oneSms(), 77),
                        new Sms().sender("159153480000005348000000F0").deliver(oneSms()))) {
            Held refused = only(take(changed));
            assertNotNull(refused.error, Sms.hex(changed));
            assertRefused("its lengths do not come out", take(Form.SMS, changed));
        }
        byte[] beyond = oneSms();
        beyond[0] = 120;
        assertRefused("does not end where its length says", take(new Sms().deliver(beyond)));
        byte[] within = oneSms();
        within[0] = 5;
        assertRefused("does not end where its length says", take(new Sms().deliver(within)));
        assertRefused("its lengths do not come out", take(Form.UD, within));
    }

    @Test
    void doesAsItIsTold() {
        assertMessage(oneSms(), true, take(Form.PUSH, oneSms()));
        assertMessage(PUSH, false, take(Form.BODY, PUSH));
        assertRefused("no SMS-DELIVER", take(Form.SMS, PUSH));
        assertRefused("no user data", take(Form.UD, PUSH));
        assertPush(take(Form.SMS, Sms.hex(new Sms().deliver(oneSms())).getBytes()));
    }

    // Parts

    @ParameterizedTest
    @CsvSource({"100, false", "40, false", "30, false", "100, true", "40, true", "24, true"})
    void putsPartsTogetherInAnyOrder(int most, boolean isWide) {
        List<byte[]> userData = Sms.parts(PUSH, most, isWide, 0xA5);
        assertEquals((PUSH.length + most - 1) / most, userData.size());
        for (int order = 0; order < 6; ++order) {
            List<byte[]> data = new ArrayList<>(userData);
            if (order == 1) {
                Collections.reverse(data);
            } else {
                Collections.shuffle(data, new Random(order));
            }
            List<byte[]> sms = data.stream().map(new Sms()::deliver).collect(Collectors.toList());
            List<byte[]> bare =
                    data.stream().map(new Sms().centre("")::deliver).collect(Collectors.toList());
            for (List<byte[]> messages : List.of(data, sms, bare)) {
                assertPush(take(messages.toArray(new byte[0][])));
                assertPush(take(Sms.lines(messages)));
                List<byte[]> texts =
                        messages.stream().map(m -> Sms.hex(m).getBytes()).toList();
                assertPush(take(texts.toArray(new byte[0][])));
            }
        }
    }

    @Test
    void tellsWhereThePartsComeFrom() {
        List<byte[]> parts = Sms.parts(PUSH, 40, false, 1);
        assertEquals("input 2 + input 1", only(take(parts.get(1), parts.get(0))).name);
        assertEquals("input 1, lines 1 and 2", only(take(Sms.lines(parts))).name);
    }

    @Test
    void namesAMissingPart() {
        List<byte[]> parts = Sms.parts(PUSH, 20, false, 7);
        assertEquals(4, parts.size());
        Sms sms = new Sms();
        assertRefused(
                "parts 2 and 3 of 4 of the SMS with reference 7 from +35840000000 are missing",
                take(sms.deliver(parts.get(0)), sms.deliver(parts.get(3))));
        assertRefused(
                "part 1 of 4 of the SMS with reference 7 is missing",
                take(parts.get(1), parts.get(2), parts.get(3)));
    }

    @Test
    void notesAPartThatIsThereTwice() {
        List<byte[]> parts = Sms.parts(PUSH, 40, false, 7);
        List<Held> held = take(parts.get(0), parts.get(0), parts.get(1));
        assertPush(held);
        assertEquals(
                List.of(
                        "part 1 of the SMS with reference 7 is there twice: in input 1 and in"
                                + " input 2"),
                held.get(0).notes);
        List<Held> late = take(parts.get(0), parts.get(1), parts.get(1));
        assertEquals(2, late.size());
        assertPush(late.subList(0, 1));
        assertEquals(1, late.get(1).notes.size());
        assertNull(late.get(1).error);
    }

    @Test
    void refusesAPartThatIsThereTwiceWithDifferentBytes() {
        List<byte[]> parts = Sms.parts(PUSH, 40, false, 7);
        byte[] other = parts.get(0).clone();
        other[other.length - 1] ^= 1;
        assertRefused(
                "part 1 of the SMS with reference 7 is there twice with different bytes",
                take(parts.get(0), other, parts.get(1)));
    }

    @ParameterizedTest
    @CsvSource({"0, 0", "0, 1", "2, 0", "2, 3"})
    void refusesAPartThatCanBeNone(int total, int number) {
        String sentence = "part " + number + " of " + total;
        String narrow = Sms.concatenated(1, total, number);
        assertRefused(sentence, take(Sms.userData(PUSH, Sms.PORTS, narrow)));
        String wide = Sms.concatenatedWide(1, total, number);
        assertRefused(sentence, take(Sms.userData(PUSH, Sms.PORTS, wide)));
    }

    @Test
    void keepsMessagesApart() {
        byte[] other = PUSH.clone();
        other[0] = 0x77;
        List<List<byte[]>> pairs =
                List.of(
                        Sms.parts(other, 40, false, 8),
                        Sms.parts(other, 40, true, 7),
                        Sms.parts(other, 20, false, 7));
        for (List<byte[]> others : pairs) {
            List<byte[]> mixed = new ArrayList<>(Sms.parts(PUSH, 40, false, 7));
            mixed.addAll(1, others);
            List<Held> held = take(mixed.toArray(new byte[0][]));
            assertEquals(2, held.size());
            assertPush(held.subList(1, 2));
            assertMessage(other, true, held.subList(0, 1));
        }
        List<byte[]> ours = Sms.parts(PUSH, 40, false, 7);
        List<byte[]> theirs = Sms.parts(other, 40, false, 7);
        Sms one = new Sms();
        Sms two = new Sms().sender("0681214365");
        List<Held> held =
                take(
                        one.deliver(ours.get(0)),
                        two.deliver(theirs.get(1)),
                        two.deliver(theirs.get(0)),
                        one.deliver(ours.get(1)));
        assertEquals(2, held.size());
        assertMessage(other, true, held.subList(0, 1));
        assertPush(held.subList(1, 2));
    }

    // Text

    static List<String> hexadecimal() {
        String digits = Sms.hex(PUSH);
        List<String> pairs = List.of(digits.split("(?<=\\G..)"));
        return List.of(
                digits,
                digits.toLowerCase(),
                String.join(" ", pairs),
                String.join(":", pairs),
                "0x" + String.join(", 0x", pairs),
                "{ 0x" + String.join(", 0x", pairs).toLowerCase() + " };",
                "0x" + digits,
                "\\x" + String.join("\\x", pairs),
                "char m[] = \"\\x" + String.join("\\x", pairs) + "\";",
                "\uFEFF" + digits,
                "\u00EF\u00BB\u00BF" + digits,
                "PDU: " + digits,
                "data=" + digits,
                "Data: " + digits,
                "bad: " + digits,
                "2015-01-01 12:00:00 DEBUG push body <" + digits + ">",
                "push:\n" + digits + "\n",
                "\n\n" + digits + "\r\n\r\n",
                digits.replaceAll("(?<=\\G.{64})", "\n"),
                digits.replaceAll("(?<=\\G.{33})", "\r\n"),
                digits.replaceAll("(?<=\\G.{32})", "\n\n"),
                String.join(" ", pairs).replaceAll("(?<=\\G.{48})", "\n"),
                String.join("", pairs).replaceAll("(?<=\\G.{4})", " "));
    }

    @ParameterizedTest
    @MethodSource("hexadecimal")
    void readsHexadecimalAsItIsWritten(String text) {
        if (text.charAt(0) == '\uFEFF') {
            assertPush(take(text.getBytes(java.nio.charset.StandardCharsets.UTF_8)));
            assertPush(take(text.substring(1).getBytes(UTF_16)));
            return;
        }
        assertPush(takeText(text));
    }

    @Test
    void readsALiteralWhereBytesStandForThemselves() {
        StringBuilder literal = new StringBuilder("b'");
        for (byte b : PUSH) {
            boolean isPlain = b > ' ' && b < 0x7F && b != '\\' && b != '\'';
            literal.append(isPlain ? "" + (char) b : String.format("\\x%02x", b));
        }
        assertPush(takeText(literal + "'"));
    }

    @Test
    void readsBase64() {
        String text = Base64.getEncoder().encodeToString(PUSH);
        assertPush(takeText(text));
        assertPush(takeText(text.replaceAll("(?<=\\G.{40})", "\n") + "\n"));
        assertPush(takeText(Base64.getUrlEncoder().withoutPadding().encodeToString(PUSH)));
        assertPush(takeText(Base64.getEncoder().encodeToString(new Sms().deliver(oneSms()))));
    }

    /** A cell of a dump of characters. */
    private static String cell(byte b) {
        int escape = "\0\u0007\b\t\n\u000b\f\r".indexOf(b);
        String shown = b > ' ' - 1 && b < 0x7F ? "" + (char) b : String.format("%03o", b);
        return String.format(" %3s", escape < 0 ? shown : "\\" + "0abtnvfr".charAt(escape));
    }

    private static String bits(byte[] bytes) {
        StringBuilder text = new StringBuilder();
        for (int at = 0; at < bytes.length; at += 6) {
            text.append(String.format("%08x:", at));
            for (int i = at; i < Math.min(at + 6, bytes.length); ++i) {
                text.append(' ').append(Integer.toBinaryString(0x100 | bytes[i] & 0xFF).substring(1));
            }
            text.append(" ".repeat(Math.max(0, at + 6 - bytes.length) * 9)).append("  ......\n");
        }
        return text.toString();
    }

    private static String dump(byte[] bytes, String style) {
        if (style.equals("xxd -b")) {
            return bits(bytes);
        }
        StringBuilder text = new StringBuilder();
        for (int at = 0; at < bytes.length; at += 16) {
            int count = Math.min(16, bytes.length - at);
            int from = at;
            List<String> pairs =
                    IntStream.range(at, at + count)
                            .mapToObj(i -> String.format("%02x", bytes[i]))
                            .toList();
            String characters =
                    IntStream.range(at, at + count)
                            .mapToObj(i -> bytes[i] < ' ' ? "." : "" + (char) bytes[i])
                            .collect(Collectors.joining());
            switch (style) {
                case "hexdump -C":
                    String left = String.join(" ", pairs.subList(0, Math.min(8, count)));
                    String right = String.join(" ", pairs.subList(Math.min(8, count), count));
                    text.append(
                            String.format(
                                    "%08x  %-48s  |%s|%n", at, left + "  " + right, characters));
                    break;
                case "xxd":
                    StringBuilder words = new StringBuilder();
                    for (int i = 0; i < count; ++i) {
                        words.append(pairs.get(i)).append(i % 2 == 1 ? " " : "");
                    }
                    text.append(String.format("%08x: %-40s %s%n", at, words, characters));
                    break;
                case "od -t x1":
                    text.append(String.format("%07o %s%n", at, String.join(" ", pairs)));
                    break;
                case "od -A x -t x1":
                    text.append(String.format("%06x %s%n", at, String.join(" ", pairs)));
                    break;
                case "od -A d -t x1":
                    text.append(String.format("%07d %s%n", at, String.join(" ", pairs)));
                    break;
                case "od -A x -t x1z":
                    text.append(
                            String.format(
                                    "%06x %-47s  >%s<%n",
                                    at, String.join(" ", pairs), characters));
                    break;
                case "hexdump":
                    text.append(String.format("%07x", at));
                    for (int i = 0; i < count; i += 2) {
                        int high = i + 1 < count ? bytes[from + i + 1] & 0xFF : 0;
                        text.append(String.format(" %02x%02x", high, bytes[from + i]));
                    }
                    text.append('\n');
                    break;
                case "od -c":
                case "od -An -c":
                case "hexdump -c":
                    String format = style.equals("od -c") ? "%07o" : "%07x";
                    text.append(style.equals("od -An -c") ? "" : String.format(format, at));
                    for (int i = 0; i < count; ++i) {
                        text.append(cell(bytes[from + i]));
                    }
                    text.append(style.equals("hexdump -c") ? "    ".repeat(16 - count) : "").append('\n');
                    break;
                case "od -b":
                    text.append(String.format("%07o", at));
                    for (int i = 0; i < count; ++i) {
                        text.append(String.format(" %03o", bytes[from + i]));
                    }
                    text.append('\n');
                    break;
                case "od":
                case "od -x":
                    text.append(String.format("%07o", at));
                    for (int i = 0; i < count; i += 2) {
                        int high = i + 1 < count ? bytes[from + i + 1] & 0xFF : 0;
                        int word = high << 8 | bytes[from + i] & 0xFF;
                        text.append(String.format(style.equals("od") ? " %06o" : " %04x", word));
                    }
                    text.append('\n');
                    break;
                default:
                    text.append(
                            String.format(
                                    "%04x   %-48s  %s%n",
                                    at, String.join(" ", pairs), characters));
                    break;
            }
        }
        return text + String.format(end(style), bytes.length);
    }

    /** The line with the length that ends a dump. */
    private static String end(String style) {
        switch (style) {
            case "hexdump -C":
                return "%08x%n";
            case "hexdump":
            case "hexdump -c":
                return "%07x%n";
            case "od -An -c":
                return "";
            case "od -A x -t x1":
            case "od -A x -t x1z":
                return "%06x%n";
            case "od -A d -t x1":
                return "%07d%n";
            default:
                return style.startsWith("od") ? "%07o%n" : "";
        }
    }

    @ParameterizedTest
    @ValueSource(
            strings = {
                "hexdump -C", "xxd", "od -t x1", "od -A x -t x1", "od -A d -t x1",
                "od -A x -t x1z", "hexdump", "od -x", "od", "od -b", "packets", "od -c", "od -An -c",
                "hexdump -c", "xxd -b"
            })
    void readsDumpsWithOffsetsAndCharacters(String style) {
        assertPush(takeText(dump(PUSH, style)));
        assertPush(takeText("A push:\n\n" + dump(PUSH, style)));
        byte[] sms = new Sms().deliver(oneSms());
        assertPush(takeText(dump(sms, style)));
        for (int length = 51; length <= PUSH.length; ++length) {
            byte[] cut = Arrays.copyOf(PUSH, length);
            assertMessage(cut, true, takeText(dump(cut, style)));
        }
    }

    @Test
    void readsCharactersOfEveryKindInADump() {
        byte[] push = PUSH.clone();
        for (int value = 0; value < 256; ++value) {
            push[30] = (byte) value;
            for (String style : List.of("od -c", "od -An -c", "hexdump -c", "xxd -b")) {
                assertMessage(push, true, takeText(dump(push, style)));
            }
        }
    }

    @ParameterizedTest
    @ValueSource(
            strings = {
                // od -a, od -d, od -t u1, od -t x1c, hexdump -d, od -t o4; od -t u1 and -d without offsets
                "0000000   S ack   /  us   -   6 dc1 soh dc2   C   7   A   1   A   9   0\n"
                        + "0000020   E   F   3   B   5   0   3   6   D\n0000031\n",
                "0000000  1619  7983 13869   401 17298 16695 16689 12345\n"
                        + "0000020 17989 16947 12341 13872 00068\n0000031\n",
                "0000000   1   6  47  31  45 182 145 128 146  67  55  65  49  65  57  48\n"
                        + "0000020  69  70  51  66  53  48  51  54  68\n0000031\n",
                "0000000  01  06  2f  1f  2d  b6  91  80  92  43  37  41  31  41  39  30\n"
                        + "        001 006   /  us   - 266 221 200 222   C   7   A   1   A   9   0\n"
                        + "0000020  45  46  33\n          E   F   3\n0000023\n",
                "0000000   01537   07983   46637   32913   17298   16695   16689   12345\n"
                        + "0000010   17989   16947   12341   13872   00068                        \n"
                        + "0000019\n",
                "0000000 03713603001 20044333055 10131641222 06016240461\n"
                        + "0000020 10214643105 15000630065\n0000030\n",
                "   1   6  47  31  45 182 145 128 146  67  55  65  49  65  57  48\n  69 170   1   6 128\n",
                "  1537  7983 46637 32913 17298 16695 16689 12345\n 17989 16947 12341\n",
                "[1, 6, 47, 31, 45, -74, -111, -128]\n"
            })
    void namesADumpOfAnythingElseThanBytes(String dump) {
        assertRefused("numbers or a dump, and not bytes as", takeText(dump));
        List<Held> held = takeText(dump + "\npush: " + Sms.hex(PUSH) + "\n");
        assertEquals(2, held.size());
        assertPush(held.subList(1, 2));
    }

    @Test
    void readsTheAsteriskOfADump() {
        byte[] push = Arrays.copyOf(PUSH, 160);
        String all = dump(push, "hexdump -C");
        String[] lines = all.split("\n");
        String first = String.join("\n", Arrays.copyOf(lines, 6));
        assertMessage(push, true, takeText(first + "\n*\n" + lines[lines.length - 1] + "\n"));
        String huge = dump(PUSH, "hexdump -C").split("\n")[0] + "\n*\nffffff0\n";
        assertFalse(takeText(huge).isEmpty());
    }

    @Test
    void readsWhatAModemSays() {
        List<byte[]> parts = Sms.parts(PUSH, 40, false, 3);
        String one = Sms.hex(new Sms().deliver(parts.get(0)));
        String two = Sms.hex(new Sms().deliver(parts.get(1)));
        assertPush(takeText("+CMT: ,67\r\n" + two + "\r\n+CMT: \"+35840\",,67\r\n" + one + "\r\n"));
        assertPush(
                takeText(
                        "AT+CMGL=4\r\n+CMGL: 1,1,,67\r\n"
                                + one
                                + "\r\n+CMGL: 2,\"REC READ\",\"+35840\",,"
                                + "\"15/01/01,12:00:00+08\"\r\n"
                                + two
                                + "\r\n\r\nOK\r\n"));
    }

    @Test
    void readsAGatewaysForm() {
        List<byte[]> parts = Sms.parts(PUSH, 40, false, 3);
        StringBuilder form = new StringBuilder();
        for (byte[] part : parts) {
            int header = part[0] + 1;
            form.append("GET /cgi-bin/sendsms?username=u&to=123&udh=")
                    .append(percent(Arrays.copyOf(part, header)))
                    .append("&text=")
                    .append(percent(Arrays.copyOfRange(part, header, part.length)))
                    .append("&coding=2 HTTP/1.0\n");
        }
        assertPush(takeText(form.toString()));
        byte[] whole = oneSms();
        String header = Sms.hex(Arrays.copyOf(whole, 7));
        assertPush(takeText("udh=" + header + "&text=" + Sms.hex(PUSH)));
        assertPush(takeText("text=" + percent(PUSH)));
        assertPush(takeText("text=" + plain(PUSH)));
        assertPush(takeText(percent(PUSH)));
    }

    private static String percent(byte[] bytes) {
        return Sms.hex(bytes).replaceAll("(..)", "%$1");
    }

    private static String plain(byte[] bytes) {
        StringBuilder text = new StringBuilder();
        for (byte b : bytes) {
            boolean isPlain = b < 0x7F && b > 0 && Character.isLetterOrDigit(b);
            text.append(isPlain ? "" + (char) b : String.format("%%%02X", b));
        }
        return text.toString();
    }

    @Test
    void readsSeveralMessagesOfAText() {
        byte[] other = PUSH.clone();
        other[0] = 0x55;
        List<Held> held = takeText(Sms.hex(PUSH) + "\n" + Sms.hex(other) + "\n" + Sms.hex(BODY));
        assertEquals(3, held.size());
        assertPush(held.subList(0, 1));
        assertMessage(other, true, held.subList(1, 2));
        assertMessage(BODY, false, held.subList(2, 3));
        assertEquals("input 1, line 2", held.get(1).name);
        List<Held> apart = takeText("first:\n" + Sms.hex(PUSH) + "\nsecond:\n" + Sms.hex(other));
        assertEquals(2, apart.size());
        assertMessage(other, true, apart.subList(1, 2));
    }

    @ParameterizedTest
    @CsvSource({
        "'', no bytes", "' ', nothing but blanks", "hello world, text",
        "<?xml version='1.0'?><si></si>, a service indication in XML",
        "'<wap-provisioningdoc>', 'a provisioning document in XML, which is not encoded yet'",
        "'{\"a\": 1}', JSON", "'+CMT: ,10', a modem", "01062, an odd number of digits",
        "8C8298, an MMS notification", "FFFEFD, nothing that is known"
    })
    void callsWhatIsNoMessageWhatItIs(String text, String expected) {
        assertRefused(expected, takeText(text));
    }

    @Test
    void handsOnWhatThePushReaderExplainsBetter() {
        Held cut = only(take(Arrays.copyOf(PUSH, 20)));
        assertNull(cut.error);
        assertTrue(cut.isPush);
        Held indication = only(take(Sms.bytes("02056A0045C6")));
        assertFalse(indication.isPush);
    }

    @Test
    void neverFailsOnAnyBytes() {
        Random random = new Random(3);
        byte[][] seeds = {
            PUSH, oneSms(), new Sms().deliver(oneSms()), dump(PUSH, "hexdump -C").getBytes(),
            "0x1, \\x, {}, udh=%0&text=%\n*\n0000 \n\\".getBytes(),
            Sms.lines(Sms.parts(PUSH, 30, true, 9))
        };
        for (int i = 0; i < 8000; ++i) {
            byte[] bytes = seeds[i % seeds.length].clone();
            for (int changes = random.nextInt(6); changes > 0; --changes) {
                int at = random.nextInt(bytes.length);
                int letter = "0x\\:*%=\n \"'".charAt(random.nextInt(11));
                bytes[at] = (byte) (random.nextBoolean() ? random.nextInt(256) : letter);
            }
            for (Held held : take(bytes, Arrays.copyOf(bytes, random.nextInt(bytes.length + 1)))) {
                assertTrue(held.bytes != null || held.error != null || !held.notes.isEmpty());
            }
        }
    }

    @Test
    void readsALongTextInOneGo() {
        List<String> units =
                List.of("01 ", "\\x01", "0000 00\n*\n", "a:", "\"", "%41", "A\n", "text=");
        for (String unit : units) {
            assertNotNull(takeText(unit.repeat((1 << 18) / unit.length())));
        }
    }

    @Test
    void comparesNoBytesByReference() {
        assertArrayEquals(PUSH, only(take(PUSH.clone())).bytes);
    }
}
