package com.qvomacp.eng.omacp;

/**
 * Where a walk has ended: the elements around, innermost eight at most. To number them the body is
 * walked once more, since counting while nobody asks would cost every walk.
 */
final class LibraryPath extends LibraryTrace {
    private static final int LONGEST = 8;
    private static final String SEPARATOR = " / ";
    private static final String UNTYPED = "characteristic";

    /** The walk that has ended. */
    private final LibraryWalk ended;

    private final int[] numbers;

    private LibraryPath(LibraryWalk ended) {
        this.ended = ended;
        numbers = new int[ended.depth];
    }

    /** The elements around the place where a walk has ended. */
    static String of(LibraryWalk ended) {
        LibraryPath path = new LibraryPath(ended);
        if (ended.depth > 0) {
            try {
                new LibraryWalk(ended.data, path).run();
            } catch (LibraryStop again) {
                // As before.
            }
        }
        return path.text();
    }

    /** Counts a characteristic that stands in front of one of those around, of the same type. */
    @Override
    void type(LibraryWalk walk, int depth, int start, LibraryKind kind) {
        if (depth < numbers.length
                && start < ended.starts[depth]
                && (depth == 0 || start > ended.starts[depth - 1])
                && typeText(kind == null ? walk.nameText() : kind.type).equals(type(depth))) {
            ++numbers[depth];
        }
    }

    private static String typeText(String type) {
        return type == null ? UNTYPED : Printable.of(type);
    }

    /** The type of one that is open. Only the innermost one can be of an unknown type. */
    private String type(int depth) {
        LibraryKind kind = ended.kinds[depth];
        if (kind != null) {
            return kind.type;
        }
        return typeText(ended.isTyped ? ended.nameText() : null);
    }

    private String text() {
        StringBuilder path = new StringBuilder();
        int steps = 1 + ended.depth + (ended.inParm ? 1 : 0);
        int first = Math.max(steps - LONGEST, 0);
        if (first > 0) {
            path.append("...");
        }
        for (int step = first; step < steps; ++step) {
            path.append(path.length() == 0 ? "" : SEPARATOR);
            if (step == 0) {
                path.append(ended.inDocument ? Element.DOCUMENT.text : "document");
            } else if (step <= ended.depth) {
                path.append(type(step - 1)).append(' ').append(numbers[step - 1] + 1);
            } else {
                String name = ended.parmName();
                boolean isNamed = name != null && !name.isEmpty();
                path.append(isNamed ? Printable.of(name) : Element.PARM.text);
            }
        }
        return path.toString();
    }
}
