package com.qvomacp.eng.omacp;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.qvomacp.support.BodyGenerator;
import com.qvomacp.support.Bytes;
import java.util.EnumSet;
import java.util.Random;
import org.junit.jupiter.api.Test;

/** The listing of every byte of a body. */
class BodyListingTest {
    /** Requires that the rows stand one behind the other, from the first byte to the last. */
    private static void requireEveryByte(byte[] body) throws Exception {
        int[] at = {0};
        ProvisioningDocument.parse(body)
                .describe(
                        (offset, length, depth, meaning) -> {
                            assertEquals(at[0], offset);
                            assertTrue(length > 0 && depth >= 0);
                            at[0] += length;
                        });
        assertEquals(body.length, at[0]);
    }

    @Test
    void everyByteIsToldOnceWithWhatItMeans() throws Exception {
        byte[] body = Bytes.of("03 0B 6A 03 'ab' 00 C5 46 01 C6 00 01 55 01 87 36 06 03 'w2' 00 01 87 05 83 00 06 C3 01 'o' 01 01 01 00");
        StringBuilder told = new StringBuilder();
        ProvisioningDocument.parse(body)
                .describe(
                        (offset, length, depth, meaning) ->
                                told.append(offset).append('+').append(length).append(' ')
                                        .append("  ".repeat(depth)).append(meaning).append('\n'));
        assertEquals(
                """
                0+1 WBXML 1.3
                1+1 document type: "-//WAPFORUM//DTD PROV 1.0//EN"
                2+1 character set: UTF-8
                3+1 string table: 3 bytes
                4+3 text 0 of the table: "ab"
                7+1 wap-provisioningdoc
                8+1   VERSION = "1.0"
                9+1   END of attributes
                10+1   characteristic
                11+2     SWITCH_PAGE: attributes by code page 1
                13+1     TYPE = "APPLICATION"
                14+1     END of attributes
                15+1     parm
                16+1       NAME = "APPID"
                17+1       VALUE
                18+4       "w2", inline
                22+1     END of parm
                23+1     parm
                24+1       NAME
                25+2       "ab", table
                27+1       VALUE
                28+3       "o", opaque
                31+1     END of parm
                32+1   END of characteristic
                33+1 END of wap-provisioningdoc
                34+1 behind the end of the document
                """,
                told.toString());
    }

    @Test
    void noByteIsLeftOutOfAnyBody() throws Exception {
        Random random = new Random(7);
        for (int seed = 0; seed < 2000; ++seed) {
            byte[] body = new BodyGenerator(seed, EnumSet.allOf(BodyGenerator.Part.class)).body();
            requireEveryByte(body);
            for (int change = 0; change < 5; ++change) {
                body[4 + random.nextInt(body.length - 4)] = (byte) random.nextInt(256);
                try {
                    requireEveryByte(body);
                } catch (ProvisioningException e) {
                    // The changed byte stands in the header.
                }
            }
        }
    }
}
