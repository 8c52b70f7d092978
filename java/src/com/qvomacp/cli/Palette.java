package com.qvomacp.cli;

/** Colours, where they are wanted. */
final class Palette {
    private static final String RESET = "\u001b[0m";

    private final boolean on;

    Palette(boolean on) {
        this.on = on;
    }

    String dim(String text) {
        return painted("\u001b[2m", text);
    }

    String error(String text) {
        return painted("\u001b[1;31m", text);
    }

    String bold(String text) {
        return painted("\u001b[1m", text);
    }

    String text(String text) {
        return painted("\u001b[32m", text);
    }

    private String painted(String color, String text) {
        return on && !text.isEmpty() ? color + text + RESET : text;
    }
}
