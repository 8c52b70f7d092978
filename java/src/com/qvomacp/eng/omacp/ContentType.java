package com.qvomacp.eng.omacp;

/** The content types that the library takes, with the codes that WSP assigns to them. */
public enum ContentType {
    /** A provisioning document in WBXML, which is what provisioning servers send. */
    CONNECTIVITY_WBXML(54, "application/vnd.wap.connectivity-wbxml"),

    /** A provisioning document in XML; the library reads its body as WBXML all the same. */
    CONNECTIVITY_XML(53, "application/vnd.wap.connectivity-xml"),

    /** A notification of SyncML device management. */
    SYNCML_NOTIFICATION(68, "application/vnd.syncml.notification"),

    /** A notification of SyncML data synchronisation. */
    SYNCML_DS_NOTIFICATION(78, "application/vnd.syncml.ds.notification"),

    /** A message of SyncML device management in WBXML. */
    SYNCML_DM_WBXML(66, "application/vnd.syncml.dm+wbxml");

    private final int code;
    private final String mediaType;

    ContentType(int code, String mediaType) {
        this.code = code;
        this.mediaType = mediaType;
    }

    /**
     * Tells the code of the content type.
     *
     * @return the code without its high bit, such as 54
     */
    public int getCode() {
        return code;
    }

    /**
     * Tells the name of the content type.
     *
     * @return the media type, such as {@code application/vnd.wap.connectivity-wbxml}
     */
    public String getMediaType() {
        return mediaType;
    }

    /** The content type with a code; null for a code that is none of these. */
    static ContentType ofCode(int code) {
        for (ContentType type : values()) {
            if (type.code == code) {
                return type;
            }
        }
        return null;
    }

    /** The content type with a name, in exactly this case; null for any other name. */
    static ContentType named(String mediaType) {
        for (ContentType type : values()) {
            if (type.mediaType.equals(mediaType)) {
                return type;
            }
        }
        return null;
    }
}
