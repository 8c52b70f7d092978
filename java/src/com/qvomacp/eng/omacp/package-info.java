/**
 * Reads OMA Client Provisioning messages: {@link
 * com.qvomacp.eng.omacp.ProvisioningMessage#parsePush parsePush} tells what a pushed message says.
 *
 * <h2>Absent values</h2>
 *
 * <p>What a message does not set is {@code null}, everywhere; a list is never {@code null} and holds
 * no {@code null}; no list can be modified. Values are told as the message writes them: a number is a
 * text.
 *
 * <h2>Threads</h2>
 *
 * <p>Every object is immutable, there is no lock, and messages may be read from any number of threads.
 */
package com.qvomacp.eng.omacp;
