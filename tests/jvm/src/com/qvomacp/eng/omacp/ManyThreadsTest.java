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

/** Threads that parse at once get what one thread alone gets. */
class ManyThreadsTest {
    private static final int THREADS = 8;
    private static final int ROUNDS = 20;

    private static Reason refusal(byte[] message) {
        try {
            ProvisioningMessage.parse(message);
            return null;
        } catch (ProvisioningException e) {
            return e.getReason();
        }
    }

    @Test
    void parseTheSameAsOneAlone() throws Exception {
        List<byte[]> messages = new ArrayList<>();
        try (Stream<Path> files = Files.list(Path.of("samples"))) {
            for (Path file : files.filter(f -> f.toString().endsWith(".push")).toList()) {
                messages.add(Files.readAllBytes(file));
            }
        }
        assertTrue(messages.size() >= 8);
        List<ProvisioningMessage> expected = new ArrayList<>();
        for (byte[] message : messages) {
            expected.add(ProvisioningMessage.parse(message));
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
                                    int parsed = 0;
                                    for (int i = 0; i < ROUNDS * messages.size(); ++i) {
                                        int m = (first + i) % messages.size();
                                        byte[] message = messages.get(m);
                                        assertEquals(
                                                expected.get(m),
                                                ProvisioningMessage.parse(message));
                                        assertEquals(
                                                expected.get(m).getHeader(),
                                                ProvisioningMessage.parseHeader(message));
                                        assertEquals(Reason.BODY_REFUSED, refusal(refused));
                                        ++parsed;
                                    }
                                    return parsed;
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
