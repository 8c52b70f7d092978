package com.qvomacp.cli;

import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningMessage;

/** The library's own word on a message whose push header it takes. */
final class Verdict {
    /** 0 for a body that can be decoded. */
    final int code;

    /** How many bytes of the body had been read; 0 for one that is taken. */
    final int read;

    Verdict(int code, int read) {
        this.code = code;
        this.read = read;
    }

    /** Asks the library; null when it cannot be asked about what it refuses. */
    static Verdict of(byte[] push) {
        try {
            ProvisioningMessage.parse(push);
            return new Verdict(0, 0);
        } catch (ProvisioningException refused) {
            Integer code = refused.getResultCode();
            return code == null ? null : new Verdict(code, refused.getBodyOffset());
        }
    }
}
