package com.qvomacp.cli;

import com.qvomacp.eng.omacp.Item;
import java.util.List;
import java.util.Objects;

/**
 * Writes the library's answers as the member {@code answers}: null with {@code unanswered} beside
 * it, or an array of characteristics with {@code type} and {@code children}. A parameter has {@code
 * name}, {@code value} and {@code same}, and {@code said} where the message says something else;
 * what is not answered has {@code answered} false.
 */
final class AnswerJson implements Comparison.Listener {
    private final JsonWriter json;

    AnswerJson(JsonWriter json) {
        this.json = json;
    }

    @Override
    public void begin() {
        json.name("answers").beginArray();
    }

    @Override
    public void begin(String type, List<Item> said) {
        json.beginObject().member("type", type).name("children").beginArray();
    }

    @Override
    public void answered(String name, String value, boolean isSaid, String said) {
        boolean isSame = isSaid && Objects.equals(value, said);
        json.beginFlatObject().member("name", name).member("value", value).member("same", isSame);
        if (isSaid && !isSame) {
            json.member("said", said);
        }
        json.end();
    }

    @Override
    public void notAnswered(String name, String value) {
        json.beginFlatObject().member("name", name).member("said", value);
        json.member("answered", false).end();
    }

    @Override
    public void notAnswered(String type) {
        json.beginFlatObject().member("type", type).member("answered", false).end();
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
