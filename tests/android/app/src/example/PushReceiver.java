package example;

import android.content.BroadcastReceiver;
import android.content.Context;
import android.content.Intent;
import android.provider.Telephony;
import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningMessage;

/** Takes the pushes that the system hands out. */
public final class PushReceiver extends BroadcastReceiver {
    @Override
    public void onReceive(Context context, Intent intent) {
        byte[] header = intent.getByteArrayExtra("header");
        byte[] data = intent.getByteArrayExtra("data");
        boolean isPush = Telephony.Sms.Intents.WAP_PUSH_RECEIVED_ACTION.equals(intent.getAction());
        if (!isPush || header == null || data == null) {
            return;
        }
        PendingResult result = goAsync();
        new Thread(
                        () -> {
                            try {
                                Inbox.keep(ProvisioningMessage.parse(header, data));
                            } catch (ProvisioningException unreadable) {
                                // Nobody asked for it: there is nobody to tell.
                            } finally {
                                result.finish();
                            }
                        })
                .start();
    }
}
