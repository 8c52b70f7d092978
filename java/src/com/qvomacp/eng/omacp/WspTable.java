package com.qvomacp.eng.omacp;

import java.util.Locale;

/**
 * Numbers that WSP assigns, as its tables have them: a row is a number, its name, and what kind of
 * value follows, where that is not plain text or number. The last row has the largest number.
 */
final class WspTable {
    /** What a value stands for, beyond the form in which it is written. */
    enum Kind {
        PLAIN, INTEGER, DATE, QUALITY, VERSION, CHARSET, MEDIA_TYPE, FIELD_NAME, APPLICATION,
        PUSH_FLAG, SEC, MAC
    }

    static final WspTable MEDIA_TYPES = new WspTable(
            "00 */* 01 text/* 02 text/html 03 text/plain 04 text/x-hdml 05 text/x-ttml"
            + " 06 text/x-vcalendar 07 text/x-vcard 08 text/vnd.wap.wml"
            + " 09 text/vnd.wap.wmlscript 0A text/vnd.wap.wta-event 0B multipart/*"
            + " 0C multipart/mixed 0D multipart/form-data 0E multipart/byteranges"
            + " 0F multipart/alternative 10 application/* 11 application/java-vm"
            + " 12 application/x-www-form-urlencoded 13 application/x-hdmlc"
            + " 14 application/vnd.wap.wmlc 15 application/vnd.wap.wmlscriptc"
            + " 16 application/vnd.wap.wta-eventc 17 application/vnd.wap.uaprof"
            + " 18 application/vnd.wap.wtls-ca-certificate"
            + " 19 application/vnd.wap.wtls-user-certificate 1A application/x-x509-ca-cert"
            + " 1B application/x-x509-user-cert 1C image/* 1D image/gif 1E image/jpeg"
            + " 1F image/tiff 20 image/png 21 image/vnd.wap.wbmp"
            + " 22 application/vnd.wap.multipart.* 23 application/vnd.wap.multipart.mixed"
            + " 24 application/vnd.wap.multipart.form-data"
            + " 25 application/vnd.wap.multipart.byteranges"
            + " 26 application/vnd.wap.multipart.alternative 27 application/xml 28 text/xml"
            + " 29 application/vnd.wap.wbxml 2A application/x-x968-cross-cert"
            + " 2B application/x-x968-ca-cert 2C application/x-x968-user-cert"
            + " 2D text/vnd.wap.si 2E application/vnd.wap.sic 2F text/vnd.wap.sl"
            + " 30 application/vnd.wap.slc 31 text/vnd.wap.co 32 application/vnd.wap.coc"
            + " 33 application/vnd.wap.multipart.related 34 application/vnd.wap.sia"
            + " 35 text/vnd.wap.connectivity-xml 36 application/vnd.wap.connectivity-wbxml"
            + " 37 application/pkcs7-mime 38 application/vnd.wap.hashed-certificate"
            + " 39 application/vnd.wap.signed-certificate 3A application/vnd.wap.cert-response"
            + " 3B application/xhtml+xml 3C application/wml+xml 3D text/css"
            + " 3E application/vnd.wap.mms-message 3F application/vnd.wap.rollover-certificate"
            + " 40 application/vnd.wap.locc+wbxml 41 application/vnd.wap.loc+xml"
            + " 42 application/vnd.syncml.dm+wbxml 43 application/vnd.syncml.dm+xml"
            + " 44 application/vnd.syncml.notification 45 application/vnd.wap.xhtml+xml"
            + " 46 application/vnd.wv.csp.cir 47 application/vnd.oma.dd+xml"
            + " 48 application/vnd.oma.drm.message 49 application/vnd.oma.drm.content"
            + " 4A application/vnd.oma.drm.rights+xml 4B application/vnd.oma.drm.rights+wbxml"
            + " 4C application/vnd.wv.csp+xml 4D application/vnd.wv.csp+wbxml"
            + " 4E application/vnd.syncml.ds.notification 4F audio/* 50 video/*"
            + " 51 application/vnd.oma.dd2+xml 52 application/mikey 53 application/vnd.oma.dcd"
            + " 54 application/vnd.oma.dcdc 59 application/octet-stream 5A application/json"
            + " 302 application/vnd.syncml+xml 303 application/vnd.syncml+wbxml"
            + " 304 text/vnd.wap.emn+xml 305 text/calendar 30A application/vnd.wap.emn+wbxml"
            + " 312 application/vnd.omaloc-supl-init"
            + " 316 application/vnd.oma.drm.roap-trigger+wbxml");

