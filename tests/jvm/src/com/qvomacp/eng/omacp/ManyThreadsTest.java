package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.eng.omacp.ProvisioningException.Reason;
import com.qvomacp.support.Push;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.List;
import java.util.concurrent.CountDownLatch;
import java.util.concurrent.ExecutorService;
import java.util.concurrent.Executors;
import java.util.concurrent.Future;
import java.util.stream.Stream;
import org.junit.jupiter.api.Test;

/** Threads that read at once, each its own message or all the same one, get what one alone gets. */
class ManyThreadsTest {
    private static final int THREADS = 8;
    private static final int ROUNDS = 20;

    /** What a message tells, in one text. */
    private static String told(ProvisioningMessage message) {
        StringBuilder text = new StringBuilder();
        for (Characteristic characteristic : message.document().characteristics()) {
            text.append(message.document().path(characteristic)).append('\n');
            for (Parameter parameter : characteristic.parameters()) {
                text.append(parameter.name()).append('=').append(parameter.value()).append('\n');
            }
        }
        Verdict verdict = message.verdict();
        return text.append(message).append(verdict.isAccepted()).append(verdict.code()).toString();
    }

    private static Reason refusal(byte[] message) {
        try {
            ProvisioningMessage.parsePush(message, ReadOptions.DEFAULT.withAcceptedOnly(true));
            return null;
        } catch (ProvisioningException e) {
            return e.reason();
        }
    }

    @Test
    void readTheSameAsOneAlone() throws Exception {
        List<byte[]> messages = new ArrayList<>();
        try (Stream<Path> files = Files.list(Path.of("samples"))) {
            for (Path file : files.filter(f -> f.toString().endsWith(".push")).toList()) {
                messages.add(Files.readAllBytes(file));
            }
        }
        assertTrue(messages.size() >= 8);
        List<ProvisioningMessage> shared = new ArrayList<>();
        List<String> expected = new ArrayList<>();
        for (byte[] message : messages) {
            shared.add(ProvisioningMessage.parsePush(message));
            expected.add(told(ProvisioningMessage.parsePush(message)));
        }
        byte[] refused = Push.push(new byte[] {0x03, 0x0B, 0x6A, 0x00, 0x7F});

        CountDownLatch start = new CountDownLatch(THREADS);
        ExecutorService pool = Executors.newFixedThreadPool(THREADS);
        try {
            List<Future<Integer>> results = new ArrayList<>();
            for (int thread = 0; thread < THREADS; ++thread) {
                int first = thread;
                results.add(
                        pool.submit(
                                () -> {
                                    start.countDown();
                                    start.await();
                                    int read = 0;
                                    for (int i = 0; i < ROUNDS * messages.size(); ++i) {
                                        int m = (first + i) % messages.size();
                                        ProvisioningMessage message =
                                                ProvisioningMessage.parsePush(messages.get(m));
                                        assertEquals(expected.get(m), told(message));
                                        assertEquals(expected.get(m), told(shared.get(m)));
                                        assertEquals(shared.get(m), message);
                                        assertEquals(Reason.REFUSED, refusal(refused));
                                        ++read;
                                    }
                                    return read;
                                }));
            }
            for (Future<Integer> result : results) {
                assertEquals(ROUNDS * messages.size(), result.get());
            }
        } finally {
            pool.shutdownNow();
        }
    }
}
