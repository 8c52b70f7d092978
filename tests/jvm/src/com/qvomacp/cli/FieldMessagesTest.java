package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.FieldMessage;
import com.qvomacp.support.Natives;
import java.io.ByteArrayInputStream;
import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.util.HexFormat;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.condition.EnabledIfEnvironmentVariable;

/** Messages from elsewhere: {@link FieldMessage}. */
@EnabledIfEnvironmentVariable(
        named = FieldMessage.VARIABLE,
        matches = ".+",
        disabledReason = FieldMessage.VARIABLE + " names no file of messages")
class FieldMessagesTest extends Natives {
    @Test
    void areShownOrExplained() throws Exception {
        int shown = 0;
        for (FieldMessage message : FieldMessage.all()) {
            if (message.bytes != null) {
                shown += showOrExplain(message) ? 1 : 0;
            }
        }
        assertTrue(shown > 0, "no message can be shown");
    }

    private boolean showOrExplain(FieldMessage message) {
        String hex = HexFormat.of().formatHex(message.bytes);
        ByteArrayOutputStream out = new ByteArrayOutputStream();
        ByteArrayOutputStream err = new ByteArrayOutputStream();
        int status =
                Main.run(
                        new ByteArrayInputStream(hex.getBytes(StandardCharsets.US_ASCII)),
                        out,
                        err,
                        Terminal.NONE);
        String errors = err.toString(StandardCharsets.UTF_8);
        assertEquals(status == 0, errors.isEmpty(), message.id);
        assertFalse(errors.contains("cannot be read"), errors);
        if (status != 0) {
            System.out.println(message.id + " is refused:\n" + errors);
        }
        assertEquals(message.isPush, new Source(message.id, message.bytes).isPush, message.id);
        AnnotationTest.assertCovers(message.bytes);
        if (message.isPush) {
            AnnotationTest.assertAgrees(message.bytes);
        } else {
            Annotation annotation = Annotation.ofBody(message.bytes);
            AnnotationTest.assertBodyAgrees(message.bytes, annotation.body);
        }
        return status == 0;
    }
}
