package com.qvomacp.cli;

import com.qvomacp.eng.omacp.AccessPoint;
import com.qvomacp.eng.omacp.Application;
import com.qvomacp.eng.omacp.PhysicalProxy;
import com.qvomacp.eng.omacp.ProvisioningMessage;
import com.qvomacp.eng.omacp.Proxy;
import java.util.HashMap;
import java.util.List;
import java.util.Map;
import picocli.CommandLine.Command;

/** Draws which application goes through which proxies to which access point. */
@Command(
        name = "graph",
        description = {
            "Draw which application goes through which proxy and machine to which access",
            "point, in DOT for Graphviz. A FILE may hold a document in XML, too."
        },
        customSynopsis = "omacp graph [-h] [OPTION...] [FILE...]",
        footerHeading = "%n",
        footer = {"Make a picture by: omacp graph FILE | dot -Tsvg >picture.svg"},
        exitCodeList = {
            "0:every message was drawn",
            "2:wrong usage, a message or document cannot be read, the output cannot be written"
        })
final class Graph extends MessageJob {
    private static final String INTERNET = "INTERNET";
    private static final String MISSING = " [style=dashed, color=red, fontcolor=red]";

    /** How many boxes and other nodes the message has. */
    private int nodes;

    /** Where references lead, by a parameter's name and value: a node, and the look of the edge. */
    private final Map<String, Map<String, String>> targets = new HashMap<>();

    /** JSON is no form of a graph. */
    Graph() {
        options.removeIf(option -> option.names[0].startsWith("--json"));
    }

    @Override
    void run(Reading reading) {
        nodes = 0;
        // Of several that have one identifier, the first is what is referred to.
        targets.put("TO-PROXY", new HashMap<>());
        targets.put("TO-NAPID", new HashMap<>());
        console.out.println("digraph \"" + escaped(reading.held.name) + "\" {");
        line("rankdir=LR");
        line("node [shape=box, fontname=\"sans-serif\"]");
        ProvisioningMessage message = reading.message;
        for (AccessPoint point : message.accessPoints()) {
            String node = node("NAPDEF", point.napId(), point.name(), point.address());
            targets.get("TO-NAPID").putIfAbsent(point.napId(), node);
        }
        for (Proxy proxy : message.proxies()) {
            String node = node("PXLOGICAL", proxy.proxyId(), proxy.name());
            targets.get("TO-PROXY").putIfAbsent(proxy.proxyId(), node);
            for (PhysicalProxy machine : proxy.physicalProxies()) {
                String inner = node("PXPHYSICAL", machine.physicalProxyId(), machine.address());
                line(node + " -> " + inner);
                edges(inner, "TO-NAPID", machine.toNapIds());
            }
        }
        for (Application application : message.applications()) {
            String node = node("APPLICATION", application.appId(), application.name());
            edges(node, "TO-PROXY", application.toProxies());
            edges(node, "TO-NAPID", application.toNapIds());
        }
        console.out.println("}");
    }

    private void edges(String from, String reference, List<String> identifiers) {
        Map<String, String> known = targets.get(reference);
        for (String identifier : identifiers) {
            if (!known.containsKey(identifier)) {
                boolean isAny = reference.equals("TO-NAPID") && identifier.equals(INTERNET);
                String node = isAny ? node(INTERNET, "any access point")
                        : node(reference, identifier, "not in this document");
                line(node + (isAny ? " [shape=ellipse]" : MISSING));
                known.put(identifier, isAny ? node : node + MISSING);
            }
            line(from + " -> " + known.get(identifier));
        }
    }

    /** Writes a node, its label a line for each text; null is left out. */
    private String node(String... texts) {
        StringBuilder label = new StringBuilder();
        for (String text : texts) {
            if (text != null) {
                label.append(label.length() == 0 ? "" : "\\n").append(escaped(text));
            }
        }
        String node = "n" + ++nodes;
        line(node + " [label=\"" + label + "\"]");
        return node;
    }

    private void line(String statement) {
        console.out.println("  " + statement + ";");
    }

    /** A text for between quotes, where Graphviz knows escapes of its own and those of HTML. */
    private static String escaped(String text) {
        String escaped = Visible.of(text).replace("\\", "\\\\");
        return escaped.replace("\"", "\\\"").replace("&", "&amp;");
    }
}
