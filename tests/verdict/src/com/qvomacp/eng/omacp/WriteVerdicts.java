package com.qvomacp.eng.omacp;

import java.io.BufferedOutputStream;
import java.io.FileOutputStream;
import java.io.FileDescriptor;
import java.io.IOException;
import java.io.OutputStream;
import java.nio.ByteBuffer;
import java.nio.ByteOrder;
import java.nio.file.DirectoryStream;
import java.nio.file.Files;
import java.nio.file.Path;
import java.nio.file.Paths;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;

/**
 * Writes messages with the verdicts on them to standard output, for the library to be asked the
 * same: the samples, every prefix of them and every change of one byte, then generated ones.
 */
final class WriteVerdicts {
    private static final int HEAD = 14;
    private static final int NEAR_LIMIT = 1000;

    private final OutputStream out;

    private WriteVerdicts(OutputStream out) {
        this.out = out;
    }

    /**
     * Writes the messages.
     *
     * @param arguments the directory of the samples, how many bodies and how many headers are
     *     generated, the seed
     */
    public static void main(String[] arguments) throws IOException {
        List<byte[]> samples = samples(Paths.get(arguments[0]));
        long bodies = Long.parseLong(arguments[1]);
        long headers = Long.parseLong(arguments[2]);
        MessageGenerator generator =
                new MessageGenerator(Long.parseLong(arguments[3]), samples);
        try (OutputStream out =
                new BufferedOutputStream(new FileOutputStream(FileDescriptor.out), 1 << 20)) {
            WriteVerdicts verdicts = new WriteVerdicts(out);
            for (byte[] sample : samples) {
                verdicts.nearTo(sample);
            }
            for (byte[] body : MessageGenerator.large()) {
                verdicts.body(body);
            }
            for (int i = 0; i < NEAR_LIMIT; ++i) {
                verdicts.body(generator.nearLimit());
            }
            for (long i = 0; i < headers; ++i) {
                verdicts.header(generator.push());
            }
            for (long i = 0; i < bodies; ++i) {
                verdicts.body(generator.body());
            }
        }
    }

    private static List<byte[]> samples(Path directory) throws IOException {
        List<Path> paths = new ArrayList<>();
        try (DirectoryStream<Path> found = Files.newDirectoryStream(directory, "*.push")) {
            found.forEach(paths::add);
        }
        List<byte[]> samples = new ArrayList<>();
        paths.sort(null);
        for (Path path : paths) {
            samples.add(Files.readAllBytes(path));
        }
        return samples;
    }

    /** A push, its prefixes, and all that differ from it in one byte, each where it was changed. */
    private void nearTo(byte[] push) throws IOException {
        int bodyAt = 3 + (push[2] & 0xFF);
        byte[] body = Arrays.copyOfRange(push, bodyAt, push.length);
        for (int length = 0; length <= push.length; ++length) {
            header(Arrays.copyOf(push, length));
        }
        for (int length = 0; length <= body.length; ++length) {
            body(Arrays.copyOf(body, length));
        }
        for (int i = 0; i < push.length; ++i) {
            byte[] changed = i < bodyAt ? push : body;
            int place = i < bodyAt ? i : i - bodyAt;
            byte before = changed[place];
            for (int value = 0; value < 256; ++value) {
                changed[place] = (byte) value;
                if (i < bodyAt) {
                    header(changed);
                } else {
                    body(changed);
                }
            }
            changed[place] = before;
        }
    }

    private void body(byte[] body) throws IOException {
        Verdict verdict = Verdict.onBody(body, null);
        write('B', body, verdict.isAccepted(), verdict.code(), verdict.bytesRead());
    }

    private void header(byte[] push) throws IOException {
        LibraryHeader header = LibraryHeader.of(push);
        write('H', push, header.refusal == null, 0, header.bodyAt);
    }

    private void write(char kind, byte[] bytes, boolean taken, int code, int read)
            throws IOException {
        out.write(
                ByteBuffer.allocate(HEAD)
                        .order(ByteOrder.LITTLE_ENDIAN)
                        .put((byte) kind)
                        .putInt(bytes.length)
                        .put((byte) (taken ? 1 : 0))
                        .putInt(code)
                        .putInt(read)
                        .array());
        out.write(bytes);
    }
}
