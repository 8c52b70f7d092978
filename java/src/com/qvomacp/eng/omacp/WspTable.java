package com.qvomacp.eng.omacp;

import java.util.Locale;

/**
 * Numbers that WSP assigns, as its tables have them: a row is a number, its name, and what kind of
 * value follows, where that is not plain text or number.
 */
final class WspTable {
    /** What a value stands for, beyond the form in which it is written. */
    enum Kind {
        PLAIN,
        INTEGER,
        DATE,
        QUALITY,
        VERSION,
        CHARSET,
        MEDIA_TYPE,
        FIELD_NAME,
        APPLICATION,
        PUSH_FLAG,
        SEC,
        MAC
    }

    static final WspTable MEDIA_TYPES =
            new WspTable(
                    0x00, "*/*",
                    0x01, "text/*",
                    0x02, "text/html",
                    0x03, "text/plain",
                    0x04, "text/x-hdml",
                    0x05, "text/x-ttml",
                    0x06, "text/x-vcalendar",
                    0x07, "text/x-vcard",
                    0x08, "text/vnd.wap.wml",
                    0x09, "text/vnd.wap.wmlscript",
                    0x0A, "text/vnd.wap.wta-event",
                    0x0B, "multipart/*",
                    0x0C, "multipart/mixed",
                    0x0D, "multipart/form-data",
                    0x0E, "multipart/byteranges",
                    0x0F, "multipart/alternative",
                    0x10, "application/*",
                    0x11, "application/java-vm",
                    0x12, "application/x-www-form-urlencoded",
                    0x13, "application/x-hdmlc",
                    0x14, "application/vnd.wap.wmlc",
                    0x15, "application/vnd.wap.wmlscriptc",
                    0x16, "application/vnd.wap.wta-eventc",
                    0x17, "application/vnd.wap.uaprof",
                    0x18, "application/vnd.wap.wtls-ca-certificate",
                    0x19, "application/vnd.wap.wtls-user-certificate",
                    0x1A, "application/x-x509-ca-cert",
                    0x1B, "application/x-x509-user-cert",
                    0x1C, "image/*",
                    0x1D, "image/gif",
                    0x1E, "image/jpeg",
                    0x1F, "image/tiff",
                    0x20, "image/png",
                    0x21, "image/vnd.wap.wbmp",
                    0x22, "application/vnd.wap.multipart.*",
                    0x23, "application/vnd.wap.multipart.mixed",
                    0x24, "application/vnd.wap.multipart.form-data",
                    0x25, "application/vnd.wap.multipart.byteranges",
                    0x26, "application/vnd.wap.multipart.alternative",
                    0x27, "application/xml",
                    0x28, "text/xml",
                    0x29, "application/vnd.wap.wbxml",
                    0x2A, "application/x-x968-cross-cert",
                    0x2B, "application/x-x968-ca-cert",
                    0x2C, "application/x-x968-user-cert",
                    0x2D, "text/vnd.wap.si",
                    0x2E, "application/vnd.wap.sic",
                    0x2F, "text/vnd.wap.sl",
                    0x30, "application/vnd.wap.slc",
                    0x31, "text/vnd.wap.co",
                    0x32, "application/vnd.wap.coc",
                    0x33, "application/vnd.wap.multipart.related",
                    0x34, "application/vnd.wap.sia",
                    0x35, "text/vnd.wap.connectivity-xml",
                    0x36, "application/vnd.wap.connectivity-wbxml",
                    0x37, "application/pkcs7-mime",
                    0x38, "application/vnd.wap.hashed-certificate",
                    0x39, "application/vnd.wap.signed-certificate",
                    0x3A, "application/vnd.wap.cert-response",
                    0x3B, "application/xhtml+xml",
                    0x3C, "application/wml+xml",
                    0x3D, "text/css",
                    0x3E, "application/vnd.wap.mms-message",
                    0x3F, "application/vnd.wap.rollover-certificate",
                    0x40, "application/vnd.wap.locc+wbxml",
                    0x41, "application/vnd.wap.loc+xml",
                    0x42, "application/vnd.syncml.dm+wbxml",
                    0x43, "application/vnd.syncml.dm+xml",
                    0x44, "application/vnd.syncml.notification",
                    0x45, "application/vnd.wap.xhtml+xml",
                    0x46, "application/vnd.wv.csp.cir",
                    0x47, "application/vnd.oma.dd+xml",
                    0x48, "application/vnd.oma.drm.message",
                    0x49, "application/vnd.oma.drm.content",
                    0x4A, "application/vnd.oma.drm.rights+xml",
                    0x4B, "application/vnd.oma.drm.rights+wbxml",
                    0x4C, "application/vnd.wv.csp+xml",
                    0x4D, "application/vnd.wv.csp+wbxml",
                    0x4E, "application/vnd.syncml.ds.notification",
                    0x4F, "audio/*",
                    0x50, "video/*",
                    0x51, "application/vnd.oma.dd2+xml",
                    0x52, "application/mikey",
                    0x53, "application/vnd.oma.dcd",
                    0x54, "application/vnd.oma.dcdc",
                    0x59, "application/octet-stream",
                    0x5A, "application/json",
                    0x302, "application/vnd.syncml+xml",
                    0x303, "application/vnd.syncml+wbxml",
                    0x304, "text/vnd.wap.emn+xml",
                    0x305, "text/calendar",
                    0x30A, "application/vnd.wap.emn+wbxml",
                    0x312, "application/vnd.omaloc-supl-init",
                    0x316, "application/vnd.oma.drm.roap-trigger+wbxml");

