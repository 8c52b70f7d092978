package com.qvomacp.eng.parser;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.ChildVm;
import java.io.IOException;
import java.io.InputStream;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.List;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.ValueSource;

/** Loading the library in a virtual machine of its own, with all ten classes and without one. */
class LoadingTest {
    private static final List<String> CLASSES =
            List.of(
                    "XCPCtxParser",
                    "XCPCtxPxLogical",
                    "XCPCtxNapDef",
                    "XCPCtxBootstrap",
                    "XCPCtxClientIdentity",
                    "XCPCtxVendorConfig",
                    "XCPCtxApplication",
                    "XCPCtxAccess",
                    "XCPCtxWifi",
                    "XCPCtxVoWifi");

    @TempDir Path classes;

    /** What the child virtual machine runs. */
    static final class Load {
        private Load() {}

        public static void main(String[] arguments) {
            System.loadLibrary("omacp");
            System.out.println("loaded");
        }
    }

    @Test
    void succeedsWithTheTenClassesAlone() throws Exception {
        copyClassesExcept("");
        ChildVm.Result result = ChildVm.run(classes.toString(), Load.class);
        assertEquals("loaded\n", result.output());
        assertEquals("", result.errors());
        assertEquals(0, result.status());
    }

    @ParameterizedTest
    @ValueSource(
            strings = {
                "XCPCtxParser",
                "XCPCtxPxLogical",
                "XCPCtxNapDef",
                "XCPCtxBootstrap",
                "XCPCtxClientIdentity",
                "XCPCtxVendorConfig",
                "XCPCtxApplication",
                "XCPCtxAccess",
                "XCPCtxWifi",
                "XCPCtxVoWifi"
            })
    void failsWhenOneClassIsMissing(String missing) throws Exception {
        copyClassesExcept(missing);
        ChildVm.Result result = ChildVm.run(classes.toString(), Load.class);
        assertEquals("", result.output());
        assertEquals(1, result.status());
        assertTrue(result.errors().contains("Error: "), result.errors());
        assertTrue(result.errors().contains("System.loadLibrary"), result.errors());
    }

    private void copyClassesExcept(String missing) throws IOException {
        for (String name : CLASSES) {
            if (!name.equals(missing)) {
                copy("com/qvomacp/eng/parser/" + name + ".class");
            }
        }
        copy("com/qvomacp/eng/parser/LoadingTest$Load.class");
    }

    private void copy(String resource) throws IOException {
        Path target = classes.resolve(resource);
        Files.createDirectories(target.getParent());
        try (InputStream in = getClass().getResourceAsStream("/" + resource)) {
            Files.copy(in, target);
        }
    }
}
