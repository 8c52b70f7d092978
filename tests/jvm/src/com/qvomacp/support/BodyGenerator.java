package com.qvomacp.support;

import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.EnumSet;
import java.util.List;
import java.util.Random;
import java.util.Set;

/** Writes documents by the format at random, and knows which parts of the format each one uses. */
public final class BodyGenerator {
    /** Parts of the format that a reader may lack. */
    public enum Part {
        WBXML_1_0,
        ENTITY,
        OPAQUE_VALUE,
        INSTRUCTION,
        TEXT_CONTENT,
        LITERAL_ELEMENT,
        LITERAL_ATTRIBUTE,
        OTHER_ELEMENT,
        OTHER_PAGE,
        ELEMENT_PAGE,
        JOINED_NAME,
        WBXML_1_1,
        VALUELESS
    }

    private static final String[] TEXTS = {
        "", "1", "w2", "internet.example.com", "Größe", "\uD83D\uDE00", "a&b<c>\"d\"", "日本"
    };

    private static final int[] NAMES_0 = {0x07, 0x08, 0x09, 0x0E, 0x10, 0x11, 0x14, 0x24, 0x3F, 0x48};
    private static final int[] NAMES_1 = {0x07, 0x14, 0x1C, 0x22, 0x2E, 0x33, 0x36, 0x3A};
    private static final int[] TYPES_0 = {0x51, 0x52, 0x53, 0x54, 0x55, 0x56, 0x57, 0x58, 0x59, 0x5A, 0x5B};
    private static final int[] TYPES_1 = {0x53, 0x55, 0x56, 0x57, 0x58, 0x59};
    private static final int[] VALUES_0 = {0x85, 0x89, 0x9A, 0xAA, 0xAB, 0xC5, 0xCA, 0xCB, 0xD3, 0xE1};
    private static final int[] VALUES_1 = {0x90, 0x91, 0x92, 0x93, 0x86, 0x8D};

    private final Random random;
    private final ByteArrayOutputStream out = new ByteArrayOutputStream();
    private final ByteArrayOutputStream table = new ByteArrayOutputStream();
    private final EnumSet<Part> used = EnumSet.noneOf(Part.class);
    private final Set<Part> allowed;
    private int page;
    private int version;

    /** The same document each time for the same seed and the same parts. */
    public BodyGenerator(long seed, Set<Part> allowed) {
        random = new Random(seed);
        this.allowed = allowed;
    }

    /** The parts of the format that the document uses. */
    public Set<Part> used() {
        return used;
    }

    /** The document. */
    public byte[] body() {
        version = random.nextInt(4);
        if (version == 0 && !may(Part.WBXML_1_0, 1) || version == 1 && !may(Part.WBXML_1_1, 1)) {
            version = 3;
        }
        boolean attributes = random.nextBoolean();
        out.write(attributes ? 0xC5 : 0x45);
        if (attributes) {
            if (random.nextBoolean()) {
                out.write(0x46);
            } else {
                out.write(0x45);
                text("1.1");
            }
            out.write(0x01);
        }
        content(1);
        out.write(0x01);
        ByteArrayOutputStream body = new ByteArrayOutputStream();
        body.write(version);
        body.write(0x0B);
        if (version > 0) {
            body.write(0x6A);
        }
        integer(body, table.size());
        body.writeBytes(table.toByteArray());
        body.writeBytes(out.toByteArray());
        return body.toByteArray();
    }

    private boolean may(Part part, int oneOf) {
        if (allowed.contains(part) && random.nextInt(oneOf) == 0) {
            used.add(part);
            return true;
        }
        return false;
    }

    private void content(int depth) {
        for (int left = random.nextInt(6); left > 0; --left) {
            if (may(Part.INSTRUCTION, 12)) {
                out.write(0x43);
                attribute(0x05);
                text("target");
                out.write(0x01);
            }
            if (may(Part.TEXT_CONTENT, 12)) {
                text("text");
            }
            if (may(Part.ELEMENT_PAGE, 6)) {
                out.write(0x00);
                out.write(1);
                characteristic(depth);
                out.write(0x00);
                out.write(0);
            } else if (depth == 1 || depth < 6 && random.nextInt(3) == 0) {
                characteristic(depth);
            } else {
                parm();
            }
        }
    }

