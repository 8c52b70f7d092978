package com.qvomacp.cli;

import com.qvomacp.eng.omacp.EncodingException;
import com.qvomacp.eng.omacp.Finding;
import com.qvomacp.eng.omacp.ProvisioningEncoder;
import com.qvomacp.eng.omacp.Rule;
import com.qvomacp.eng.omacp.Rule.Severity;
import java.util.Collections;
import java.util.EnumSet;
import java.util.List;
import java.util.Set;
import picocli.CommandLine.Command;

/** Tells what is wrong with messages. */
@Command(
        name = "lint",
        description = {
            "Tell what is wrong with messages, and what would be right.",
            "A FILE may hold a document in XML, too."
        },
        customSynopsis = "omacp lint [-h] [OPTION...] [FILE...]",
        exitCodeList = {
            "0:no error was found and, with --strict, no warning",
            "1:an error was found or, with --strict, a warning",
            "2:wrong usage, a message or document cannot be read, the output cannot be written"
        })
final class Lint extends MessageJob {
    private static final Option<String> NO = Option.texts("--no --disable", "RULE",
            "Leave out a rule, or several with commas between their names.");
    private static final Option<Boolean> STRICT =
            Option.flag("--strict", "End with 1 for warnings, too.");

    private final Set<Rule> left = EnumSet.allOf(Rule.class);

    Lint() {
        Collections.addAll(options, NO, STRICT);
    }

    @Override
    void begin() {
        for (String name : has(NO) ? value(NO).split(",") : new String[0]) {
            Rule rule = Rule.named(name);
            if (rule == null) {
                throw new UsageException("--no is given what is no rule: " + name);
            }
            left.remove(rule);
        }
        super.begin();
    }

    @Override
    boolean runXml(String name, byte[] xml) throws EncodingException {
        tell(name, ProvisioningEncoder.lint(xml));
        return true;
    }

    @Override
    void run(Reading reading) {
        tell(reading.held.name, reading.message.lint());
    }

    private void tell(String name, List<Finding> findings) {
        if (isJson()) {
            beginObject(name);
            writer.name("findings").beginArray();
        }
        for (Finding finding : findings) {
            if (left.contains(finding.rule())) {
                Severity severity = finding.rule().severity();
                boolean isCounted = has(STRICT) && severity == Severity.WARNING;
                isCounted |= severity == Severity.ERROR;
                console.raise(isCounted ? Console.REFUSED : Console.DONE);
                if (isJson()) {
                    json(finding);
                } else {
                    text(name, finding);
                }
            }
        }
        if (isJson()) {
            writer.end();
            endObject();
        }
    }

    private void text(String name, Finding finding) {
        String offset = finding.offset() < 0 ? "" : ":" + finding.offset();
        boolean hasLine = finding.line() > 0;
        String place = hasLine ? ":" + finding.line() + ":" + finding.column() : offset;
        boolean isError = finding.rule().severity() == Severity.ERROR;
        String severity = MessageJson.lowerCase(finding.rule().severity()) + ":";
        String rule = " [" + finding.rule().ruleName() + "]";
        String start = Visible.of(name) + place + ": " + severity;
        String text = start + " " + Visible.of(finding.sentence()) + rule;
        String painted = isError ? palette.error(severity) : palette.bold(severity);
        console.out.print(Lines.paragraph("", text).replaceFirst("(?<=: )" + severity, painted));
        String told = "in " + finding.path() + "; right: " + finding.remedy();
        told += "; see " + finding.rule().reference();
        console.out.print(Lines.paragraph("  ", Visible.of(told)));
    }

    private void json(Finding finding) {
        writer.beginObject().member("rule", finding.rule().ruleName());
        writer.member("severity", MessageJson.lowerCase(finding.rule().severity()));
        writer.member("path", finding.path());
        if (finding.line() > 0) {
            writer.member("line", finding.line()).member("column", finding.column());
        } else {
            writer.place("offset", finding.offset());
        }
        writer.member("sentence", finding.sentence()).member("remedy", finding.remedy());
        writer.member("reference", finding.rule().reference()).end();
    }
}
