package com.qvomacp.eng;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;
import static org.junit.jupiter.api.Assumptions.assumeTrue;

import com.qvomacp.eng.parser.NativeLibrary;
import com.qvomacp.support.Document;
import com.qvomacp.support.Push;
import java.io.ByteArrayOutputStream;
import java.io.PrintStream;
import java.io.StringWriter;
import java.lang.reflect.Method;
import java.net.URL;
import java.net.URLClassLoader;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.List;
import java.util.Map;
import java.util.TreeMap;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import java.util.stream.Stream;
import javax.tools.JavaCompiler;
import javax.tools.StandardJavaFileManager;
import javax.tools.ToolProvider;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;

/**
 * The examples in the documentation of each public class can be compiled and run. What they use
 * without declaring it is a field of {@link #PREAMBLE}.
 */
class ExamplesTest {
    private static final Pattern PUBLIC =
            Pattern.compile("^public (final |abstract )?(class|enum|interface) ", Pattern.MULTILINE);
    private static final Pattern EXAMPLE =
            Pattern.compile("<pre>\\{@code\n(.*?)\n *\\* *\\}</pre>", Pattern.DOTALL);
    private static final String PREAMBLE =
            """
            import com.qvomacp.eng.omacp.*;
            import com.qvomacp.eng.parser.*;
            import java.util.*;

            public class Examples {
                static byte[] bytes;
                static byte[] push;
                static byte[] headers;
                static byte[] body;
                static byte[] xml;
                static ProvisioningMessage message;
                static ProvisioningDocument document;
                static PushHeader header;
                static Characteristic characteristic;

                public static void prepare(byte[] given) throws Exception {
                    bytes = given;
                    push = given;
                    message = ProvisioningMessage.parsePush(push);
                    document = message.document();
                    header = message.header();
                    headers = Arrays.copyOfRange(push, 3, header.length());
                    body = document.body();
                    xml = "<wap-provisioningdoc/>".getBytes("UTF-8");
                    characteristic = document.characteristics().get(0);
                }
            """;

    @TempDir Path directory;

    /** The text of every example, by class and number. */
    private static Map<String, String> examples() throws Exception {
        Map<String, String> examples = new TreeMap<>();
        try (Stream<Path> files = Files.walk(Path.of("java/src/com/qvomacp/eng"))) {
            for (Path file : files.filter(f -> f.toString().endsWith(".java")).toList()) {
                String source = Files.readString(file);
                Matcher type = PUBLIC.matcher(source);
                String name = file.getFileName().toString().replaceAll("\\W", "_");
                Matcher example = EXAMPLE.matcher(source);
                int count = 0;
                while (example.find()) {
                    String text = example.group(1).replaceAll("(?m)^ *\\* ?", "");
                    examples.put(name + ++count, text);
                }
                assertFalse(type.find() && count == 0, file + " has no example");
            }
        }
        return examples;
    }

    /** A document with a characteristic of each kind that the examples look into. */
    private static byte[] push() {
        Document.Element authentication = Document.characteristic("NAPAUTHINFO");
        Document.Element validity = Document.characteristic("VALIDITY");
        return Push.secured(
                Push.SEC_USERPIN,
                "00",
                Document.document(
                        Document.characteristic("NAPDEF", authentication, validity),
                        Document.characteristic(
                                "PXLOGICAL",
                                Document.characteristic("PXAUTHINFO"),
                                Document.characteristic("PORT"),
                                Document.characteristic("PXPHYSICAL")),
                        Document.characteristic("BOOTSTRAP"),
                        Document.characteristic("CLIENTIDENTITY"),
                        Document.characteristic("VENDORCONFIG", Document.named("own", "1")),
                        Document.characteristic("ACCESS"),
                        Document.characteristic("WI-FI"),
                        Document.characteristic("Vodafone VoWiFi"),
                        Document.characteristic(
                                "APPLICATION",
                                Document.characteristic("APPADDR"),
                                Document.characteristic("APPAUTH"),
                                Document.characteristic("RESOURCE"),
                                Document.characteristic("ROAMING"))));
    }

    @Test
    void ofEveryPublicClassCompileAndRun() throws Exception {
        JavaCompiler compiler = ToolProvider.getSystemJavaCompiler();
        assumeTrue(compiler != null, "there is no compiler beside this VM: skipped");
        Map<String, String> examples = examples();
        assertTrue(examples.size() > 40, examples.size() + " examples");
        StringBuilder source = new StringBuilder(PREAMBLE);
        examples.forEach(
                (name, text) ->
                        source.append("public static void ")
                                .append(name)
                                .append("() throws Exception {\n")
                                .append(text)
                                .append("\n}\n"));
        Path file = Files.writeString(directory.resolve("Examples.java"), source.append("}\n"));
        StringWriter output = new StringWriter();
        List<String> options = List.of("-proc:none", "-d", directory.toString());
        try (StandardJavaFileManager files = compiler.getStandardFileManager(null, null, null)) {
            boolean isCompiled =
                    compiler.getTask(
                                    output,
                                    files,
                                    null,
                                    options,
                                    null,
                                    files.getJavaFileObjects(file))
                            .call();
            assertTrue(isCompiled, output.toString());
        }
        assertEquals(List.of(), failuresOf(examples.keySet().toArray(new String[0])));
    }

    private List<String> failuresOf(String... names) throws Exception {
        NativeLibrary.load();
        List<String> failures = new ArrayList<>();
        PrintStream out = System.out;
        System.setOut(new PrintStream(new ByteArrayOutputStream(), true, StandardCharsets.UTF_8));
        try (URLClassLoader loader = new URLClassLoader(new URL[] {directory.toUri().toURL()})) {
            Class<?> type = loader.loadClass("Examples");
            type.getMethod("prepare", byte[].class).invoke(null, (Object) push());
            for (String name : names) {
                Method example = type.getMethod(name);
                try {
                    example.invoke(null);
                } catch (ReflectiveOperationException e) {
                    failures.add(name + ": " + e.getCause());
                }
            }
        } finally {
            System.setOut(out);
        }
        return failures;
    }
}
