import com.qvomacp.eng.omacp.*;
import java.util.List;

/** Reads a push to its tree, with views of all kinds and the verdict. */
final class Views {
    private static final ReadOptions OPTIONS = ReadOptions.DEFAULT.withInputLimit(1 << 24);

    private Views() {}

    /** Answers how many views there are. */
    static int all(byte[] push) throws ProvisioningException {
        ProvisioningMessage message = ProvisioningMessage.parsePush(push, OPTIONS);
        if (!message.verdict().isAccepted()) {
            throw new IllegalStateException("the library refuses the message");
        }
        int count =
                message.bootstraps().size()
                        + message.clientIdentities().size()
                        + message.vendorConfigurations().size()
                        + message.accessRules().size()
                        + message.wifis().size()
                        + message.voWifis().size();
        for (Proxy proxy : message.proxies()) {
            count += 1 + proxy.authentications().size() + ports(proxy.ports());
            for (PhysicalProxy physical : proxy.physicalProxies()) {
                count += 1 + ports(physical.ports());
            }
        }
        for (AccessPoint point : message.accessPoints()) {
            count += 1 + point.authentications().size() + point.validities().size();
        }
        for (Application application : message.applications()) {
            count +=
                    1
                            + application.authentications().size()
                            + application.resources().size()
                            + application.roamings().size();
            for (ApplicationAddress address : application.addresses()) {
                count += 1 + ports(address.ports());
            }
        }
        return count;
    }

    private static int ports(List<Port> ports) {
        int services = 0;
        for (Port port : ports) {
            services += 1 + port.services().size();
        }
        return services;
    }
}
