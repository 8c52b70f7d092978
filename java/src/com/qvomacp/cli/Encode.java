package com.qvomacp.cli;

import com.qvomacp.eng.omacp.EncodeOption;
import com.qvomacp.eng.omacp.EncodeOptions;
import com.qvomacp.eng.omacp.EncodingException;
import com.qvomacp.eng.omacp.ProvisioningEncoder;
import java.io.ByteArrayOutputStream;
import java.io.IOException;
import java.nio.charset.StandardCharsets;
import java.util.Base64;
import java.util.Collections;
import java.util.List;
import picocli.CommandLine.Command;

/** Makes messages of documents in XML, or of messages. */
@Command(
        name = "encode",
        description = {
            "Make a push, or its body alone, of a document in XML or of a message.",
            "A FILE may hold such a document, too. An option wins over its <?omacp-push?>",
            "instruction."
        },
        customSynopsis = "omacp encode [-h] [OPTION...] [FILE...]",
        exitCodeList = {
            "0:everything was written, and the library takes it",
            "1:a document or message is refused, or the library refuses what was written",
            "2:wrong usage, an option that does not fit, a file that cannot be read or written"
        })
final class Encode extends Job {
    private static final String USERPINMAC = "userpinmac";

    /** How the parts of an SMS are written. */
    enum Sms { UD, SUBMIT }

    private static final Option<Boolean> BODY = Option.flag("--body", "Write the body alone.");
    private static final Option<Boolean> HEX =
            Option.flag("--hex", "Write a line of hexadecimal digits.");
    private static final Option<Boolean> BASE64 =
            Option.flag("--base64", "Write a line of base64.");
    private static final Option<Sms> SMS = Option.constant("--sms", "FORM", Sms.values(),
            "Write the parts of an SMS, each a line of hexadecimal digits: ud (user data) or submit"
                    + " (an SMS-SUBMIT).");
    private static final Option<String> TO = Option.text("--to", "NUMBER",
            "Who gets the SMS-SUBMIT: up to 20 digits, with \"+\" or without.");
    private static final Option<String> OUTPUT =
            Option.text("-o --output", "FILE", "Write to a file that is not there yet.");
    private static final Option<Boolean> FORCE = Option.flag("--force", "Overwrite the file.");

    private EncodeOptions encoding = EncodeOptions.NONE;

    /** The file that is written; null for standard output. */
    private String output;

    private final ByteArrayOutputStream written = new ByteArrayOutputStream();

    Encode() {
        Collections.addAll(options, BODY, HEX, BASE64, SMS, TO, OUTPUT, FORCE);
        options.addAll(Choices.ALL.values());
    }

    @Override
    void begin() {
        int forms = (has(HEX) ? 1 : 0) + (has(BASE64) ? 1 : 0) + (has(SMS) ? 1 : 0);
        if (forms > 1 || has(SMS) && has(BODY)) {
            throw new UsageException(
                    "--hex, --base64 and --sms go not together, nor --sms with --body");
        }
        String to = value(TO);
        if (value(SMS) == Sms.SUBMIT ? to == null || !to.matches("\\+?[0-9]{1,20}") : to != null) {
            throw new UsageException(
                    "--sms=submit, and nothing else, needs --to with 1 to 20 digits");
        }
        output = Input.STANDARD_INPUT.equals(value(OUTPUT)) ? null : value(OUTPUT);
        if (output == null && isRaw() && console.terminal.isScreen) {
            throw new UsageException(
                    "bytes are not for a terminal: --hex, --base64, --sms or --output is needed");
        }
        Choices choices = new Choices(this);
        for (EncodeOption option : EncodeOption.values()) {
            String value = choices.value(option);
            try {
                encoding = value == null ? encoding : encoding.with(option, value);
            } catch (IllegalArgumentException wrong) {
                throw new UsageException("--" + wrong.getMessage());
            }
        }
    }

    private boolean isRaw() {
        return !has(HEX) && !has(BASE64) && !has(SMS);
    }

    @Override
    boolean runXml(String name, byte[] xml) throws EncodingException {
        encode(name, ProvisioningEncoder.ofXml(xml, encoding));
        return true;
    }

    @Override
    void run(Held held) {
        Reading reading = new Reading(held, limit);
        if (reading.message == null) {
            explain(reading);
            return;
        }
        warn(reading);
        try {
            encode(held.name, ProvisioningEncoder.of(reading.message, encoding));
        } catch (EncodingException refused) {
            refuse(held.name, refused);
        }
    }

    /** Says of a message that is not what it should be that not all of it is written. */
    private void warn(Reading reading) {
        int deviations = reading.document.deviations().size();
        String places = deviations == 1 ? "1 place" : deviations + " places";
        String departs = deviations == 0 ? "" : "departs from the format in " + places;
        String refused = reading.isAccepted() ? "" : "is refused by the library";
        String and = departs.isEmpty() || refused.isEmpty() ? "" : " and ";
        if (!(departs + refused).isEmpty()) {
            String note = "note: what is read " + departs + and + refused;
            complain(startOf(reading.held.name) + note + "; only what it sets is encoded\n");
        }
    }

    private void encode(String name, ProvisioningEncoder encoder) throws EncodingException {
        if (isRaw() && isOneOfSeveral) {
            String reason = "is one of several, which only --hex, --base64 and --sms can write";
            fail(Console.FAILED, name, reason);
            return;
        }
        byte[] message = has(BODY) ? encoder.body() : encoder.push();
        List<byte[]> parts = has(SMS) ? ShortMessageWriter.userData(message) : null;
        if (isRaw()) {
            written.write(message, 0, message.length);
        } else if (has(HEX)) {
            line(HexText.digits(message));
        } else if (has(BASE64)) {
            line(Base64.getEncoder().encodeToString(message));
        } else if (parts != null) {
            for (byte[] part : parts) {
                boolean isWhole = value(SMS) == Sms.SUBMIT;
                byte[] octets = isWhole ? ShortMessageWriter.submit(value(TO), part) : part;
                line(HexText.digits(octets));
            }
        } else {
            fail(Console.FAILED, name, "is too long for an SMS");
            return;
        }
        if (USERPINMAC.equals(encoder.options().value(EncodeOption.SEC))) {
            String digits = encoder.digitsToTell();
            String none = "digits, for which a PIN of 5 to 20 is needed";
            String told = "the user has to be told " + (digits == null ? none : digits);
            complain(startOf(name) + told + "\n");
        }
        Reading reading = new Reading(Held.message(name, message, !has(BODY)), message.length);
        if (reading.isAccepted()) {
            complain(startOf(name) + "the library takes it\n");
        }
        explain(reading);
    }

    private void line(String text) {
        byte[] line = (text + '\n').getBytes(StandardCharsets.US_ASCII);
        written.write(line, 0, line.length);
    }

    @Override
    void end() {
        byte[] all = written.toByteArray();
        try {
            if (all.length > 0 && output == null) {
                console.write(all);
            } else if (all.length > 0) {
                Input.write(output, all, has(FORCE));
            }
        } catch (IOException unwritable) {
            fail(Console.FAILED, output, unwritable.getMessage());
        }
    }
}
