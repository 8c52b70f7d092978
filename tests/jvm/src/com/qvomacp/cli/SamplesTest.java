package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Natives;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.HashMap;
import java.util.List;
import java.util.Map;
import java.util.stream.Stream;
import javax.xml.parsers.DocumentBuilderFactory;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;
import org.w3c.dom.Element;
import org.w3c.dom.Node;

/**
 * The sample messages set what the documents beside them say, but for what the library answers
 * under another name or not at all.
 */
class SamplesTest extends Natives {
    private static final Path SAMPLES = Path.of("samples");

    /** What the natives name a proxy port's SERVICE, by its place in the list. */
    private static final List<String> SERVICES = List.of("CO-WSP", "CL-SEC-WSP", "CO-SEC-WSP");

    static List<Path> pushes() throws Exception {
        try (Stream<Path> files = Files.list(SAMPLES)) {
            return files.filter(file -> file.toString().endsWith(".push")).sorted().toList();
        }
    }

    @Test
    void thereAreSamples() throws Exception {
        assertTrue(pushes().size() >= 8);
    }

    @ParameterizedTest
    @MethodSource("pushes")
    void setWhatTheirDocumentSays(Path push) throws Exception {
        Message message = new MessageReader().read(new Source("", Files.readAllBytes(push)));
        List<String> answered = new ArrayList<>();
        describe("", message.characteristics, answered);
        assertFalse(answered.isEmpty());

        List<String> documented = new ArrayList<>();
        Path document = Path.of(push.toString().replaceAll("push$", "xml"));
        describe("", root(document), documented);
        assertEquals(sorted(documented), sorted(answered));
    }

    private static String sorted(List<String> lines) {
        return String.join("\n", lines.stream().sorted().toList());
    }

    /** A line per parameter, such as {@code /NAPDEF 2/VALIDITY 1/NETWORK=01}. */
    private static void describe(
            String path, List<Characteristic> characteristics, List<String> lines) {
        Map<String, Integer> counts = new HashMap<>();
        for (Characteristic characteristic : characteristics) {
            String type = characteristic.type;
            String inner = path + "/" + type + " " + counts.merge(type, 1, Integer::sum);
            for (Characteristic.Parm parm : characteristic.parms) {
                lines.add(inner + "/" + parm.name + "=" + parm.value);
            }
            describe(inner, characteristic.characteristics, lines);
        }
    }

    private static void describe(String path, Element element, List<String> lines) {
        Map<String, Integer> counts = new HashMap<>();
        for (Element child : children(element)) {
            if (child.getTagName().equals("characteristic")) {
                String type = child.getAttribute("type");
                int count = counts.merge(type, 1, Integer::sum);
                describe(path + "/" + type + " " + count, child, lines);
            } else {
                String name = child.getAttribute("name");
                int place = counts.merge("parm " + name, 1, Integer::sum);
                String value = child.hasAttribute("value") ? child.getAttribute("value") : null;
                if (name.equals("NAP-ADDRTYPE")) {
                    lines.add(path + "/NAP-ADDRTYPE=null");
                } else {
                    String answer = answer(path, name, value, place);
                    if (answer != null) {
                        lines.add(path + "/" + name + "=" + answer);
                    }
                }
            }
        }
    }

    /** What the library answers for a parm; null when it answers nothing. */
    private static String answer(String path, String name, String value, int place) {
        return switch (name) {
            case "INIT" -> value == null ? "empty" : null;
            case "STARTPAGE" -> value == null && path.contains("/RESOURCE") ? "startpage" : value;
            case "PXADDRTYPE" -> value.equals("IPV6") ? "NET_ADDR_IPV6" : "NET_ADDR_IPV4";
            case "SERVICE" -> path.startsWith("/PXLOGICAL") ? SERVICES.get(place - 1) : value;
            default -> value;
        };
    }

    private static Element root(Path document) throws Exception {
        DocumentBuilderFactory factory = DocumentBuilderFactory.newInstance();
        factory.setFeature("http://apache.org/xml/features/nonvalidating/load-external-dtd", false);
        return factory.newDocumentBuilder().parse(document.toFile()).getDocumentElement();
    }

    private static List<Element> children(Element element) {
        List<Element> children = new ArrayList<>();
        for (Node node = element.getFirstChild(); node != null; node = node.getNextSibling()) {
            if (node instanceof Element child) {
                children.add(child);
            }
        }
        return children;
    }
}
