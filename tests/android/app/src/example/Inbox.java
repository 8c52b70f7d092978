package example;

import com.qvomacp.eng.omacp.AccessPoint;
import com.qvomacp.eng.omacp.MacResult;
import com.qvomacp.eng.omacp.ProvisioningMessage;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/** The messages that wait for the user; the oldest goes when there are too many. */
final class Inbox {
    private static final int MESSAGES = 16;
    private static final int TRIES = 3;

    /** With how often each has been tried. */
    private static final Map<ProvisioningMessage, Integer> WAITING =
            new LinkedHashMap<ProvisioningMessage, Integer>() {
                @Override
                protected boolean removeEldestEntry(Map.Entry<ProvisioningMessage, Integer> eldest) {
                    return size() > MESSAGES;
                }
            };

    private Inbox() {}

    static synchronized void keep(ProvisioningMessage message) {
        if (!WAITING.containsKey(message)) {
            WAITING.put(message, 0);
        }
    }

    static synchronized ProvisioningMessage next() {
        return WAITING.isEmpty() ? null : WAITING.keySet().iterator().next();
    }

    /**
     * The access points of a message that is to be believed, or null. The PIN is what the user was
     * told, the IMSI that of the SIM; null for what the application does not know.
     */
    static synchronized List<AccessPoint> open(ProvisioningMessage message, String pin, String imsi) {
        int tries = WAITING.get(message) + 1;
        boolean isRight = message.verifyMac(pin, imsi) == MacResult.RIGHT;
        if (isRight || tries == TRIES) {
            WAITING.remove(message);
        } else {
            WAITING.put(message, tries);
        }
        return isRight ? message.accessPoints() : null;
    }
}
