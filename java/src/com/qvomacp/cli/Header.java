package com.qvomacp.cli;

/** What the push header says. */
final class Header {
    private static final String[] METHODS = {"NETWPIN", "USERPIN", "USERNETWPIN", "USERPINMAC"};

    final int contentType;
    final int headerLength;
    final int bodyLength;

    /** The byte as sent, high bit included; 0 when the message has no SEC. */
    final int sec;

    /** Empty when the message has no MAC. */
    final String mac;

    Header(int contentType, int headerLength, int bodyLength, int sec, String mac) {
        this.contentType = contentType;
        this.headerLength = headerLength;
        this.bodyLength = bodyLength;
        this.sec = sec;
        this.mac = mac;
    }

    String mediaType() {
        String name = mediaType(contentType);
        return name == null ? "unknown" : name;
    }

    /** The media type of a well-known content type that the library takes; null for others. */
    static String mediaType(int code) {
        switch (code) {
            case 53:
                return "application/vnd.wap.connectivity-xml";
            case 54:
                return "application/vnd.wap.connectivity-wbxml";
            case 66:
                return "application/vnd.syncml.dm+wbxml";
            case 68:
                return "application/vnd.syncml.notification";
            case 78:
                return "application/vnd.syncml.ds.notification";
            default:
                return null;
        }
    }

    boolean hasSec() {
        return sec != 0;
    }

    String secName() {
        return secName(sec);
    }

    /** A SEC byte, for people. */
    static String secShown(int sec) {
        return String.format("%s (0x%02X)", secName(sec), sec);
    }

    /** The name that OMA Provisioning Bootstrap gives the security method. */
    private static String secName(int sec) {
        int method = sec & 0x7F;
        return method < METHODS.length ? METHODS[method] : "unknown";
    }

    boolean hasMac() {
        return !mac.isEmpty();
    }
}
