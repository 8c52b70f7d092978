package com.qvomacp.cli;

import com.qvomacp.eng.omacp.Item;
import java.util.List;

/**
 * Writes the library's answers as the member {@code answers}: null with {@code unanswered} beside
 * it, or an array of characteristics with {@code type} and {@code children}. A parameter has {@code
 * name}, {@code value} and {@code same}, and {@code said} where the message says something else;
 * what is not answered has {@code answered} false.
 */
final class AnswerJson implements Comparison.Listener {
    private final JsonWriter json;
    private boolean begun;

    AnswerJson(JsonWriter json) {
        this.json = json;
    }

    private JsonWriter element() {
        if (!begun) {
            begun = true;
            json.name("answers").beginArray();
        }
        return json;
    }

    @Override
    public void begin(String type, List<Item> said) {
        element().beginObject().member("type", type).name("children").beginArray();
    }

    @Override
    public void answered(
            String name, String value, Comparison.Agreement agreement, String said) {
        json.beginFlatObject().member("name", name).member("value", value);
        json.member("same", agreement == Comparison.Agreement.SAME);
        if (agreement == Comparison.Agreement.OTHERWISE) {
            json.member("said", said);
        }
        json.end();
    }

    @Override
    public void notAnswered(String name, String value) {
        element().beginFlatObject().member("name", name).member("said", value);
        json.member("answered", false).end();
    }

    @Override
    public void notAnswered(String type) {
        element().beginFlatObject().member("type", type).member("answered", false).end();
    }

    @Override
    public void end() {
        json.end().end();
    }

    @Override
    public void unanswered(String why) {
        json.nullMember("answers").member("unanswered", why);
    }
}
