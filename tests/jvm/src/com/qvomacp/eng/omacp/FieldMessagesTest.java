package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertTrue;
import static org.junit.jupiter.api.Assumptions.assumeTrue;

import com.qvomacp.support.Json;
import com.qvomacp.support.Push;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.HexFormat;
import java.util.Map;
import org.junit.jupiter.api.Test;

/**
 * Messages from elsewhere: a file that OMACP_FIELD_MESSAGES names, with a JSON object a line. Of
 * its members, {@code id} names the message, {@code kind} says what {@code data} is: {@code
 * push-hex} a whole push, {@code wbxml-hex} a body, {@code xml} a document to be encoded; any other
 * kind is left out.
 */
class FieldMessagesTest {
    private static final String VARIABLE = "OMACP_FIELD_MESSAGES";

    @Test
    void parseOrAreRefusedWithAReason() throws Exception {
        String file = System.getenv(VARIABLE);
        assumeTrue(file != null && !file.isEmpty(), VARIABLE + " names no file: skipped");
        int parsed = 0;
        int refused = 0;
        int leftOut = 0;
        for (String line : Files.readAllLines(Path.of(file))) {
            if (line.isBlank()) {
                continue;
            }
            Map<?, ?> message = (Map<?, ?>) Json.parse(line);
            byte[] push = push((String) message.get("kind"), (String) message.get("data"));
            if (push == null) {
                System.out.println("field message " + message.get("id") + ": left out");
                ++leftOut;
                continue;
            }
            try {
                ProvisioningMessage snapshot = ProvisioningMessage.parse(push);
                assertEquals(snapshot, ProvisioningMessage.parse(push));
                assertNotNull(snapshot.toString());
                System.out.println("field message " + message.get("id") + ": parsed");
                ++parsed;
            } catch (ProvisioningException e) {
                assertFalse(e.getMessage().isEmpty());
                System.out.printf(
                        "field message %s: refused, %s: %s%n",
                        message.get("id"), e.getReason(), e.getMessage());
                ++refused;
            }
        }
        System.out.printf(
                "field messages: %d parsed, %d refused, %d left out%n",
                parsed, refused, leftOut);
        assertTrue(parsed + refused > 0, "no message in " + file);
    }

    /** The push of a line; null for a kind that is none of the three, or cannot be encoded. */
    private static byte[] push(String kind, String data) throws Exception {
        switch (kind) {
            case "push-hex":
                return HexFormat.of().parseHex(data.replaceAll("\\s", ""));
            case "wbxml-hex":
                return Push.push(HexFormat.of().parseHex(data.replaceAll("\\s", "")));
            case "xml":
                return encoded(data);
            default:
                return null;
        }
    }

    /** What the samples' encoder makes of a document; null, and said so, when it refuses it. */
    private static byte[] encoded(String document) throws Exception {
        Path file = Files.writeString(Files.createTempFile("field", ".xml"), document);
        try {
            Process encoder =
                    new ProcessBuilder("tools/encode-sample", "-o", "-", file.toString())
                            .redirectErrorStream(true)
                            .start();
            byte[] output = encoder.getInputStream().readAllBytes();
            if (encoder.waitFor() == 0) {
                return output;
            }
            System.out.print(new String(output, StandardCharsets.UTF_8));
            return null;
        } finally {
            Files.delete(file);
        }
    }
}
