package com.qvomacp.cli;

import com.qvomacp.eng.omacp.MacResult;
import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningMac;
import com.qvomacp.eng.omacp.PushHeader;
import com.qvomacp.eng.omacp.SecurityMethod;
import java.util.Arrays;
import picocli.CommandLine.Command;
import picocli.CommandLine.Option;

/** Checks the MAC of messages. */
@Command(
        name = "verify",
        description = "Check the MAC of messages, by the security method that each of them states.",
        sortOptions = false,
        parameterListHeading = "%n",
        optionListHeading = "%nOptions:%n",
        exitCodeListHeading = "%nExit status:%n",
        exitCodeList = {
            "0:every MAC is right",
            "1:a MAC is not right or not there, or a message has no push header",
            "2:wrong usage, a PIN or IMSI that cannot be one, a message cannot be read,"
                    + " or the output cannot be written"
        })
final class Verify extends Job {
    private static final int MAC_DIGITS = 40;

    @Option(
            names = "--pin",
            paramLabel = "PIN",
            description = "What the user has been told (USERPIN, USERNETWPIN, USERPINMAC).")
    private String pin;

    @Option(
            names = "--imsi",
            paramLabel = "IMSI",
            description = "The subscriber's number (NETWPIN, USERNETWPIN).")
    private String imsi;

    @Override
    void begin() {
        if (pin == null && imsi == null) {
            throw new UsageException("--pin or --imsi is needed");
        }
    }

    @Override
    void run(Held held) {
        if (!held.isPush) {
            say(held, Console.REFUSED, "it has no push header, and so no MAC");
            return;
        }
        PushHeader header;
        try {
            header = PushHeader.parse(held.bytes);
        } catch (ProvisioningException none) {
            console.raise(Console.REFUSED);
            complain(Refusal.of(held, none, 0).write(startOf(held.name), errPalette()));
            return;
        }
        SecurityMethod method = header.securityMethod();
        byte[] body = Arrays.copyOfRange(held.bytes, header.length(), held.bytes.length);
        MacResult result = ProvisioningMac.verify(method, header.mac(), body, pin, imsi);
        if (result == MacResult.RIGHT) {
            console.out.println(Visible.of(held.name) + ": verified (" + method + ")");
        } else {
            say(held, statusOf(result), reasonFor(result, header, held.bytes));
        }
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

    private void say(Held held, int status, String reason) {
        console.raise(status);
        String name = Visible.of(held.name) + ": ";
        console.out.println(name + outPalette().error("NOT VERIFIED") + ": " + reason);
    }
}
