/**
 * Parses OMA Client Provisioning messages: {@link
 * com.qvomacp.eng.omacp.ProvisioningMessage#parse parse} answers what a pushed message sets.
 *
 * <h2>Absent values</h2>
 *
 * <p>A value that the message does not set is {@code null}, everywhere; so is one that the message
 * sets without saying which, as it does with flags, unless the getter says otherwise. A list is
 * never {@code null} and holds no {@code null}; no list can be modified. Values are told as the
 * message writes them: a number is a text.
 *
 * <h2>What the library does not answer</h2>
 *
 * <p>Some values that a message may set cannot be had, and the getters say so: the services of a
 * proxy's port ({@link com.qvomacp.eng.omacp.ProxyPort}), a bearer that is given as a text and most
 * types of an access point's address ({@link com.qvomacp.eng.omacp.AccessPoint}), all but one
 * parameter of a vendor's own ({@link com.qvomacp.eng.omacp.VendorConfiguration}), and what all
 * applications but the first may do while roaming ({@link com.qvomacp.eng.omacp.Application}).
 *
 * <h2>Threads</h2>
 *
 * <p>Every object is immutable, and messages may be parsed from many threads. The library parses
 * one message at a time; a call holds the monitor of {@link
 * com.qvomacp.eng.parser.XCPCtxParser}'s class while it does, and leaves nothing behind in the
 * library. A program that also calls the natives of {@link com.qvomacp.eng.parser} has to hold the
 * same monitor from its parse to its delete.
 *
 * <h2>Loading</h2>
 *
 * <p>The native library is loaded by the first message: from {@code java.library.path} (on Android,
 * from the application), or else the copy that the jar has for the platform that runs. The copy is
 * unpacked to a temporary file that its owner alone can read, and that is deleted as soon as the
 * library is loaded. Without either, an {@link java.lang.UnsatisfiedLinkError} says what was tried.
 * A program may as well load the library itself, with {@link java.lang.System#load}.
 */
package com.qvomacp.eng.omacp;
