package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.ChildVm;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.List;
import java.util.Random;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;
import org.junit.jupiter.params.provider.ValueSource;
import picocli.CommandLine;
import picocli.CommandLine.Model.CommandSpec;

/** A plain command line is read as picocli reads it. */
class ArgumentsTest {
    private static final String[] TEXTS = {
        "a", "", " ", "-", "--", "=", "a=b", "@a", "a b", "\"a\"", "'a", "-1", "-x", "show", "auto", "SMS", "Ud",
        "SUBMIT", "64K", "${x}", "$$", "a,b", "\\", "--json", "--nothing", "completion", "ä", "@", "--=", "true"
    };

    static List<String> commands() {
        return List.of(Main.COMMANDS);
    }

    private static Arguments plain(String command, String... arguments) {
        return Arguments.plain(Main.command(command).options(), arguments, 0);
    }

    private void assertIsReadAsPicocliReadsIt(
            String command, String[] arguments, Arguments plain) {
        String[] whole = concatenated(List.of(command), List.of(arguments));
        CommandSpec parsed = Usage.parsed(program, whole).subcommand().commandSpec();
        Arguments given = Usage.given(parsed);
        assertEquals(command, parsed.name(), () -> String.join("|", whole));
        assertEquals(given.values, plain.values, () -> String.join("|", whole));
        assertEquals(given.files, plain.files, () -> String.join("|", whole));
    }

    private static String[] concatenated(List<String> first, List<String> second) {
        List<String> all = new ArrayList<>(first);
        all.addAll(second);
        return all.toArray(new String[0]);
    }

    private final CommandLine program = Usage.program();

    @ParameterizedTest
    @MethodSource("commands")
    void isPlainWithAnyOptionInAnyWayOfWritingIt(String command) {
        for (Option<?> option : Main.command(command).options()) {
            for (String name : option.names) {
                List<String[]> ways = new ArrayList<>();
                if (option.label == null) {
                    ways.add(new String[] {"file", name, "-"});
                } else {
                    String value = option.constants == null ? "x" : option.constants[0].toString();
                    ways.add(new String[] {"file", name, value, "-"});
                    ways.add(new String[] {"file", name + "=" + value, "-"});
                }
                for (String[] way : ways) {
                    Arguments plain = plain(command, way);
                    assertNotNull(plain, () -> String.join("|", way));
                    assertTrue(plain.has(option));
                    assertEquals(List.of("file", "-"), plain.files);
                    assertIsReadAsPicocliReadsIt(command, way, plain);
                }
            }
        }
    }

    @ParameterizedTest
    @MethodSource("commands")
    void isReadTheSameInBothWays(String command) {
        Random random = new Random(14);
        List<Option<?>> options = Main.command(command).options();
        int plainOnes = 0;
        for (int n = 0; n < 2000; ++n) {
            List<String> line = new ArrayList<>();
            for (int i = random.nextInt(5); i > 0; --i) {
                Option<?> option = options.get(random.nextInt(options.size()));
                String name = option.names[random.nextInt(option.names.length)];
                String text = TEXTS[random.nextInt(TEXTS.length)];
                boolean isKnown = option.constants != null && random.nextBoolean();
                String value =
                        isKnown ? option.constants[random.nextInt(option.constants.length)].toString() : text;
                switch (random.nextInt(option.label == null ? 6 : 4)) {
                    case 0:
                        line.add(name + "=" + value);
                        break;
                    case 1:
                        line.add(name);
                        line.add(value);
                        break;
                    case 2:
                        line.add(text);
                        break;
                    default:
                        line.add(name);
                }
            }
            String[] arguments = line.toArray(new String[0]);
            Arguments plain = plain(command, arguments);
            if (plain != null) {
                ++plainOnes;
                assertIsReadAsPicocliReadsIt(command, arguments, plain);
            }
        }
        assertTrue(plainOnes > 300, () -> command);
    }

    @ParameterizedTest
    @ValueSource(
            strings = {
                "--nothing", "--json --json", "--json=true", "--limit", "--limit --json", "--limit -1", "-h",
                "--help", "-V", "-x", "-- a", "--color=blue", "--as", "--js", "--limit=1 --limit=2"
            })
    void isLeftToPicocliWhereItIsNotPlain(String line) {
        assertNull(plain("show", line.split(" ")));
    }

    @Test
    void loadsPicocliOnlyWhereItIsNotPlain() throws Exception {
        assertFalse(loaded("--limit", "1K", "--json-lines").contains("picocli"));
        assertTrue(loaded("--limit=1K", "--json-lines", "--").contains("picocli"));
    }

    /** What is printed with the classes that are loaded. */
    private static String loaded(String... arguments) throws Exception {
        byte[] message = Files.readAllBytes(Path.of("samples", "internet.push"));
        ChildVm.Result result =
                ChildVm.run(List.of("-verbose:class"), message, Main.class, arguments);
        assertEquals(0, result.status(), result.errors());
        assertTrue(result.output().contains("com.qvomacp.cli.Show"), result.output());
        return result.output();
    }
}
