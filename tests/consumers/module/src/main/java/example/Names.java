package example;

import com.qvomacp.eng.omacp.AccessPoint;
import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningMessage;
import java.io.IOException;
import java.nio.file.Files;
import java.nio.file.Paths;

/** Prints the names of the access points of a message. */
public final class Names {
    private Names() {}

    /** Takes a path. */
    public static void main(String[] arguments) throws IOException, ProvisioningException {
        byte[] push = Files.readAllBytes(Paths.get(arguments[0]));
        for (AccessPoint point : ProvisioningMessage.parsePush(push).accessPoints()) {
            System.out.println(point.name());
        }
    }
}
