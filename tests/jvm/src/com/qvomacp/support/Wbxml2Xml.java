package com.qvomacp.support;

import java.io.ByteArrayInputStream;
import java.nio.file.Files;
import java.nio.file.Path;
import javax.xml.parsers.DocumentBuilder;
import javax.xml.parsers.DocumentBuilderFactory;
import org.w3c.dom.Element;
import org.xml.sax.InputSource;
import org.xml.sax.SAXException;

/** Reads a body with {@code wbxml2xml} of Debian's package libwbxml2-utils. */
public final class Wbxml2Xml {
    private Wbxml2Xml() {}

    /** Whether the program is there. */
    public static boolean isInstalled() {
        return Files.isExecutable(Path.of("/usr/bin/wbxml2xml"));
    }

    /** The document element; null for a body that the program does not take. */
    public static Element read(byte[] body) throws Exception {
        Path in = Files.write(Files.createTempFile("body", ".wbxml"), body);
        Path out = Files.createTempFile("body", ".xml");
        try {
            Process process =
                    new ProcessBuilder(
                                    "wbxml2xml", "-m", "2", "-k", "-o", out.toString(), in.toString())
                            .redirectErrorStream(true)
                            .redirectOutput(ProcessBuilder.Redirect.DISCARD)
                            .start();
            return process.waitFor() == 0 ? parse(Files.readAllBytes(out)) : null;
        } finally {
            Files.delete(in);
            Files.delete(out);
        }
    }

    private static Element parse(byte[] xml) throws Exception {
        DocumentBuilder builder = DocumentBuilderFactory.newInstance().newDocumentBuilder();
        builder.setErrorHandler(null);
        builder.setEntityResolver((publicId, systemId) -> new InputSource(new ByteArrayInputStream(new byte[0])));
        try {
            return builder.parse(new ByteArrayInputStream(xml)).getDocumentElement();
        } catch (SAXException e) {
            return null;
        }
    }
}
