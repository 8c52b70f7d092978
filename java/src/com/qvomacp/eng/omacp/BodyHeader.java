package com.qvomacp.eng.omacp;

/** What stands before the elements of a body: version, document type, character set, string table. */
final class BodyHeader {
    private static final int UNKNOWN = 1;
    private static final int PROVISIONING = 11;
    private static final String PROVISIONING_TEXT = "//DTD PROV ";
    private static final int FIRST_VERSION = 0x00;
    private static final int LAST_VERSION = 0x03;
    private static final int ROOT_TOKEN = 0x05;
    private static final int ROOT_MASK = 0x3F;

    /** The document types, by their public identifiers. */
    private static final String[] DOCUMENT_TYPES = {
        null,
        null,
        "-//WAPFORUM//DTD WML 1.0//EN",
        "-//WAPFORUM//DTD WTA 1.0//EN",
        "-//WAPFORUM//DTD WML 1.1//EN",
        "-//WAPFORUM//DTD SI 1.0//EN",
        "-//WAPFORUM//DTD SL 1.0//EN",
        "-//WAPFORUM//DTD CO 1.0//EN",
        "-//WAPFORUM//DTD CHANNEL 1.1//EN",
        "-//WAPFORUM//DTD WML 1.2//EN",
        "-//WAPFORUM//DTD WML 1.3//EN",
        "-//WAPFORUM//DTD PROV 1.0//EN",
        "-//WAPFORUM//DTD WTA-WML 1.2//EN",
        "-//WAPFORUM//DTD EMN 1.0//EN",
        "-//OMA//DTD DRMREL 1.0//EN",
    };

    final int version;
    final long publicIdentifier;
    final String documentType;
    final CharacterSet charset;

    /** Where the fields begin that follow the version; the last is where the elements begin. */
    final int identifierAt = 1;

    final int charsetAt;
    final int tableLengthAt;
    final int tableAt;
    final int elementsAt;

    BodyHeader(byte[] body) throws ProvisioningException {
        Cursor cursor = new Cursor(body, 0, body.length);
        version = cursor.take();
        if (version < 0) {
            throw unreadable(body, "the body is empty", 0);
        }
        if (version >> 4 != 0) {
            throw unreadable(body, "the body is no WBXML: its version is " + versionText(), 0);
        }
        publicIdentifier = integer(body, cursor, "document type");
        long typeIndex = publicIdentifier == 0 ? integer(body, cursor, "document type") : 0;
        charsetAt = cursor.at();
        long number = version == FIRST_VERSION ? 0 : integer(body, cursor, "character set");
        charset = CharacterSet.of(number);
        tableLengthAt = cursor.at();
        long length = integer(body, cursor, "string table");
        tableAt = cursor.at();
        if (length > cursor.left()) {
            throw unreadable(body, "the body ends within its string table", body.length);
        }
        cursor.skip((int) length);
        elementsAt = cursor.at();
        documentType = documentType(body, typeIndex);
        requireProvisioning(body, cursor);
    }

    private static long integer(byte[] body, Cursor cursor, String field)
            throws ProvisioningException {
        int from = cursor.at();
        long value = cursor.integer();
        if (value == Cursor.NO_INTEGER) {
            throw unreadable(body, "the body is no WBXML: its " + field + " cannot be read", from);
        }
        return value;
    }

    private static ProvisioningException unreadable(byte[] body, String text, int offset) {
        return new ProvisioningException(
                ProvisioningException.Reason.NO_WBXML, offset, text + likeness(body));
    }

    /** What the body looks like, if that can be said. */
    private static String likeness(byte[] body) {
        String likeness = body.length == 0 ? null : ForeignBytes.describe(body);
        return likeness == null ? "" : "; this looks like " + likeness;
    }

    private String documentType(byte[] body, long index) {
        if (publicIdentifier != 0) {
            return publicIdentifier < DOCUMENT_TYPES.length
                    ? DOCUMENT_TYPES[(int) publicIdentifier]
                    : null;
        }
        if (index >= elementsAt - tableAt) {
            return null;
        }
        int from = tableAt + (int) index;
        return charset.decode(body, from, charset.zero(body, from, elementsAt));
    }

    /** Refuses another document type. One that is not stated is looked at: its root must fit. */
    private void requireProvisioning(byte[] body, Cursor cursor) throws ProvisioningException {
        if (publicIdentifier == PROVISIONING) {
            return; // as nearly all: its name need not be looked at
        }
        if (isStated()) {
            if (!documentType.contains(PROVISIONING_TEXT)) {
                throw otherType(body, "the document type is " + Printable.quoted(documentType));
            }
        } else if (publicIdentifier > UNKNOWN) {
            throw otherType(body, "the public identifier of the document is " + publicIdentifier);
        } else {
            int root = cursor.peek();
            boolean literal = root >= 0 && (root & ROOT_MASK) == BodyReader.LITERAL;
            if (root >= 0 && !literal && (root & ROOT_MASK) != ROOT_TOKEN) {
                throw otherType(
                        body, "the document type is not stated, and its first token is another's");
            }
        }
    }

    private static ProvisioningException otherType(byte[] body, String text) {
        return new ProvisioningException(
                ProvisioningException.Reason.OTHER_DOCUMENT_TYPE, 1, text + likeness(body));
    }

    /** Whether it says of what type the document is. */
    boolean isStated() {
        return documentType != null;
    }

    boolean isVersionKnown() {
        return version <= LAST_VERSION;
    }

    /** Such as {@code 1.3}. */
    String versionText() {
        return (version >> 4) + 1 + "." + (version & 0xF);
    }
}
