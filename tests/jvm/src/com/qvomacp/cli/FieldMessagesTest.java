package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.FieldMessage;
import com.qvomacp.support.Natives;
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
    void areShownWhetherTheLibraryTakesThemOrNot() throws Exception {
        int taken = 0;
        for (FieldMessage message : FieldMessage.all()) {
            if (message.bytes != null) {
                taken += show(message) ? 1 : 0;
            }
        }
        assertTrue(taken > 0, "no message is taken");
    }

    /** Whether the library takes a message, which has to be what the program says. */
    private boolean show(FieldMessage message) {
        byte[] hex = HexFormat.of().formatHex(message.bytes).getBytes(StandardCharsets.US_ASCII);
        Program program = Program.run(hex);
        assertEquals(message.isPush, new Intake(null).take("", message.bytes).get(0).isPush, message.id);
        boolean isTaken = parse(message.push(), WHOLE_MESSAGE);
        parser.qvomacp_parser_del();
        assertEquals(isTaken ? 0 : 1, program.status(), message.id + ": " + program.errors());
        assertEquals(isTaken, program.errors().isEmpty(), message.id);
        assertTrue(program.output().contains("\n\n"), message.id + ": " + program.output());
        assertNotNull(Program.run(hex, "--json").json().get("document"), message.id);
        Program answers = Program.run(hex, "--answers");
        assertEquals(isTaken, !answers.output().contains("answers nothing"), message.id);
        assertFalse(Program.run(hex, "--bytes").output().contains("not read"), message.id);
        if (!isTaken) {
            System.out.println(message.id + " is refused:\n" + program.errors());
        }
        return isTaken;
    }
}
