package com.qvomacp.cli;

import com.qvomacp.cli.Differences.Change;
import com.qvomacp.cli.Differences.Kind;
import com.qvomacp.eng.omacp.Item;
import com.qvomacp.eng.omacp.Parameter;
import java.util.ArrayList;
import java.util.Collections;
import java.util.List;
import picocli.CommandLine.Command;

/** Tells what differs between two messages. */
@Command(
        name = "diff",
        description = {
            "Tell what differs between two messages: what they say, not how it is written.",
            "A FILE may hold a document in XML, too."
        },
        customSynopsis = "omacp diff [-h] [OPTION...] FILE FILE",
        exitCodeList = {
            "0:they say the same",
            "1:they differ",
            "2:wrong usage, not two messages that can be read, the output cannot be written"
        })
final class Diff extends MessageJob {
    private final List<Reading> readings = new ArrayList<>();

    @Override
    void run(Reading reading) {
        readings.add(reading);
    }

    @Override
    void end() {
        if (console.status == Console.DONE && readings.size() != 2) {
            String found = "two messages are compared, and here are " + readings.size();
            fail(Console.FAILED, "diff", found);
        }
        if (console.status != Console.DONE) {
            super.end();
            return;
        }
        Reading left = readings.get(0);
        Reading right = readings.get(1);
        if ((left.header == null) != (right.header == null)) {
            Reading alone = left.header == null ? left : right;
            String note = "note: has no push header; the documents alone are compared\n";
            complain(startOf(alone.held.name) + note);
        }
        List<Change> changes = Differences.of(left, right);
        console.raise(changes.isEmpty() ? Console.DONE : Console.REFUSED);
        if (isJson()) {
            writer.beginObject().name("files").beginArray();
            writer.text(left.held.name).text(right.held.name).end();
            writer.name("changes").beginArray();
            for (Change change : changes) {
                json(change);
            }
            writer.endTo(0);
        } else if (!changes.isEmpty()) {
            console.out.println(palette.bold("--- " + Visible.of(left.held.name)));
            console.out.println(palette.bold("+++ " + Visible.of(right.held.name)));
            for (Change change : changes) {
                text(change);
            }
        }
    }

    private static boolean isValue(Change change) {
        return change.item == null || change.item instanceof Parameter;
    }

    private void text(Change change) {
        console.out.println(MessageJson.lowerCase(change.kind) + ": " + Visible.of(change.path));
        if (change.kind == Kind.MOVED) {
            console.out.println("  from place " + change.before + " to place " + change.after);
            return;
        }
        if (change.kind != Kind.ADDED) {
            side('-', change, change.before);
        }
        if (change.kind != Kind.REMOVED) {
            side('+', change, change.after);
        }
    }

    /** Writes what one of the messages has. */
    private void side(char sign, Change change, String value) {
        if (isValue(change)) {
            line(sign, 0, value == null ? "(no value)" : Visible.value(value));
            return;
        }
        new Walk() {
            @Override
            void enter(Item item, int depth) {
                line(sign, Math.min(depth, TextWriter.DEEPEST) * Lines.INDENT, shown(item));
            }
        }.through(Collections.singletonList(change.item));
    }

    private void line(char sign, int indent, String text) {
        String whole = "  " + sign + ' ' + Lines.blanks(indent) + text;
        console.out.println(sign == '-' ? palette.error(whole) : palette.text(whole));
    }

    private static String shown(Item item) {
        String value = TextWriter.value(item);
        return TextWriter.title(item) + (value == null ? "" : "  " + Visible.value(value));
    }

    private void json(Change change) {
        writer.beginObject().member("change", MessageJson.lowerCase(change.kind));
        writer.member("path", change.path);
        if (change.kind == Kind.MOVED) {
            writer.member("from", Integer.parseInt(change.before));
            writer.member("to", Integer.parseInt(change.after));
        } else if (isValue(change)) {
            if (change.kind != Kind.ADDED) {
                writer.member("before", change.before);
            }
            if (change.kind != Kind.REMOVED) {
                writer.member("after", change.after);
            }
        } else {
            new MessageJson(writer).items("items", Collections.singletonList(change.item));
        }
        writer.end();
    }
}
