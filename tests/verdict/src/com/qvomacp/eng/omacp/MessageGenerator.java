package com.qvomacp.eng.omacp;

import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;

/** Makes bodies and pushes: well-formed ones, odd ones and hostile ones, repeatable from a seed. */
final class MessageGenerator {
    /** What is put into a body, or in place of one of its pieces. */
    private static final byte[][] ODD_PIECES = {
        {0, 0}, {0, 1}, {0, 2}, {0, 0x41}, {0x40, 1}, {(byte) 0x80, (byte) 0x80}, {0}, {1}, {1, 1},
        {0x41}, {(byte) 0x81}, {3, 'a', 'b', 0}, {3, 0}, {3}, {0x43, 'x', 0}, {(byte) 0x83, 0},
        {(byte) 0x83, 2}, {(byte) 0x83, (byte) 0x8F, -1, -1, -1, 0x7F},
        {(byte) 0x83, -1, -1, -1, -1, -1}, {(byte) 0xC3, 0}, {(byte) 0xC3, 2, 'h', 'i'},
        {(byte) 0xC3, 3, 'a', 0, 'b'}, {(byte) 0xC3, (byte) 0x85, (byte) 0x80, (byte) 0x80, 0},
        {(byte) 0xC3, (byte) 0x8F, -1, -1, -1, 0x7F}, {4}, {5}, {0x45}, {0x46}, {6}, {(byte) 0x86},
        {(byte) 0xC6}, {7}, {0x47}, {(byte) 0x87}, {(byte) 0xC7}, {(byte) 0x87, 1},
        {(byte) 0xC6, 1, 1}, {0x50}, {0x50, 3, 'W', 'I', '-', 'F', 'I', 0},
        {0x50, (byte) 0xC3, 5, 'W', 'I', '-', 'F', 'I'},
        {0x50, (byte) 0xC3, 7, 'R', 'O', 'A', 'M', 'I', 'N', 'G'}, {0x5C}, {(byte) 0x80},
        {(byte) 0x84}, {(byte) 0x8D}, {(byte) 0x90}, {(byte) 0x94}, {(byte) 0x9A}, {(byte) 0xFE},
        {0x17, 6}, {6, 1}, {2}, {0x10}, {0x57}
    };
    private static final String[] MEDIA_TYPES = {
        "application/vnd.wap.connectivity-wbxml", "application/vnd.wap.connectivity-xml",
        "application/vnd.syncml.notification", "application/vnd.syncml.ds.notification",
        "application/vnd.syncml.dm+wbxml"
    };

    private final Draw draw;
    private final List<byte[]> samples;

    MessageGenerator(long seed, List<byte[]> samples) {
        this.draw = new Draw(seed);
        this.samples = samples;
    }

    private static byte[] joined(List<byte[]> pieces) {
        ByteArrayOutputStream out = new ByteArrayOutputStream();
        for (byte[] piece : pieces) {
            out.write(piece, 0, piece.length);
        }
        return out.toByteArray();
    }

    private static byte[] latin(String text) {
        return text.getBytes(StandardCharsets.ISO_8859_1);
    }

    // ---- Bodies

    byte[] body() {
        double how = draw.part();
        if (how < 0.25) {
            return joined(new DocumentGenerator(draw, 0).body());
        }
        if (how < 0.5) {
            return joined(new DocumentGenerator(draw, 0.3).body());
        }
        if (how < 0.73) {
            return withOddPieces();
        }
        if (how < 0.85) {
            return withChangedBytes(joined(new DocumentGenerator(draw, 0.05).body()));
        }
        if (how < 0.9) {
            byte[] sample = draw.one(samples.toArray(new byte[0][]));
            return withChangedBytes(Arrays.copyOfRange(sample, 3 + sample[2], sample.length));
        }
        return how < 0.997 ? tiny() : many();
    }

    private byte[] withOddPieces() {
        List<byte[]> pieces = new DocumentGenerator(draw, 0.1).body();
        for (int more = draw.of(1, 1, 2, 3); more > 0; --more) {
            changePiece(pieces);
        }
        return joined(pieces);
    }

