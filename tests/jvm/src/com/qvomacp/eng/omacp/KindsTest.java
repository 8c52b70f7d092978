package com.qvomacp.eng.omacp;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.document;
import static com.qvomacp.support.Document.named;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Document.Element;
import java.io.ByteArrayOutputStream;
import java.lang.reflect.Method;
import java.lang.reflect.Modifier;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.List;
import java.util.Map;
import java.util.Objects;
import java.util.Set;
import java.util.TreeMap;
import java.util.TreeSet;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;

/**
 * The accessors of each kind: {@code kinds.txt} has a line for each kind with its class, its types
 * from the document on and the accessors that lead to it, and below it the names of parameters with
 * their accessors. Those of flags begin with {@code has}. Every other parameter is told by its name.
 */
class KindsTest {
    /** A kind of characteristic in a place. */
    record Kind(String view, String types, String way, Map<String, String> accessors) {
        @Override
        public String toString() {
            return types;
        }

        /** A document that holds the kind, with the given content. */
        byte[] body(Element... content) {
            Element[] inner = content;
            String[] nested = types.split("/");
            for (int i = nested.length - 1; i >= 0; --i) {
                inner = new Element[] {characteristic(nested[i], inner)};
            }
            return document(inner);
        }

        /** The one view of the kind in a body. */
        Object of(byte[] body) throws Exception {
            Object object = ProvisioningMessage.parseBody(body);
            for (String accessor : way.split("/")) {
                List<?> views = (List<?>) call(object, accessor);
                assertEquals(1, views.size(), accessor);
                object = views.get(0);
            }
            assertEquals(view, object.getClass().getSimpleName());
            return object;
        }
    }

    private static Object call(Object object, String accessor) throws Exception {
        return object.getClass().getMethod(accessor).invoke(object);
    }

    static List<Kind> kinds() throws Exception {
        List<Kind> kinds = new ArrayList<>();
        byte[] bytes = KindsTest.class.getResourceAsStream("kinds.txt").readAllBytes();
        for (String line : new String(bytes, StandardCharsets.UTF_8).split("\n")) {
            String[] cells = line.strip().split(" \\| ");
            if (cells.length == 3) {
                kinds.add(new Kind(cells[0], cells[1], cells[2], new TreeMap<>()));
            } else {
                kinds.get(kinds.size() - 1).accessors().put(cells[0], cells[1]);
            }
        }
        return kinds;
    }

    @ParameterizedTest
    @MethodSource("kinds")
    void tellEachParameterByItsAccessor(Kind kind) throws Exception {
        List<Element> parms = new ArrayList<>();
        for (String name : kind.accessors().keySet()) {
            parms.add(named(name, "first " + name));
            parms.add(named(name, "second " + name));
        }
        Object view = kind.of(kind.body(parms.toArray(new Element[0])));
        for (Map.Entry<String, String> entry : kind.accessors().entrySet()) {
            String name = entry.getKey();
            String accessor = entry.getValue();
            Object told = call(view, accessor);
            if (told instanceof List) {
                assertEquals(List.of("first " + name, "second " + name), told);
            } else if (told instanceof AddressType) {
                assertEquals(AddressType.UNKNOWN, told);
                assertEquals("first " + name, call(view, accessor + "Text"));
            } else {
                assertEquals(accessor.startsWith("has") ? true : "first " + name, told);
            }
            TypedCharacteristic typed = (TypedCharacteristic) view;
            assertTrue(typed.has(name));
            assertEquals("first " + name, typed.value(name));
            assertEquals(List.of("first " + name, "second " + name), typed.values(name));
        }
    }

    @ParameterizedTest
    @MethodSource("kinds")
    void tellWhatIsNotThereAsNullOrAsAnEmptyList(Kind kind) throws Exception {
        Object view = kind.of(kind.body());
        for (String accessor : kind.accessors().values()) {
            Object told = call(view, accessor);
            Object absent = accessor.startsWith("has") ? false : null;
            assertTrue(Objects.equals(told, absent) || told.equals(List.of()), accessor);
        }
    }

    @ParameterizedTest
    @MethodSource("kinds")
    void tellAFlagWithoutAValueFromOneThatIsNotThere(Kind kind) throws Exception {
        List<Element> parms = new ArrayList<>();
        kind.accessors().keySet().forEach(name -> parms.add(named(name)));
        Object view = kind.of(kind.body(parms.toArray(new Element[0])));
        for (String accessor : kind.accessors().values()) {
            Object told = call(view, accessor);
            Object valueless = accessor.startsWith("has") ? true : null;
            assertTrue(Objects.equals(told, valueless) || told.equals(List.of()), accessor);
        }
    }

