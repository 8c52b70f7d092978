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
        switch (contentType) {
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
                return "unknown";
        }
    }

    boolean hasSec() {
        return sec != 0;
    }

    /** The name that OMA Provisioning Bootstrap gives the security method. */
    String secName() {
        int method = sec & 0x7F;
        return method < METHODS.length ? METHODS[method] : "unknown";
    }

    boolean hasMac() {
        return !mac.isEmpty();
    }
}
