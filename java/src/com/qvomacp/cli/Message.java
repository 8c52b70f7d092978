package com.qvomacp.cli;

import java.util.List;

/** A parsed message: the facts of its push header and its top-level characteristics. */
final class Message {
    /** Null when the message is a body alone. */
    final Header header;

    final int bodyLength;
    final List<Characteristic> characteristics;

    Message(Header header, int bodyLength, List<Characteristic> characteristics) {
        this.header = header;
        this.bodyLength = bodyLength;
        this.characteristics = characteristics;
    }
}
