package com.qvomacp.cli;

/** In what form a message is held, below the text that its bytes may be written as. */
enum Form {
    /** A push, from its transaction identifier on. */
    PUSH,

    /** The WBXML body of a push alone. */
    BODY,

    /**
     * An SMS-DELIVER as a modem hands it out, with the address of the service centre or without.
     */
    SMS,

    /** The user data of an SMS, from the length of its header on. */
    UD
}
