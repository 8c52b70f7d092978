package com.qvomacp.cli;

import com.qvomacp.eng.omacp.Characteristic;
import com.qvomacp.eng.omacp.Deviation;
import com.qvomacp.eng.omacp.HeaderField;
import com.qvomacp.eng.omacp.Item;
import com.qvomacp.eng.omacp.Other;
import com.qvomacp.eng.omacp.Parameter;
import com.qvomacp.eng.omacp.ProvisioningDocument;
import com.qvomacp.eng.omacp.PushHeader;
import com.qvomacp.eng.omacp.Verdict;
import java.util.List;
import java.util.Locale;

/**
 * Writes a message as the members of a JSON object. {@code header} is null for a body alone, {@code
 * document} is null when the message cannot be read, which {@code error} then explains. {@code
 * children} stand in the order of the message; each tells by its members what it is: {@code type} a
 * characteristic, {@code name} and {@code value} a parameter, {@code other} whatever else.
 */
final class MessageJson {
    private final JsonWriter json;

    MessageJson(JsonWriter json) {
        this.json = json;
    }

    void message(Reading reading) {
        header(reading.header, reading.held.bytes.length - reading.bodyAt());
        if (reading.document == null) {
            json.member("document", null);
        } else {
            document(reading.document);
        }
        json.name("deviations").beginArray();
        if (reading.document != null) {
            for (Deviation deviation : reading.document.deviations()) {
                json.beginFlatObject().member("offset", deviation.offset());
                json.member("path", deviation.path());
                json.member("sentence", deviation.sentence()).end();
            }
        }
        json.end();
        verdict(reading.verdict, reading.document);
        json.optional("error", reading.failure == null ? null : reading.failure.getMessage());
    }

    void header(PushHeader header, int bodyLength) {
        if (header == null) {
            json.member("header", null);
            return;
        }
        json.name("header").beginObject();
        if (header.transactionIdentifier() >= 0) {
            json.member("transactionIdentifier", header.transactionIdentifier());
        }
        json.member("contentType", header.contentType().mediaType());
        if (header.contentType().code() >= 0) {
            json.member("contentTypeCode", header.contentType().code());
        }
        json.member("headerLength", header.length()).member("bodyLength", bodyLength);
        json.member("securityMethod", header.securityMethod().name()).member("mac", header.mac());
        fields("parameters", header.contentType().parameters());
        fields("fields", header.fields());
        json.end();
    }

    private void fields(String member, List<HeaderField> fields) {
        json.name(member).beginArray();
        for (HeaderField field : fields) {
            json.beginFlatObject().member("name", field.name()).member("value", field.value());
            json.member("offset", field.offset()).member("length", field.length()).end();
        }
        json.end();
    }

    private void document(ProvisioningDocument document) {
        json.name("document").beginObject().member("wbxmlVersion", document.wbxmlVersion());
        json.member("publicIdentifier", document.publicIdentifier());
        json.member("documentType", document.documentType());
        json.member("charset", document.charset()).member("charsetName", document.charsetName());
        json.member("version", document.version());
        items("children", document.children());
        json.end();
    }

    /** Writes items as a member, with everything in them. */
    void items(String member, List<Item> items) {
        json.name(member).beginArray();
        new Walk() {
            @Override
            void enter(Item item, int depth) {
                boolean isOpen = isOpen(item);
                if (isOpen) {
                    json.beginObject();
                } else {
                    json.beginFlatObject();
                }
                describe(item);
                if (isOpen) {
                    json.name("children").beginArray();
                }
            }

            @Override
            void leave(Item item) {
                if (isOpen(item)) {
                    json.end();
                }
                json.end();
            }
        }.through(items);
        json.end();
    }

    /** Whether others stand in an item, or have their place there. */
    private static boolean isOpen(Item item) {
        return item instanceof Characteristic || !item.children().isEmpty();
    }

    private void describe(Item item) {
        if (item instanceof Characteristic) {
            Characteristic characteristic = (Characteristic) item;
            json.member("type", characteristic.type());
            json.optional("typeWriting", lowerCase(characteristic.typeWriting()));
        } else if (item instanceof Parameter) {
            Parameter parameter = (Parameter) item;
            json.member("name", parameter.name()).member("value", parameter.value());
            json.optional("nameWriting", lowerCase(parameter.nameWriting()));
            json.optional("valueWriting", lowerCase(parameter.valueWriting()));
        } else {
            Other other = (Other) item;
            json.member("other", lowerCase(other.kind()));
            json.member("name", other.name()).member("text", other.text());
            json.optional("textWriting", lowerCase(other.textWriting()));
        }
        place(item);
    }

    private void place(Item item) {
        json.member("offset", item.offset()).member("length", item.length());
    }

    /** A constant as it is told; null for null. */
    static String lowerCase(Enum<?> constant) {
        return constant == null ? null : constant.name().toLowerCase(Locale.ROOT).replace('_', '-');
    }

    private void verdict(Verdict verdict, ProvisioningDocument document) {
        json.name("verdict").beginObject().member("accepted", verdict.isAccepted());
        String part = verdict.isHeaderRefused() ? "header" : "body";
        json.optional("part", verdict.isAccepted() ? null : part);
        json.member("code", verdict.code()).member("codeName", verdict.codeName());
        json.member("bytesRead", verdict.bytesRead());
        json.place("offset", verdict.offset()).member("path", verdict.path());
        json.member("reason", verdict.reason()).member("found", verdict.found());
        json.name("expected").beginArray();
        for (String expected : verdict.expected()) {
            json.text(expected);
        }
        json.end();
        json.name("readOtherwise").beginArray();
        for (Item item : verdict.readOtherwise()) {
            json.beginFlatObject().member("path", document.path(item));
            place(item);
            json.end();
        }
        json.end().end();
    }

    /**
     * Writes what the library answers as the member {@code answers}: null with {@code unanswered}
     * beside it, or an array of characteristics with {@code type} and {@code children}. A parameter
     * has {@code name}, {@code value} and {@code same}, and {@code said} where the message says
     * something else; what is not answered has {@code answered} false.
     */
    void answers(Comparison comparison) {
        if (comparison.unanswered != null) {
            json.member("answers", null).member("unanswered", comparison.unanswered);
        } else {
            json.name("answers").beginArray();
            answers(comparison.answers);
            json.end();
        }
    }

    private void answers(List<Answer> answers) {
        for (Answer answer : answers) {
            if (answer.children != null && answer.isAnswered) {
                json.beginObject().member("type", answer.name).name("children").beginArray();
                answers(answer.children);
                json.end().end();
                continue;
            }
            json.beginFlatObject().member(answer.children == null ? "name" : "type", answer.name);
            if (answer.isAnswered) {
                json.member("value", answer.value).member("same", answer.isSame());
            }
            if (answer.children == null && answer.isSaid && !answer.isSame()) {
                json.member("said", answer.said);
            }
            if (!answer.isAnswered) {
                json.member("answered", false);
            }
            json.end();
        }
    }
}
