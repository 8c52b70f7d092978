/**
 * The native methods through which Java reads a provisioning message that the library {@code omacp}
 * has parsed.
 *
 * <h2>Loading</h2>
 *
 * <p>The ten classes do not load the library: whoever uses them calls {@link
 * com.qvomacp.eng.parser.NativeLibrary#load NativeLibrary.load()} once before the first call, or
 * {@code System.loadLibrary("omacp")}, or {@code System.load} with the path of the file. The library
 * looks up all ten classes while it is loaded and registers their natives, so all ten must be visible
 * to the class loader of the class that loads it; without one of them, or one native, the loading
 * fails.
 *
 * <h2>One message at a time</h2>
 *
 * <p>The library holds one parse result, for whatever thread asks. A use is:
 * {@link com.qvomacp.eng.parser.XCPCtxParser#qvomacp_parser parse}, then the queries of these
 * classes, then {@link com.qvomacp.eng.parser.XCPCtxParser#qvomacp_parser_del delete}. The next
 * parse must not come before the delete, since it would lose the memory of the result before. There
 * is no lock: only one thread at a time may call natives, of whichever class. The objects hold
 * nothing; it does not matter on which object of a class a native is called.
 *
 * <h2>Rules that all queries share</h2>
 *
 * <ul>
 *   <li>An argument has the name of what it counts, within the record that those before it choose.
 *       Every index counts from 1, in the order of the message. An index of 0, a negative one and
 *       one beyond the last record or value find nothing.
 *   <li>A count answers 0 when the record that it asks about is not there.
 *   <li>A single text is {@code null} when it is not there.
 *   <li>An array is {@code null} when its record is not there. Its elements are {@code null} for
 *       parameters that the message does not set; the last element is always {@code null} and
 *       stands for no parameter.
 *   <li>Every call makes a new String or a new array.
 *   <li>When nothing has been parsed (no parse yet, a refused message, after the delete) every
 *       count is 0 and every text and array is {@code null}.
 * </ul>
 *
 * <p>The few natives that depart from these rules say so. Names are spelled as they are registered,
 * misspellings included. The names of characteristics and parameters are those of OMA Client
 * Provisioning.
 */
package com.qvomacp.eng.parser;
