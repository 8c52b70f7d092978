package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;
import static org.junit.jupiter.api.Assumptions.assumeTrue;

import com.qvomacp.support.BodyGenerator;
import com.qvomacp.support.FieldMessage;
import com.qvomacp.support.TreeText;
import com.qvomacp.support.Wbxml2Xml;
import java.io.StringReader;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.Arrays;
import java.util.EnumSet;
import java.util.List;
import java.util.Set;
import java.util.stream.Stream;
import javax.xml.parsers.DocumentBuilder;
import javax.xml.parsers.DocumentBuilderFactory;
import org.junit.jupiter.api.Test;
import org.w3c.dom.Element;
import org.xml.sax.InputSource;

/** The whole tree, held against the samples' XML and against another reader. */
class TreePeerTest {
    private static final int GENERATED = 300;

    /** Messages from elsewhere that {@code wbxml2xml} reads otherwise, and why: none is known. */
    private static final Set<String> OTHERWISE = Set.of();

    /** The samples that it does not take: they have the bearer 3G-GSM, which it does not know. */
    private static final Set<String> NOT_TAKEN =
            Set.of("samples/everything.push", "samples/xcap.push");

    private static byte[] body(byte[] push) {
        return Arrays.copyOfRange(push, 3 + push[2], push.length);
    }

    private static List<Path> samples() throws Exception {
        try (Stream<Path> files = Files.list(Path.of("samples"))) {
            return files.filter(file -> file.toString().endsWith(".push")).sorted().toList();
        }
    }

    private static String tree(byte[] body) throws Exception {
        return TreeText.of(ProvisioningDocument.parse(body));
    }

    @Test
    void aSampleSaysWhatTheXmlBesideItSays() throws Exception {
        DocumentBuilder builder = DocumentBuilderFactory.newInstance().newDocumentBuilder();
        builder.setEntityResolver(
                (publicId, systemId) -> new InputSource(new StringReader("")));
        for (Path sample : samples()) {
            Path xml = Path.of(sample.toString().replace(".push", ".xml"));
            Element document = builder.parse(xml.toFile()).getDocumentElement();
            byte[] body = body(Files.readAllBytes(sample));
            assertEquals(TreeText.of(document), tree(body), sample.toString());
            assertEquals(List.of(), ProvisioningDocument.parse(body).deviations(), sample.toString());
        }
    }

    @Test
    void wbxml2xmlReadsTheSamplesAsTheSame() throws Exception {
        assumeTrue(Wbxml2Xml.isInstalled(), "libwbxml2-utils is not installed");
        for (Path sample : samples()) {
            byte[] body = body(Files.readAllBytes(sample));
            Element peer = Wbxml2Xml.read(body);
            assertEquals(NOT_TAKEN.contains(sample.toString()), peer == null, sample.toString());
            if (peer != null) {
                assertEquals(TreeText.of(peer), tree(body), sample.toString());
            }
        }
    }

    @Test
    void wbxml2xmlReadsMessagesFromElsewhereAsTheSame() throws Exception {
        String file = System.getenv(FieldMessage.VARIABLE);
        assumeTrue(
                file != null && !file.isEmpty(), FieldMessage.VARIABLE + " names no file: skipped");
        assumeTrue(Wbxml2Xml.isInstalled(), "libwbxml2-utils is not installed");
        int compared = 0;
        for (FieldMessage message : FieldMessage.all()) {
            if (message.bytes == null) {
                continue;
            }
            byte[] body = message.isPush ? body(message.bytes) : message.bytes;
            String tree = tree(body);
            Element peer = Wbxml2Xml.read(body);
            if (peer == null) {
                System.out.println("field message " + message.id + ": not taken by wbxml2xml");
            } else if (!OTHERWISE.contains(message.id)) {
                assertEquals(TreeText.of(peer), tree, message.id);
                ++compared;
            }
        }
        System.out.println("field messages: " + compared + " as wbxml2xml reads them");
        assertTrue(compared > 0);
    }

    /** It takes no document with some entities, and none whose pages it does not switch itself. */
    @Test
    void wbxml2xmlReadsGeneratedDocumentsAsTheSame() throws Exception {
        assumeTrue(Wbxml2Xml.isInstalled(), "libwbxml2-utils is not installed");
        int compared = 0;
        for (int seed = 0; seed < GENERATED; ++seed) {
            Set<BodyGenerator.Part> parts = EnumSet.allOf(BodyGenerator.Part.class);
            if (seed % 2 == 0) {
                parts.remove(BodyGenerator.Part.ENTITY);
                parts.remove(BodyGenerator.Part.OTHER_PAGE);
            }
            byte[] body = new BodyGenerator(seed, parts).body();
            String tree = tree(body);
            Element peer = Wbxml2Xml.read(body);
            if (peer != null) {
                // It leaves instructions out.
                String told = tree.replaceAll("(?m)^ *\\[instruction\\].*\n", "");
                assertEquals(TreeText.of(peer), told, "seed " + seed);
                ++compared;
            }
        }
        assertTrue(compared >= GENERATED / 2, compared + " compared");
    }
}
