package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;

import com.qvomacp.support.Bytes;
import java.util.ArrayList;
import java.util.List;
import java.util.concurrent.CountDownLatch;
import java.util.concurrent.ExecutorService;
import java.util.concurrent.Executors;
import java.util.concurrent.Future;
import org.junit.jupiter.api.Test;

/** Many threads that read, and that ask one document. */
class ManyReadersTest {
    private static final int THREADS = 16;
    private static final int ROUNDS = 200;

    @Test
    void answerTheSameAsOne() throws Exception {
        byte[] body = Bytes.repeated(4000, "03 0B 6A 00 45", "C6 55 01 87 11 06 03 'x' 00 01 07 01");
        ProvisioningDocument alone = ProvisioningDocument.parse(body);
        String expected = alone.deviations().toString();
        ExecutorService threads = Executors.newFixedThreadPool(THREADS);
        try {
            for (int round = 0; round < ROUNDS; ++round) {
                ProvisioningDocument shared = ProvisioningDocument.parse(body);
                CountDownLatch start = new CountDownLatch(THREADS);
                List<Future<String>> answers = new ArrayList<>();
                for (int i = 0; i < THREADS; ++i) {
                    boolean own = i % 4 == 0;
                    answers.add(
                            threads.submit(
                                    () -> {
                                        start.countDown();
                                        start.await();
                                        ProvisioningDocument asked =
                                                own ? ProvisioningDocument.parse(body) : shared;
                                        return asked.deviations().toString();
                                    }));
                }
                for (Future<String> answer : answers) {
                    assertEquals(expected, answer.get());
                }
            }
        } finally {
            threads.shutdownNow();
        }
        assertEquals(alone, ProvisioningDocument.parse(body));
    }
}
