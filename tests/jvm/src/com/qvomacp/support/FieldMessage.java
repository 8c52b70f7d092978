package com.qvomacp.support;

import com.qvomacp.eng.omacp.EncodeOptions;
import com.qvomacp.eng.omacp.EncodingException;
import com.qvomacp.eng.omacp.ProvisioningEncoder;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.HexFormat;
import java.util.List;
import java.util.Map;

/**
 * A message from elsewhere, of the file that OMACP_FIELD_MESSAGES names: a JSON object a line. Of its
 * members, {@code id} names the message, {@code kind} says what {@code data} is: {@code push-hex} a
 * whole push, {@code wbxml-hex} a body, {@code xml} a document, which is encoded as a sample is; {@code
 * expected} may hold the PIN that its MAC is made with.
 */
public final class FieldMessage {
    public static final String VARIABLE = "OMACP_FIELD_MESSAGES";

    public final String id;

    /** False for a body alone. */
    public final boolean isPush;

    /** Null for another kind, and for a document that cannot be encoded. */
    public final byte[] bytes;

    /** Null when it is not known. */
    public final String pin;

    private FieldMessage(String id, String kind, String data, String pin) throws Exception {
        this.id = id;
        this.pin = pin;
        this.isPush = !kind.equals("wbxml-hex");
        if (kind.equals("xml")) {
            this.bytes = encoded(data);
        } else if (kind.equals("push-hex") || kind.equals("wbxml-hex")) {
            this.bytes = HexFormat.of().parseHex(data.replaceAll("\\s", ""));
        } else {
            this.bytes = null;
        }
    }

    /** The messages of the file, those that can be tried and those that cannot. */
    public static List<FieldMessage> all() throws Exception {
        List<FieldMessage> messages = new ArrayList<>();
        for (String line : Files.readAllLines(Path.of(System.getenv(VARIABLE)))) {
            if (!line.isBlank()) {
                Map<?, ?> fields = (Map<?, ?>) Json.parse(line);
                messages.add(
                        new FieldMessage(
                                String.valueOf(fields.get("id")),
                                String.valueOf(fields.get("kind")),
                                String.valueOf(fields.get("data")),
                                pin(fields.get("expected"))));
            }
        }
        return messages;
    }

    private static String pin(Object expected) {
        if (!(expected instanceof Map)) {
            return null;
        }
        Map<?, ?> facts = (Map<?, ?>) expected;
        Object pin = facts.get("user_pin");
        return (String) (pin != null ? pin : facts.get("MAC_verified_with_userpin"));
    }

    /** The message as a push. */
    public byte[] push() {
        return isPush ? bytes : Push.push(bytes);
    }

    /** What becomes of a document; null, and said so, when it is refused. */
    private static byte[] encoded(String document) {
        try {
            byte[] xml = document.getBytes(StandardCharsets.UTF_8);
            return ProvisioningEncoder.ofXml(xml, EncodeOptions.NONE).push();
        } catch (EncodingException refused) {
            System.out.println(refused);
            return null;
        }
    }
}
