package com.qvomacp.eng.omacp;

import java.util.Arrays;
import java.util.Collections;
import java.util.List;

/**
 * What can be chosen when a document is encoded. Each has a name, under which a document may state
 * it in its {@code <?omacp-push?>} instruction, and a text as its value.
 *
 * <pre>{@code
 * for (EncodeOption option : EncodeOption.values()) {
 *     System.out.println(option.optionName() + " " + option.choices());
 * }
 * }</pre>
 */
public enum EncodeOption {
    /**
     * Where tokens are written: {@code library}, where the native library answers the text for which
     * the token stands; {@code oma}, wherever the format has a token; {@code none}.
     */
    TOKENS("where tokens are written", "library", "library", "oma", "none"),

    /** The character set of the texts, by its IANA name. */
    CHARSET("the character set", "UTF-8"),

    /** How the document type is named: by its number, or by a text in the string table. */
    IDENTIFIER("how the document type is named", "token", "token", "table"),

    /** Where texts stand that occur more than once: each in its place, or in the string table. */
    STRINGS("where repeated texts stand", "inline", "inline", "table"),

    /** The content type: a number or a text, alone or with a quoted length in front. */
    CONTENT_TYPE("how the content type is written", "quoted",
            "short", "text", "quoted", "quoted-text"),

    /** The security method; without one, the push has neither SEC nor MAC. */
    SEC("the security method", null, "netwpin", "userpin", "usernetwpin", "userpinmac"),

    /** The PIN, for {@code userpin}, {@code usernetwpin} and {@code userpinmac}. */
    PIN("what the user has been told (USERPIN, USERNETWPIN, USERPINMAC)", null),

    /** The subscriber's number, for {@code netwpin} and {@code usernetwpin}. */
    IMSI("the subscriber's number (NETWPIN, USERNETWPIN)", null),

    /** The bytes of the key in hexadecimal, in place of PIN and IMSI. */
    KEY("the key in hexadecimal, in place of PIN and IMSI", null),

    /** How SEC and MAC are named: by number or by text. */
    PARAMETERS("how SEC and MAC are named", "binary", "binary", "text"),

    /** The transaction identifier, two hexadecimal digits. */
    TID("the transaction identifier, two hexadecimal digits", "01"),

    /** Further headers, in hexadecimal. */
    HEADERS("further headers, in hexadecimal", "");

    private final String optionName = Printable.nameOf(this);
    private final String description;
    private final String defaultValue;
    private final List<String> choices;

    EncodeOption(String description, String defaultValue, String... choices) {
        this.description = description;
        this.defaultValue = defaultValue;
        this.choices = Collections.unmodifiableList(Arrays.asList(choices));
    }

    /** {@return the name: such as {@code content-type}} */
    public String optionName() {
        return optionName;
    }

    /** {@return what the option says, for people: a few words in lower case} */
    public String description() {
        return description;
    }

    /** {@return the value of an option that is not set: the value; {@code null} for none} */
    public String defaultValue() {
        return defaultValue;
    }

    /**
     * {@return the values that the option takes: the values; not modifiable, empty for an option
     * that takes any text of its kind}
     */
    public List<String> choices() {
        return choices;
    }

    /** {@return whether the value is a secret, which is never shown nor written into a document} */
    public boolean isSecret() {
        return this == PIN || this == IMSI || this == KEY;
    }

    /** The option of a name; null for a name that is none's. */
    static EncodeOption named(String name) {
        for (EncodeOption option : values()) {
            if (option.optionName.equals(name)) {
                return option;
            }
        }
        return null;
    }
}
