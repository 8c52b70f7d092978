import com.qvomacp.eng.omacp.AccessPoint;
import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningMessage;
import java.nio.file.Files;
import java.nio.file.Paths;
import java.util.Arrays;

/** A program that knows the jar and nothing else: {@code Show MESSAGE PIN}. */
final class Show {
    private Show() {}

    public static void main(String[] arguments) throws Exception {
        byte[] bytes = Files.readAllBytes(Paths.get(arguments[0]));
        ProvisioningMessage message = ProvisioningMessage.parse(bytes);
        System.out.println(message.verifyMac(arguments[1]) ? "verified" : "not verified");
        for (AccessPoint accessPoint : message.getAccessPoints()) {
            System.out.println(accessPoint.getName() + ": " + accessPoint.getAddress());
        }
        refuse(new byte[] {1, 7, 1, 0});
        refuse(Arrays.copyOf(bytes, bytes.length / 2));
    }

    private static void refuse(byte[] bytes) {
        try {
            ProvisioningMessage.parse(bytes);
            System.out.println("taken");
        } catch (ProvisioningException e) {
            System.out.println(e.getReason() + ": " + e.getMessage());
        }
    }
}
