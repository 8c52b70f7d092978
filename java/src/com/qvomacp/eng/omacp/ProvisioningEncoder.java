package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.Collections;
import java.util.IdentityHashMap;
import java.util.List;
import java.util.Map;

/**
 * A document that can be encoded as a body, as a whole push, and as XML: one that was read, or a
 * wap-provisioningdoc in XML. Immutable.
 *
 * <pre>{@code
 * ProvisioningEncoder encoder = ProvisioningEncoder.of(document, EncodeOptions.NONE);
 * byte[] encoded = encoder.push();
 * String text = encoder.xml();
 * }</pre>
 */
public final class ProvisioningEncoder {
    private final DocumentSource source;
    private final EncodeOptions options;

    private ProvisioningEncoder(DocumentSource source, EncodeOptions options) {
        this.source = source;
        this.options = options;
    }

    /**
     * Takes a document in XML. Nothing is ever opened or fetched for it: a document type is read over,
     * and an entity that it may define is an error.
     *
     * @param xml the bytes of the document, in the encoding that they state
     * @param options what is chosen; an option that is not set may be set by the document's {@code
     *     <?omacp-push?>} instruction
     * @return what can be encoded
     * @throws EncodingException when the bytes are no wap-provisioningdoc, with line and column
     */
    public static ProvisioningEncoder ofXml(byte[] xml, EncodeOptions options)
            throws EncodingException {
        XmlReader.Result result = XmlReader.read(xml, false);
        return new ProvisioningEncoder(result.source, options.orElse(result.options));
    }

    /**
     * Looks for what is wrong with a document in XML, and with the body that is encoded of it. A
     * characteristic without type and a parm without name are findings here.
     *
     * @param xml the bytes of the document, as {@link #ofXml} takes them
     * @return what each {@link Rule} finds, with line and column, in the order of the document; not
     *     modifiable
     * @throws EncodingException when the bytes are no wap-provisioningdoc, with line and column
     */
    public static List<Finding> lint(byte[] xml) throws EncodingException {
        XmlReader.Result result = XmlReader.read(xml, true);
        byte[] body = BodyWriter.write(result.source, result.options);
        ProvisioningDocument document;
        try {
            document = ProvisioningDocument.of(body, ReadOptions.DEFAULT
                    .withInputLimit(body.length).withTextLimit(Integer.MAX_VALUE));
        } catch (ProvisioningException e) {
            throw new AssertionError(e);
        }
        // The items stand in the body in the order of their tags.
        Map<Item, int[]> places = new IdentityHashMap<>();
        Walk items = new Walk(document.root());
        for (int[] place : result.source.places) {
            places.put(items.next(), place);
        }
        List<Finding> findings = new ArrayList<>();
        for (Finding finding : document.lint()) {
            int[] place = places.get(finding.item());
            findings.add(finding.at(place[0], place[1]));
        }
        return Collections.unmodifiableList(findings);
    }

    /**
     * Takes a document that was read.
     *
     * @param document the document
     * @param options what is chosen
     * @return what can be encoded
     * @throws EncodingException when something stands in it that is neither a characteristic of a type
     *     nor a parameter of a name, with its path
     */
    public static ProvisioningEncoder of(ProvisioningDocument document, EncodeOptions options)
            throws EncodingException {
        return new ProvisioningEncoder(source(document), options);
    }

    /**
     * Takes a message that was read. Its character set and the form of its header are those of the
     * message, as far as an option states them; PIN, IMSI and key are not known.
     *
     * @param message the message
     * @param options what is chosen in place of what the message has
     * @return what can be encoded
     * @throws EncodingException as {@link #of(ProvisioningDocument, EncodeOptions)}
     */
    public static ProvisioningEncoder of(ProvisioningMessage message, EncodeOptions options)
            throws EncodingException {
        return new ProvisioningEncoder(
                source(message.document()), options.orElse(MessageOptions.of(message)));
    }

    /**
     * {@return the options, those of the instruction or the message included: the options, never
     * {@code null}}
     */
    public EncodeOptions options() {
        return options;
    }

    /**
     * Encodes the body.
     *
     * @return a new array
     * @throws EncodingException when a text cannot be written in the character set, with its path
     */
    public byte[] body() throws EncodingException {
        return BodyWriter.write(source, options);
    }

    /**
     * Encodes a whole push.
     *
     * @return a new array
     * @throws EncodingException as {@link #body}; also when the security method needs a PIN, an IMSI
     *     or a key that the options do not have
     */
    public byte[] push() throws EncodingException {
        return PushWriter.write(body(), options);
    }

    /**
     * Tells the digits that a user has to be told for {@link SecurityMethod#USERPINMAC}: PIN and MAC.
     *
     * @return the digits; {@code null} for another security method, and without a PIN of 5 to 20
     *     digits
     * @throws EncodingException as {@link #body}
     */
    public String digitsToTell() throws EncodingException {
        return PushWriter.method(options) == SecurityMethod.USERPINMAC
                ? ProvisioningMac.digitsToTell(options.value(EncodeOption.PIN), body())
                : null;
    }

    /**
     * Writes the document as XML, for {@link #ofXml}, which reads the same document from it. The
     * options are stated in its instruction, without PIN, IMSI and key.
     *
     * @return the XML, in lines that end in a line feed, stating UTF-8 as its encoding
     * @throws EncodingException when a text holds a character that XML does not have, with its path
     */
    public String xml() throws EncodingException {
        return XmlWriter.write(source, options);
    }

    /** The steps of a document, whose nesting costs no stack. */
    private static DocumentSource source(ProvisioningDocument document) throws EncodingException {
        DocumentSource source = new DocumentSource(document.version());
        List<List<Item>> open = new ArrayList<>();
        List<Integer> places = new ArrayList<>();
        open.add(document.children());
        places.add(0);
        while (true) {
            int innermost = open.size() - 1;
            int place = places.get(innermost);
            if (place == open.get(innermost).size()) {
                open.remove(innermost);
                places.remove(innermost);
                if (innermost == 0) {
                    return source;
                }
                source.end();
                continue;
            }
            places.set(innermost, place + 1);
            Item item = open.get(innermost).get(place);
            if (item instanceof Characteristic && ((Characteristic) item).type() != null) {
                Characteristic characteristic = (Characteristic) item;
                source.characteristic(characteristic.type());
                open.add(characteristic.children());
                places.add(0);
            } else if (item instanceof Parameter && ((Parameter) item).name() != null) {
                source.parameter(((Parameter) item).name(), ((Parameter) item).value());
            } else {
                throw EncodingException.in(
                        item.path(), "what stands here is no element of the document type");
            }
        }
    }
}
