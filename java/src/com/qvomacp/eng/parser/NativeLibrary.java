package com.qvomacp.eng.parser;

import java.io.IOException;
import java.io.InputStream;
import java.nio.file.Files;
import java.nio.file.Path;
import java.nio.file.Paths;
import java.util.Locale;

/**
 * Loads the library {@code omacp} for the ten classes of this package, once for each class loader
 * that has them.
 *
 * <pre>{@code
 * NativeLibrary.load();
 * XCPCtxParser parser = new XCPCtxParser();
 * if (parser.qvomacp_parser(push, push.length, 0)) {
 *     System.out.println(new XCPCtxNapDef().qvomacp_GetPxNapDefCount());
 * }
 * parser.qvomacp_parser_del();
 * }</pre>
 */
public final class NativeLibrary {
    /** The system property with the path of the library's file: {@value}. */
    public static final String PATH_PROPERTY = "com.qvomacp.library";

    /**
     * The system property with the folder to unpack the copy to: {@value}. Without it, that is the one
     * for temporary files. It needs room for the library, and the right to run what is in it.
     */
    public static final String FOLDER_PROPERTY = "com.qvomacp.library.folder";

    private static final String NAME = "omacp";

    /** What virtual machines call an architecture, and what the copies for it are called. */
    private static final String[][] MACHINES = {
        {"i[3-6]86", "x86"}, {"amd64", "x86_64"}, {"arm64", "aarch64"}, {"arm", "armhf"}
    };

    private static boolean loaded;
    private static LinkageError failure;

    private NativeLibrary() {}

    /**
     * Makes sure that the library is loaded. It is the file that {@link #PATH_PROPERTY} names; without
     * that property it is looked for in {@code java.library.path} (on Android, in the application),
     * and else it is the copy beside these classes for the platform that runs, which is unpacked for
     * as long as loading it takes ({@link #FOLDER_PROPERTY} says where).
     *
     * <p>The first call decides: where it fails, every later one does, with the same cause. A class
     * loader that is not the first to load a file needs a file of its own, such as the copy.
     *
     * @throws UnsatisfiedLinkError when the library cannot be loaded; its cause says what failed,
     *     such as the {@code NoClassDefFoundError} or {@code NoSuchMethodError} of a class or native
     *     that is missing
     */
    public static synchronized void load() {
        if (failure == null && !loaded) {
            try {
                find();
                loaded = true;
            } catch (LinkageError error) {
                failure = error;
            }
        }
        if (failure != null) {
            throw error("The library " + NAME + " cannot be loaded: " + failure.getMessage(), failure);
        }
    }

    private static void find() {
        String path = System.getProperty(PATH_PROPERTY);
        if (path != null) {
            System.load(path);
            return;
        }
        try {
            System.loadLibrary(NAME);
        } catch (UnsatisfiedLinkError notThere) {
            Copy.load(notThere);
        }
    }

    /** The resource with the library for an operating system and an architecture. */
    static String resource(String system, String architecture) {
        String platform = system.toLowerCase(Locale.ROOT).replaceAll("[^a-z0-9]", "");
        String machine = architecture.toLowerCase(Locale.ROOT);
        for (String[] names : MACHINES) {
            machine = machine.matches(names[0]) ? names[1] : machine;
        }
        return "/com/qvomacp/eng/native/" + platform + '-' + machine + "/lib" + NAME + ".so";
    }

    private static UnsatisfiedLinkError error(String text, Throwable cause) {
        UnsatisfiedLinkError error = new UnsatisfiedLinkError(text);
        error.initCause(cause);
        return error;
    }

    /** The copy beside the classes; a class of its own, so that Android never gets to see it. */
    private static final class Copy {
        private Copy() {}

        /** Loads the copy; what is thrown says as well why it came to that. */
        static void load(UnsatisfiedLinkError first) {
            String resource = resource(System.getProperty("os.name"), System.getProperty("os.arch"));
            String why = first.getMessage() + "; and ";
            try (InputStream in = NativeLibrary.class.getResourceAsStream(resource)) {
                if (in == null) {
                    throw error(why + "there is no " + resource + " beside its classes", first);
                }
                // Nobody else may put anything into a folder that is made here.
                Path folder = newFolder(System.getProperty(FOLDER_PROPERTY));
                Path file = folder.resolve("lib" + NAME + ".so");
                try {
                    Files.copy(in, file);
                    load(file, why + "the copy " + resource + " cannot be loaded: ");
                } finally {
                    delete(folder, file);
                }
            } catch (IOException e) {
                throw unusable(why + "the copy " + resource + " cannot be unpacked: " + e, e);
            }
        }

        private static void load(Path file, String why) {
            try {
                System.load(file.toString());
            } catch (UnsatisfiedLinkError e) {
                throw unusable(why + e.getMessage(), e);
            }
        }

        private static Path newFolder(String parent) throws IOException {
            return parent == null
                    ? Files.createTempDirectory(NAME)
                    : Files.createTempDirectory(Paths.get(parent).toAbsolutePath(), NAME);
        }

        private static UnsatisfiedLinkError unusable(String text, Throwable cause) {
            return error(text + " (another folder for it is named by " + FOLDER_PROPERTY + ")", cause);
        }

        /** Deletes the copy, which a loaded library no longer needs, now or when the VM ends. */
        private static void delete(Path folder, Path file) {
            try {
                Files.deleteIfExists(file);
                Files.delete(folder);
            } catch (IOException e) {
                // What is named last goes first.
                folder.toFile().deleteOnExit();
                file.toFile().deleteOnExit();
            }
        }
    }
}
