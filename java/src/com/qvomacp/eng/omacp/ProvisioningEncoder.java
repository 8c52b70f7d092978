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
    private final Item root;
    private final String version;
    private final EncodeOptions options;

    private ProvisioningEncoder(Item root, String version, EncodeOptions options) {
        this.root = root;
        this.version = version;
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
        XmlReader read = new XmlReader(xml, false);
        return new ProvisioningEncoder(read.root, read.version, options.orElse(read.options));
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
        XmlReader read = new XmlReader(xml, true);
        byte[] body = BodyWriter.write(read.root, read.version, read.options);
        ProvisioningDocument document;
        try {
            document = ProvisioningDocument.of(body, ReadOptions.DEFAULT
                    .withInputLimit(body.length).withTextLimit(Integer.MAX_VALUE));
        } catch (ProvisioningException e) {
            throw new AssertionError(e);
        }
        // The items stand in the body in the order of their tags.
        Map<Item, Item> tags = new IdentityHashMap<>();
        Walk items = new Walk(document.root());
        Walk elements = new Walk(read.root);
        for (Item element; (element = elements.next()) != null; ) {
            tags.put(items.next(), element);
        }
        List<Finding> findings = new ArrayList<>();
        for (Finding finding : document.lint()) {
            findings.add(finding.at(read.place(tags.get(finding.item()))));
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
        Walk items = new Walk(document.root());
        items.next();
        for (Item item; (item = items.next()) != null; ) {
            if (item instanceof Other || item.called() == null) {
                throw EncodingException.in(
                        item.path(), "what stands here is no element of the document type");
            }
            if (item instanceof Parameter) {
                items.pass();
            }
        }
        return new ProvisioningEncoder(document.root(), document.version(), options);
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
        return of(message.document(), options.orElse(MessageOptions.of(message)));
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
        return BodyWriter.write(root, version, options);
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
        return XmlWriter.write(root, version, options);
    }
}
