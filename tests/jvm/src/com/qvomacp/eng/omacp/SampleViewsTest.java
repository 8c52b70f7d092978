package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNotNull;

import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.HashMap;
import java.util.List;
import java.util.Map;
import java.util.stream.Stream;
import javax.xml.parsers.DocumentBuilderFactory;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;
import org.w3c.dom.Element;
import org.w3c.dom.Node;

/** The views of every sample tell what the document beside it says. */
class SampleViewsTest {
    static List<Path> documents() throws Exception {
        try (Stream<Path> files = Files.list(Path.of("samples"))) {
            return files.filter(file -> file.toString().endsWith(".xml")).sorted().toList();
        }
    }

    private final Map<String, KindsTest.Kind> kinds = new HashMap<>();

    @ParameterizedTest
    @MethodSource("documents")
    void tellWhatTheirDocumentSays(Path document) throws Exception {
        KindsTest.kinds().forEach(kind -> kinds.put(kind.types(), kind));
        Path push = Path.of(document.toString().replaceAll("xml$", "push"));
        ProvisioningMessage message = ProvisioningMessage.parsePush(Files.readAllBytes(push));
        DocumentBuilderFactory factory = DocumentBuilderFactory.newInstance();
        factory.setFeature("http://apache.org/xml/features/nonvalidating/load-external-dtd", false);
        Element root = factory.newDocumentBuilder().parse(document.toFile()).getDocumentElement();
        compare(root, "", message);
    }

    private void compare(Element element, String types, Object view) throws Exception {
        Map<String, Integer> seen = new HashMap<>();
        for (Element child : children(element, "characteristic")) {
            String type = types + child.getAttribute("type");
            KindsTest.Kind kind = kinds.get(type);
            assertNotNull(kind, type);
            String accessor = kind.way().substring(kind.way().lastIndexOf('/') + 1);
            List<?> views = (List<?>) view.getClass().getMethod(accessor).invoke(view);
            Object inner = views.get(seen.merge(type, 1, Integer::sum) - 1);
            compareParms(child, kind, inner);
            compare(child, type + "/", inner);
        }
    }

    private static void compareParms(Element element, KindsTest.Kind kind, Object view)
            throws Exception {
        Map<String, List<String>> documented = new HashMap<>();
        for (Element parm : children(element, "parm")) {
            String value = parm.hasAttribute("value") ? parm.getAttribute("value") : null;
            documented
                    .computeIfAbsent(parm.getAttribute("name"), name -> new ArrayList<>())
                    .add(value);
        }
        for (String name : kind.accessors().keySet()) {
            Object told = view.getClass().getMethod(kind.accessors().get(name)).invoke(view);
            List<String> values = documented.getOrDefault(name, List.of());
            if (told instanceof List) {
                assertEquals(values, told, name);
            } else if (told instanceof AddressType) {
                assertEquals(AddressType.valueOf(values.get(0)), told);
            } else if (told instanceof Boolean) {
                assertEquals(!values.isEmpty(), told, name);
            } else {
                assertEquals(values.isEmpty() ? null : values.get(0), told, name);
            }
            documented.remove(name);
        }
        for (String name : documented.keySet()) {
            assertEquals(documented.get(name).get(0), ((TypedCharacteristic) view).value(name));
        }
    }

    private static List<Element> children(Element element, String tag) {
        List<Element> children = new ArrayList<>();
        for (Node node = element.getFirstChild(); node != null; node = node.getNextSibling()) {
            if (node instanceof Element child && child.getTagName().equals(tag)) {
                children.add(child);
            }
        }
        return children;
    }
}