    static final WspTable PARAMETERS =
            new WspTable(
                    0x00, "Q", Kind.QUALITY,
                    0x01, "charset", Kind.CHARSET,
                    0x02, "level", Kind.VERSION,
                    0x03, "type", Kind.INTEGER,
                    0x05, "name",
                    0x06, "filename",
                    0x07, "differences", Kind.FIELD_NAME,
                    0x08, "padding", Kind.INTEGER,
                    0x09, "type", Kind.MEDIA_TYPE,
                    0x0A, "start",
                    0x0B, "start-info",
                    0x0C, "comment",
                    0x0D, "domain",
                    0x0E, "max-age", Kind.INTEGER,
                    0x0F, "path",
                    0x10, "secure",
                    0x11, "SEC", Kind.SEC,
                    0x12, "MAC", Kind.MAC,
                    0x13, "creation-date", Kind.DATE,
                    0x14, "modification-date", Kind.DATE,
                    0x15, "read-date", Kind.DATE,
                    0x16, "size", Kind.INTEGER,
                    0x17, "name",
                    0x18, "filename",
                    0x19, "start",
                    0x1A, "start-info",
                    0x1B, "comment",
                    0x1C, "domain",
                    0x1D, "path");

    static final WspTable HEADERS =
            new WspTable(
                    0x00, "Accept", Kind.MEDIA_TYPE,
                    0x01, "Accept-Charset", Kind.CHARSET,
                    0x02, "Accept-Encoding",
                    0x03, "Accept-Language",
                    0x04, "Accept-Ranges",
                    0x05, "Age", Kind.INTEGER,
                    0x06, "Allow",
                    0x07, "Authorization",
                    0x08, "Cache-Control",
                    0x09, "Connection",
                    0x0A, "Content-Base",
                    0x0B, "Content-Encoding",
                    0x0C, "Content-Language",
                    0x0D, "Content-Length", Kind.INTEGER,
                    0x0E, "Content-Location",
                    0x0F, "Content-MD5",
                    0x10, "Content-Range",
                    0x11, "Content-Type", Kind.MEDIA_TYPE,
                    0x12, "Date", Kind.DATE,
                    0x13, "ETag",
                    0x14, "Expires", Kind.DATE,
                    0x15, "From",
                    0x16, "Host",
                    0x17, "If-Modified-Since", Kind.DATE,
                    0x18, "If-Match",
                    0x19, "If-None-Match",
                    0x1A, "If-Range",
                    0x1B, "If-Unmodified-Since", Kind.DATE,
                    0x1C, "Location",
                    0x1D, "Last-Modified", Kind.DATE,
                    0x1E, "Max-Forwards", Kind.INTEGER,
                    0x1F, "Pragma",
                    0x20, "Proxy-Authenticate",
                    0x21, "Proxy-Authorization",
                    0x22, "Public",
                    0x23, "Range",
                    0x24, "Referer",
                    0x25, "Retry-After",
                    0x26, "Server",
                    0x27, "Transfer-Encoding",
                    0x28, "Upgrade",
                    0x29, "User-Agent",
                    0x2A, "Vary", Kind.FIELD_NAME,
                    0x2B, "Via",
                    0x2C, "Warning",
                    0x2D, "WWW-Authenticate",
                    0x2E, "Content-Disposition",
                    0x2F, "X-Wap-Application-Id", Kind.APPLICATION,
                    0x30, "X-Wap-Content-URI",
                    0x31, "X-Wap-Initiator-URI",
                    0x32, "Accept-Application", Kind.APPLICATION,
                    0x33, "Bearer-Indication", Kind.INTEGER,
                    0x34, "Push-Flag", Kind.PUSH_FLAG,
                    0x35, "Profile",
                    0x36, "Profile-Diff",
                    0x37, "Profile-Warning",
                    0x38, "Expect",
                    0x39, "TE",
                    0x3A, "Trailer", Kind.FIELD_NAME,
                    0x3B, "Accept-Charset", Kind.CHARSET,
                    0x3C, "Accept-Encoding",
                    0x3D, "Cache-Control",
                    0x3E, "Content-Range",
                    0x3F, "X-Wap-Tod", Kind.DATE,
                    0x40, "Content-ID",
                    0x41, "Set-Cookie",
                    0x42, "Cookie",
                    0x43, "Encoding-Version", Kind.VERSION,
                    0x44, "Profile-Warning",
                    0x45, "Content-Disposition",
                    0x46, "X-WAP-Security",
                    0x47, "Cache-Control",
                    0x48, "Expect",
                    0x49, "X-Wap-Loc-Invocation",
                    0x4A, "X-Wap-Loc-Delivery");

