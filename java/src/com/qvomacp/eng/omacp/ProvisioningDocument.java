package com.qvomacp.eng.omacp;

import java.util.Arrays;
import java.util.List;
import java.util.Objects;

/**
 * A provisioning document as its body says it: a tree of items in the order of the message. It
 * reads whatever WBXML 1.0 to 1.3 allow, and is immutable.
 *
 * <pre>{@code
 * ProvisioningDocument document = ProvisioningDocument.parse(body);
 * for (Characteristic characteristic : document.characteristics()) {
 *     System.out.println(characteristic.type());
 * }
 * }</pre>
 */
public final class ProvisioningDocument {
    private final byte[] body;
    private final BodyHeader header;
    private final Other root;
    private final String version;

    private ProvisioningDocument(byte[] body, int textLimit) throws ProvisioningException {
        this.body = body;
        header = new BodyHeader(body);
        TreeBuilder builder = new TreeBuilder(header.elementsAt);
        new BodyReader(body, header, textLimit, builder).read();
        root = builder.root();
        version = builder.version();
    }

    /** Reads a body that nobody else has. */
    static ProvisioningDocument of(byte[] body, ReadOptions options) throws ProvisioningException {
        ProvisioningException.checkInput(body.length, options);
        return new ProvisioningDocument(body, options.textLimit());
    }

    /**
     * Reads a body with the usual limits.
     *
     * @param body a WBXML body; it is copied
     * @return the document
     * @throws ProvisioningException when the body is over a limit, is no WBXML, or is a document of
     *     another type
     */
    public static ProvisioningDocument parse(byte[] body) throws ProvisioningException {
        return parse(body, ReadOptions.DEFAULT);
    }

    /**
     * Reads a body.
     *
     * @param body a WBXML body; it is copied
     * @param options the limits, and whether what the native library refuses is refused
     * @return the document
     * @throws ProvisioningException when the body is over a limit, is no WBXML, is a document of
     *     another type, or is refused as the options ask for
     */
    public static ProvisioningDocument parse(byte[] body, ReadOptions options)
            throws ProvisioningException {
        ProvisioningException.checkInput(body.length, options);
        ProvisioningDocument document = of(body.clone(), options);
        if (options.acceptedOnly()) {
            ProvisioningException.checkVerdict(document.verdict());
        }
        return document;
    }

    /** {@return the version of WBXML, such as {@code 1.3}} */
    public String wbxmlVersion() {
        return header.versionText();
    }

    /** {@return the number of the document type: 11 for provisioning, 0 when given as text} */
    public int publicIdentifier() {
        return (int) header.publicIdentifier;
    }

    /**
     * {@return the name of the document type, such as {@code -//WAPFORUM//DTD PROV 1.0//EN}; {@code
     * null} when the number stands for none, or the text cannot be had}
     */
    public String documentType() {
        return header.documentType;
    }

    /** {@return the MIBenum of the character set, 106 for UTF-8; 0 when it is not stated} */
    public int charset() {
        return (int) header.charset.number();
    }

    /** {@return the name of the character set, such as {@code UTF-8}; {@code null} if not known} */
    public String charsetName() {
        return header.charset.name();
    }

    /** {@return the string table: a new array, empty when there is none} */
    public byte[] stringTable() {
        return Arrays.copyOfRange(body, header.tableAt, header.elementsAt);
    }

    /** {@return the version of the document element, such as {@code 1.0}; {@code null} for none} */
    public String version() {
        return version;
    }

    /** {@return the items in the document element, in the order of the message; not modifiable} */
    public List<Item> children() {
        return root.children();
    }

    /** {@return the characteristics directly in the document element; as {@link #children}} */
    public List<Characteristic> characteristics() {
        return root.children(Characteristic.class, null);
    }

    /**
     * {@return the characteristics of a type in the document element, as {@link #children}}
     * @param type what TYPE is, in exactly this case
     */
    public List<Characteristic> characteristics(String type) {
        return root.children(Characteristic.class, Objects.requireNonNull(type));
    }

