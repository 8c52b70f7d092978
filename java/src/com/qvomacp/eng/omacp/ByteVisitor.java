package com.qvomacp.eng.omacp;

/** Is told what each byte of a message means, in order, without a gap and without an overlap. */
public interface ByteVisitor {
    /**
     * Some bytes that mean something together.
     *
     * @param offset where they begin: bytes from the start of what is told, counted from 0
     * @param length how many they are, at least 1
     * @param depth how many elements they stand in
     * @param meaning what they mean, in one line
     */
    void visit(int offset, int length, int depth, String meaning);
}
