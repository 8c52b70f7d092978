package com.qvomacp.cli;

import picocli.CommandLine.Option;

/** A job whose results can be JSON: an object for each message. */
abstract class JsonJob extends Job {
    @Option(names = "--json", description = "Print JSON: an object, or an array for several files.")
    private boolean json;

    @Option(names = "--json-lines", description = "Print JSON: an object on a line for each file.")
    private boolean jsonLines;

    JsonWriter writer;
    private boolean inObject;

    @Override
    void begin() {
        if (json && jsonLines) {
            throw new UsageException("--json-lines goes not with --json");
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

    final boolean isJson() {
        return json || jsonLines;
    }

    final void beginObject(String name) {
        if (isInArray() && writer.depth() == 0) {
            writer.beginArray();
        }
        writer.beginObject();
        inObject = true;
        if (isOneOfSeveral()) {
            writer.member("file", name);
        }
    }

    final void endObject() {
        writer.end();
        inObject = false;
    }

    @Override
    void complain(String text) {
        writer.separate();
        super.complain(text);
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
