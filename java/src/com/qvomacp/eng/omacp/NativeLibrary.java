package com.qvomacp.eng.omacp;

import com.qvomacp.eng.parser.XCPCtxParser;
import java.io.IOException;
import java.io.InputStream;
import java.io.OutputStream;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.Locale;

/**
 * Loads the native library, once for all. {@link ProvisioningMessage} does so by itself; a program
 * that calls the natives of {@link com.qvomacp.eng.parser} may have it done here.
 */
public final class NativeLibrary {
    private static final String NAME = "omacp";
    private static final String EXPLANATIONS = "omacp_explain";
    private static final String FOLDER = "/com/qvomacp/eng/native/";

    private static boolean loaded;
    private static boolean fromCopy;

    private NativeLibrary() {}

    /**
     * Makes sure that the natives answer: they may do so already; else the library is looked for in
     * {@code java.library.path} (on Android, in the application), else it is the copy beside these
     * classes for the platform that runs.
     *
     * @throws UnsatisfiedLinkError without any of them; a later call tries again
     */
    public static void load() {
        synchronized (MessageReader.LOCK) {
            if (loaded) {
                return;
            }
            if (!answers()) {
                try {
                    System.loadLibrary(NAME);
                } catch (UnsatisfiedLinkError error) {
                    Copy.load(NAME, error);
                    fromCopy = true;
                }
            }
            loaded = true;
        }
    }

    /** Loads the library that asks the decoder, from where the other one is; false without it. */
    static boolean loadExplanations() {
        try {
            System.loadLibrary(EXPLANATIONS);
            return true;
        } catch (UnsatisfiedLinkError error) {
            if (!fromCopy) {
                return false;
            }
            try {
                Copy.load(EXPLANATIONS, error);
                return true;
            } catch (UnsatisfiedLinkError missing) {
                return false;
            }
        }
    }

    /** Whether somebody else has loaded the library, from wherever. */
    private static boolean answers() {
        try {
            new XCPCtxParser().qvomacp_GetParserContentType();
            return true;
        } catch (UnsatisfiedLinkError error) {
            return false;
        }
    }

    /** The resource with a library for an operating system and an architecture. */
    static String resource(String name, String system, String architecture) {
        return FOLDER + platform(system) + '-' + machine(architecture) + "/lib" + name + ".so";
    }

    private static String platform(String system) {
        return system.toLowerCase(Locale.ROOT).replaceAll("[^a-z0-9]", "");
    }

    private static String machine(String architecture) {
        switch (architecture.toLowerCase(Locale.ROOT)) {
            case "x86":
            case "i386":
            case "i486":
            case "i586":
            case "i686":
                return "x86";
            case "amd64":
            case "x86_64":
                return "x86_64";
            default:
                return architecture.toLowerCase(Locale.ROOT);
        }
    }

    /** The copy beside the classes; a class of its own, so that Android never gets to see it. */
    private static final class Copy {
        private Copy() {}

        /** Loads the copy; without one, {@code first} is the cause of the error that says so. */
        static void load(String name, UnsatisfiedLinkError first) {
            String resource =
                    resource(name, System.getProperty("os.name"), System.getProperty("os.arch"));
            try (InputStream in = NativeLibrary.class.getResourceAsStream(resource)) {
                if (in == null) {
                    throw error("there is no " + resource + " beside its classes", first, null);
                }
                Path file = Files.createTempFile("lib" + name, ".so");
                try {
                    fill(file, in);
                    System.load(file.toString());
                } finally {
                    delete(file);
                }
            } catch (IOException e) {
                throw error("the copy " + resource + " cannot be unpacked: " + e, first, e);
            } catch (UnsatisfiedLinkError e) {
                if (e.getCause() == first) {
                    throw e;
                }
                throw error("the copy " + resource + " cannot be loaded: " + e, first, e);
            }
        }

        /** Writes a file that is there already, with the rights for its owner alone. */
        private static void fill(Path file, InputStream in) throws IOException {
            try (OutputStream out = Files.newOutputStream(file)) {
                byte[] bytes = new byte[1 << 13];
                for (int count = in.read(bytes); count >= 0; count = in.read(bytes)) {
                    out.write(bytes, 0, count);
                }
            }
        }

        /** Deletes the file, which a loaded library no longer needs, now or when the VM ends. */
        private static void delete(Path file) {
            try {
                Files.deleteIfExists(file);
            } catch (IOException e) {
                file.toFile().deleteOnExit();
            }
        }

        private static UnsatisfiedLinkError error(
                String why, UnsatisfiedLinkError first, Throwable second) {
            UnsatisfiedLinkError error =
                    new UnsatisfiedLinkError(
                            "The library "
                                    + NAME
                                    + " cannot be loaded: "
                                    + first.getMessage()
                                    + "; and "
                                    + why);
            error.initCause(first);
            if (second != null) {
                error.addSuppressed(second);
            }
            return error;
        }
    }
}
