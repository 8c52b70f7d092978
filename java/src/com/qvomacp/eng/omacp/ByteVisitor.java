package com.qvomacp.eng.omacp;

/**
 * Hears what the bytes of a message mean, in their order: each byte once, without a gap.
 *
 * <pre>{@code
 * header.describe(
 *         (offset, length, depth, meaning) -> System.out.println(offset + ": " + meaning));
 * }</pre>
 */
public interface ByteVisitor {
    /**
     * Hears what some bytes mean.
     *
     * @param offset bytes from the start of what was read, counted from 0
     * @param length how many bytes they are, at least 1
     * @param depth how deep they are nested, 0 for what stands outermost
     * @param meaning what they mean, for people
     */
    void visit(int offset, int length, int depth, String meaning);
}
