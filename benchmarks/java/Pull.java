import java.io.ByteArrayInputStream;
import org.kxml2.wap.WbxmlParser;
import org.xmlpull.v1.XmlPullParser;

/** Pulls every event of a body with kXML's parser, told the tokens as far as it has to name them. */
final class Pull {
    private static final int PAGES = 2;
    private static final int FIRST_TOKEN = 5;

    private static final String[] TAGS = new String[64];
    private static final String[] ATTRIBUTES = new String[128];
    private static final String[] VALUES = new String[128];

    static {
        for (int i = 0; i < ATTRIBUTES.length; ++i) {
            ATTRIBUTES[i] = "NAME-OF-" + (i + FIRST_TOKEN);
            VALUES[i] = "VALUE-" + (i + FIRST_TOKEN);
        }
        TAGS[0] = "wap-provisioningdoc";
        TAGS[1] = "characteristic";
        TAGS[2] = "parm";
    }

    /** Answers how many elements have begun. */
    static int all(byte[] body) throws Exception {
        WbxmlParser parser = new WbxmlParser();
        for (int page = 0; page < PAGES; ++page) {
            parser.setTagTable(page, TAGS);
            parser.setAttrStartTable(page, ATTRIBUTES);
            parser.setAttrValueTable(page, VALUES);
        }
        parser.setInput(new ByteArrayInputStream(body), null);
        int elements = 0;
        for (int event; (event = parser.next()) != XmlPullParser.END_DOCUMENT; ) {
            elements += event == XmlPullParser.START_TAG ? 1 : 0;
        }
        return elements;
    }
}
