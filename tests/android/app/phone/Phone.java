package example;

import android.content.Intent;
import android.provider.Telephony;
import com.qvomacp.eng.omacp.ProvisioningMessage;
import java.nio.file.Files;
import java.util.Arrays;

/** Hands a push out as the system does, and opens it as a user does who mistypes the PIN once. */
final class Phone {
    private Phone() {}

    public static void main(String[] arguments) throws Exception {
        byte[] push = Files.readAllBytes(java.nio.file.Paths.get(arguments[0]));
        // In front of the headers: transaction, type, the headers' length (below 128 here).
        int body = 3 + push[2];
        Intent intent =
                new Intent(Telephony.Sms.Intents.WAP_PUSH_RECEIVED_ACTION)
                        .putExtra("header", Arrays.copyOfRange(push, 3, body))
                        .putExtra("data", Arrays.copyOfRange(push, body, push.length));
        new PushReceiver().onReceive(null, intent);
        ProvisioningMessage message = Inbox.next();
        while (message == null) {
            Thread.sleep(10);
            message = Inbox.next();
        }
        System.out.println(Inbox.open(message, "9999", null));
        System.out.println(Inbox.open(message, arguments[1], null).get(0).address());
        System.out.println(Inbox.next());
    }
}
