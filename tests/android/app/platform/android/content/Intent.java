package android.content;

import java.util.HashMap;
import java.util.Map;

public class Intent {
    private final String action;
    private final Map<String, byte[]> extras = new HashMap<>();

    public Intent(String action) {
        this.action = action;
    }

    public String getAction() {
        return action;
    }

    public Intent putExtra(String name, byte[] value) {
        extras.put(name, value);
        return this;
    }

    public byte[] getByteArrayExtra(String name) {
        return extras.get(name);
    }
}
