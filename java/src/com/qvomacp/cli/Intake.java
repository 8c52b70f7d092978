package com.qvomacp.cli;

import com.qvomacp.cli.HexText.Piece;
import com.qvomacp.eng.omacp.ForeignBytes;
import com.qvomacp.eng.omacp.PushHeader;
import java.nio.ByteBuffer;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.List;

/**
 * Finds the messages in what people hold: files with a push or a body, the same as text, dumps, and
 * short messages, whose parts may stand on several lines and in several inputs, in any order.
 *
 * <p>Bytes are tried as an SMS with the address of its service centre, an SMS without, user data, a
 * push and a body, in this order; each only when its lengths come out.
 */
final class Intake {
    private static final String NO_MESSAGE = "no message: this is ";
    private static final String UNKNOWN = "nothing that is known";
    private static final String HEXADECIMAL = "hexadecimal text";
    private static final String OTHER_NUMBERS =
            "numbers or a dump, and not bytes as hexadecimal or octal digits, bits or characters";

    private static final int PUSH = 0x06;
    private static final int LAST_WBXML_VERSION = 0x03;
    private static final int LAST_CHARSET = 3000;
    private static final int LAST_DOCUMENT_TYPE = 0x1FFF;
    private static final List<Integer> KNOWN_TYPES = Arrays.asList(0x35, 0x36, 0x42, 0x44, 0x4E);

    /** What the user says that the bytes are; null to find out. */
    private final Form form;

    private final SmsParts parts = new SmsParts();

    /** What is known with the input that is being taken. */
    private List<Held> held;

    Intake(Form form) {
        this.form = form;
    }

    /**
     * Takes an input.
     *
     * @return what is known with it: messages that are whole, errors and notes; empty when it holds
     *     parts of which others are still to come
     */
    List<Held> take(String name, byte[] content) {
        held = new ArrayList<>();
        String text = HexText.text(content);
        if (text == null) {
            take(new Place(name), content, form);
        } else {
            takeText(name, content, text);
        }
        return held;
    }

    /** Says what is missing when there are no more inputs. */
    List<Held> finish() {
        return parts.missing();
    }

    /** A text is what its digits stand for, or base64; anything else is called what it is. */
    private void takeText(String name, byte[] content, String text) {
        byte[] base64 = HexText.base64(text);
        if (base64 != null && isMessage(base64)) {
            take(new Place(name), base64, form);
            return;
        }
        boolean isMarkup = text.trim().startsWith("<");
        List<Piece> pieces = isMarkup ? new ArrayList<>() : HexText.pieces(text);
        takePieces(name, pieces);
        boolean areUnknown = pieces.isEmpty() || !held.isEmpty();
        for (Held each : held) {
            areUnknown &= (NO_MESSAGE + UNKNOWN).equals(each.error);
        }
        String likeness = areUnknown ? likeness(content) : HEXADECIMAL;
        // Digits that are nothing may have been read out of what is something else as a whole.
        if (pieces.isEmpty() || !likeness.startsWith(HEXADECIMAL)) {
            held.clear();
            held.add(Held.error(name, content, NO_MESSAGE + likeness));
        }
    }

    private static String likeness(byte[] bytes) {
        String likeness = ForeignBytes.describe(bytes);
        return likeness == null ? UNKNOWN : likeness;
    }

    private void refuse(Place place, String what) {
        held.add(Held.error(place.toString(), null, NO_MESSAGE + what));
    }

    /**
     * Takes lines of digits. Each line may hold a message, or one message all lines that follow
     * each other, or all lines of the text.
     */
    private void takePieces(String input, List<Piece> pieces) {
        List<List<Piece>> runs = runs(pieces);
        boolean areMessages = true;
        for (List<Piece> run : runs) {
            areMessages &= run.get(0).isWhole || isJoinedMessage(run) || isLineByLine(run);
        }
        if (!areMessages && isJoinedMessage(pieces)) {
            runs = Collections.singletonList(pieces);
        }
        for (List<Piece> run : runs) {
            boolean isLineByLine = isLineByLine(run);
            for (Piece piece : isLineByLine ? run : run.subList(0, 1)) {
                boolean isAll = runs.size() == 1 && !isLineByLine;
                Place place = isAll ? new Place(input) : new Place(input, piece.line);
                takeDigits(place, isLineByLine ? piece.digits : digits(run), piece.isUserData);
            }
        }
    }

    private void takeDigits(Place place, String digits, boolean isUserData) {
        if (digits == null) {
            refuse(place, OTHER_NUMBERS);
        } else if (digits.length() % 2 != 0) {
            refuse(place, HEXADECIMAL + " with an odd number of digits, " + digits.length());
        } else {
            take(place, HexText.bytes(digits), isUserData && form == null ? Form.UD : form);
        }
    }

    /** The pieces that follow each other. */
    private static List<List<Piece>> runs(List<Piece> pieces) {
        List<List<Piece>> runs = new ArrayList<>();
        int from = 0;
        for (int i = 1; i <= pieces.size(); ++i) {
            if (i == pieces.size() || !pieces.get(i).follows(pieces.get(i - 1))) {
                runs.add(pieces.subList(from, i));
                from = i;
            }
        }
        return runs;
    }

