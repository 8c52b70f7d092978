package com.qvomacp.eng.parser;

import static com.qvomacp.support.Document.characteristic;
import static com.qvomacp.support.Document.parm;
import static com.qvomacp.support.Push.push;
import static org.junit.jupiter.api.Assertions.assertArrayEquals;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.Everything;
import com.qvomacp.support.Natives;
import java.lang.reflect.Method;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;
import org.junit.jupiter.api.Test;

/** What all queries of a context have in common, called by reflection so that none is missed. */
class AnswersTest extends Natives {
    private static final int[] NEVER_FOUND = {
        0, -1, 2, 1000, Integer.MIN_VALUE, Integer.MAX_VALUE,
    };

    /** A query native and the object to call it on. */
    private record Query(Object object, Method method) {
        Object at(int... indexes) throws ReflectiveOperationException {
            return method.invoke(object, Arrays.stream(indexes).boxed().toArray());
        }

        int[] firstOfEach() {
            int[] indexes = new int[method.getParameterCount()];
            Arrays.fill(indexes, 1);
            return indexes;
        }

        boolean is(String name) {
            return method.getName().equals("qvomacp_" + name);
        }
    }

    private static List<Query> queries() {
        List<Query> queries = new ArrayList<>();
        for (Object object : ALL) {
            for (Method method : object.getClass().getDeclaredMethods()) {
                boolean changes = method.getName().equals("qvomacp_SetPxNapDefIndex");
                if (object != parser && !changes) {
                    queries.add(new Query(object, method));
                }
            }
        }
        assertEquals(87 - 9 - 1, queries.size());
        return queries;
    }

    private static void assertNothing(Object answer, Object what) {
        if (answer instanceof Integer) {
            assertEquals(0, answer, what.toString());
        } else {
            assertNull(answer, what.toString());
        }
    }

    private static void assertNoContext() throws ReflectiveOperationException {
        napDefs.qvomacp_SetPxNapDefIndex(2);
        for (Query query : queries()) {
            assertNothing(query.at(query.firstOfEach()), query);
            for (int never : NEVER_FOUND) {
                int[] indexes = query.firstOfEach();
                Arrays.fill(indexes, never);
                assertNothing(query.at(indexes), query);
            }
        }
    }

    @Test
    void areNothingBeforeAParse() throws ReflectiveOperationException {
        assertNoContext();
    }

    @Test
    void areNothingWhenOnlyTheHeaderIsRead() throws ReflectiveOperationException {
        assertTrue(parse(Everything.push(), HEADER_ONLY));
        assertNoContext();
    }

    @Test
    void areNothingWhenTheHeaderIsRefused() throws ReflectiveOperationException {
        assertFalse(parse(new byte[] {1, 7, 0, 0}, WHOLE_MESSAGE));
        assertNoContext();
    }

    @Test
    void areNothingWhenTheBodyIsRefused() throws ReflectiveOperationException {
        assertFalse(parse(push(new byte[] {3, 1, 0x6A, 0}), WHOLE_MESSAGE));
        assertNoContext();
    }

    @Test
    void areNothingAfterTheDelete() throws ReflectiveOperationException {
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        delete();
        assertNoContext();
    }

    /** A PORT outside a proxy or an address is decoded and dropped. */
    @Test
    void areNothingForADocumentThatSetsNothing() throws ReflectiveOperationException {
        parse(characteristic("PORT"));
        for (Query query : queries()) {
            Object answer = query.at(query.firstOfEach());
            if (query.is("GetProxyData")) {
                assertArrayEquals(fourteenEmptyTexts(), (String[]) answer);
            } else {
                assertNothing(answer, query);
            }
        }
    }

    @Test
    void areSomethingForAMessageThatSetsEverything() throws ReflectiveOperationException {
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        for (Query query : queries()) {
            Object answer = query.at(query.firstOfEach());
            if (answer instanceof Integer) {
                assertEquals(1, answer, query.toString());
            } else {
                assertNotNull(answer, query.toString());
            }
        }
    }

    @Test
    void areNothingForAnIndexThatIsNotThere() throws ReflectiveOperationException {
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        for (Query query : queries()) {
            for (int position = 0; position < query.firstOfEach().length; ++position) {
                for (int never : NEVER_FOUND) {
                    int[] indexes = query.firstOfEach();
                    indexes[position] = never;
                    Object answer = query.at(indexes);
                    if (query.is("GetProxyData")) {
                        assertArrayEquals(fourteenEmptyTexts(), (String[]) answer);
                    } else if (query.is("GetPxBearerCount") && never <= 0) {
                        assertEquals(1, answer);
                    } else {
                        assertNothing(answer, query + " " + Arrays.toString(indexes));
                    }
                }
            }
        }
    }

    @Test
    void areNewObjectsEveryTime() throws ReflectiveOperationException {
        assertTrue(parse(Everything.push(), WHOLE_MESSAGE));
        for (Query query : queries()) {
            if (query.method().getReturnType().isArray()) {
                String[] first = (String[]) query.at(query.firstOfEach());
                String[] before = first.clone();
                Arrays.fill(first, "changed by the caller");
                assertArrayEquals(before, (String[]) query.at(query.firstOfEach()));
            }
        }
    }

    @Test
    void endWithANullInEveryArray() throws ReflectiveOperationException {
        parse(Everything.withoutNapAddrType());
        int arrays = 0;
        for (Query query : queries()) {
            if (query.method().getReturnType().isArray()) {
                String[] array = (String[]) query.at(query.firstOfEach());
                assertNull(array[array.length - 1], query.toString());
                ++arrays;
            }
        }
        assertEquals(15, arrays);
    }

    @Test
    void keepTextsOfEveryLengthAndOfOtherAlphabets() {
        for (String text : List.of("", "x", "€uro 中文 ß", "x".repeat(127), "y".repeat(70_000))) {
            parse(characteristic("NAPDEF", parm("NAME", text), parm("DNS-ADDR", text)));
            assertEquals(text, napDefs.qvomacp_GetPxNapDefData(1)[1]);
            assertEquals(text, napDefs.qvomacp_GetPxDnsAddrData(1, 1));
            delete();
        }
    }

    @Test
    void surviveTextsThatEndInsideACharacter() {
        byte[][] cuts = {
            {'A', (byte) 0xC3}, {'A', (byte) 0xE2}, {'A', (byte) 0xE2, (byte) 0x82}, {'A', -1},
        };
        for (byte[] cut : cuts) {
            parse(characteristic("NAPDEF", parm("NAME", (Object) cut)));
            String answer = napDefs.qvomacp_GetPxNapDefData(1)[1];
            assertTrue(answer.startsWith("A"), answer);
            delete();
        }
    }

    private static String[] fourteenEmptyTexts() {
        String[] texts = new String[14];
        Arrays.fill(texts, "");
        return texts;
    }
}
