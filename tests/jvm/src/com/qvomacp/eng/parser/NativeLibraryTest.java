package com.qvomacp.eng.parser;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.ChildVm;
import java.io.File;
import java.io.IOException;
import java.io.InputStream;
import java.net.URL;
import java.net.URLClassLoader;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.Collections;
import java.util.List;
import java.util.stream.Stream;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.ValueSource;

/** Where the library is loaded from, and what a load that fails leaves, in virtual machines of their own. */
class NativeLibraryTest {
    private static final String PARSED = "epdg.epc.mnc001.mcc001.example.net";

    /**
     * Loads twice, and parses the sample when that goes well; within one class loader of the child.
     * The second time the property is gone, and must not matter.
     */
    public static final class Use implements Runnable {
        public Use() {}

        @Override
        public void run() {
            for (int i = 0; i < 2; ++i) {
                try {
                    NativeLibrary.load();
                    System.out.println(parsed());
                } catch (UnsatisfiedLinkError e) {
                    Throwable cause = e.getCause();
                    System.out.println(cause.getClass().getSimpleName() + ": " + e.getMessage());
                }
                System.clearProperty(NativeLibrary.PATH_PROPERTY);
            }
        }

        private static String parsed() {
            XCPCtxParser parser = new XCPCtxParser();
            try {
                byte[] push = Files.readAllBytes(Path.of("samples/vowifi.push"));
                parser.qvomacp_parser(push, push.length, 0);
                return new XCPCtxVoWifi().qvomacp_GetPxVoWifiData(1)[0];
            } catch (IOException e) {
                throw new AssertionError(e);
            } finally {
                parser.qvomacp_parser_del();
            }
        }
    }

    /**
     * What the child runs: {@link Use}, in a class loader for each class path that is given. An
     * argument with an equals sign sets a system property first.
     */
    static final class Child {
        private Child() {}

        public static void main(String[] arguments) throws Exception {
            List<ClassLoader> loaders = new ArrayList<>();
            for (String argument : arguments) {
                int equals = argument.indexOf('=');
                if (equals >= 0) {
                    System.setProperty(
                            argument.substring(0, equals), argument.substring(equals + 1));
                    continue;
                }
                List<URL> urls = new ArrayList<>();
                for (String part : argument.split(File.pathSeparator)) {
                    urls.add(Path.of(part).toUri().toURL());
                }
                ClassLoader loader =
                        new URLClassLoader(
                                urls.toArray(new URL[0]), ClassLoader.getPlatformClassLoader());
                loaders.add(loader);
                Object use =
                        loader.loadClass(Use.class.getName()).getConstructor().newInstance();
                ((Runnable) use).run();
            }
            System.out.println(loaders.size() + " class loaders");
        }
    }

    @TempDir Path directory;

    private static String resource() {
        return NativeLibrary.resource(System.getProperty("os.name"), System.getProperty("os.arch"));
    }

    private static Path library() {
        return Stream.of(System.getProperty("java.library.path").split(File.pathSeparator))
                .map(folder -> Path.of(folder, "libomacp.so").toAbsolutePath())
                .filter(Files::exists)
                .findFirst()
                .orElseThrow();
    }

    /** The class path of a class loader, with a copy of the library when there is content for it. */
    private String classes(byte[] copy) throws IOException {
        Path root = Files.createTempDirectory(directory, "classes");
        for (Class<?> type :
                List.of(
                        NativeLibrary.class,
                        XCPCtxParser.class,
                        XCPCtxPxLogical.class,
                        XCPCtxNapDef.class,
                        XCPCtxBootstrap.class,
                        XCPCtxClientIdentity.class,
                        XCPCtxVendorConfig.class,
                        XCPCtxApplication.class,
                        XCPCtxAccess.class,
                        XCPCtxWifi.class,
                        XCPCtxVoWifi.class,
                        Use.class)) {
            copy(type.getName(), root);
        }
        copy(NativeLibrary.class.getName() + "$Copy", root);
        if (copy != null) {
            Path file = root.resolve(resource().substring(1));
            Files.createDirectories(file.getParent());
            Files.write(file, copy);
        }
        return root.toString();
    }

