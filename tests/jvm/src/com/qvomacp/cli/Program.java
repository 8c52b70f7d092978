package com.qvomacp.cli;

import com.qvomacp.support.Json;
import java.io.ByteArrayInputStream;
import java.io.ByteArrayOutputStream;
import java.nio.charset.StandardCharsets;
import java.util.Map;

/** A run of the program in this virtual machine. */
record Program(int status, String output, String errors) {
    static Program run(byte[] input, String... arguments) {
        return run(Terminal.NONE, input, arguments);
    }

    static Program run(Terminal terminal, byte[] input, String... arguments) {
        ByteArrayOutputStream out = new ByteArrayOutputStream();
        ByteArrayOutputStream err = new ByteArrayOutputStream();
        int status = Main.run(new ByteArrayInputStream(input), out, err, terminal, arguments);
        return new Program(
                status, out.toString(StandardCharsets.UTF_8), err.toString(StandardCharsets.UTF_8));
    }

    /** What is printed, which has to be one JSON object. */
    Map<?, ?> json() {
        return (Map<?, ?>) Json.parse(output);
    }
}
