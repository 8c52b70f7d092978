package com.qvomacp.cli;

import com.qvomacp.cli.Terminal.Color;
import com.qvomacp.eng.omacp.EncodingException;
import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.PushHeader;
import java.io.IOException;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;

/** A command that does the same to each of its files. */
abstract class Job {
    private static final int DEFAULT_LIMIT = 64 << 10;

    private static final Option<String> LIMIT = Option.text("--limit", "BYTES",
            "Read no more than so many bytes of a file; K and M may stand behind the number (by"
                    + " itself 64K).");
    private static final Option<Form> AS = Option.constant("--as", "FORM", Form.values(),
            "What the messages are, where it does not show by itself: push, body, sms (an"
                    + " SMS-DELIVER) or ud (the user data of an SMS).");
    private static final Option<Color> COLOR = Option.constant("--color", "WHEN", Color.values(),
            "Use colours: auto (on a terminal, unless NO_COLOR is set), always, never.");

    /** What it takes, in the order of its help; each kind of job adds its own. */
    final List<Option<?>> options = new ArrayList<>(Arrays.asList(LIMIT, AS, COLOR));

    Arguments arguments;
    Console console;

    /** The colours of standard output. */
    Palette palette;

    /** How many bytes of a file are read, and so how long a message may be. */
    int limit;

    /** Whether there are several files, or several messages in the only one. */
    boolean isOneOfSeveral;

    List<Option<?>> options() {
        return options;
    }

    boolean has(Option<?> option) {
        return arguments.has(option);
    }

    /** The value of an option; null without one. */
    @SuppressWarnings("unchecked")
    <T> T value(Option<T> option) {
        return (T) arguments.values.get(option);
    }

    /** Does it to one message. */
    abstract void run(Held held);

    /** Looks at what the command line asks for, in front of the first file. */
    abstract void begin();

    /** Does it to a document in XML; false where a command does it to messages alone. */
    boolean runXml(String name, byte[] xml) throws EncodingException {
        return false;
    }

    /** Called in front of saying that something is no message. */
    void unknown(Held held) {}

    /** Says in which way a file has failed, where more than a complaint is wanted. */
    void failed(String name, String reason) {}

    /** Called behind the last file. */
    void end() {}

    final void run(Console to, Arguments given) {
        console = to;
        arguments = given;
        palette = palette(to.terminal.hasColorOut);
        limit = has(LIMIT) ? bytes(value(LIMIT)) : DEFAULT_LIMIT;
        List<String> files = given.files;
        if (files.isEmpty()) {
            files.add(Input.STANDARD_INPUT);
        }
        begin();
        Intake intake = new Intake(value(AS));
        isOneOfSeveral = files.size() > 1;
        for (int i = 0; i < files.size(); ++i) {
            run(files.get(i), intake, i == files.size() - 1);
        }
        end();
    }

    /** Does it to the messages that are whole with a file, or for which it was the last hope. */
    private void run(String file, Intake intake, boolean isLast) {
        String name = Input.nameOf(file);
        try {
            List<Held> messages = new ArrayList<>();
            try {
                byte[] content = Input.read(file, console.in, limit);
                if (has(AS) || !isXml(content) || !runXml(name, content)) {
                    messages.addAll(intake.take(name, content));
                }
            } catch (IOException unreadable) {
                fail(Console.FAILED, name, unreadable.getMessage());
            } catch (EncodingException refused) {
                refuse(name, refused);
            }
            if (isLast) {
                messages.addAll(intake.finish());
            }
            isOneOfSeveral |= messages.size() > 1;
            for (Held held : messages) {
                name = held.name;
                look(held);
            }
        } catch (OutOfMemoryError tooLarge) {
            fail(Console.FAILED, name, "needs more memory than there is");
        }
    }

    private void look(Held held) {
        for (String note : held.notes) {
            complain(startOf(held.name) + "note: " + Visible.of(note) + "\n");
        }
        if (held.error != null) {
            unknown(held);
            fail(Console.REFUSED, held.name, held.error);
        } else if (held.bytes != null) {
            run(held);
        }
    }

    private static int bytes(String number) {
        int unit = number.endsWith("K") ? 10 : number.endsWith("M") ? 20 : 0;
        try {
            long count = Long.parseLong(number.substring(0, number.length() - (unit == 0 ? 0 : 1)));
            if (count > 0 && count <= Integer.MAX_VALUE / 2 >> unit) {
                return (int) count << unit;
            }
        } catch (NumberFormatException none) {
            // Said below.
        }
        throw new UsageException("--limit is a number of bytes, up to 1023M: " + number);
    }

    /** Whether it begins with a tag, in UTF-8 or UTF-16, and not with that of a push. */
    private static boolean isXml(byte[] content) {
        int at = 0;
        while (at < content.length
                && "\u00EF\u00BB\u00BF\u00FE\u00FF\0 \t\r\n".indexOf(content[at] & 0xFF) >= 0) {
            ++at;
        }
        return at < content.length && content[at] == '<' && (at > 0 || !Intake.isPush(content));
    }

    /** The colours of an output that has some by itself or has not. */
    private Palette palette(boolean byItself) {
        Color wish = value(COLOR);
        return new Palette(wish == Color.always || wish != Color.never && byItself);
    }

    /** How a line begins that says something about a file where errors go. */
    static String startOf(String name) {
        return "omacp: " + Visible.of(name) + ": ";
    }

    /** Writes to standard error; more about the file goes to the output behind it. */
    void complain(String text) {
        console.complain(text);
    }

    /** Says why a message is refused, where it is. */
    void explain(Reading reading) {
        console.raise(reading.status());
        if (!reading.isAccepted()) {
            Palette colors = palette(console.terminal.hasColorErr);
            complain(new Refusal(reading).write(startOf(reading.held.name), colors));
        }
    }

    /** The push header of a message; where it cannot be read, null, and that is said. */
    PushHeader header(Held held) {
        try {
            return PushHeader.parse(held.bytes);
        } catch (ProvisioningException none) {
            explain(new Reading(held, limit));
            failed(held.name, none.getMessage());
            return null;
        }
    }

    /** Says why a document cannot be encoded, or not be written as XML. */
    void refuse(String name, EncodingException e) {
        String reason = e.getMessage();
        if (e.line() > 0) {
            List<String> expected = e.expected();
            reason += expected.isEmpty() ? "" : ", expected " + String.join(", ", expected);
            fail(Console.REFUSED, name + ':' + e.line() + ':' + e.column(), reason);
        } else if (e.path() != null) {
            fail(Console.REFUSED, name, reason + ", in " + e.path());
        } else {
            // An option is at fault, and not the document.
            fail(Console.FAILED, name, reason);
        }
    }

    void fail(int status, String name, String reason) {
        console.raise(status);
        complain(startOf(name) + Visible.of(reason) + "\n");
        failed(name, reason);
    }
}
