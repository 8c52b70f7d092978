package com.qvomacp.eng.omacp;

import java.util.ArrayList;
import java.util.List;

/**
 * A document on its way into another form: the elements in their order, as steps that can be taken
 * any number of times. Text by text, it holds no more than the document does.
 */
final class DocumentSource {
    /** Takes the steps. */
    interface Steps {
        /** A characteristic begins. */
        void characteristic(String type) throws EncodingException;

        /** A parameter; the value is null for none. */
        void parameter(String name, String value) throws EncodingException;

        /** The characteristic that began last, of those that have not ended, ends. */
        void end() throws EncodingException;
    }

    private enum Step {
        CHARACTERISTIC,
        PARAMETER,
        END
    }

    final String version;
    private final List<Step> steps = new ArrayList<>();

    /** A type for each characteristic, name and value for each parameter. */
    private final List<String> texts = new ArrayList<>();

    DocumentSource(String version) {
        this.version = version;
    }

    void characteristic(String type) {
        steps.add(Step.CHARACTERISTIC);
        texts.add(type);
    }

    void parameter(String name, String value) {
        steps.add(Step.PARAMETER);
        texts.add(name);
        texts.add(value);
    }

    void end() {
        steps.add(Step.END);
    }

    void take(Steps taker) throws EncodingException {
        int text = 0;
        for (Step step : steps) {
            switch (step) {
                case CHARACTERISTIC:
                    taker.characteristic(texts.get(text++));
                    break;
                case PARAMETER:
                    taker.parameter(texts.get(text), texts.get(text + 1));
                    text += 2;
                    break;
                default:
                    taker.end();
            }
        }
    }
}
