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
import java.lang.reflect.Method;
import java.lang.reflect.Modifier;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.List;
import java.util.Map;
import java.util.Set;
import java.util.TreeMap;
import java.util.TreeSet;
import java.util.stream.Stream;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;

/**
 * Every parameter of a kind has its accessor: {@code kinds.txt} has a line for each kind with its
 * class, its types from the document on and the accessors that lead to it, and below it the names of
 * its parameters with their accessors.
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

    private static boolean isFlag(Object view, String accessor) {
        return Stream.of(view.getClass().getMethods())
                .anyMatch(method -> method.getName().equals(has(accessor)));
    }

    private static String has(String accessor) {
        return "has" + Character.toUpperCase(accessor.charAt(0)) + accessor.substring(1);
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
                assertEquals("first " + name, told);
            }
            if (isFlag(view, accessor)) {
                assertEquals(true, call(view, has(accessor)), name);
            }
        }
    }

    @ParameterizedTest
    @MethodSource("kinds")
    void tellWhatIsNotThereAsNullOrAsAnEmptyList(Kind kind) throws Exception {
        Object view = kind.of(kind.body());
        for (String accessor : kind.accessors().values()) {
            Object told = call(view, accessor);
            assertTrue(told == null || told.equals(List.of()), accessor);
            if (isFlag(view, accessor)) {
                assertEquals(false, call(view, has(accessor)), accessor);
            }
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
            assertTrue(told == null || told.equals(List.of()), accessor);
            if (isFlag(view, accessor)) {
                assertEquals(true, call(view, has(accessor)), accessor);
            }
        }
    }

    @ParameterizedTest
    @MethodSource("kinds")
    void haveNoOtherAccessors(Kind kind) throws Exception {
        Object view = kind.of(kind.body());
        Set<String> known = new TreeSet<>(kind.accessors().values());
        kind.accessors().values().forEach(accessor -> known.add(has(accessor)));
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
    void haveAPlaceForEveryNameOfTheVocabulary() throws Exception {
        Set<String> known = new TreeSet<>();
        kinds().forEach(kind -> known.addAll(kind.accessors().keySet()));
        Set<String> types = new TreeSet<>(Set.of("BEARERINFO", "DNS-ADDRINFO"));
        kinds().forEach(kind -> types.addAll(List.of(kind.types().split("/"))));
        int names = 0;
        for (int page = 0; page < 2; ++page) {
            for (int token = 0x05; token < 0x80; ++token) {
                Parameter parameter = read(page, token, 0x07);
                if (parameter != null && isStated(parameter.name())) {
                    ++names;
                    assertTrue(known.contains(parameter.name()), parameter.name());
                }
                Characteristic characteristic = read(page, token, 0x06);
                if (characteristic != null && isStated(characteristic.type())) {
                    assertTrue(types.contains(characteristic.type()), characteristic.type());
                }
            }
        }
        assertTrue(names > 100, "names: " + names);
        assertNotNull(read(0, 0x08, 0x07));
        assertNull(read(0, 0x06, 0x06));
    }

    private static boolean isStated(String text) {
        return text != null && !text.isEmpty();
    }

    /** The element that an attribute start token of a page makes with no more than itself. */
    @SuppressWarnings("unchecked")
    private static <T extends Item> T read(int page, int token, int element) throws Exception {
        byte[] body = {
            3, 0x0B, 0x6A, 0, 0x45, 0x46, (byte) (element | 0x80), 0, (byte) page, (byte) token, 1, 1, 1
        };
        ProvisioningDocument document = ProvisioningDocument.parse(body);
        List<Item> items = document.characteristics().get(0).children();
        boolean isUsual = items.size() == 1 && document.deviations().size() < 2;
        return isUsual ? (T) items.get(0) : null;
    }
}
