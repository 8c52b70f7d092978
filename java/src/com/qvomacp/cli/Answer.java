package com.qvomacp.cli;

import java.util.ArrayList;
import java.util.List;
import java.util.Objects;

/** What the library answers of a characteristic or a parameter, beside what the message says. */
final class Answer {
    /** The type or the name; null for one that has none. */
    final String name;

    /** What stands in a characteristic; null for a parameter. */
    final List<Answer> children;

    /** The column in which the values of a characteristic stand for people. */
    final int column;

    final boolean isAnswered;
    final String value;

    /** Whether the message has the parameter, whose value may be null. */
    final boolean isSaid;

    final String said;

    private Answer(String name, List<Answer> children, int column, boolean isAnswered, String value,
            boolean isSaid, String said) {
        this.name = name;
        this.children = children;
        this.column = column;
        this.isAnswered = isAnswered;
        this.value = value;
        this.isSaid = isSaid;
        this.said = said;
    }

    static Answer characteristic(String type, int column, boolean isAnswered) {
        return new Answer(type, new ArrayList<>(), column, isAnswered, null, true, null);
    }

    static Answer parameter(String name, String value, boolean isSaid, String said) {
        return new Answer(name, null, 0, true, value, isSaid, said);
    }

    static Answer missing(String name, String said) {
        return new Answer(name, null, 0, false, null, true, said);
    }

    boolean isSame() {
        return isAnswered && isSaid && Objects.equals(value, said);
    }
}
