package com.qvomacp.cli;

import com.qvomacp.eng.omacp.ForeignBytes;
import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.PushHeader;
import java.util.ArrayList;
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
    private static final int[] KNOWN_TYPES = {0x35, 0x36, 0x42, 0x44, 0x4E};

    /** What the user says that the bytes are; null to find out. */
    private final Form form;

    private final SmsParts parts = new SmsParts();

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
        List<Held> held = new ArrayList<>();
        String text = HexText.text(content);
        if (text == null) {
            take(Place.in(name), content, form, held);
        } else {
            takeText(name, content, text, held);
        }
        return held;
    }

    /** Says what is missing when there are no more inputs. */
    List<Held> finish() {
        return parts.missing();
    }

    /** A text is what its digits stand for, or base64; anything else is called what it is. */
    private void takeText(String name, byte[] content, String text, List<Held> held) {
        byte[] base64 = HexText.base64(text);
        boolean isMessage = base64 != null && isMessage(base64);
        if (isMessage) {
            take(Place.in(name), base64, form, held);
            return;
        }
        boolean isMarkup = text.trim().startsWith("<");
        List<HexText.Piece> pieces =
                isMarkup ? Collections.<HexText.Piece>emptyList() : HexText.pieces(text);
        if (pieces.isEmpty()) {
            held.add(Held.unknown(name, content, NO_MESSAGE + likeness(content)));
        } else {
            takePieces(Place.in(name), pieces, held);
            nameWhole(name, content, held);
        }
    }

    /** Calls the whole text what it is when digits have been read out of it that are nothing. */
    private static void nameWhole(String name, byte[] content, List<Held> held) {
        boolean areUnknown = !held.isEmpty();
        for (Held each : held) {
            areUnknown &= (NO_MESSAGE + UNKNOWN).equals(each.error);
        }
        String likeness = areUnknown ? likeness(content) : HEXADECIMAL;
        if (!likeness.startsWith(HEXADECIMAL)) {
            held.clear();
            held.add(Held.unknown(name, content, NO_MESSAGE + likeness));
        }
    }

    private static String likeness(byte[] bytes) {
        String likeness = ForeignBytes.describe(bytes);
        return likeness == null ? UNKNOWN : likeness;
    }

    /**
     * Takes lines of digits. Each line may hold a message, or one message all lines that follow
     * each other, or all lines of the text.
     */
    private void takePieces(Place input, List<HexText.Piece> pieces, List<Held> held) {
        List<Run> runs = Run.of(pieces);
        boolean areMessages = true;
        for (Run run : runs) {
            areMessages &= run.isMessage(this);
        }
        if (!areMessages && runs.size() > 1 && new Run(pieces).isJoinedMessage(this)) {
            runs = Collections.singletonList(new Run(pieces));
        }
        boolean isAlone = runs.size() == 1 && !runs.get(0).isLineByLine(this);
        for (Run run : runs) {
            if (run.isLineByLine(this)) {
                for (HexText.Piece piece : run.pieces) {
                    takeDigits(input.line(piece.line), piece.digits, piece.isUserData, held);
                }
            } else {
                HexText.Piece first = run.pieces.get(0);
                Place place = isAlone ? input : input.line(first.line);
                takeDigits(place, run.digits(), first.isUserData, held);
            }
        }
    }

    private void takeDigits(Place place, String digits, boolean isUserData, List<Held> held) {
        if (digits == null) {
            held.add(Held.error(place.toString(), NO_MESSAGE + OTHER_NUMBERS));
            return;
        }
        if (digits.length() % 2 != 0) {
            String odd = HEXADECIMAL + " with an odd number of digits, " + digits.length();
            held.add(Held.error(place.toString(), NO_MESSAGE + odd));
            return;
        }
        take(place, HexText.bytes(digits), isUserData && form == null ? Form.UD : form, held);
    }

    /** Lines of digits that follow each other. */
    private static final class Run {
        final List<HexText.Piece> pieces;

        Run(List<HexText.Piece> pieces) {
            this.pieces = pieces;
        }

        static List<Run> of(List<HexText.Piece> pieces) {
            List<Run> runs = new ArrayList<>();
            int from = 0;
            for (int i = 1; i <= pieces.size(); ++i) {
                if (i == pieces.size() || !pieces.get(i).follows(pieces.get(i - 1))) {
                    runs.add(new Run(pieces.subList(from, i)));
                    from = i;
                }
            }
            return runs;
        }

        /** All their digits; null when there are numbers among them. */
        String digits() {
            StringBuilder digits = new StringBuilder();
            for (HexText.Piece piece : pieces) {
                if (piece.digits == null) {
                    return null;
                }
                digits.append(piece.digits);
            }
            return digits.toString();
        }

        /** Whether every line is a message of its own. */
        boolean isLineByLine(Intake intake) {
            boolean areMessages = pieces.size() > 1;
            for (HexText.Piece piece : pieces) {
                areMessages = areMessages && intake.isMessageAlone(piece.digits);
            }
            return areMessages;
        }

        boolean isJoinedMessage(Intake intake) {
            String digits = digits();
            return digits != null && digits.length() % 2 == 0 && intake.isMessage(HexText.bytes(digits));
        }

        boolean isMessage(Intake intake) {
            return pieces.get(0).isWhole || isJoinedMessage(intake) || isLineByLine(intake);
        }
    }

    /** Whether a line is a message, for certain and not just the beginning of one. */
    private boolean isMessageAlone(String digits) {
        byte[] bytes = HexText.bytes(digits);
        PushHeader header = header(bytes);
        boolean isPush = isKnownPush(bytes, header) && isDocument(bytes, header.length());
        return digits.length() % 2 == 0
                && (isPush || isDocument(bytes, 0) || shortMessage(bytes, header, form) != null);
    }

    private boolean isMessage(byte[] bytes) {
        PushHeader header = header(bytes);
        return header != null || isDocument(bytes, 0) || shortMessage(bytes, null, form) != null;
    }

    /** The short message that bytes are by their form or, without one, by their lengths; or null. */
    private ShortMessage shortMessage(byte[] bytes, PushHeader header, Form form) {
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

    private void take(Place place, byte[] bytes, Form form, List<Held> held) {
        String name = place.toString();
        PushHeader header = header(bytes);
        ShortMessage message = shortMessage(bytes, header, form);
        boolean isPush = isPush(bytes);
        boolean isBody = bytes.length > 0 && bytes[0] >= 0 && bytes[0] <= LAST_WBXML_VERSION;
        if (message != null) {
            takeShortMessage(place, message, held);
        } else if (form == Form.SMS || form == Form.UD) {
            String what = form == Form.SMS ? "no SMS-DELIVER" : "no user data of an SMS";
            held.add(Held.error(name, what + ": its lengths do not come out"));
        } else if (form != null) {
            held.add(Held.message(name, bytes, form == Form.PUSH));
        } else if (isPush || isBody) {
            held.add(Held.message(name, bytes, isPush));
        } else {
            held.add(Held.unknown(name, bytes, NO_MESSAGE + likeness(bytes)));
        }
    }

    private void takeShortMessage(Place place, ShortMessage message, List<Held> held) {
        String fault = message.fault();
        Held whole = fault == null ? parts.take(place, message) : Held.error(place.toString(), NO_MESSAGE + fault);
        if (whole == null) {
            return;
        }
        boolean isOther = whole.bytes != null && !message.hasPort() && header(whole.bytes) == null;
        held.add(isOther ? Held.error(whole.name, NO_MESSAGE + "an SMS without a port") : whole);
    }

    /** Whether the second byte is that of a push. */
    static boolean isPush(byte[] bytes) {
        return bytes.length > 1 && bytes[1] == PUSH;
    }

    private static PushHeader header(byte[] bytes) {
        try {
            return isPush(bytes) ? PushHeader.parse(bytes) : null;
        } catch (ProvisioningException none) {
            return null;
        }
    }

    /** Whether it is a push of a type that is pushed to the decoder, or of a document. */
    private static boolean isKnownPush(byte[] bytes, PushHeader header) {
        if (header == null) {
            return false;
        }
        for (int type : KNOWN_TYPES) {
            if (header.contentType().code() == type) {
                return true;
            }
        }
        return header.contentType().mediaType().indexOf('/') >= 0 && isDocument(bytes, header.length());
    }

    /** Whether WBXML begins at a place: version, document type, character set and string table. */
    private static boolean isDocument(byte[] bytes, int from) {
        if (from >= bytes.length || bytes[from] < 0 || bytes[from] > LAST_WBXML_VERSION) {
            return false;
        }
        long[] number = {from + 1, 0};
        boolean isSound = integer(bytes, number) && number[1] <= LAST_DOCUMENT_TYPE;
        if (isSound && number[1] == 0) {
            isSound = integer(bytes, number);
        }
        if (isSound && bytes[from] != 0) {
            isSound = integer(bytes, number) && number[1] <= LAST_CHARSET;
        }
        return isSound && integer(bytes, number) && number[1] <= bytes.length - number[0];
    }

    /** Reads a multi-byte integer at the place in the first cell into the second one. */
    private static boolean integer(byte[] bytes, long[] number) {
        long value = 0;
        for (int at = (int) number[0]; at < bytes.length && value >> 31 == 0; ++at) {
            value = value << 7 | bytes[at] & 0x7F;
            if (bytes[at] >= 0) {
                number[0] = at + 1;
                number[1] = value;
                return true;
            }
        }
        return false;
    }
}