    private static void copy(String name, Path root) throws IOException {
        String file = name.replace('.', '/') + ".class";
        Files.createDirectories(root.resolve(file).getParent());
        try (InputStream in = NativeLibraryTest.class.getResourceAsStream("/" + file)) {
            Files.copy(in, root.resolve(file));
        }
    }

    private static Path classFile(String classes, String name) {
        return Path.of(classes, "com/qvomacp/eng/parser/" + name + ".class");
    }

    /** What the child prints, line by line; it must print no error. */
    private static List<String> run(String libraryPath, String... arguments) throws Exception {
        ChildVm.Result result = ended(libraryPath, arguments);
        assertEquals("", result.errors());
        return List.of(result.output().split("\n"));
    }

    /** What the child leaves; it must end well, without a copy of the library. */
    private static ChildVm.Result ended(String libraryPath, String... arguments) throws Exception {
        Path temporary = Files.createTempDirectory("omacp-copies");
        ChildVm.Result result =
                ChildVm.run(
                        libraryPath,
                        System.getProperty("java.class.path"),
                        List.of("-Djava.io.tmpdir=" + temporary),
                        new byte[0],
                        Child.class,
                        arguments);
        assertEquals(0, result.status(), result.output() + result.errors());
        // Only an empty folder can be deleted.
        Files.delete(temporary);
        return result;
    }

    /** Runs with the library in the library path. */
    private static List<String> runWithPath(String... arguments) throws Exception {
        return run(library().getParent().toString(), arguments);
    }

    /** Runs without the library in the library path. */
    private List<String> runWithoutPath(String... arguments) throws Exception {
        return run(directory.toString(), arguments);
    }

    private static List<String> parsedBy(int loaders) {
        List<String> lines = new ArrayList<>(Collections.nCopies(2 * loaders, PARSED));
        lines.add(loaders + " class loaders");
        return lines;
    }

    /** Holds that both calls have failed alike, and answers how. */
    private static String failure(List<String> lines) {
        assertEquals(3, lines.size(), lines.toString());
        assertEquals(lines.get(0), lines.get(1));
        assertEquals("1 class loaders", lines.get(2));
        return lines.get(0);
    }

    @Test
    void namesTheResourceOfAPlatform() {
        for (String x86 : List.of("x86", "i386", "i586", "i686")) {
            assertEquals(
                    "/com/qvomacp/eng/native/linux-x86/libomacp.so",
                    NativeLibrary.resource("Linux", x86));
        }
        for (String x86_64 : List.of("amd64", "x86_64")) {
            assertEquals(
                    "/com/qvomacp/eng/native/linux-x86_64/libomacp.so",
                    NativeLibrary.resource("Linux", x86_64));
        }
        assertEquals(
                "/com/qvomacp/eng/native/linux-armhf/libomacp.so",
                NativeLibrary.resource("Linux", "arm"));
        assertEquals(
                "/com/qvomacp/eng/native/linux-aarch64/libomacp.so",
                NativeLibrary.resource("Linux", "arm64"));
        assertEquals(
                "/com/qvomacp/eng/native/macosx-aarch64/libomacp.so",
                NativeLibrary.resource("Mac OS X", "aarch64"));
    }

    @Test
    void comesFromTheLibraryPath() throws Exception {
        assertEquals(parsedBy(1), runWithPath(classes(new byte[] {1, 2, 3})));
    }

    @Test
    void comesFromTheCopyWithoutALibraryPath() throws Exception {
        assertEquals(parsedBy(1), runWithoutPath(classes(Files.readAllBytes(library()))));
    }

    @Test
    void unpacksTheCopyIntoTheFolderOfTheProperty() throws Exception {
        Path folder = Files.createDirectory(directory.resolve("to unpack"));
        String property = NativeLibrary.FOLDER_PROPERTY + "=" + folder;
        byte[] copy = Files.readAllBytes(library());
        assertEquals(parsedBy(1), runWithoutPath(property, classes(copy)));
        // Only an empty folder can be deleted.
        Files.delete(folder);
        String failure = failure(runWithoutPath(property, classes(copy)));
        assertTrue(failure.contains("cannot be unpacked: "), failure);
        assertTrue(failure.contains(folder.toString()), failure);
        assertTrue(failure.endsWith("named by " + NativeLibrary.FOLDER_PROPERTY + ")"), failure);
    }