    @ParameterizedTest
    @MethodSource("kinds")
    void haveNoOtherAccessors(Kind kind) throws Exception {
        Object view = kind.of(kind.body());
        Set<String> known = new TreeSet<>(kind.accessors().values());
        kind.accessors().values().forEach(accessor -> known.add(accessor + "Text"));
        for (Kind other : kinds()) {
            known.add(other.way().substring(other.way().lastIndexOf('/') + 1));
        }
        known.addAll(Set.of("parameter", "parameters"));
        for (Method method : view.getClass().getDeclaredMethods()) {
            if (Modifier.isPublic(method.getModifiers())) {
                assertTrue(known.contains(method.getName()), method.toString());
            }
        }
    }

    @ParameterizedTest
    @MethodSource("kinds")
    void keepWhatTheyHaveNoAccessorForWithinReach(Kind kind) throws Exception {
        Object view = kind.of(kind.body(named("X-OWN", "1"), characteristic("X-OWN")));
        Characteristic characteristic = ((TypedCharacteristic) view).characteristic();
        assertEquals("1", characteristic.value("X-OWN"));
        assertEquals(1, characteristic.characteristics("X-OWN").size());
        assertEquals(view, kind.of(kind.body(named("X-OWN", "1"), characteristic("X-OWN"))));
        assertFalse(view.equals(kind.of(kind.body(named("X-OWN", "2"), characteristic("X-OWN")))));
        assertFalse(view.toString().contains("X-OWN"), view.toString());
    }

    @Test
    void tellEveryNameOfTheVocabularyByItsName() throws Exception {
        int names = 0;
        for (int page = 0; page < 2; ++page) {
            for (int token = 0x05; token < 0x80; ++token) {
                Parameter parameter = read(page, token);
                if (parameter != null && isStated(parameter.name())) {
                    ++names;
                    byte[] body = body(page, token, "x");
                    TypedCharacteristic view =
                            ProvisioningMessage.parseBody(body).accessPoints().get(0);
                    assertEquals("x", view.value(parameter.name()), parameter.name());
                    assertTrue(view.has(parameter.name()));
                }
            }
        }
        assertTrue(names > 100, "names: " + names);
        assertNotNull(read(0, 0x08));
        assertNull(read(0, 0x06));
    }

    @Test
    void areThereForTheTypesThatMessagesHave() throws Exception {
        Set<String> types = new TreeSet<>();
        kinds().forEach(kind -> types.addAll(List.of(kind.types().split("/"))));
        Set<String> others =
                Set.of("BEARERINFO", "DNS-ADDRINFO", "WLAN", "SEC-SSID", "EAP", "CERT", "WEPKEY");
        for (int page = 0; page < 2; ++page) {
            for (int token = 0x51; token < 0x60; ++token) {
                String type = CodePage.of(page).begin(token);
                assertTrue(type == null || types.contains(type) || others.contains(type), type);
            }
        }
    }

    private static boolean isStated(String text) {
        return text != null && !text.isEmpty();
    }

    /** A NAPDEF with one parameter, whose name is a token of a page. */
    private static byte[] body(int page, int token, String value) {
        ByteArrayOutputStream body = new ByteArrayOutputStream();
        body.writeBytes(new byte[] {3, 0x0B, 0x6A, 0, 0x45, (byte) 0xC6, 0x55, 1});
        body.writeBytes(new byte[] {(byte) 0x87, 0, (byte) page, (byte) token});
        if (value != null) {
            body.writeBytes(new byte[] {0, 0, 6, 3});
            body.writeBytes((value + '\0').getBytes(StandardCharsets.UTF_8));
        }
        body.writeBytes(new byte[] {1, 1, 1});
        return body.toByteArray();
    }

    /** The parameter that an attribute start token of a page makes; null when it makes none. */
    private static Parameter read(int page, int token) throws Exception {
        ProvisioningDocument document = ProvisioningDocument.parse(body(page, token, null));
        List<Item> items = document.characteristics().get(0).children();
        boolean isUsual = items.size() == 1 && document.deviations().isEmpty();
        return isUsual && items.get(0) instanceof Parameter ? (Parameter) items.get(0) : null;
    }
}
