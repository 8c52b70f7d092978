package com.qvomacp.cli;

import com.qvomacp.eng.omacp.EncodeOptions;
import com.qvomacp.eng.omacp.EncodingException;
import com.qvomacp.eng.omacp.ProvisioningEncoder;

/** A job that takes documents in XML as well, and for which what cannot be read is a failure. */
abstract class MessageJob extends JsonJob {
    /** Does it to one message that was read. */
    abstract void run(Reading reading);

    /** Does it to one document in XML: to what is encoded of it. */
    @Override
    boolean runXml(String name, byte[] xml) throws EncodingException {
        byte[] body = ProvisioningEncoder.ofXml(xml, EncodeOptions.NONE).body();
        run(new Reading(Held.message(name, body, false), body.length));
        return true;
    }

    @Override
    final void run(Held held) {
        Reading reading = new Reading(held, limit);
        if (reading.message != null) {
            run(reading);
            return;
        }
        console.raise(Console.FAILED);
        explain(reading);
        failed(held.name, reading.failure.getMessage());
    }

    /** What is refused elsewhere is here what cannot be read. */
    @Override
    final void fail(int status, String name, String reason) {
        super.fail(Console.FAILED, name, reason);
    }
}
