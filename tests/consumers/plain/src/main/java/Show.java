import com.qvomacp.eng.omacp.AccessPoint;
import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningMessage;
import com.qvomacp.eng.omacp.ReadOptions;
import com.qvomacp.eng.parser.NativeLibrary;
import com.qvomacp.eng.parser.XCPCtxNapDef;
import com.qvomacp.eng.parser.XCPCtxParser;
import java.nio.file.Files;
import java.nio.file.Paths;
import java.util.Arrays;

/** A program that knows the jars and nothing else: {@code Show MESSAGE PIN}. */
final class Show {
    private Show() {}

    public static void main(String[] arguments) throws Exception {
        byte[] bytes = Files.readAllBytes(Paths.get(arguments[0]));
        ProvisioningMessage message = ProvisioningMessage.parsePush(bytes);
        System.out.println(message.verifyMac(arguments[1], null));
        for (AccessPoint accessPoint : message.accessPoints()) {
            System.out.println(accessPoint.name() + ": " + accessPoint.address());
        }
        refuse(new byte[] {1, 7, 1, 0});
        refuse(Arrays.copyOf(bytes, bytes.length / 2));
        NativeLibrary.load();
        XCPCtxParser parser = new XCPCtxParser();
        if (parser.qvomacp_parser(bytes, bytes.length, 0)) {
            System.out.println(new XCPCtxNapDef().qvomacp_GetPxNapDefData(1)[1]);
        }
        parser.qvomacp_parser_del();
    }

    private static void refuse(byte[] bytes) {
        try {
            ProvisioningMessage.parsePush(bytes, ReadOptions.DEFAULT.withAcceptedOnly(true));
            System.out.println("taken");
        } catch (ProvisioningException e) {
            System.out.println(e.reason() + ", " + e.code());
        }
    }
}
