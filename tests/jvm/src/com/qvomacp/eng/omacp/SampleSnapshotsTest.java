package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotNull;

import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.List;
import java.util.Map;
import java.util.function.Function;
import java.util.stream.Stream;
import javax.xml.parsers.DocumentBuilderFactory;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;
import org.w3c.dom.Element;
import org.w3c.dom.Node;

/** The snapshot of every sample tells what the document beside it says. */
class SampleSnapshotsTest {
    /** Where the characteristics of a TYPE are listed in the snapshot around them. */
    private static final Map<String, Function<Object, List<?>>> LISTS =
            Map.ofEntries(
                    Map.entry("PXLOGICAL", o -> ((ProvisioningMessage) o).getProxies()),
                    Map.entry("NAPDEF", o -> ((ProvisioningMessage) o).getAccessPoints()),
                    Map.entry("BOOTSTRAP", o -> ((ProvisioningMessage) o).getBootstraps()),
                    Map.entry("CLIENTIDENTITY", List::of),
                    Map.entry(
                            "VENDORCONFIG",
                            o -> ((ProvisioningMessage) o).getVendorConfigurations()),
                    Map.entry("APPLICATION", o -> ((ProvisioningMessage) o).getApplications()),
                    Map.entry("ACCESS", o -> ((ProvisioningMessage) o).getAccessRules()),
                    Map.entry("WI-FI", o -> ((ProvisioningMessage) o).getWifis()),
                    Map.entry("Vodafone VoWiFi", o -> ((ProvisioningMessage) o).getVoWifis()),
                    Map.entry("PXPHYSICAL", o -> ((Proxy) o).getPhysicalProxies()),
                    Map.entry("PXAUTHINFO", o -> ((Proxy) o).getAuthentications()),
                    Map.entry("NAPAUTHINFO", o -> ((AccessPoint) o).getAuthentications()),
                    Map.entry("VALIDITY", o -> ((AccessPoint) o).getValidities()),
                    Map.entry("APPADDR", o -> ((Application) o).getAddresses()),
                    Map.entry("APPAUTH", o -> ((Application) o).getAuthentications()),
                    Map.entry("RESOURCE", o -> ((Application) o).getResources()),
                    Map.entry("ROAMING", o -> List.of(((Application) o).getRoaming())),
                    Map.entry("PORT", SampleSnapshotsTest::ports));

    /** Which parameters of which snapshot are lists. */
    private static final Map<String, Function<Object, List<String>>> VALUES =
            Map.ofEntries(
                    Map.entry("Proxy DOMAIN", o -> ((Proxy) o).getDomains()),
                    Map.entry("PhysicalProxy DOMAIN", o -> ((PhysicalProxy) o).getDomains()),
                    Map.entry("PhysicalProxy TO-NAPID", o -> ((PhysicalProxy) o).getToNapIds()),
                    Map.entry("ProxyPort SERVICE", o -> ((ProxyPort) o).getServicesByPlace()),
                    Map.entry("ApplicationPort SERVICE", o -> ((ApplicationPort) o).getServices()),
                    Map.entry("AccessPoint BEARER", o -> ((AccessPoint) o).getBearers()),
                    Map.entry("AccessPoint DNS-ADDR", o -> ((AccessPoint) o).getDnsAddresses()),
                    Map.entry(
                            "AccessPointAuthentication AUTH-ENTITY",
                            o -> ((AccessPointAuthentication) o).getEntities()),
                    Map.entry("Bootstrap PROXY-ID", o -> ((Bootstrap) o).getProxyIds()),
                    Map.entry("Bootstrap NETWORK", o -> ((Bootstrap) o).getNetworks()),
                    Map.entry("Application TO-PROXY", o -> ((Application) o).getToProxies()),
                    Map.entry("Application TO-NAPID", o -> ((Application) o).getToNapIds()),
                    Map.entry("Application ADDR", o -> ((Application) o).getSimpleAddresses()),
                    Map.entry("AccessRule RULE", o -> ((AccessRule) o).getRules()),
                    Map.entry("AccessRule APPID", o -> ((AccessRule) o).getAppIds()),
                    Map.entry("AccessRule PORTNBR", o -> ((AccessRule) o).getPortNumbers()),
                    Map.entry("AccessRule DOMAIN", o -> ((AccessRule) o).getDomains()),
                    Map.entry("AccessRule TO-NAPID", o -> ((AccessRule) o).getToNapIds()),
                    Map.entry("AccessRule TO-PROXY", o -> ((AccessRule) o).getToProxies()));

