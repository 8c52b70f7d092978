package example;

import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningMessage;
import com.qvomacp.eng.parser.NativeLibrary;
import com.qvomacp.eng.parser.XCPCtxNapDef;
import com.qvomacp.eng.parser.XCPCtxParser;
import java.io.IOException;
import java.nio.file.Files;
import java.nio.file.Paths;

/** Prints how many access points the reader and the library find in a message. */
public final class Both {
    private Both() {}

    /** Takes a path. */
    public static void main(String[] arguments) throws IOException, ProvisioningException {
        byte[] push = Files.readAllBytes(Paths.get(arguments[0]));
        System.out.println("read: " + ProvisioningMessage.parsePush(push).accessPoints().size());
        NativeLibrary.load();
        XCPCtxParser parser = new XCPCtxParser();
        if (parser.qvomacp_parser(push, push.length, 0)) {
            System.out.println("answered: " + new XCPCtxNapDef().qvomacp_GetPxNapDefCount());
        }
        parser.qvomacp_parser_del();
    }
}
