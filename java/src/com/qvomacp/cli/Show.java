package com.qvomacp.cli;

import picocli.CommandLine.Command;
import picocli.CommandLine.Option;
import picocli.CommandLine.ParameterException;

/** Shows what messages say. */
@Command(
        name = "show",
        description = "Show what messages set.",
        sortOptions = false,
        parameterListHeading = "%n",
        optionListHeading = "%nOptions:%n",
        footerHeading = "%n",
        footer = {
            "Values are shown as the library answers them: the SERVICE of a proxy's port by its"
                    + " place in the list, a BEARER given as text by the NAP-ADDRESS of its access"
                    + " point. A message that is refused is explained."
        },
        exitCodeListHeading = "%nExit status:%n",
        exitCodeList = {
            "0:every message was shown",
            "1:a message is refused",
            "2:wrong usage, a message cannot be read, the output cannot be written,"
                    + " or the library cannot be loaded"
        })
final class Show extends Job {
    @Option(names = "--json", description = "Print JSON: an object, or an array for several files.")
    private boolean json;

    @Option(names = "--header", description = "Show the push header alone, whatever the body is.")
    private boolean header;

    @Option(names = "--bytes", description = "List every byte with what it means.")
    private boolean bytes;

    private int shown;

    /** The last element of the JSON array, which waits for what separates it from the next. */
    private String waiting = "";

    Show(Main main) {
        super(main);
    }

    @Override
    void begin() {
        if (bytes && (json || header)) {
            throw new ParameterException(
                    spec.commandLine(), "--bytes goes with neither --json nor --header");
        }
        if (json && hasSeveralFiles()) {
            out().print("[\n");
        }
    }

    @Override
    void end() {
        if (json && hasSeveralFiles()) {
            out().print(waiting + "\n]\n");
        }
    }

    @Override
    void run(Source source) throws RefusedException {
        MessageReader reader = new MessageReader();
        if (header) {
            if (!source.isPush) {
                fail(Main.REFUSED, source.name, "has no push header");
                return;
            }
            Header answered = reader.readHeader(source.bytes);
            print(source.name, json ? JsonWriter.write(answered) : TextWriter.write(answered));
        } else if (bytes) {
            list(source, reader);
        } else {
            Message message = reader.read(source);
            print(source.name, json ? JsonWriter.write(message) : TextWriter.write(message));
        }
    }

    /** The listing, and below it why the message is refused, if it is. */
    private void list(Source source, MessageReader reader) {
        String listing = Listing.write(source.annotation(), outPalette());
        try {
            reader.read(source);
        } catch (RefusedException refused) {
            raise(Main.REFUSED);
            Explanation explanation = Explanation.of(source, refused.headerTaken);
            listing += "\n" + explanation.write("", outPalette());
        }
        print(source.name, listing);
    }

    /** Prints what is shown of a file; of several, each under its name. */
    private void print(String name, String text) {
        if (!hasSeveralFiles()) {
            out().print(text);
        } else if (json) {
            out().print(shown == 0 ? "" : waiting + ",\n");
            waiting = JsonWriter.element(name, text);
        } else {
            out().print(shown == 0 ? "" : "\n");
            out().println(outPalette().bold("==> " + Visible.of(name) + " <=="));
            out().print(text);
        }
        ++shown;
    }

    @Override
    void refused(Explanation explanation) {
        complain(explanation);
        if (json) {
            print(explanation.source.name, JsonWriter.write(explanation));
        }
    }

    @Override
    void failed(String name, String reason) {
        if (json) {
            print(name, JsonWriter.error(reason));
        }
    }
}
