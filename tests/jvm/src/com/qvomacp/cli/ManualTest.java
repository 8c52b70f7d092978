package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.eng.omacp.Rule;
import java.io.ByteArrayInputStream;
import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.EnumMap;
import java.util.Locale;
import java.util.Map;
import java.util.Set;
import java.util.TreeSet;
import java.util.concurrent.TimeUnit;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;
import picocli.CommandLine;
import picocli.CommandLine.Model.OptionSpec;

/** The manual page and the shell completion know the options that the program has. */
class ManualTest {
    private static final Path MANUAL = Path.of("docs", "omacp.1");

    @TempDir Path directory;

    private static Set<String> options() {
        Set<String> options = new TreeSet<>();
        CommandLine program = Usage.program();
        for (OptionSpec option : program.getCommandSpec().options()) {
            options.addAll(Set.of(option.names()));
        }
        for (CommandLine command : program.getSubcommands().values()) {
            for (OptionSpec option : command.getCommandSpec().options()) {
                options.addAll(Set.of(option.names()));
            }
        }
        return options;
    }

    private static Set<String> found(String pattern, String text) {
        Set<String> found = new TreeSet<>();
        Matcher matcher = Pattern.compile(pattern).matcher(text);
        while (matcher.find()) {
            found.add(matcher.group(1));
        }
        return found;
    }

    private static String section(String name) throws Exception {
        String manual = Files.readString(MANUAL);
        int start = manual.indexOf(".SH " + name + "\n");
        assertTrue(start >= 0, name);
        int end = manual.indexOf("\n.SH", start + 1);
        return manual.substring(start, end).replace("\\-", "-");
    }

    @Test
    void theManualHasTheOptions() throws Exception {
        assertEquals(options(), found("(?<![\\w-])(--?[a-zA-Z][a-zA-Z0-9-]*)", section("OPTIONS")));
        String rest = Files.readString(MANUAL).replace("\\-", "-");
        assertTrue(options().containsAll(found("(?<![\\w-])(--[a-z][a-z0-9-]*)", rest)), rest);
    }

    @Test
    void theManualHasTheCommands() throws Exception {
        assertEquals(
                new TreeSet<>(Usage.program().getSubcommands().keySet()),
                found("\n\\.TP\n\\.B (\\w+)\n", section("COMMANDS")));
    }

    @Test
    void theManualHasTheExitStatuses() throws Exception {
        assertEquals(
                new TreeSet<>(
                        Usage.program()
                                .getCommandSpec()
                                .usageMessage()
                                .exitCodeList()
                                .keySet()),
                found("\n\\.TP\n\\.B (\\d)\n", section("\"EXIT STATUS\"")));
    }

    @Test
    void theManualHasTheRulesByTheirSeverity() throws Exception {
        Map<Rule.Severity, Set<String>> rules = new EnumMap<>(Rule.Severity.class);
        for (Rule rule : Rule.values()) {
            rules.computeIfAbsent(rule.severity(), severity -> new TreeSet<>()).add(rule.ruleName());
        }
        Map<Rule.Severity, Set<String>> told = new EnumMap<>(Rule.Severity.class);
        for (Rule.Severity severity : Rule.Severity.values()) {
            String[] paragraphs = section("RULES").toLowerCase(Locale.ROOT).split("\n\\.pp\n");
            String bold = String.join(" ", found("(?m)^\\.br? (.*)$", paragraphs[severity.ordinal()]));
            told.put(severity, found("(?<![\\w-])([a-z]+(?:-[a-z]+)*)", bold));
            told.get(severity).remove("and");
        }
        assertEquals(rules, told);
    }

    @Test
    void theCompletionHasTheOptionsAndIsAScript() throws Exception {
        ByteArrayOutputStream out = new ByteArrayOutputStream();
        int status =
                Main.run(
                        new ByteArrayInputStream(new byte[0]),
                        out,
                        out,
                        Terminal.NONE,
                        "completion");
        assertEquals(0, status);
        String script = out.toString(StandardCharsets.UTF_8);
        assertTrue(found("(?<![\\w-])(--?[a-zA-Z][a-zA-Z0-9-]*)", script).containsAll(options()), script);
        Path file = Files.writeString(directory.resolve("completion"), script);
        assertEquals("--bytes\n", completed(file, "COMP_WORDS=(omacp show --by) COMP_CWORD=2"));
        // Without a command, show is meant.
        assertEquals("--bytes\n", completed(file, "COMP_WORDS=(omacp --by) COMP_CWORD=1"));
        assertEquals("push\n", completed(file, "COMP_WORDS=(omacp --as pu) COMP_CWORD=2"));
        assertFalse(script.contains("compopt +o default"), "files are completed, too");
        assertEquals("verify\n", completed(file, "COMP_WORDS=(omacp ver) COMP_CWORD=1"));
    }

    private static String completed(Path script, String line) throws Exception {
        String ask = "source " + script + " && " + line + " && _complete_omacp && echo \"${COMPREPLY[@]}\"";
        Process bash =
                new ProcessBuilder("bash", "--norc", "-c", ask)
                        .redirectError(ProcessBuilder.Redirect.DISCARD)
                        .start();
        String answer = new String(bash.getInputStream().readAllBytes(), StandardCharsets.UTF_8);
        assertTrue(bash.waitFor(10, TimeUnit.SECONDS));
        return answer;
    }
}