    /**
     * {@return the bytes of an item: a new array of {@link Item#length} bytes}
     * @param item an item of this document
     */
    public byte[] bytes(Item item) {
        return Arrays.copyOfRange(body, item.offset(), item.offset() + item.length());
    }

    /**
     * {@return the path of an item, as {@link Deviation#path} does; never {@code null}}
     * @param item an item of this document
     */
    public String path(Item item) {
        return item.path();
    }

    /** {@return where the body departs from the format, in its order; not modifiable} */
    public List<Deviation> deviations() {
        DeviationFinder finder = new DeviationFinder(root, body.length);
        read(finder);
        return finder.found();
    }

    /** {@return the body that was read: a new array} */
    public byte[] body() {
        return body.clone();
    }

    /** {@return whether the native library takes the body, worked out at each call} */
    public Verdict verdict() {
        return Verdict.onBody(body, this);
    }

    /**
     * Looks for what is wrong with the document, worked out at each call.
     *
     * @return what each {@link Rule} finds, in the order of the body; not modifiable
     */
    public List<Finding> lint() {
        return Linter.lint(null, this, verdict());
    }

    /**
     * Tells what each byte of the body means by the format, in order, without a gap and without an
     * overlap. Texts are told whole. Nothing is kept: the body is read again.
     *
     * @param visitor who is told
     */
    public void describe(ByteVisitor visitor) {
        Describer describer = new Describer(visitor);
        describer.header(body, header);
        read(describer);
    }

    /**
     * Tells what each byte of a body means, as {@link #describe(ByteVisitor)}, as far as it can be
     * read. Nothing is kept of a document that is too much for {@link #parse}.
     *
     * @param body a WBXML body, not to be changed meanwhile
     * @param options the limits
     * @param visitor who is told
     * @throws ProvisioningException as {@link #parse}, once what stands before has been told
     */
    public static void describe(byte[] body, ReadOptions options, ByteVisitor visitor)
            throws ProvisioningException {
        ProvisioningException.checkInput(body.length, options);
        BodyHeader header = new BodyHeader(body);
        Describer describer = new Describer(visitor);
        describer.header(body, header);
        new BodyReader(body, header, options.textLimit(), describer).read();
    }

    /** The body, not to be changed. */
    byte[] bytes() {
        return body;
    }

    BodyHeader header() {
        return header;
    }

    /** The document element. */
    Item root() {
        return root;
    }

    /** The innermost item that some byte of the body is in; the document for one outside of all. */
    Item itemAt(int offset) {
        Item item = root;
        for (Item inner = item; inner != null; inner = childAt(item, offset)) {
            item = inner;
        }
        return item;
    }

    private static Item childAt(Item item, int offset) {
        Item[] children = item.inside();
        int low = 0;
        int high = children.length;
        while (low < high) {
            int middle = (low + high) >>> 1;
            if (children[middle].offset() <= offset) {
                low = middle + 1;
            } else {
                high = middle;
            }
        }
        if (low == 0) {
            return null;
        }
        Item last = children[low - 1];
        return offset < last.offset() + last.length() ? last : null;
    }

    /** Reads the body again, which went well before, for another listener. */
    private void read(Reading reading) {
        try {
            new BodyReader(body, header, Integer.MAX_VALUE, reading).read();
        } catch (ProvisioningException e) {
            throw new AssertionError(e);
        }
    }

    /**
     * {@return whether another document says the same: it has the same version attribute and the
     * same items, however they are written}
     * @param other what to compare with
     */
    @Override
    public boolean equals(Object other) {
        if (!(other instanceof ProvisioningDocument)) {
            return false;
        }
        ProvisioningDocument that = (ProvisioningDocument) other;
        return Objects.equals(version, that.version) && root.equals(that.root);
    }

    @Override
    public int hashCode() {
        return 31 * Objects.hashCode(version) + root.hashCode();
    }

    /** {@return the document, without any value: one line of text} */
    @Override
    public String toString() {
        return "ProvisioningDocument{WBXML "
                + wbxmlVersion()
                + ", "
                + body.length
                + " bytes, children="
                + root.inside().length
                + "}";
    }
}
