package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Bytes;
import java.util.List;
import java.util.Random;
import java.util.concurrent.Callable;
import java.util.concurrent.FutureTask;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.ValueSource;

/** Bodies of a mebibyte that were made to cost much. */
class HostileBodiesTest {
    private static final int MEBIBYTE = 1 << 20;
    private static final String HEADER = "03 0B 6A 00 45";
    private static final int LITTLE_STACK = 128 << 10;
    private static final ReadOptions LARGE = ReadOptions.DEFAULT.withInputLimit(MEBIBYTE);

    /** What tree and views may take for each byte of a body. */
    private static final int BYTES_EACH = 100;

    /** What the views may take of it. */
    private static final int FOR_VIEWS = 30;

    /** Where items are kept, so that they are not collected. */
    private static Object kept;

    /** Does something on a stack that has no room for recursion. */
    private static <T> T onLittleStack(Callable<T> work) throws Exception {
        FutureTask<T> task = new FutureTask<>(work);
        Thread thread = new Thread(null, task, "little stack", LITTLE_STACK);
        thread.start();
        thread.join();
        return task.get();
    }

    /** Asks for everything that there is of a document. */
    private static int askAll(ProvisioningDocument document) {
        int answers = document.hashCode() + document.toString().length();
        for (Deviation deviation : document.deviations()) {
            answers += deviation.toString().length();
        }
        int[] rows = {0};
        document.describe((offset, length, depth, meaning) -> rows[0] += length);
        assertEquals(document.body().length, rows[0]);
        return answers;
    }

    /** Elements in each other or beside each other, texts, instructions, pages, values. */
    @ParameterizedTest
    @ValueSource(
            strings = {
                "46", "47", "45", "48", "06", "07", "05", "08", "C6", "C7", "87", "C6 51", "C6 51 01",
                "C6 51 01 03 'a' 00", "47 03 00", "02 41", "C3 00", "C0", "40 00", "80 00", "43", "43 01",
                "43 05 03 'a' 00 01", "00 01 07", "00 02 08 00 03 08", "87 11 12 13 14 01",
                "87 11 06 85 01", "87 11 11", "C7 08 85 01", "47 01", "86 7E 01", "87 11 06 02 41 01",
                "44 00", "04 00"
            })
    void anyPatternIsReadWithLittleStackAndMemory(String pattern) throws Exception {
        byte[] body = Bytes.repeated(MEBIBYTE, HEADER, pattern);
        ProvisioningDocument document =
                onLittleStack(
                        () -> {
                            ProvisioningDocument read;
                            try {
                                read = ProvisioningDocument.parse(body, LARGE);
                            } catch (ProvisioningException e) {
                                assertEquals(ProvisioningException.Reason.TEXT_TOO_LONG, e.reason());
                                return null;
                            }
                            assertEquals(read, ProvisioningDocument.parse(body, LARGE));
                            askAll(read);
                            return read;
                        });
        if (document != null) {
            document = null;
            long before = used();
            kept = ProvisioningDocument.parse(body, LARGE);
            long each = (used() - before) / MEBIBYTE;
            kept = null;
            assertTrue(each <= BYTES_EACH - FOR_VIEWS, each + " bytes a byte");
        }
    }

    private static long used() {
        Runtime runtime = Runtime.getRuntime();
        for (int i = 0; i < 3; ++i) {
            System.gc();
        }
        return runtime.totalMemory() - runtime.freeMemory();
    }

    /** References to everywhere in a table are too much text; equal ones share one. */
    @Test
    void referencesToAllPlacesOfATableAreOverTheLimit() throws Exception {
        StringBuilder references = new StringBuilder();
        for (int place = 0; place < 8000; ++place) {
            references.append(String.format("83 %02X %02X", place >> 7 | 0x80, place & 0x7F));
        }
        byte[] table = Bytes.repeated(8192, "", "'x'");
        for (String separator : List.of("", "06")) {
            byte[] head = Bytes.of("03 0B 6A C0 00");
            byte[] tail = Bytes.of("45 87 11 06" + references.toString().replace("83", separator + "83"));
            byte[] body = new byte[head.length + table.length + tail.length];
            System.arraycopy(head, 0, body, 0, head.length);
            System.arraycopy(table, 0, body, head.length, table.length);
            System.arraycopy(tail, 0, body, head.length + table.length, tail.length);
            try {
                ProvisioningDocument.parse(body);
                throw new AssertionError("read");
            } catch (ProvisioningException e) {
                assertEquals(ProvisioningException.Reason.TEXT_TOO_LONG, e.reason());
            }
        }
    }

    @Test
    void referencesToOnePlaceShareOneText() throws Exception {
        byte[] body = Bytes.repeated(65536, "03 0B 6A 0B '0123456789' 00 45", "87 11 06 83 00 01");
        List<Item> children = ProvisioningDocument.parse(body).children();
        String first = ((Parameter) children.get(0)).value();
        for (Item child : children.subList(0, children.size() - 1)) {
            assertTrue(first == ((Parameter) child).value());
        }
    }

    @Test
    void noBytesMakeAnotherExceptionThanTheDocumentedOne() throws Exception {
        Random random = new Random(11);
        int read = 0;
        for (int round = 0; round < 200_000; ++round) {
            byte[] body = new byte[random.nextInt(60)];
            random.nextBytes(body);
            byte[] header = {(byte) random.nextInt(4), 0x0B, 0x6A, (byte) random.nextInt(4)};
            System.arraycopy(header, 0, body, 0, Math.min(header.length, body.length));
            for (int i = header.length; i < body.length; ++i) {
                if (random.nextBoolean()) {
                    body[i] = new byte[] {0, 1, 3, 6, 7, (byte) 0x83, (byte) 0xC6, (byte) 0xC7}[random.nextInt(8)];
                }
            }
            try {
                ProvisioningDocument document = ProvisioningDocument.parse(body);
                askAll(document);
                requireOrder(document);
                ++read;
            } catch (ProvisioningException e) {
                assertNotNull(e.getMessage());
            }
        }
        assertTrue(read > 100_000, read + " read");
    }

    /** Requires that items stand in order, inside of what they stand in. */
    private static void requireOrder(ProvisioningDocument document) {
        Item root = document.root();
        Walk walk = new Walk(root);
        for (Item item; (item = walk.next()) != null; ) {
            int at = item.offset();
            for (Item child : item.inside()) {
                assertTrue(item == root || at <= child.offset());
                assertTrue(item == root || child.offset() + child.length() <= item.offset() + item.length());
                at = child.offset() + child.length();
                assertEquals(item, child.parent());
            }
        }
        int before = 0;
        for (Deviation deviation : document.deviations()) {
            assertTrue(before <= deviation.offset(), document.deviations().toString());
            before = deviation.offset();
        }
    }
}
