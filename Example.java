import com.qvomacp.eng.omacp.*;
import java.nio.file.*;

class Example {
    public static void main(String[] arguments) throws Exception {
        byte[] bytes = Files.readAllBytes(Paths.get(arguments[0]));
        ProvisioningMessage message = ProvisioningMessage.parsePush(bytes);
        System.out.println("the MAC is " + message.verifyMac("1234", null));
        System.out.println("the library takes it: " + message.verdict().isAccepted());
        for (AccessPoint point : message.accessPoints()) {
            System.out.println(point.name() + ": " + point.address());
        }
        for (Characteristic proxy : message.document().characteristics("PXLOGICAL")) {
            System.out.println(proxy.value("NAME") + ": " + proxy.characteristics("PXPHYSICAL").size());
        }
    }
}
