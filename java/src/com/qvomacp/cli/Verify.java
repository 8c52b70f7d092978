package com.qvomacp.cli;

import com.qvomacp.eng.omacp.EncodeOption;
import com.qvomacp.eng.omacp.MacResult;
import com.qvomacp.eng.omacp.ProvisioningMac;
import com.qvomacp.eng.omacp.PushHeader;
import com.qvomacp.eng.omacp.SecurityMethod;
import java.nio.charset.StandardCharsets;
import java.util.Arrays;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
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
    private static final Pattern DIGITS_OF_MAC =
            Pattern.compile("(?<![0-9A-Fa-f])[0-9A-Fa-f]{40}\0");

    private static final Option<Boolean> SHOW_MAC =
            Option.flag("--show-mac", "Tell the MAC that the message should have.");

    private String pin;
    private String imsi;

    /** In place of PIN and IMSI; null to make it of them. */
    private byte[] key;

    Verify() {
        options.add(SHOW_MAC);
        options.addAll(Choices.SECRETS);
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
        if (digits != null && !digits.matches("([0-9A-Fa-f]{2})+")) {
            throw new UsageException("--key is no even number of hexadecimal digits");
        }
        key = digits == null ? null : HexText.bytes(digits);
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
        boolean isByKey = key != null;
        String mac = header.mac();
        MacResult result = isByKey ? ProvisioningMac.verify(method, mac, body, key)
                : ProvisioningMac.verify(method, mac, body, pin, imsi);
        String computed = !has(SHOW_MAC) ? null
                : isByKey ? ProvisioningMac.compute(key, body)
                : ProvisioningMac.compute(method, body, pin, imsi);
        String reason = result == MacResult.RIGHT ? null : reasonFor(result, header, held.bytes);
        say(held, method, result, reason, computed);
    }

    /** What cannot be tried is not the message's fault. */
    private int statusOf(MacResult result) {
        boolean isUnusable = result == MacResult.UNUSABLE_PIN && pin != null
                || result == MacResult.UNUSABLE_IMSI && imsi != null;
        boolean isRight = result == MacResult.RIGHT;
        return isRight ? Console.DONE : isUnusable ? Console.FAILED : Console.REFUSED;
    }

    private String reasonFor(MacResult result, PushHeader header, byte[] message) {
        SecurityMethod method = header.securityMethod();
        String needs = method + " needs ";
        switch (result) {
            case WRONG:
                return "the MAC is wrong (" + method + ")";
            case NO_METHOD:
                return method == SecurityMethod.NONE ? "the message states no security method"
                        : "the message states a security method that is not known";
            case NO_MAC:
                int at = digitsAt(message, header.length());
                String where = at < 0 ? "" : ", but what may be one stands at message offset " + at;
                return "no MAC was found (" + method + ")" + where;
            case UNUSABLE_PIN:
                boolean needsBoth = method == SecurityMethod.USERNETWPIN;
                return pin == null
                        ? needs + (needsBoth ? "--imsi and --pin" : "--pin")
                        : "the PIN cannot be one for " + method;
            default:
                return imsi == null
                        ? needs + (method == SecurityMethod.NETWPIN ? "--imsi" : "--imsi and --pin")
                        : "the IMSI is no number of 1 to 15 digits";
        }
    }

    /** Where in the body as many digits stand as a MAC has, with a NUL behind; or -1. */
    private static int digitsAt(byte[] message, int from) {
        String text = new String(message, StandardCharsets.ISO_8859_1);
        Matcher digits = DIGITS_OF_MAC.matcher(text).region(from, text.length());
        return digits.find() ? digits.start() : -1;
    }

    /** Says what came of a message; the reason is null when the MAC is right. */
    private void say(
            Held held, SecurityMethod method, MacResult result, String reason, String computed) {
        console.raise(statusOf(result));
        if (isJson()) {
            beginObject(held.name);
            writer.member("verified", reason == null).member("result", result.name());
            writer.member("method", method.name());
            writer.optional("reason", reason).optional("computedMac", computed);
            endObject();
            return;
        }
        String not = palette.error("NOT VERIFIED") + ": " + reason;
        String found = reason == null ? "verified (" + method + ")" : not;
        String told = computed == null ? "" : ", computed " + computed;
        console.out.println(Visible.of(held.name) + ": " + found + told);
    }
}
