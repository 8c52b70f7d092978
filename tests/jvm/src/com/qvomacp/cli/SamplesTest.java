package com.qvomacp.cli;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.List;
import java.util.Map;
import java.util.stream.Stream;
import javax.xml.parsers.DocumentBuilderFactory;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;
import org.w3c.dom.Element;
import org.w3c.dom.Node;

/** What is printed of the sample messages is what the documents beside them say, in their order. */
class SamplesTest {
    private static final Path SAMPLES = Path.of("samples");

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
    void sayWhatTheirDocumentSays(Path push) throws Exception {
        Program program = Program.run(Files.readAllBytes(push), "--json");
        assertEquals(0, program.status(), program.errors());
        Map<?, ?> document = (Map<?, ?>) program.json().get("document");
        List<String> said = new ArrayList<>();
        describe("", (List<?>) document.get("children"), said);

        List<String> documented = new ArrayList<>();
        describe("", root(Path.of(push.toString().replaceAll("push$", "xml"))), documented);
        assertEquals(String.join("\n", documented), String.join("\n", said));
    }

    /** A line per item, such as {@code /NAPDEF/VALIDITY/NETWORK=01}. */
    private static void describe(String path, List<?> children, List<String> lines) {
        for (Object child : children) {
            Map<?, ?> item = (Map<?, ?>) child;
            if (item.containsKey("type")) {
                lines.add(path + "/" + item.get("type"));
                describe(path + "/" + item.get("type"), (List<?>) item.get("children"), lines);
            } else {
                lines.add(path + "/" + item.get("name") + "=" + item.get("value"));
            }
        }
    }

    private static void describe(String path, Element element, List<String> lines) {
        for (Node node = element.getFirstChild(); node != null; node = node.getNextSibling()) {
            if (!(node instanceof Element child)) {
                continue;
            }
            if (child.getTagName().equals("characteristic")) {
                String inner = path + "/" + child.getAttribute("type");
                lines.add(inner);
                describe(inner, child, lines);
            } else {
                String value = child.hasAttribute("value") ? child.getAttribute("value") : null;
                lines.add(path + "/" + child.getAttribute("name") + "=" + value);
            }
        }
    }

    private static Element root(Path document) throws Exception {
        DocumentBuilderFactory factory = DocumentBuilderFactory.newInstance();
        factory.setFeature("http://apache.org/xml/features/nonvalidating/load-external-dtd", false);
        return factory.newDocumentBuilder().parse(document.toFile()).getDocumentElement();
    }
}