    static final WspTable PARAMETERS = new WspTable(
            "00 Q=QUALITY 01 charset=CHARSET 02 level=VERSION 03 type=INTEGER 05 name"
            + " 06 filename 07 differences=FIELD_NAME 08 padding=INTEGER 09 type=MEDIA_TYPE"
            + " 0A start 0B start-info 0C comment 0D domain 0E max-age=INTEGER 0F path"
            + " 10 secure 11 SEC=SEC 12 MAC=MAC 13 creation-date=DATE 14 modification-date=DATE"
            + " 15 read-date=DATE 16 size=INTEGER 17 name 18 filename 19 start 1A start-info"
            + " 1B comment 1C domain 1D path");

    static final WspTable HEADERS = new WspTable(
            "00 Accept=MEDIA_TYPE 01 Accept-Charset=CHARSET 02 Accept-Encoding"
            + " 03 Accept-Language 04 Accept-Ranges 05 Age=INTEGER 06 Allow 07 Authorization"
            + " 08 Cache-Control 09 Connection 0A Content-Base 0B Content-Encoding"
            + " 0C Content-Language 0D Content-Length=INTEGER 0E Content-Location"
            + " 0F Content-MD5 10 Content-Range 11 Content-Type=MEDIA_TYPE 12 Date=DATE 13 ETag"
            + " 14 Expires=DATE 15 From 16 Host 17 If-Modified-Since=DATE 18 If-Match"
            + " 19 If-None-Match 1A If-Range 1B If-Unmodified-Since=DATE 1C Location"
            + " 1D Last-Modified=DATE 1E Max-Forwards=INTEGER 1F Pragma 20 Proxy-Authenticate"
            + " 21 Proxy-Authorization 22 Public 23 Range 24 Referer 25 Retry-After 26 Server"
            + " 27 Transfer-Encoding 28 Upgrade 29 User-Agent 2A Vary=FIELD_NAME 2B Via"
            + " 2C Warning 2D WWW-Authenticate 2E Content-Disposition"
            + " 2F X-Wap-Application-Id=APPLICATION 30 X-Wap-Content-URI 31 X-Wap-Initiator-URI"
            + " 32 Accept-Application=APPLICATION 33 Bearer-Indication=INTEGER"
            + " 34 Push-Flag=PUSH_FLAG 35 Profile 36 Profile-Diff 37 Profile-Warning 38 Expect"
            + " 39 TE 3A Trailer=FIELD_NAME 3B Accept-Charset=CHARSET 3C Accept-Encoding"
            + " 3D Cache-Control 3E Content-Range 3F X-Wap-Tod=DATE 40 Content-ID 41 Set-Cookie"
            + " 42 Cookie 43 Encoding-Version=VERSION 44 Profile-Warning 45 Content-Disposition"
            + " 46 X-WAP-Security 47 Cache-Control 48 Expect 49 X-Wap-Loc-Invocation"
            + " 4A X-Wap-Loc-Delivery");

    static final WspTable APPLICATIONS = new WspTable(
            "00 x-wap-application:* 01 x-wap-application:push.sia"
            + " 02 x-wap-application:wml.ua 03 x-wap-application:wta.ua"
            + " 04 x-wap-application:mms.ua 05 x-wap-application:push.syncml"
            + " 06 x-wap-application:loc.ua 07 x-wap-application:syncml.dm"
            + " 08 x-wap-application:drm.ua 09 x-wap-application:emn.ua"
            + " 0A x-wap-application:wv.ua");

    private final String[] names;
    private final Kind[] kinds;

    /** Rows of a hexadecimal number and a name, with = and a kind where there is one. */
    private WspTable(String rows) {
        String[] words = rows.split(" ");
        names = new String[Integer.parseInt(words[words.length - 2], 16) + 1];
        kinds = new Kind[names.length];
        for (int i = 0; i < words.length; i += 2) {
            int number = Integer.parseInt(words[i], 16);
            if (names[number] != null) {
                throw new AssertionError("number " + number + " twice");
            }
            String name = words[i + 1];
            int nameEnd = name.indexOf('=');
            names[number] = (nameEnd < 0 ? name : name.substring(0, nameEnd)).intern();
            kinds[number] = nameEnd < 0 ? Kind.PLAIN : Kind.valueOf(name.substring(nameEnd + 1));
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
        return name(number) != null ? kinds[number] : Kind.PLAIN;
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
