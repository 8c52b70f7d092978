package com.qvomacp.cli;

import com.qvomacp.eng.omacp.ProvisioningException;
import com.qvomacp.eng.omacp.ProvisioningMessage;
import com.qvomacp.eng.omacp.PushHeader;
import com.qvomacp.eng.omacp.SecurityMethod;
import picocli.CommandLine.Command;
import picocli.CommandLine.Option;
import picocli.CommandLine.ParameterException;

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
            "1:a MAC is not right, or the push header is refused",
            "2:wrong usage, a message cannot be read, the output cannot be written,"
                    + " or the library cannot be loaded"
        })
final class Verify extends Job {
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

    Verify(Main main) {
        super(main);
    }

    @Override
    void begin() {
        if (pin == null && imsi == null) {
            throw new ParameterException(spec.commandLine(), "--pin or --imsi is needed");
        }
    }

    @Override
    void run(Source source) throws RefusedException {
        if (!source.isPush) {
            say(source, "it has no push header, and so no MAC");
            return;
        }
        PushHeader header;
        try {
            header = ProvisioningMessage.parseHeader(source.bytes);
        } catch (ProvisioningException refused) {
            throw new RefusedException(false);
        }
        say(source, header.verifyMac(pin, imsi) ? null : reasonFor(header), header);
    }

    private String reasonFor(PushHeader header) {
        SecurityMethod method = header.getSecurityMethod();
        switch (method) {
            case NONE:
                return "the message states no security method";
            case UNKNOWN:
                return "the message states a security method that is not known";
            case NETWPIN:
                return imsi == null ? "NETWPIN needs --imsi" : "the MAC is wrong (NETWPIN)";
            case USERNETWPIN:
                return imsi == null || pin == null
                        ? "USERNETWPIN needs --imsi and --pin"
                        : "the MAC is wrong (USERNETWPIN)";
            default:
                return pin == null
                        ? method + " needs --pin"
                        : "the MAC is wrong (" + method + ")";
        }
    }

    private void say(Source source, String reason) {
        say(source, reason, null);
    }

    /** Says what became of a file; a null reason that all is well. */
    private void say(Source source, String reason, PushHeader header) {
        String name = Visible.of(source.name) + ": ";
        if (reason == null) {
            out().println(name + "verified (" + header.getSecurityMethod() + ")");
        } else {
            raise(Main.REFUSED);
            out().println(name + outPalette().error("NOT VERIFIED") + ": " + reason);
        }
    }

    @Override
    void refused(Explanation explanation) {
        complain(explanation);
    }
}