    static final WspTable APPLICATIONS =
            new WspTable(
                    0x00, "x-wap-application:*",
                    0x01, "x-wap-application:push.sia",
                    0x02, "x-wap-application:wml.ua",
                    0x03, "x-wap-application:wta.ua",
                    0x04, "x-wap-application:mms.ua",
                    0x05, "x-wap-application:push.syncml",
                    0x06, "x-wap-application:loc.ua",
                    0x07, "x-wap-application:syncml.dm",
                    0x08, "x-wap-application:drm.ua",
                    0x09, "x-wap-application:emn.ua",
                    0x0A, "x-wap-application:wv.ua");

    private final String[] names;
    private final Kind[] kinds;

    /** The rows have ascending numbers. */
    private WspTable(Object... cells) {
        int last = cells.length - (cells[cells.length - 1] instanceof Kind ? 3 : 2);
        names = new String[(Integer) cells[last] + 1];
        kinds = new Kind[names.length];
        for (int i = 0; i < cells.length; i += 2) {
            int number = (Integer) cells[i];
            if (names[number] != null) {
                throw new AssertionError("number " + number + " twice");
            }
            names[number] = (String) cells[i + 1];
            if (i + 2 < cells.length && cells[i + 2] instanceof Kind) {
                kinds[number] = (Kind) cells[i + 2];
                ++i;
            }
        }
    }

    /** The name of a number; null for one that the table does not have. */
    String name(int number) {
        return number >= 0 && number < names.length ? names[number] : null;
    }

    /** The name of a number; its digits for one that the table does not have. */
    String nameOrDigits(int number) {
        String name = name(number);
        return name != null ? name : "0x" + Integer.toHexString(number).toUpperCase(Locale.ROOT);
    }

    /** What kind of value follows a number, -1 for a name that has none. */
    Kind kind(int number) {
        return name(number) != null && kinds[number] != null ? kinds[number] : Kind.PLAIN;
    }

    /** The first number of a name in any case; -1 for one that the table does not have. */
    int number(String name) {
        for (int i = 0; i < names.length; ++i) {
            if (name.equalsIgnoreCase(names[i])) {
                return i;
            }
        }
        return -1;
    }
}
