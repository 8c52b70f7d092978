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

    @Override
    void begin() {
        if (bytes && (isJson() || header || answers)) {
            throw new UsageException("--bytes goes with none of --json, --header and --answers");
        }
        if (json && jsonLines || answers && header) {
            throw new UsageException(
                    (json ? "--json-lines goes not with --json" : "--answers goes not with --header"));
        }
        writer = new JsonWriter(console.out, jsonLines);
        if (json && hasSeveralFiles()) {
            writer.beginArray();
        }
    }

    @Override
    void end() {
        writer.endTo(0);
    }

    private boolean isJson() {
        return json || jsonLines;
    }

    @Override
    void run(Source source) {
        if (header) {
            showHeader(source);
            return;
        }
        Reading reading = Reading.of(source, limit());
        console.raise(reading.status());
        if (isJson()) {
            json(reading);
        } else if (bytes) {
            title(source.name);
            Listing.write(console.out, outPalette(), reading);
        } else {
            text(reading);
        }
        if (reading.isAccepted()) {
            return;
        }
        String reason = Refusal.of(reading).write(bytes ? "" : startOf(source.name),
                bytes ? outPalette() : errPalette());
        if (bytes) {
            console.out.print("\n" + reason);
        } else {
            console.complain(reason);
        }
    }

    private void showHeader(Source source) {
        if (!source.isPush) {
            fail(Console.REFUSED, source.name, "has no push header");
            return;
        }
        PushHeader read;
        try {
            read = PushHeader.parse(source.bytes);
        } catch (ProvisioningException refused) {
            console.raise(Console.REFUSED);
            console.complain(
                    Refusal.of(source, refused, 0).write(startOf(source.name), errPalette()));
            failed(source.name, refused.getMessage());
            return;
        }
        int bodyLength = source.bytes.length - read.length();
        if (isJson()) {
            beginObject(source.name);
            new MessageJson(writer).header(read, bodyLength);
            writer.end();
        } else {
            title(source.name);
            new TextWriter(console.out, outPalette()).header(read, bodyLength);
        }
    }

    private void text(Reading reading) {
        if (reading.document == null && reading.header == null) {
            return;
        }
        title(reading.source.name);
        TextWriter text = new TextWriter(console.out, outPalette());
        int bodyLength = reading.source.bytes.length - reading.bodyAt();
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
        beginObject(reading.source.name);
        int depth = writer.depth();
        try {
            new MessageJson(writer).message(reading);
            if (answers) {
                answers(reading, new AnswerJson(writer));
            }
        } finally {
            writer.endTo(depth);
        }
        writer.end();
    }

    /** Asks the library; where it cannot be loaded, that is said. */
    private void answers(Reading reading, Comparison.Listener listener) {
        try {
            Comparison.of(reading, listener);
        } catch (UnsatisfiedLinkError missing) {
            listener.unanswered("the library cannot be loaded");
            console.raise(Console.FAILED);
            console.complain(
                    startOf(reading.source.name) + Visible.of(missing.getMessage()) + "\n");
        }
    }

    private void beginObject(String name) {
        writer.beginObject();
        if (hasSeveralFiles()) {
            writer.member("file", name);
        }
    }

    /** Of several files, each stands under its name. */
    private void title(String name) {
        if (hasSeveralFiles()) {
            console.out.print(shown == 0 ? "" : "\n");
            console.out.println(outPalette().bold("==> " + Visible.of(name) + " <=="));
        }
        ++shown;
    }

    @Override
    void failed(String name, String reason) {
        if (isJson()) {
            // What was begun of the message may stand already.
            if (writer.depth() == (json && hasSeveralFiles() ? 1 : 0)) {
                beginObject(name);
            }
            writer.member("error", reason).end();
        }
    }
}
