package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.ChildVm;
import java.io.File;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.Arrays;
import java.util.List;
import java.util.Set;
import java.util.TreeSet;
import java.util.stream.Stream;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;

/** Where the native library is loaded from, seen in a virtual machine of its own. */
class NativeLibraryTest {
    @TempDir Path directory;

    /** What the child runs: parses a sample twice; the second time nothing need be loaded. */
    static final class Parse {
        private Parse() {}

        public static void main(String[] arguments) throws Exception {
            if (arguments.length > 1) {
                System.load(arguments[1]);
            }
            for (int i = 0; i < 2; ++i) {
                try {
                    byte[] bytes = Files.readAllBytes(Path.of(arguments[0]));
                    ProvisioningMessage message = ProvisioningMessage.parse(bytes);
                    System.out.println(message.getVoWifis().get(0).getEpdgHostName());
                } catch (UnsatisfiedLinkError e) {
                    System.out.println(e.getMessage());
                }
            }
        }
    }

    /** What another child runs: prints what the library says about a body that it refuses. */
    static final class Refuse {
        private Refuse() {}

        public static void main(String[] arguments) {
            try {
                ProvisioningMessage.parse(new byte[] {1, 6, 1, (byte) 0xB6, 3, 11, 106, 0, 127});
            } catch (ProvisioningException e) {
                System.out.println(e.getResultCode() + " at " + e.getBodyOffset());
            }
        }
    }

    private static final String SAMPLE = "samples/vowifi.push";
    private static final String PARSED = "epdg.epc.mnc001.mcc001.example.net\n".repeat(2);

    private static String resource() {
        return resource("omacp");
    }

    private static String resource(String name) {
        return NativeLibrary.resource(
                name, System.getProperty("os.name"), System.getProperty("os.arch"));
    }

    private static Path library() {
        return Stream.of(System.getProperty("java.library.path").split(File.pathSeparator))
                .map(folder -> Path.of(folder, "libomacp.so").toAbsolutePath())
                .filter(Files::exists)
                .findFirst()
                .orElseThrow();
    }

    /** The child's class path, with a copy of the library in front when there is content for it. */
    private String classPath(byte[] copy) throws Exception {
        if (copy != null) {
            Path file = directory.resolve(resource().substring(1));
            Files.createDirectories(file.getParent());
            Files.write(file, copy);
        }
        return directory + File.pathSeparator + System.getProperty("java.class.path");
    }

    private ChildVm.Result run(String libraryPath, byte[] copy, String... arguments)
            throws Exception {
        return ChildVm.run(libraryPath, classPath(copy), new byte[0], Parse.class, arguments);
    }

    private static Set<String> temporaryCopies() throws Exception {
        try (Stream<Path> files = Files.list(Path.of(System.getProperty("java.io.tmpdir")))) {
            Set<String> names = new TreeSet<>();
            files.map(file -> file.getFileName().toString())
                    .filter(name -> name.startsWith("libomacp"))
                    .forEach(names::add);
            return names;
        }
    }

    @Test
    void namesTheResourceOfAPlatform() {
        for (String x86 : List.of("x86", "i386", "i586", "i686")) {
            assertEquals(
                    "/com/qvomacp/eng/native/linux-x86/libomacp.so",
                    NativeLibrary.resource("omacp", "Linux", x86));
        }
        for (String x86_64 : List.of("amd64", "x86_64")) {
            assertEquals(
                    "/com/qvomacp/eng/native/linux-x86_64/libomacp.so",
                    NativeLibrary.resource("omacp", "Linux", x86_64));
        }
        assertEquals(
                "/com/qvomacp/eng/native/macosx-aarch64/libomacp.so",
                NativeLibrary.resource("omacp", "Mac OS X", "aarch64"));
    }

    @Test
    void comesFromTheLibraryPath() throws Exception {
        ChildVm.Result result =
                run(library().getParent().toString(), new byte[] {1, 2, 3}, SAMPLE);
        assertEquals(PARSED, result.output());
        assertEquals("", result.errors());
    }

    @Test
    void comesFromTheCopyWithoutALibraryPath() throws Exception {
        Set<String> before = temporaryCopies();
        ChildVm.Result result =
                run(directory.toString(), Files.readAllBytes(library()), SAMPLE);
        assertEquals(PARSED, result.output());
        assertEquals("", result.errors());
        Set<String> left = temporaryCopies();
        left.removeAll(before);
        assertEquals(Set.of(), left);
    }

    @Test
    void comesFromWhereverTheProgramHasLoadedIt() throws Exception {
        ChildVm.Result result = run(directory.toString(), null, SAMPLE, library().toString());
        assertEquals(PARSED, result.output());
        assertEquals("", result.errors());
    }

    @Test
    void asksTheDecoderFromTheCopyToo() throws Exception {
        Path explanations = library().resolveSibling("libomacp_explain.so");
        String classPath = classPath(Files.readAllBytes(library()));
        Path copy = directory.resolve(resource("omacp_explain").substring(1));
        assertEquals("null at null\n", refuse(classPath));
        Files.copy(explanations, copy);
        assertEquals("4101 at 4\n", refuse(classPath));
    }

    private String refuse(String classPath) throws Exception {
        Set<String> before = temporaryCopies();
        ChildVm.Result result =
                ChildVm.run(directory.toString(), classPath, new byte[0], Refuse.class);
        assertEquals("", result.errors());
        Set<String> left = temporaryCopies();
        left.removeAll(before);
        assertEquals(Set.of(), left);
        return result.output();
    }

    @Test
    void isMissedWithWhatWasTried() throws Exception {
        ChildVm.Result result = run(directory.toString(), null, SAMPLE);
        assertEquals("", result.errors());
        String[] lines = result.output().split("\n");
        assertEquals(2, lines.length, result.output());
        assertEquals(lines[0], lines[1]);
        String expected = "The library omacp cannot be loaded: no omacp in java.library.path";
        assertTrue(lines[0].startsWith(expected), lines[0]);
        assertTrue(lines[0].endsWith("; and there is no " + resource() + " beside its classes"));
    }

    @Test
    void saysThatACopyCannotBeLoaded() throws Exception {
        Set<String> before = temporaryCopies();
        byte[] half = Files.readAllBytes(library());
        ChildVm.Result result = run(directory.toString(), Arrays.copyOf(half, 100), SAMPLE);
        assertTrue(
                result.output().contains("; and the copy " + resource() + " cannot be loaded: "),
                result.output());
        Set<String> left = temporaryCopies();
        left.removeAll(before);
        assertEquals(Set.of(), left);
    }
}