    @Test
    void comesFromTheFileOfTheProperty() throws Exception {
        Path file = Files.copy(library(), directory.resolve("another name"));
        String property = NativeLibrary.PATH_PROPERTY + "=" + file;
        assertEquals(parsedBy(1), runWithoutPath(property, classes(null)));
    }

    @Test
    void comesFromNowhereElseWithTheProperty() throws Exception {
        String property = NativeLibrary.PATH_PROPERTY + "=" + directory.resolve("missing.so");
        String failure = failure(runWithPath(property, classes(Files.readAllBytes(library()))));
        assertTrue(failure.contains("missing.so"), failure);
    }

    @Test
    void comesFromCopiesInTheClassLoadersAfterTheFirst() throws Exception {
        byte[] copy = Files.readAllBytes(library());
        assertEquals(parsedBy(2), runWithPath(classes(copy), classes(copy)));
        assertEquals(parsedBy(3), runWithPath(classes(copy), classes(copy), classes(copy)));
        assertEquals(parsedBy(3), runWithoutPath(classes(copy), classes(copy), classes(copy)));
    }

    @Test
    void isMissedInASecondAndThirdClassLoaderWithoutACopy() throws Exception {
        List<String> lines = runWithPath(classes(null), classes(null), classes(null));
        assertEquals(List.of(PARSED, PARSED), lines.subList(0, 2));
        for (int i = 2; i < 6; ++i) {
            assertTrue(lines.get(i).contains("already loaded in another classloader"), lines.get(i));
        }
        assertEquals("3 class loaders", lines.get(6));
    }

    @Test
    void isMissedWithWhatWasTried() throws Exception {
        String failure = failure(runWithoutPath(classes(null)));
        String expected =
                "UnsatisfiedLinkError: The library omacp cannot be loaded:"
                        + " no omacp in java.library.path";
        assertTrue(failure.startsWith(expected), failure);
        String end = "; and there is no " + resource() + " beside its classes";
        assertTrue(failure.endsWith(end), failure);
    }

    @Test
    void saysThatACopyCannotBeLoaded() throws Exception {
        // The VM warns of a file that is no library.
        String output = ended(directory.toString(), classes(new byte[] {1, 2, 3})).output();
        String failure = failure(List.of(output.split("\n")));
        assertTrue(
                failure.contains("; and the copy " + resource() + " cannot be loaded: "), failure);
        assertTrue(failure.endsWith("named by " + NativeLibrary.FOLDER_PROPERTY + ")"), failure);
    }

    @ParameterizedTest
    @ValueSource(strings = {"XCPCtxParser", "XCPCtxClientIdentity", "XCPCtxVoWifi"})
    void failsForGoodWithoutOneOfTheClasses(String missing) throws Exception {
        for (byte[] copy : new byte[][] {null, Files.readAllBytes(library())}) {
            String classes = classes(copy);
            Files.delete(classFile(classes, missing));
            failsForGood(missing, classes);
        }
    }

    @ParameterizedTest
    @ValueSource(strings = {"XCPCtxParser", "XCPCtxWifi", "XCPCtxVoWifi"})
    void failsForGoodWithoutOneOfTheNatives(String type) throws Exception {
        for (byte[] copy : new byte[][] {null, Files.readAllBytes(library())}) {
            String classes = classes(copy);
            Path file = classFile(classes, type);
            String bytes = Files.readString(file, StandardCharsets.ISO_8859_1);
            String renamed = bytes.replace("qvomacp_GetP", "qvomacp_GotP");
            Files.writeString(file, renamed, StandardCharsets.ISO_8859_1);
            failsForGood("qvomacp_GetP", classes);
        }
    }

    /** In a class loader alone, and with a whole one in front and behind. */
    private void failsForGood(String missing, String classes) throws Exception {
        String failure = failure(runWithPath(classes));
        assertTrue(failure.contains(missing), failure);
        String whole = classes(Files.readAllBytes(library()));
        List<String> lines = runWithPath(whole, classes, whole);
        assertEquals(List.of(PARSED, PARSED), lines.subList(0, 2));
        assertEquals(lines.get(2), lines.get(3));
        assertTrue(lines.get(2).contains("Error: "), lines.get(2));
        assertEquals(List.of(PARSED, PARSED), lines.subList(4, 6));
        assertEquals("3 class loaders", lines.get(6));
    }
}
