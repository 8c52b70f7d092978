package com.qvomacp.support;

import java.io.IOException;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.List;

/** A second virtual machine of the kind that runs the tests, with the same library path. */
public final class ChildVm {
    /** What a child left behind. */
    public record Result(int status, String output, String errors) {}

    private ChildVm() {}

    public static Result run(String classPath, Class<?> main, String... arguments)
            throws IOException, InterruptedException {
        String libraryPath = System.getProperty("java.library.path");
        return run(libraryPath, classPath, new byte[0], main, arguments);
    }

    /** Runs {@code main} with options of the virtual machine, and the class path of this one. */
    public static Result run(
            List<String> options, byte[] input, Class<?> main, String... arguments)
            throws IOException, InterruptedException {
        String libraryPath = System.getProperty("java.library.path");
        String classPath = System.getProperty("java.class.path");
        return run(libraryPath, classPath, options, input, main, arguments);
    }

    public static Result run(
            String libraryPath, String classPath, byte[] input, Class<?> main, String... arguments)
            throws IOException, InterruptedException {
        return run(libraryPath, classPath, List.of(), input, main, arguments);
    }

    /** Runs {@code main} to its end; the locale is C, which knows ASCII alone. */
    public static Result run(
            String libraryPath,
            String classPath,
            List<String> options,
            byte[] input,
            Class<?> main,
            String... arguments)
            throws IOException, InterruptedException {
        Path directory = Files.createTempDirectory("omacp-child");
        Path in = Files.write(directory.resolve("in"), input);
        Path out = directory.resolve("out");
        Path err = directory.resolve("err");
        List<String> command = new ArrayList<>();
        command.add(Path.of(System.getProperty("java.home"), "bin", "java").toString());
        command.add("-Xcheck:jni");
        command.add("-Djava.library.path=" + libraryPath);
        command.addAll(options);
        command.add("-cp");
        command.add(classPath);
        command.add(main.getName());
        command.addAll(List.of(arguments));
        ProcessBuilder builder = new ProcessBuilder(command);
        builder.environment().put("LC_ALL", "C");
        builder.redirectInput(in.toFile());
        builder.redirectOutput(out.toFile());
        builder.redirectError(err.toFile());
        try {
            int status = builder.start().waitFor();
            return new Result(status, text(out), text(err));
        } finally {
            for (Path file : List.of(in, out, err, directory)) {
                Files.deleteIfExists(file);
            }
        }
    }

    private static String text(Path file) throws IOException {
        return Files.readString(file, StandardCharsets.UTF_8);
    }
}
