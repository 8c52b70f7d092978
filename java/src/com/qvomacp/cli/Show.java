package com.qvomacp.cli;

import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.PushHeader;
import picocli.CommandLine.Command;
import picocli.CommandLine.Option;

/** Shows what messages say. */
@Command(
        name = "show",
        description = "Show what messages set.",
        sortOptions = false,
        parameterListHeading = "%n",
        optionListHeading = "%nOptions:%n",
        footerHeading = "%n",
        footer = {
            "A message that the native library refuses is shown all the same, and the refusal is"
                    + " explained."
        },
        exitCodeListHeading = "%nExit status:%n",
        exitCodeList = {
            "0:every message was shown",
            "1:a message is refused",
            "2:wrong usage, a message cannot be read, the output cannot be written,"
                    + " or the library that is asked cannot be loaded"
        })
final class Show extends Job {
    @Option(names = "--json", description = "Print JSON: an object, or an array for several files.")
    private boolean json;

    @Option(names = "--json-lines", description = "Print JSON: an object on a line for each file.")
    private boolean jsonLines;

    @Option(names = "--header", description = "Show the push header alone, whatever the body is.")
    private boolean header;

    @Option(names = "--bytes", description = "List every byte with what it means.")
    private boolean bytes;

    @Option(
            names = "--answers",
            description =
                    "Ask the native library as well, and mark where it answers otherwise than the"
                            + " message says.")
    private boolean answers;

    private JsonWriter writer;
    private int shown;
    private boolean inObject;

    @Override
    void begin() {
        if (bytes && (isJson() || header || answers)) {
            throw new UsageException("--bytes goes with none of --json, --header and --answers");
        }
        if (json && jsonLines || answers && header) {
            throw new UsageException("--json-lines goes not with --json, nor --answers with --header");
        }
        writer = new JsonWriter(console.out, jsonLines);
    }

    @Override
    void end() {
        if (isInArray() && writer.depth() == 0) {
            writer.beginArray();
        }
        writer.endTo(0);
    }

    private boolean isInArray() {
        return json && isOneOfSeveral();
    }

    private boolean isJson() {
        return json || jsonLines;
    }

    @Override
    void run(Held held) {
        if (header) {
            showHeader(held);
            return;
        }
        Reading reading = Reading.of(held, limit());
        console.raise(reading.status());
        if (isJson()) {
            if (!reading.isAccepted()) {
                complain(Refusal.of(reading).write(startOf(held.name), errPalette()));
            }
            json(reading);
        } else if (bytes) {
            list(reading);
            if (!reading.isAccepted()) {
                console.out.print("\n" + Refusal.of(reading).write("", outPalette()));
            }
        } else {
            text(reading);
            if (!reading.isAccepted()) {
                complain(Refusal.of(reading).write(startOf(held.name), errPalette()));
            }
        }
    }

    private void list(Reading reading) {
        title(reading.held.name);
        Listing.write(console.out, outPalette(), reading);
    }

    @Override
    void unknown(Held held) {
        if (bytes && held.bytes != null) {
            list(Reading.of(held, limit()));
        }
    }

    @Override
    void complain(String text) {
        writer.separate();
        super.complain(text);
    }

    private void showHeader(Held held) {
        if (!held.isPush) {
            fail(Console.REFUSED, held.name, "has no push header");
            return;
        }
        PushHeader read;
        try {
            read = PushHeader.parse(held.bytes);
        } catch (ProvisioningException refused) {
            console.raise(Console.REFUSED);
            complain(Refusal.of(held, refused, 0).write(startOf(held.name), errPalette()));
            failed(held.name, refused.getMessage());
            return;
        }
        int bodyLength = held.bytes.length - read.length();
        if (isJson()) {
            beginObject(held.name);
            new MessageJson(writer).header(read, bodyLength);
            endObject();
        } else {
            title(held.name);
            new TextWriter(console.out, outPalette()).header(read, bodyLength);
        }
    }

    private void text(Reading reading) {
        if (reading.document == null && reading.header == null) {
            return;
        }
        title(reading.held.name);
        TextWriter text = new TextWriter(console.out, outPalette());
        int bodyLength = reading.held.bytes.length - reading.bodyAt();
        if (reading.header == null) {
            text.bodyAlone(bodyLength);
        } else {
            text.header(reading.header, bodyLength);
        }
        if (reading.document != null) {
            text.document(reading.document);
        }
        if (answers) {
            answers(reading, new AnswerText(console.out, outPalette()));
        }
    }

    private void json(Reading reading) {
        beginObject(reading.held.name);
        int depth = writer.depth();
        try {
            new MessageJson(writer).message(reading);
            if (answers) {
                answers(reading, new AnswerJson(writer));
            }
        } finally {
            writer.endTo(depth);
        }
        endObject();
    }

    /** Asks the library; where it cannot be loaded, that is said. */
    private void answers(Reading reading, Comparison.Listener listener) {
        try {
            Comparison.of(reading, listener);
        } catch (UnsatisfiedLinkError missing) {
            console.raise(Console.FAILED);
            complain(startOf(reading.held.name) + Visible.of(missing.getMessage()) + "\n");
            listener.unanswered("the library cannot be loaded");
        }
    }

    private void beginObject(String name) {
        if (isInArray() && writer.depth() == 0) {
            writer.beginArray();
        }
        writer.beginObject();
        inObject = true;
        if (isOneOfSeveral()) {
            writer.member("file", name);
        }
    }

    private void endObject() {
        writer.end();
        inObject = false;
    }

    /** Of several files, each stands under its name. */
    private void title(String name) {
        if (isOneOfSeveral()) {
            console.out.print(shown == 0 ? "" : "\n");
            console.out.println(outPalette().bold("==> " + Visible.of(name) + " <=="));
        }
        ++shown;
    }

    @Override
    void failed(String name, String reason) {
        if (isJson()) {
            // What was begun of the message stands already.
            if (!inObject) {
                beginObject(name);
            }
            writer.member("error", reason);
            endObject();
        }
    }
}
