package com.qvomacp.support;

import com.qvomacp.eng.omacp.Characteristic;
import com.qvomacp.eng.omacp.Item;
import com.qvomacp.eng.omacp.Other;
import com.qvomacp.eng.omacp.Parameter;
import com.qvomacp.eng.omacp.ProvisioningDocument;
import java.util.List;
import java.util.Locale;
import org.w3c.dom.Element;
import org.w3c.dom.NamedNodeMap;
import org.w3c.dom.Node;

/** Documents, read from a body or from XML, as lines that can be compared. */
public final class TreeText {
    private final StringBuilder lines = new StringBuilder();

    private TreeText() {}

    /** A document that was read from a body. */
    public static String of(ProvisioningDocument document) {
        TreeText text = new TreeText();
        text.line(0, "document", document.version());
        text.items(1, document.children());
        return text.lines.toString();
    }

    /** A document that was read from XML; attributes in any case. */
    public static String of(Element document) {
        TreeText text = new TreeText();
        text.line(0, "document", attribute(document, "version"));
        text.nodes(1, document);
        return text.lines.toString();
    }

    private void items(int depth, List<Item> items) {
        for (Item item : items) {
            if (item instanceof Characteristic characteristic) {
                line(depth, "characteristic", characteristic.type());
            } else if (item instanceof Parameter parameter) {
                line(depth, "parm", parameter.name(), parameter.value());
            } else {
                Other other = (Other) item;
                String name = other.name();
                if (other.kind() == Other.Kind.ATTRIBUTE) {
                    name = name.toLowerCase(Locale.ROOT);
                }
                line(depth, other.kind().name().toLowerCase(Locale.ROOT), name, other.text());
            }
            items(depth + 1, item.children());
        }
    }

    private void nodes(int depth, Element element) {
        for (Node node = element.getFirstChild(); node != null; node = node.getNextSibling()) {
            if (node.getNodeType() == Node.TEXT_NODE && !node.getTextContent().isBlank()) {
                line(depth, "text", null, node.getTextContent());
            } else if (node instanceof Element inner) {
                String name = inner.getTagName();
                if (name.equals("characteristic")) {
                    line(depth, name, attribute(inner, "type"));
                } else if (name.equals("parm")) {
                    line(depth, name, attribute(inner, "name"), attribute(inner, "value"));
                } else {
                    line(depth, "element", name, null);
                    NamedNodeMap attributes = inner.getAttributes();
                    for (int i = 0; i < attributes.getLength(); ++i) {
                        Node attribute = attributes.item(i);
                        line(depth + 1, "attribute", attribute.getNodeName(), attribute.getNodeValue());
                    }
                }
                nodes(depth + 1, inner);
            }
        }
    }

    private static String attribute(Element element, String name) {
        return element.hasAttribute(name) ? element.getAttribute(name) : null;
    }

    private void line(int depth, Object... parts) {
        lines.append("  ".repeat(depth));
        for (Object part : parts) {
            lines.append(part == null ? "-" : "[" + part + "]").append(' ');
        }
        lines.append('\n');
    }
}