    private void changePiece(List<byte[]> pieces) {
        int place = draw.below(pieces.size());
        int other = draw.below(pieces.size());
        if (place < 5 && !draw.chance(0.1)) {
            place = pieces.size() - 1;
        }
        switch (draw.below(9)) {
            case 0:
                pieces.add(place, draw.one(ODD_PIECES));
                break;
            case 1:
                pieces.remove(place);
                break;
            case 2:
                pieces.add(place, pieces.get(place));
                break;
            case 3:
                byte[] moved = pieces.get(place);
                pieces.set(place, pieces.get(other));
                pieces.set(other, moved);
                break;
            case 4:
                pieces.set(place, draw.one(ODD_PIECES));
                break;
            case 5:
                pieces.set(place, draw.bytes(1));
                break;
            case 6:
                int end = Math.min(other + draw.between(1, 12), pieces.size());
                pieces.addAll(place, new ArrayList<>(pieces.subList(other, end)));
                break;
            case 7:
                pieces.subList(Math.min(place + 1, pieces.size()), pieces.size()).clear();
                pieces.add(new byte[0]);
                break;
            default:
                pieces.add(place, draw.one(ODD_PIECES));
                pieces.add(place, draw.one(ODD_PIECES));
                break;
        }
        if (pieces.isEmpty()) {
            pieces.add(new byte[0]);
        }
    }

    private byte[] withChangedBytes(byte[] data) {
        byte[] changed = data;
        for (int more = draw.of(1, 1, 1, 2, 3, 8); more > 0; --more) {
            changed = withChangedByte(changed);
        }
        return changed;
    }

    private byte[] withChangedByte(byte[] data) {
        int place = data.length == 0 ? 0 : draw.below(data.length);
        byte[] changed = data.clone();
        int how = data.length == 0 ? 0 : draw.below(7);
        switch (how) {
            case 0:
                return replaced(data, place, place, draw.bytes(draw.between(1, 4)));
            case 1:
                changed[place] = (byte) draw.below(256);
                return changed;
            case 2:
                changed[place] ^= (byte) (1 << draw.below(8));
                return changed;
            case 3:
                changed[place] = (byte) draw.of(0, 1, 3, 6, 7, 0x7F, 0x80, 0x83, 0xC3, 0xFF);
                return changed;
            case 4:
                int end = Math.min(place + draw.between(1, 6), data.length);
                return replaced(data, place, end, new byte[0]);
            case 5:
                return Arrays.copyOf(data, place);
            default:
                int from = draw.below(data.length);
                int to = Math.min(from + draw.between(1, 30), data.length);
                return replaced(data, place, place, Arrays.copyOfRange(data, from, to));
        }
    }

    private static byte[] replaced(byte[] data, int from, int to, byte[] by) {
        return joined(
                Arrays.asList(
                        Arrays.copyOf(data, from),
                        by,
                        Arrays.copyOfRange(data, to, data.length)));
    }

    /** A few tokens behind the opening of a characteristic or of the document. */
    private byte[] tiny() {
        List<byte[]> pieces = new ArrayList<>();
        pieces.add(
                draw.chance(0.7)
                        ? new byte[] {3, 11, 106, 0}
                        : new byte[] {3, 11, 106, 5, 'a', 'b', 0, 'F', 'R'});
        if (draw.chance(0.67)) {
            pieces.add(draw.chance(0.5) ? new byte[] {(byte) 0xC5, 0x46, 1} : new byte[] {0x45});
        }
        if (draw.chance(0.7)) {
            int token = draw.between(0x50, 0x5B);
            boolean second = draw.chance(0.5);
            pieces.add(second ? new byte[] {(byte) 0xC6, 0, 1} : new byte[] {(byte) 0xC6});
            pieces.add(token == 0x50 ? ODD_PIECES[39] : new byte[] {(byte) token});
            if (draw.chance(0.9)) {
                pieces.add(new byte[] {1});
            }
            if (draw.chance(0.7)) {
                pieces.add(new byte[] {(byte) 0x87});
            }
        }
        for (int more = draw.below(6); more > 0; --more) {
            pieces.add(draw.chance(0.6) ? draw.one(ODD_PIECES) : draw.bytes(1));
        }
        for (int more = draw.below(5); more > 0; --more) {
            pieces.add(new byte[] {1});
        }
        return joined(pieces);
    }

