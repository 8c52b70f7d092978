package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;
import static org.junit.jupiter.api.Assumptions.assumeTrue;

import com.qvomacp.support.FieldMessage;
import org.junit.jupiter.api.Test;

/** Messages from elsewhere: {@link FieldMessage}. */
class FieldMessagesTest {
    private static ProvisioningMessage read(FieldMessage message) throws ProvisioningException {
        return message.isPush
                ? ProvisioningMessage.parsePush(message.bytes)
                : ProvisioningMessage.parseBody(message.bytes);
    }

    @Test
    void areReadOrAreNoMessageForAReason() throws Exception {
        String file = System.getenv(FieldMessage.VARIABLE);
        assumeTrue(
                file != null && !file.isEmpty(), FieldMessage.VARIABLE + " names no file: skipped");
        int accepted = 0;
        int refused = 0;
        int leftOut = 0;
        for (FieldMessage field : FieldMessage.all()) {
            if (field.bytes == null) {
                System.out.println("field message " + field.id + ": left out");
                ++leftOut;
                continue;
            }
            try {
                ProvisioningMessage message = read(field);
                assertEquals(message, read(field));
                assertEquals(message.hashCode(), read(field).hashCode());
                assertFalse(message.document().characteristics().isEmpty());
                Verdict verdict = message.verdict();
                System.out.printf("field message %s: %s, %s%n", field.id, message, verdict);
                accepted += verdict.isAccepted() ? 1 : 0;
                refused += verdict.isAccepted() ? 0 : 1;
            } catch (ProvisioningException e) {
                assertFalse(e.getMessage().isEmpty());
                System.out.printf(
                        "field message %s: none, %s: %s%n", field.id, e.reason(), e.getMessage());
                ++leftOut;
            }
        }
        System.out.printf(
                "field messages: %d that the library takes, %d that it refuses, %d left out%n",
                accepted, refused, leftOut);
        assertTrue(accepted + refused > 0, "no message in " + file);
    }
}
