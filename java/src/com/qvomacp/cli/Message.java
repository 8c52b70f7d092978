package com.qvomacp.cli;

import java.util.List;

/** A parsed message: the facts of its push header and its top-level characteristics. */
final class Message {
    final Header header;
    final List<Characteristic> characteristics;

    Message(Header header, List<Characteristic> characteristics) {
        this.header = header;
        this.characteristics = characteristics;
    }
}
