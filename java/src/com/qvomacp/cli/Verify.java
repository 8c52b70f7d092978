package com.qvomacp.cli;

import com.qvomacp.eng.omacp.EncodeOption;
import com.qvomacp.eng.omacp.MacResult;
import com.qvomacp.eng.omacp.ProvisioningMac;
import com.qvomacp.eng.omacp.PushHeader;
import com.qvomacp.eng.omacp.SecurityMethod;
import java.util.Arrays;
import java.util.List;
import picocli.CommandLine.Command;

/** Checks the MAC of messages. */
@Command(
        name = "verify",
        description = "Check the MAC of messages, by the security method that each of them states.",
        customSynopsis = "omacp verify [-h] [OPTION...] [FILE...]",
        exitCodeList = {
            "0:every MAC is right",
            "1:a MAC is not right or not there, or a message has no push header",
            "2:wrong usage, a PIN or IMSI that cannot be one, a message cannot be read,"
                    + " or the output cannot be written"
        })
final class Verify extends JsonJob {
    private static final int MAC_DIGITS = 40;

    private static final Option<Boolean> SHOW_MAC =
            Option.flag("--show-mac", "Tell the MAC that the message should have.");

    private String pin;
    private String imsi;

    /** In place of PIN and IMSI; null to make it of them. */
    private byte[] key;

    @Override
    List<Option<?>> options() {
        List<Option<?>> options = super.options();
        options.add(SHOW_MAC);
        options.addAll(Choices.SECRETS);
        return options;
    }

    @Override
    void begin() {
        Choices choices = new Choices(this);
        pin = choices.value(EncodeOption.PIN);
        imsi = choices.value(EncodeOption.IMSI);
        String digits = choices.value(EncodeOption.KEY);
        if (digits == null ? pin == null && imsi == null : pin != null || imsi != null) {
            throw new UsageException("--pin or --imsi is needed, or else --key alone");
        }
        if (digits != null) {
            if (!digits.matches("([0-9A-Fa-f]{2})+")) {
                throw new UsageException("--key is no even number of hexadecimal digits");
            }
            key = HexText.bytes(digits);
        }
        super.begin();
    }

    @Override
    void run(Held held) {
        if (!held.isPush) {
            String reason = "it has no push header, and so no MAC";
            say(held, SecurityMethod.NONE, MacResult.NO_MAC, reason, null);
            return;
        }
        PushHeader header = header(held);
        if (header == null) {
            return;
        }
        SecurityMethod method = header.securityMethod();
        byte[] body = Arrays.copyOfRange(held.bytes, header.length(), held.bytes.length);
        MacResult result =
                key == null
                        ? ProvisioningMac.verify(method, header.mac(), body, pin, imsi)
                        : ProvisioningMac.verify(method, header.mac(), body, key);
        String computed =
                key == null
                        ? ProvisioningMac.compute(method, body, pin, imsi)
                        : ProvisioningMac.compute(key, body);
        String reason =
                result == MacResult.RIGHT ? null : reasonFor(result, header, held.bytes);
        say(held, method, result, reason, has(SHOW_MAC) ? computed : null);
    }

    /** What cannot be tried is not the message's fault. */
    private int statusOf(MacResult result) {
        boolean isUnusable =
                result == MacResult.UNUSABLE_PIN && pin != null
                        || result == MacResult.UNUSABLE_IMSI && imsi != null;
        return isUnusable ? Console.FAILED : Console.REFUSED;
    }

    private String reasonFor(MacResult result, PushHeader header, byte[] message) {
        SecurityMethod method = header.securityMethod();
        switch (result) {
            case WRONG:
                return "the MAC is wrong (" + method + ")";
            case NO_METHOD:
                return method == SecurityMethod.NONE
                        ? "the message states no security method"
                        : "the message states a security method that is not known";
            case NO_MAC:
                int at = digitsAt(message, header.length());
                return "no MAC was found ("
                        + method
                        + (at < 0 ? ")" : "), but what may be one stands at message offset " + at);
            case UNUSABLE_PIN:
                return pin == null ? needs(method) : "the PIN cannot be one for " + method;
            default:
                return imsi == null ? needs(method) : "the IMSI is no number of 1 to 15 digits";
        }
    }

    private static String needs(SecurityMethod method) {
        switch (method) {
            case NETWPIN:
                return method + " needs --imsi";
            case USERNETWPIN:
                return method + " needs --imsi and --pin";
            default:
                return method + " needs --pin";
        }
    }

    /** Where in the body as many hexadecimal digits stand as a MAC has, with a NUL behind; or -1. */
    private static int digitsAt(byte[] message, int from) {
        int digits = 0;
        for (int at = from; at < message.length; ++at) {
            if (message[at] == 0 && digits == MAC_DIGITS) {
                return at - MAC_DIGITS;
            }
            digits = Character.digit(message[at], 16) < 0 ? 0 : digits + 1;
        }
        return -1;
    }

    /** Says what came of a message; the reason is null when the MAC is right. */
    private void say(
            Held held, SecurityMethod method, MacResult result, String reason, String computed) {
        boolean isRight = reason == null;
        console.raise(isRight ? Console.DONE : statusOf(result));
        if (isJson()) {
            beginObject(held.name);
            writer.member("verified", isRight).member("result", result.name());
            writer.member("method", method.name());
            if (!isRight) {
                writer.member("reason", reason);
            }
            if (computed != null) {
                writer.member("computedMac", computed);
            }
            endObject();
            return;
        }
        console.out.println(
                Visible.of(held.name)
                        + ": "
                        + (isRight
                                ? "verified (" + method + ")"
                                : outPalette().error("NOT VERIFIED") + ": " + reason)
                        + (computed == null ? "" : ", computed " + computed));
    }
}
