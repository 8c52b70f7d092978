package com.qvomacp.support;

import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.eng.parser.XCPCtxAccess;
import com.qvomacp.eng.parser.XCPCtxApplication;
import com.qvomacp.eng.parser.XCPCtxBootstrap;
import com.qvomacp.eng.parser.XCPCtxClientIdentity;
import com.qvomacp.eng.parser.XCPCtxNapDef;
import com.qvomacp.eng.parser.XCPCtxParser;
import com.qvomacp.eng.parser.XCPCtxPxLogical;
import com.qvomacp.eng.parser.XCPCtxVendorConfig;
import com.qvomacp.eng.parser.XCPCtxVoWifi;
import com.qvomacp.eng.parser.XCPCtxWifi;
import java.util.List;
import org.junit.jupiter.api.AfterEach;

/** The loaded library and an object of each of its ten classes; deletes after every test. */
public abstract class Natives {
    static {
        System.loadLibrary("omacp");
    }

    protected static final int WHOLE_MESSAGE = 0;
    protected static final int HEADER_ONLY = 1;

    protected static final XCPCtxParser parser = new XCPCtxParser();
    protected static final XCPCtxPxLogical proxies = new XCPCtxPxLogical();
    protected static final XCPCtxNapDef napDefs = new XCPCtxNapDef();
    protected static final XCPCtxBootstrap bootstraps = new XCPCtxBootstrap();
    protected static final XCPCtxClientIdentity identity = new XCPCtxClientIdentity();
    protected static final XCPCtxVendorConfig vendorConfigs = new XCPCtxVendorConfig();
    protected static final XCPCtxApplication applications = new XCPCtxApplication();
    protected static final XCPCtxAccess accesses = new XCPCtxAccess();
    protected static final XCPCtxWifi wifis = new XCPCtxWifi();
    protected static final XCPCtxVoWifi voWifis = new XCPCtxVoWifi();

    /** In the order in which the library registers their classes. */
    protected static final List<Object> ALL =
            List.of(
                    parser,
                    proxies,
                    napDefs,
                    bootstraps,
                    identity,
                    vendorConfigs,
                    applications,
                    accesses,
                    wifis,
                    voWifis);

    /** Parses a whole message and fails the test when it is refused. */
    protected static void parse(Document.Element... elements) {
        byte[] message = Push.push(elements);
        assertTrue(parse(message, WHOLE_MESSAGE), "the message is refused");
    }

    protected static boolean parse(byte[] message, int mode) {
        return parser.qvomacp_parser(message, message.length, mode);
    }

    protected static String[] array(String... elements) {
        return elements;
    }

    @AfterEach
    protected void delete() {
        parser.qvomacp_parser_del();
    }
}