    private void characteristic(int depth) {
        boolean content = random.nextInt(8) != 0;
        int bits = content ? 0xC0 : 0x80;
        if (may(Part.OTHER_ELEMENT, 10)) {
            out.write(bits | 0x04);
            reference("element");
            attribute(0x05);
            text("x");
        } else {
            if (may(Part.LITERAL_ELEMENT, 6)) {
                out.write(bits | 0x04);
                reference("characteristic");
            } else {
                out.write(bits | 0x06);
            }
            if (may(Part.LITERAL_ATTRIBUTE, 6)) {
                out.write(0x04);
                reference("type");
                text("LITERAL");
            } else if (random.nextInt(5) == 0) {
                attribute(0x50);
                text("NAPDEF");
            } else {
                switchPage();
                out.write(pick(page == 0 ? TYPES_0 : TYPES_1));
            }
        }
        out.write(0x01);
        if (content) {
            content(depth + 1);
            out.write(0x01);
        }
    }

    private void parm() {
        boolean content = random.nextInt(12) == 0;
        out.write((content ? 0xC0 : 0x80) | 0x07);
        if (may(Part.LITERAL_ATTRIBUTE, 6)) {
            out.write(0x04);
            reference("name");
            text("LITERAL");
        } else if (random.nextInt(4) == 0) {
            attribute(0x05);
            text("X-NAME");
            if (may(Part.JOINED_NAME, 4)) {
                text("-JOINED");
            }
        } else {
            switchPage();
            out.write(pick(page == 0 ? NAMES_0 : NAMES_1));
            if (may(Part.JOINED_NAME, 8)) {
                text("-JOINED");
            }
        }
        int pieces = random.nextInt(4);
        if (pieces > 0 || may(Part.VALUELESS, 2)) {
            attribute(0x06);
        }
        for (; pieces > 0; --pieces) {
            piece();
        }
        out.write(0x01);
        if (content) {
            out.write(0x01);
        }
    }

    private void piece() {
        if (may(Part.ENTITY, 5)) {
            out.write(0x02);
            integer(out, new int[] {0x41, 0x20AC, 0x1F600}[random.nextInt(3)]);
        } else if (may(Part.OPAQUE_VALUE, 5)) {
            out.write(0xC3);
            out.write(3);
            out.writeBytes("abc".getBytes(StandardCharsets.UTF_8));
        } else if (random.nextInt(3) == 0) {
            switchPage();
            if (page == 1 && may(Part.OTHER_PAGE, 4)) {
                out.write(pick(new int[] {0x85, 0xAB, 0xCB}));
            } else {
                out.write(pick(page == 0 ? VALUES_0 : VALUES_1));
            }
        } else {
            text(TEXTS[random.nextInt(TEXTS.length)]);
        }
    }

    private void attribute(int token) {
        switchPage();
        if (page == 0 || token != 0x45) {
            out.write(token);
        } else {
            out.write(0x00);
            out.write(0);
            page = 0;
            out.write(token);
        }
    }

    private void switchPage() {
        if (random.nextInt(8) == 0) {
            page = random.nextInt(2);
            out.write(0x00);
            out.write(page);
        }
    }

    private int pick(int[] tokens) {
        return tokens[random.nextInt(tokens.length)];
    }

    private void text(String text) {
        if (random.nextInt(3) == 0) {
            out.write(0x83);
            reference(text);
        } else {
            out.write(0x03);
            out.writeBytes(text.getBytes(StandardCharsets.UTF_8));
            out.write(0);
        }
    }

    /** The place of a text in the table, which it is added to. */
    private void reference(String text) {
        integer(out, table.size());
        table.writeBytes(text.getBytes(StandardCharsets.UTF_8));
        table.write(0);
    }

    private static void integer(ByteArrayOutputStream to, int value) {
        for (int shift = 28; shift > 0; shift -= 7) {
            if (value >>> shift != 0) {
                to.write(value >>> shift & 0x7F | 0x80);
            }
        }
        to.write(value & 0x7F);
    }
}
