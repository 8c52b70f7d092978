/**
 * Reads OMA Client Provisioning messages: {@link
 * com.qvomacp.eng.omacp.ProvisioningMessage#parsePush parsePush} tells what a pushed message says.
 *
 * <h2>The message and its tree</h2>
 *
 * <p>{@link com.qvomacp.eng.omacp.ProvisioningMessage} has the characteristics of a message by their
 * kinds, such as {@link com.qvomacp.eng.omacp.AccessPoint}, with accessors for what messages set in
 * them: the first parameter of its name, or a list where there may be several; any other parameter is
 * told by its name. They are views: {@link
 * com.qvomacp.eng.omacp.ProvisioningDocument} is the tree that they look at, with everything that was
 * read. Types and names are compared exactly as OMA writes them.
 *
 * <p>Nothing here runs the native library. What it makes of a message, which is not everywhere what the
 * message says, is a {@link com.qvomacp.eng.omacp.Verdict}; its answers come from the classes of {@link
 * com.qvomacp.eng.parser}. What is wrong with a message, by rules with names, is a list of {@link
 * com.qvomacp.eng.omacp.Finding}.
 *
 * <h2>Absent values</h2>
 *
 * <p>What a message does not set is {@code null}, everywhere, and so is the value of a parameter that
 * has none; where the difference counts, a second accessor tells it, as {@link
 * com.qvomacp.eng.omacp.AccessPoint#hasInternet} does. A list is never {@code null} and holds no {@code
 * null}; no list can be modified. Values are told as the message writes them: a number is a text. No
 * method takes {@code null} unless it says so.
 *
 * <h2>Threads</h2>
 *
 * <p>Every object is immutable, there is no lock, and messages may be read from any number of threads.
 */
package com.qvomacp.eng.omacp;
