package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Json;
import com.qvomacp.support.Natives;
import java.io.ByteArrayInputStream;
import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.HexFormat;
import java.util.Map;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.condition.EnabledIfEnvironmentVariable;

/**
 * Messages of one's own: the file that OMACP_FIELD_MESSAGES names has a JSON object a line, with
 * {@code id}, {@code kind} (push-hex or wbxml-hex; others are left out) and {@code data}.
 */
@EnabledIfEnvironmentVariable(
        named = "OMACP_FIELD_MESSAGES",
        matches = ".+",
        disabledReason = "OMACP_FIELD_MESSAGES names no file of messages")
class FieldMessagesTest extends Natives {
    @Test
    void areShownOrExplained() throws Exception {
        int shown = 0;
        for (String line : Files.readAllLines(Path.of(System.getenv("OMACP_FIELD_MESSAGES")))) {
            Map<?, ?> message = (Map<?, ?>) Json.parse(line);
            String kind = String.valueOf(message.get("kind"));
            if (kind.equals("push-hex") || kind.equals("wbxml-hex")) {
                shown += showOrExplain(message, kind.equals("push-hex"));
            }
        }
        assertTrue(shown > 0, "no message can be shown");
    }

    private int showOrExplain(Map<?, ?> message, boolean isPush) {
        String id = String.valueOf(message.get("id"));
        String hex = String.valueOf(message.get("data"));
        byte[] bytes = HexFormat.of().parseHex(hex.replaceAll("\\s", ""));
        ByteArrayOutputStream out = new ByteArrayOutputStream();
        ByteArrayOutputStream err = new ByteArrayOutputStream();
        int status =
                Main.run(
                        new ByteArrayInputStream(hex.getBytes(StandardCharsets.US_ASCII)),
                        out,
                        err,
                        Terminal.NONE);
        String errors = err.toString(StandardCharsets.UTF_8);
        assertEquals(status == 0, errors.isEmpty(), id);
        assertFalse(errors.contains("cannot be read"), errors);
        if (status != 0) {
            System.out.println(id + " is refused:\n" + errors);
        }
        assertEquals(isPush, new Source(id, bytes).isPush, id);
        AnnotationTest.assertCovers(bytes);
        if (isPush) {
            AnnotationTest.assertAgrees(bytes);
        } else {
            AnnotationTest.assertBodyAgrees(bytes, Annotation.ofBody(bytes).body);
        }
        return status == 0 ? 1 : 0;
    }
}
