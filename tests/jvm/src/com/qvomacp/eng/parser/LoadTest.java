package com.qvomacp.eng.parser;

import static org.junit.jupiter.api.Assertions.assertEquals;

import com.qvomacp.support.ChildVm;
import java.io.IOException;
import java.io.InputStream;
import java.lang.ref.WeakReference;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.HashMap;
import java.util.List;
import java.util.Map;
import java.util.function.Supplier;
import org.junit.jupiter.api.Test;

/** Loads that fail, and what is left when a class loader has gone, in machines of their own. */
class LoadTest {
    private static final String OF_THE_PARSER = XCPCtxParser.class.getPackageName() + ".XCP";
    private static final String LAST = XCPCtxVoWifi.class.getName();

    /** The classes of the parser and of the loads, defined anew; one of them may be another. */
    private static final class Loader extends ClassLoader {
        private final String own;
        private final Map<String, byte[]> others;

        /** Null for one that is missing. */
        Loader(String own, Map<String, byte[]> others) {
            super(LoadTest.class.getClassLoader());
            this.own = own;
            this.others = others;
        }

        @Override
        protected Class<?> loadClass(String name, boolean resolve) throws ClassNotFoundException {
            if (!name.startsWith(own) && !name.equals(Load.class.getName())) {
                return super.loadClass(name, resolve);
            }
            Class<?> loaded = findLoadedClass(name);
            if (loaded != null) {
                return loaded;
            }
            byte[] bytes = others.containsKey(name) ? others.get(name) : bytesOf(name);
            if (bytes == null) {
                throw new ClassNotFoundException(name);
            }
            return defineClass(name, bytes, 0, bytes.length);
        }
    }

    private static byte[] bytesOf(String name) {
        String resource = "/" + name.replace('.', '/') + ".class";
        try (InputStream in = LoadTest.class.getResourceAsStream(resource)) {
            return in.readAllBytes();
        } catch (IOException e) {
            throw new IllegalStateException(e);
        }
    }

    /** Loads the library for the loader of this class, and says how that went and what answers. */
    public static final class Load implements Supplier<String> {
        @Override
        public String get() {
            String loaded = "loaded";
            try {
                System.loadLibrary("omacp");
            } catch (LinkageError e) {
                loaded = e.getClass().getSimpleName();
            }
            return loaded + ", " + new XCPCtxParser().qvomacp_GetParserContentType();
        }
    }

    private static Object load(Loader loader) throws ReflectiveOperationException {
        Class<?> load = loader.loadClass(Load.class.getName());
        return ((Supplier<?>) load.getConstructor().newInstance()).get();
    }

    private static boolean isMapped() throws IOException {
        return Files.readString(Path.of("/proc/self/maps")).contains("libomacp.so");
    }

    /** With a class missing, with a native missing, and then with all that is needed. */
    static final class Failures {
        private Failures() {}

        public static void main(String[] arguments) throws Exception {
            String name = "qvomacp_GetPxVoWifiData";
            String bytes = new String(bytesOf(LAST), StandardCharsets.ISO_8859_1);
            String without = bytes.replace(name, name.replace("Data", "Dato"));
            Map<String, byte[]> missing = new HashMap<>();
            missing.put(LAST, null);
            System.out.println(load(new Loader(OF_THE_PARSER, missing)));
            missing.put(LAST, without.getBytes(StandardCharsets.ISO_8859_1));
            System.out.println(load(new Loader(OF_THE_PARSER, missing)));
            System.out.println(load(new Loader(OF_THE_PARSER, Map.of())));
        }
    }

    /** Twice for a loader that goes: of the parser's classes, or of the class that loads alone. */
    static final class Unloads {
        private Unloads() {}

        public static void main(String[] arguments) throws Exception {
            byte[] message = Files.readAllBytes(Path.of(arguments[0]));
            for (String own : List.of(OF_THE_PARSER, "none")) {
                System.out.println(loadedAndGone(own, message));
                System.out.println(isMapped());
            }
            // These are classes of a loader that stays.
            System.out.println(new XCPCtxParser().qvomacp_GetParserContentType());
            new XCPCtxParser().qvomacp_parser_del();
            System.out.println(new XCPCtxParser().qvomacp_GetParserContentType());
        }

        private static Object loadedAndGone(String own, byte[] message) throws Exception {
            Loader loader = new Loader(own, Map.of());
            Object answer = load(loader);
            Class<?> parser = loader.loadClass(XCPCtxParser.class.getName());
            Object session = parser.getConstructor().newInstance();
            parser.getMethod("qvomacp_parser", byte[].class, long.class, int.class)
                    .invoke(session, message, (long) message.length, 1);
            WeakReference<Loader> gone = new WeakReference<>(loader);
            loader = null;
            parser = null;
            session = null;
            while (gone.get() != null) {
                System.gc();
                Thread.sleep(10);
            }
            return answer;
        }
    }

    private static String outputOf(Class<?> main, String... arguments) throws Exception {
        ChildVm.Result result =
                ChildVm.run(System.getProperty("java.class.path"), main, arguments);
        assertEquals("", result.errors());
        assertEquals(0, result.status(), result.output());
        return result.output();
    }

    @Test
    void thatFailsLeavesNativesThatAnswer() throws Exception {
        assertEquals(
                "NoClassDefFoundError, -1\nNoSuchMethodError, -1\nloaded, -1\n",
                outputOf(Failures.class));
    }

    @Test
    void thatIsUndoneLeavesTheLibraryAndItsSessionToTheNext() throws Exception {
        assertEquals(
                "loaded, -1\ntrue\nloaded, 54\ntrue\n54\n-1\n",
                outputOf(Unloads.class, "samples/vowifi.push"));
    }
}
