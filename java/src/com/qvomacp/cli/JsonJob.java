package com.qvomacp.cli;

import java.util.Collections;

/** A job whose results can be JSON: an object for each message. */
abstract class JsonJob extends Job {
    private static final Option<Boolean> JSON =
            Option.flag("--json", "Print JSON: an object, or an array for several files.");
    private static final Option<Boolean> JSON_LINES =
            Option.flag("--json-lines", "Print JSON: an object on a line for each file.");

    JsonWriter writer;
    private boolean inObject;

    JsonJob() {
        Collections.addAll(options, JSON, JSON_LINES);
    }

    @Override
    void begin() {
        if (has(JSON) && has(JSON_LINES)) {
            throw new UsageException("--json-lines goes not with --json");
        }
        writer = new JsonWriter(console.out, has(JSON_LINES));
    }

    @Override
    void end() {
        beginArray();
        writer.endTo(0);
    }

    /** Begins the array of several objects where it is not begun yet. */
    private void beginArray() {
        if (has(JSON) && isOneOfSeveral && writer.depth() == 0) {
            writer.beginArray();
        }
    }

    final boolean isJson() {
        return has(JSON) || has(JSON_LINES);
    }

    final void beginObject(String name) {
        beginArray();
        writer.beginObject();
        inObject = true;
        if (isOneOfSeveral) {
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
