package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;

import com.qvomacp.support.ChildVm;
import java.lang.reflect.Method;
import java.util.ArrayList;
import java.util.HexFormat;
import java.util.List;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;

/**
 * A message of 1 MiB and all views of it need no more than 100 bytes of heap for each of its bytes,
 * whatever they are; with all that is wrong with it, no more than 200.
 */
class LittleMemoryTest {
    private static final int LENGTH = 1 << 20;

    /** Reads a body of the given element, below the given start, and keeps every list of views. */
    static final class Child {
        private Child() {}

        public static void main(String[] arguments) throws Exception {
            byte[] start = HexFormat.of().parseHex("030b6a0045" + arguments[0]);
            byte[] element = HexFormat.of().parseHex(arguments[1]);
            byte[] body = new byte[LENGTH];
            System.arraycopy(start, 0, body, 0, start.length);
            int at = start.length;
            for (; at + element.length <= body.length; at += element.length) {
                System.arraycopy(element, 0, body, at, element.length);
            }
            ReadOptions options = ReadOptions.DEFAULT.withInputLimit(LENGTH);
            ProvisioningMessage message = ProvisioningMessage.parseBody(body, options);
            List<Object> kept = new ArrayList<>();
            if (arguments.length > 2) {
                kept.add(message.lint());
            } else {
                views(message, kept);
            }
            System.out.println(message.document().children().isEmpty() ? "empty" : "read");
        }

        private static void views(Object owner, List<Object> kept) throws Exception {
            for (Method method : owner.getClass().getMethods()) {
                boolean isList = method.getReturnType() == List.class && method.getParameterCount() == 0;
                if (isList && !method.getName().equals("lint")) {
                    List<?> list = (List<?>) method.invoke(owner);
                    if (!list.isEmpty()) {
                        kept.add(list);
                    }
                    for (Object view : list) {
                        if (view instanceof TypedCharacteristic) {
                            views(view, kept);
                        }
                    }
                }
            }
        }
    }

    @ParameterizedTest(name = "{0} {1}")
    @CsvSource({
        "06, 06", "06, 07", "06, 46", "c65501, 07", "06, 865501", "c65101, 865301", "c65101, 06",
    })
    void isEnoughForTreeAndViews(String start, String element) throws Exception {
        ChildVm.Result result =
                ChildVm.run(
                        List.of("-Xmx100m"), new byte[0], Child.class, start, element);
        assertEquals("", result.errors());
        assertEquals("read\n", result.output());
    }

    /** Where every item is wrong, and the library reads none of them as it stands. */
    @ParameterizedTest(name = "{0} {1}")
    @CsvSource({"06, 06", "06, 07", "06, 46", "c65501, 07", "06, 865501", "c65101, 865301", "c65501, 87110601"})
    void twiceAsMuchIsEnoughForWhatIsWrongWithIt(String start, String element) throws Exception {
        ChildVm.Result result =
                ChildVm.run(
                        List.of("-Xmx200m"), new byte[0], Child.class, start, element, "lint");
        assertEquals("", result.errors());
        assertEquals("read\n", result.output());
    }
}
