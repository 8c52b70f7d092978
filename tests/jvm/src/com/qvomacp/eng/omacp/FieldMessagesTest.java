package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertTrue;
import static org.junit.jupiter.api.Assumptions.assumeTrue;

import com.qvomacp.support.FieldMessage;
import org.junit.jupiter.api.Test;

/** Messages from elsewhere: {@link FieldMessage}. */
class FieldMessagesTest {
    @Test
    void parseOrAreRefusedWithAReason() throws Exception {
        String file = System.getenv(FieldMessage.VARIABLE);
        assumeTrue(
                file != null && !file.isEmpty(), FieldMessage.VARIABLE + " names no file: skipped");
        int parsed = 0;
        int refused = 0;
        int leftOut = 0;
        for (FieldMessage message : FieldMessage.all()) {
            if (message.bytes == null) {
                System.out.println("field message " + message.id + ": left out");
                ++leftOut;
                continue;
            }
            byte[] push = message.push();
            try {
                ProvisioningMessage snapshot = ProvisioningMessage.parse(push);
                assertEquals(snapshot, ProvisioningMessage.parse(push));
                assertNotNull(snapshot.toString());
                System.out.println("field message " + message.id + ": parsed");
                ++parsed;
            } catch (ProvisioningException e) {
                assertFalse(e.getMessage().isEmpty());
                System.out.printf(
                        "field message %s: refused, %s: %s%n",
                        message.id, e.getReason(), e.getMessage());
                ++refused;
            }
        }
        System.out.printf(
                "field messages: %d parsed, %d refused, %d left out%n", parsed, refused, leftOut);
        assertTrue(parsed + refused > 0, "no message in " + file);
    }
}