    /** Long runs of one thing. */
    private byte[] many() {
        int count = draw.of(50, 300);
        List<byte[]> pieces = new ArrayList<>();
        pieces.add(new byte[] {3, 11, 106, 0, 0x45});
        byte[][] parts =
                draw.one(
                        new byte[][] {
                            {(byte) 0xC6, 0x51, 1}, {(byte) 0x87, 0x17, 6, 3, 'a', 0, 1}, {1}
                        },
                        new byte[][] {
                            {}, {(byte) 0xC6, 0x55, 1, (byte) 0x87, 0x11, 6, (byte) 0xC3, 1, 'b', 1, 1}, {}
                        },
                        new byte[][] {{}, {(byte) 0xC6, 0x51, 1}, new byte[0]},
                        new byte[][] {{(byte) 0xC6, 0x52, 1}, {(byte) 0xC6, 0x53, 1, 1}, {1}},
                        new byte[][] {
                            {(byte) 0xC6, 0x51, 1, (byte) 0x87, 0x15, 6}, {3, 'x', 0, (byte) 0x9A}, {1, 1}
                        });
        pieces.add(parts[0]);
        for (int i = 0; i < count; ++i) {
            pieces.add(parts[1]);
        }
        pieces.add(parts[2]);
        for (int ends = parts[0].length + parts[2].length == 0 ? draw.between(0, count + 2) : 1;
                ends > 0;
                --ends) {
            pieces.add(new byte[] {1});
        }
        return joined(pieces);
    }

    /** Bodies around the limit of text, on either side of both its bounds, and deep nesting. */
    static List<byte[]> large() {
        List<byte[]> bodies = new ArrayList<>();
        int[][] families = {
            {60000, 90}, {60000, 139}, {60000, 140}, {60000, 300}, {200000, 60}, {1000, 5000},
            {90000, 120}
        };
        byte[] access = {(byte) 0xC6, 0x5B, 1};
        byte[] proxy = {(byte) 0xC6, 0x51, 1};
        byte[] physical = {(byte) 0xC6, 0x51, 1, (byte) 0xC6, 0x52, 1};
        byte[] application = {(byte) 0xC6, 0, 1, 0x57, 1};
        for (int[] family : families) {
            bodies.add(references(access, new byte[] {0x3B, 6}, family[0], family[1], true));
            bodies.add(references(proxy, new byte[] {0x15, 6}, family[0], family[1], true));
            bodies.add(references(proxy, new byte[] {0x15, 6}, family[0], family[1], false));
            bodies.add(references(physical, new byte[] {0x17, 6}, family[0], family[1], true));
            bodies.add(references(physical, new byte[] {0x17, 6}, family[0], family[1], false));
            bodies.add(references(access, new byte[] {0x3B, 6, 0x50}, family[0], family[1], false));
            bodies.add(references(application, new byte[] {0x33, 6}, family[0], family[1], false));
        }
        for (int ends : new int[] {19999, 20000, 20001}) {
            List<byte[]> pieces = new ArrayList<>();
            pieces.add(new byte[] {3, 11, 106, 0, 0x45});
            for (int i = 0; i < 20000; ++i) {
                pieces.add(proxy);
            }
            byte[] closing = new byte[ends];
            Arrays.fill(closing, (byte) 1);
            pieces.add(closing);
            bodies.add(joined(pieces));
        }
        return bodies;
    }

    /** References to one long text, in parms of their own or as one value. */
    private static byte[] references(
            byte[] start, byte[] parm, int length, int count, boolean apart) {
        List<byte[]> pieces = new ArrayList<>();
        byte[] text = new byte[length];
        Arrays.fill(text, (byte) 'x');
        pieces.add(new byte[] {3, 11, 106});
        pieces.add(Draw.integer(length, 0));
        pieces.add(text);
        pieces.add(new byte[] {0x45});
        pieces.add(start);
        for (int i = 0; i < count; ++i) {
            if (i == 0 || apart) {
                pieces.add(new byte[] {(byte) 0x87});
                pieces.add(parm);
            }
            pieces.add(new byte[] {(byte) 0x83, 0});
            if (apart || i + 1 == count) {
                pieces.add(new byte[] {1});
            }
        }
        pieces.add(new byte[] {1, 1, 1, 1});
        return joined(pieces);
    }