    /** All digits of a run; null when there are numbers among them. */
    private static String digits(List<Piece> run) {
        StringBuilder digits = new StringBuilder();
        for (Piece piece : run) {
            if (piece.digits == null) {
                return null;
            }
            digits.append(piece.digits);
        }
        return digits.toString();
    }

    /** Whether every line is a message of its own. */
    private boolean isLineByLine(List<Piece> run) {
        boolean areMessages = run.size() > 1;
        for (Piece piece : run) {
            areMessages = areMessages && isMessageAlone(piece.digits);
        }
        return areMessages;
    }

    private boolean isJoinedMessage(List<Piece> run) {
        String digits = digits(run);
        return digits != null && digits.length() % 2 == 0 && isMessage(HexText.bytes(digits));
    }

    /** Whether a line is a message, for certain and not just the beginning of one. */
    private boolean isMessageAlone(String digits) {
        byte[] bytes = HexText.bytes(digits);
        PushHeader header = Held.header(bytes);
        boolean isPush = isKnownPush(bytes, header) && isDocument(bytes, header.length());
        return digits.length() % 2 == 0
                && (isPush || isDocument(bytes, 0) || shortMessage(bytes, header, form) != null);
    }

    private boolean isMessage(byte[] bytes) {
        PushHeader header = Held.header(bytes);
        return header != null || isDocument(bytes, 0) || shortMessage(bytes, null, form) != null;
    }

    /** The short message that bytes are by their form or, without one, their lengths; or null. */
    private static ShortMessage shortMessage(byte[] bytes, PushHeader header, Form form) {
        ShortMessage message = null;
        if (form == null || form == Form.SMS) {
            message = ShortMessage.withCentre(bytes);
            if (message == null || message.other != null) {
                ShortMessage bare = ShortMessage.withoutCentre(bytes, 0);
                message = message == null || bare != null && bare.other == null ? bare : message;
            }
        }
        boolean isSure = message != null && message.other == null;
        if (!isSure && (form == Form.UD || form == null && !isKnownPush(bytes, header))) {
            ShortMessage userData = ShortMessage.ofUserData(bytes);
            message = userData != null ? userData : message;
        }
        boolean isPush = message != null && message.other != null && form == null && header != null;
        return isPush ? null : message;
    }

    private void take(Place place, byte[] bytes, Form form) {
        String name = place.toString();
        ShortMessage message = shortMessage(bytes, Held.header(bytes), form);
        boolean isPush = form == null ? isPush(bytes) : form == Form.PUSH;
        boolean isBody = bytes.length > 0 && bytes[0] >= 0 && bytes[0] <= LAST_WBXML_VERSION;
        if (message != null) {
            takeShortMessage(place, message);
        } else if (form == Form.SMS || form == Form.UD) {
            String what = form == Form.SMS ? "no SMS-DELIVER" : "no user data of an SMS";
            held.add(Held.error(name, null, what + ": its lengths do not come out"));
        } else if (form != null || isPush || isBody) {
            held.add(Held.message(name, bytes, isPush));
        } else {
            held.add(Held.error(name, bytes, NO_MESSAGE + likeness(bytes)));
        }
    }

    private void takeShortMessage(Place place, ShortMessage message) {
        String fault = message.fault();
        if (fault != null) {
            refuse(place, fault);
            return;
        }
        Held whole = parts.take(place, message);
        if (whole != null) {
            boolean isPush = whole.bytes == null || message.hasPort() || whole.header() != null;
            String none = NO_MESSAGE + "an SMS without a port";
            held.add(isPush ? whole : Held.error(whole.name, null, none));
        }
    }

    /** Whether the second byte is that of a push. */
    static boolean isPush(byte[] bytes) {
        return bytes.length > 1 && bytes[1] == PUSH;
    }

    /** Whether it is a push of a type that is pushed to the decoder, or of a document. */
    private static boolean isKnownPush(byte[] bytes, PushHeader header) {
        return header != null
                && (KNOWN_TYPES.contains(header.contentType().code())
                        || header.contentType().mediaType().indexOf('/') >= 0
                                && isDocument(bytes, header.length()));
    }

    /** Whether WBXML begins at a place: version, document type, character set and string table. */
    private static boolean isDocument(byte[] bytes, int from) {
        if (from >= bytes.length || bytes[from] < 0 || bytes[from] > LAST_WBXML_VERSION) {
            return false;
        }
        ByteBuffer left = ByteBuffer.wrap(bytes, from + 1, bytes.length - from - 1);
        long type = integer(left);
        long name = type == 0 ? integer(left) : 0;
        long charset = bytes[from] == 0 ? 0 : integer(left);
        long table = integer(left);
        boolean areThere = type >= 0 && name >= 0 && charset >= 0 && table >= 0;
        boolean areKnown = type <= LAST_DOCUMENT_TYPE && charset <= LAST_CHARSET;
        return areThere && areKnown && table <= left.remaining();
    }

    /** Reads a multi-byte integer; -1 when it does not end, or is too large. */
    private static long integer(ByteBuffer bytes) {
        long value = 0;
        while (bytes.hasRemaining() && value >> 31 == 0) {
            byte next = bytes.get();
            value = value << 7 | next & 0x7F;
            if (next >= 0) {
                return value;
            }
        }
        return -1;
    }
}