    private static List<?> ports(Object owner) {
        if (owner instanceof Proxy proxy) {
            return proxy.getPorts();
        }
        return owner instanceof PhysicalProxy physical
                ? physical.getPorts()
                : ((ApplicationAddress) owner).getPorts();
    }

    static List<Path> documents() throws Exception {
        try (Stream<Path> files = Files.list(Path.of("samples"))) {
            return files.filter(file -> file.toString().endsWith(".xml")).sorted().toList();
        }
    }

    @ParameterizedTest
    @MethodSource("documents")
    void tellWhatTheirDocumentSays(Path document) throws Exception {
        Path push = Path.of(document.toString().replaceAll("xml$", "push"));
        ProvisioningMessage message = ProvisioningMessage.parse(Files.readAllBytes(push));
        DocumentBuilderFactory factory = DocumentBuilderFactory.newInstance();
        factory.setFeature("http://apache.org/xml/features/nonvalidating/load-external-dtd", false);
        Element root = factory.newDocumentBuilder().parse(document.toFile()).getDocumentElement();
        compareCharacteristics(root, message);
    }

    private static void compareCharacteristics(Element element, Object snapshot) {
        for (String type : LISTS.keySet()) {
            List<Element> documented = children(element, "characteristic", "type", type);
            if (documented.isEmpty()) {
                continue;
            }
            List<?> told = LISTS.get(type).apply(snapshot);
            assertEquals(documented.size(), told.size(), type);
            for (int i = 0; i < told.size(); ++i) {
                compareParms(documented.get(i), (Characteristic) told.get(i));
                compareCharacteristics(documented.get(i), told.get(i));
            }
        }
        for (Element child : children(element, "characteristic", null, null)) {
            assertNotNull(LISTS.get(child.getAttribute("type")), child.getAttribute("type"));
        }
    }

    private static void compareParms(Element element, Characteristic told) {
        for (Element parm : children(element, "parm", null, null)) {
            String name = parm.getAttribute("name");
            Function<Object, List<String>> values =
                    VALUES.get(told.getClass().getSimpleName() + " " + name);
            if (values != null) {
                List<String> documented = new ArrayList<>();
                for (Element one : children(element, "parm", "name", name)) {
                    documented.add(one.getAttribute("value"));
                }
                assertEquals(documented, values.apply(told), name);
            } else {
                compare(parm, name, told);
            }
        }
    }

    private static void compare(Element parm, String name, Characteristic told) {
        String value = parm.hasAttribute("value") ? parm.getAttribute("value") : null;
        if (told instanceof AccessPoint accessPoint && name.equals("NAP-ADDRTYPE")) {
            assertEquals(true, accessPoint.isAddressTypeHidden());
            assertEquals(null, accessPoint.getAddressType());
        } else if (told instanceof AccessPoint accessPoint && name.equals("INIT")) {
            assertEquals(value == null, accessPoint.isInit());
        } else if (told instanceof PhysicalProxy proxy && name.equals("PXADDRTYPE")) {
            assertEquals(ProxyAddressType.valueOf(value), proxy.getAddressType());
        } else if (told instanceof Resource resource && name.equals("STARTPAGE")) {
            assertEquals(value == null ? "startpage" : value, resource.getStartPage());
        } else if (told instanceof VendorConfiguration vendor && !name.equals("NAME")) {
            assertEquals(name, vendor.getParameterName());
            assertEquals(value, vendor.getParameterValue());
        } else {
            assertEquals(value, told.value(name), name);
            assertFalse(value != null && value.isEmpty(), name);
        }
    }

    /** The child elements with a name and, unless null, with this value of an attribute. */
    private static List<Element> children(
            Element element, String tag, String attribute, String value) {
        List<Element> children = new ArrayList<>();
        for (Node node = element.getFirstChild(); node != null; node = node.getNextSibling()) {
            if (node instanceof Element child
                    && child.getTagName().equals(tag)
                    && (attribute == null || child.getAttribute(attribute).equals(value))) {
                children.add(child);
            }
        }
        return children;
    }
}