    /** A body whose texts pass the limit somewhere in a run of characteristics at its end. */
    byte[] nearLimit() {
        List<byte[]> pieces = new ArrayList<>();
        byte[] text = new byte[59900];
        Arrays.fill(text, (byte) 'x');
        pieces.add(new byte[] {3, 11, 106});
        pieces.add(Draw.integer(text.length, 0));
        pieces.add(text);
        pieces.add(new byte[] {0x45, (byte) 0xC6, 0x5B, 1});
        for (int i = 0; i < (8 << 20) / text.length; ++i) {
            pieces.add(new byte[] {(byte) 0x87, 0x3B, 6, (byte) 0x83, 0, 1});
        }
        pieces.add(new byte[] {(byte) 0x87, 0x3B, 6, 3});
        byte[] filling = new byte[draw.below((8 << 20) % text.length)];
        if (draw.chance(0.9)) {
            filling = new byte[(8 << 20) % text.length - draw.below(draw.of(30, 100, 400))];
        }
        Arrays.fill(filling, (byte) 'y');
        pieces.add(filling);
        pieces.add(new byte[] {0, 1, 1});
        pieces.addAll(new DocumentGenerator(draw, draw.of(0, 3) / 10.0).run());
        pieces.add(new byte[] {1});
        return joined(pieces);
    }

    // ---- Pushes

    byte[] push() {
        ByteArrayOutputStream content = new ByteArrayOutputStream();
        write(content, contentType());
        write(content, security());
        if (draw.chance(0.2)) {
            write(content, draw.one(new byte[] {(byte) 0xAF, (byte) 0x82}, draw.bytes(3)));
        }
        boolean quoted = draw.chance(0.6);
        int size = content.size() + (quoted ? 2 : 0);
        if (draw.chance(0.1)) {
            size += draw.between(-6, 6);
        }
        ByteArrayOutputStream push = new ByteArrayOutputStream();
        push.write(draw.below(256));
        push.write(draw.chance(0.98) ? 6 : draw.below(256));
        push.write(Math.max(0, Math.min(size, 255)));
        if (quoted) {
            push.write(0x1F);
            push.write(content.size());
        }
        write(push, content.toByteArray());
        write(push, draw.chance(0.6) ? new byte[] {3, 11, 106, 0, 0x45, 1} : draw.bytes(draw.below(3)));
        byte[] whole = push.toByteArray();
        double how = draw.part();
        if (how < 0.15) {
            return Arrays.copyOf(whole, draw.below(whole.length + 1));
        }
        return how < 0.4 ? withChangedBytes(whole) : whole;
    }

    private static void write(ByteArrayOutputStream out, byte[] bytes) {
        out.write(bytes, 0, bytes.length);
    }

    private byte[] contentType() {
        double how = draw.part();
        if (how < 0.6) {
            return new byte[] {(byte) 0xB6};
        }
        if (how < 0.75) {
            return new byte[] {
                (byte) draw.of(0xB5, 0xC4, 0xCE, 0xC2, 0x36, 0x35, 0x44, 0x4E, 0x42, 0xAF, 0x05)
            };
        }
        String name = draw.one(MEDIA_TYPES);
        if (draw.chance(0.2)) {
            name =
                    draw.one(
                            name.toUpperCase(java.util.Locale.ROOT),
                            name + "x",
                            "6" + name,
                            "D" + "x".repeat(62),
                            "D" + "x".repeat(63),
                            "D" + "x".repeat(64),
                            "5");
        }
        return latin(name + "\0");
    }

    private byte[] security() {
        List<byte[]> parts = new ArrayList<>();
        if (draw.chance(0.6)) {
            String name = draw.one("\u0091", "\u0091", "SEC\0", "sec\0", "Sec\0", "SEC!");
            parts.add(latin(name + (char) draw.of(0x80, 0x81, 0x82, 0x83, 0, 1, 0xFF)));
        }
        if (draw.chance(0.6)) {
            String name = draw.one("\u0092", "\u0092", "MAC\0", "mac\0", "mAc?");
            int digits = draw.chance(0.8) ? 40 : draw.of(0, 1, 42, 43, 44, 60);
            parts.add(latin(draw.chance(0.95) ? name + "7".repeat(digits) + "\0" : name));
        }
        if (draw.chance(0.1)) {
            java.util.Collections.reverse(parts);
        }
        if (draw.chance(0.1)) {
            parts.add(
                    draw.below(parts.size() + 1),
                    draw.one(new byte[] {(byte) 0xAF, (byte) 0x82}, new byte[] {'S'}));
        }
        return joined(parts);
    }
}
