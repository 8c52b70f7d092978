import com.qvomacp.eng.omacp.*;
import java.nio.file.*;

class Example {
    public static void main(String[] arguments) throws Exception {
        byte[] bytes = Files.readAllBytes(Paths.get(arguments[0]));
        ProvisioningMessage message = ProvisioningMessage.parse(bytes);
        System.out.println("genuine: " + message.verifyMac("1234"));
        for (AccessPoint point : message.getAccessPoints()) {
            System.out.println(point.getName() + ": " + point.getAddress());
        }
    }
}
