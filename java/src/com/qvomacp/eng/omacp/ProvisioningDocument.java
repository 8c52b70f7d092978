package com.qvomacp.eng.omacp;

import java.util.List;

/**
 * A provisioning document as its body says it: a tree of items in the order of the message. It reads
 * whatever WBXML 1.0 to 1.3 allow, and is immutable.
 *
 * <pre>{@code
 * ProvisioningDocument document = ProvisioningDocument.parse(body);
 * for (Characteristic characteristic : document.characteristics()) {
 *     System.out.println(characteristic.type());
 * }
 * }</pre>
 */
public final class ProvisioningDocument {
    private ProvisioningDocument() {}

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
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the version of WBXML.
     *
     * @return such as {@code 1.3}
     */
    public String wbxmlVersion() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the public identifier of the document type.
     *
     * @return the number, 11 for a provisioning document; 0 when it is given as text
     */
    public int publicIdentifier() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the name of the document type.
     *
     * @return such as {@code -//WAPFORUM//DTD PROV 1.0//EN}; {@code null} when the number stands for
     *     none, or the text cannot be had
     */
    public String documentType() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the character set of the texts.
     *
     * @return the MIBenum that IANA assigns, 106 for UTF-8; 0 when it is not stated
     */
    public int charset() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the name of the character set.
     *
     * @return such as {@code UTF-8}; {@code null} when the number stands for none that is known
     */
    public String charsetName() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the string table.
     *
     * @return a new array, empty when there is none
     */
    public byte[] stringTable() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the version attribute of the document element.
     *
     * @return such as {@code 1.0}; {@code null} when there is none
     */
    public String version() {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists what stands in the document element.
     *
     * @return every item, in the order of the message; not modifiable
     */
    public List<Item> children() {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists the characteristics that stand directly in the document element.
     *
     * @return every characteristic, in the order of the message; not modifiable
     */
    public List<Characteristic> characteristics() {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists the characteristics of a type that stand directly in the document element.
     *
     * @param type what TYPE is, in exactly this case
     * @return all of them, in the order of the message; not modifiable
     */
    public List<Characteristic> characteristics(String type) {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the bytes of an item of this document.
     *
     * @param item an item of this document
     * @return a new array with {@link Item#length} bytes
     */
    public byte[] bytes(Item item) {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the path of an item of this document, as {@link Deviation#path} does.
     *
     * @param item an item of this document
     * @return the path, never {@code null}
     */
    public String path(Item item) {
        throw new UnsupportedOperationException();
    }

    /**
     * Lists where the body departs from the format.
     *
     * @return every deviation, in the order of the body; not modifiable, empty when there is none
     */
    public List<Deviation> deviations() {
        throw new UnsupportedOperationException();
    }

    /**
     * Tells the body that was read.
     *
     * @return a new array
     */
    public byte[] body() {
        throw new UnsupportedOperationException();
    }

    /**
     * Finds out whether the native library takes the body. It is worked out at each call.
     *
     * @return the verdict, never {@code null}
     */
    public Verdict verdict() {
        throw new UnsupportedOperationException();
    }
}
