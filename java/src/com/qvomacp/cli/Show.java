package com.qvomacp.cli;

import com.qvomacp.eng.omacp.EncodeOptions;
import com.qvomacp.eng.omacp.EncodingException;
import com.qvomacp.eng.omacp.ProvisioningEncoder;
import com.qvomacp.eng.omacp.PushHeader;
import java.util.Collections;
import java.util.List;
import picocli.CommandLine.Command;

/** Shows what messages say. */
@Command(
        name = "show",
        description = "Show what messages set.",
        footerHeading = "%n",
        footer = {
            "A message that the native library refuses is shown all the same, and the refusal is"
                    + " explained."
        },
        exitCodeList = {
            "0:every message was shown",
            "1:a message is refused",
            "2:wrong usage, a message cannot be read, the output cannot be written,"
                    + " or the library that is asked cannot be loaded"
        })
final class Show extends JsonJob {
    private static final Option<Boolean> HEADER =
            Option.flag("--header", "Show the push header alone, whatever the body is.");
    private static final Option<Boolean> BYTES =
            Option.flag("--bytes", "List every byte with what it means.");
    private static final Option<Boolean> ANSWERS = Option.flag("--answers",
            "Ask the native library as well, and mark where it answers otherwise than the message"
                    + " says.");
    private static final Option<Boolean> XML =
            Option.flag("--xml", "Print the document as XML, from which encode makes it.");

    private int shown;

    Show() {
        Collections.addAll(options, HEADER, BYTES, ANSWERS, XML);
    }

    @Override
    void begin() {
        if (has(BYTES) && (isJson() || has(HEADER) || has(ANSWERS))) {
            throw new UsageException("--bytes goes with none of --json, --header and --answers");
        }
        if (has(XML) && (has(BYTES) || isJson() || has(HEADER) || has(ANSWERS))) {
            throw new UsageException("--xml goes with no other form, nor with --answers");
        }
        if (has(ANSWERS) && has(HEADER)) {
            throw new UsageException("--answers goes not with --header");
        }
        super.begin();
    }

    @Override
    void run(Held held) {
        if (has(HEADER)) {
            showHeader(held);
            return;
        }
        Reading reading = new Reading(held, limit);
        if (has(BYTES)) {
            console.raise(reading.status());
            list(reading);
            if (!reading.isAccepted()) {
                console.out.print("\n" + new Refusal(reading).write("", palette));
            }
        } else if (isJson()) {
            explain(reading);
            json(reading);
        } else {
            if (!has(XML)) {
                text(reading);
            } else if (reading.message != null) {
                xml(reading);
            }
            explain(reading);
        }
    }

    private void xml(Reading reading) {
        try {
            String text = ProvisioningEncoder.of(reading.message, EncodeOptions.NONE).xml();
            title(reading.held.name);
            console.out.print(text);
        } catch (EncodingException none) {
            refuse(reading.held.name, none);
        }
    }

    private void list(Reading reading) {
        title(reading.held.name);
        Listing.write(console.out, palette, reading);
    }

    @Override
    void unknown(Held held) {
        if (has(BYTES) && held.bytes != null) {
            list(new Reading(held, limit));
        }
    }

    private void showHeader(Held held) {
        if (!held.isPush) {
            fail(Console.REFUSED, held.name, "has no push header");
            return;
        }
        PushHeader read = header(held);
        if (read != null && isJson()) {
            beginObject(held.name);
            new MessageJson(writer).header(read, held.bytes.length - read.length());
            endObject();
        } else if (read != null) {
            title(held.name);
            new TextWriter(console.out, palette).header(read, held.bytes.length - read.length());
        }
    }

    private void text(Reading reading) {
        if (reading.document == null && reading.header == null) {
            return;
        }
        title(reading.held.name);
        TextWriter text = new TextWriter(console.out, palette);
        text.header(reading.header, reading.held.bytes.length - reading.bodyAt());
        if (reading.document != null) {
            text.document(reading.document);
        }
        if (has(ANSWERS)) {
            text.answers(compared(reading));
        }
    }

    private void json(Reading reading) {
        beginObject(reading.held.name);
        int depth = writer.depth();
        try {
            MessageJson json = new MessageJson(writer);
            json.message(reading);
            if (has(ANSWERS)) {
                json.answers(compared(reading));
            }
        } finally {
            writer.endTo(depth);
        }
        endObject();
    }

    /** Asks the library; where it cannot be loaded, that is said. */
    private Comparison compared(Reading reading) {
        try {
            return new Comparison(reading);
        } catch (UnsatisfiedLinkError missing) {
            console.raise(Console.FAILED);
            complain(startOf(reading.held.name) + Visible.of(missing.getMessage()) + "\n");
            return new Comparison("the library cannot be loaded");
        }
    }

    /** Of several files, each stands under its name. */
    private void title(String name) {
        if (isOneOfSeveral) {
            console.out.print(shown == 0 ? "" : "\n");
            console.out.println(palette.bold("==> " + Visible.of(name) + " <=="));
        }
        ++shown;
    }
}
