// What every PARM decoder does, whatever parameters it knows. The tests of each characteristic's
// own parameters say which of this holds for it.
#include "parms.h"

#include <set>

namespace parms {

// ---- The loop around the parameters

TEST_P(ParmLoop, RefusesEveryOtherToken)
{
    std::set<uint8_t> known = {0x00, 0x01};
    for (const auto &row : GetParam().rows) {
        known.insert(row.token);
    }
    for (unsigned byte = 0; byte < 256; ++byte) {
        const uint8_t token = static_cast<uint8_t>(byte);
        if (known.count(token) || GetParam().hasOtherMeaning(token)) {
            continue;
        }
        SCOPED_TRACE(byte);
        // With the content flag, so that a token is not taken for the END of an empty element.
        AnyReading run(GetParam(), join({{0xC7, token}, value("v"), {0x01}}));
        Traces traces;
        EXPECT_EQ(run.read(), 4101U);
        EXPECT_EQ(run.decoder.position(), 1U) << "the token stays";
        EXPECT_EQ(run.fieldsSet(), records::Numbers{});
        EXPECT_EQ(traces.texts, GetParam().refused(token));
    }
}

TEST_P(ParmLoop, LeavesTheFlagsOfAnElementThatItRefuses)
{
    for (const uint8_t flags : {0x80, 0xC0}) {
        AnyReading run(GetParam(), {static_cast<uint8_t>(0x07 | flags), 0x7F, 0x01});
        run.decoder->nHasContent = 9;
        run.decoder->nHasAttr = 9;
        EXPECT_EQ(run.read(), 4101U);
        EXPECT_EQ(run.decoder->nHasContent, flags == 0xC0 ? 1U : 0U);
        EXPECT_EQ(run.decoder->nHasAttr, 1U);
    }
    AnyReading run(GetParam(), {0xC7, 0x00, 0x01, 0x7F, 0x01});
    EXPECT_EQ(run.read(), 4101U);
    EXPECT_EQ(run.decoder->nHasContent, 0U) << "those of the page, as it is read like an element";
    EXPECT_EQ(run.decoder->nHasAttr, 0U);
}

TEST_P(ParmLoop, EndsAtTheEndOfTheAttributes)
{
    for (const uint8_t flags : {0x40, 0xC0}) {
        AnyReading run(GetParam(), {static_cast<uint8_t>(0x07 | flags), 0x01, 0x01});
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.decoder.position(), 2U);
        EXPECT_EQ(run.fieldsSet(), records::Numbers{});
    }
}

TEST_P(ParmLoop, TakesAnEndBehindAnElementWithoutContentForTheElements)
{
    // The attributes follow all the same. Their first token is looked at without its top bits.
    for (const uint8_t tag : {0x07, 0x87}) {
        for (const uint8_t end : {0x01, 0x41, 0x81, 0xC1}) {
            AnyReading run(GetParam(), {tag, end, 0x01});
            EXPECT_EQ(run.read(), 0U);
            EXPECT_EQ(run.left(), 0U);
            AnyReading cut(GetParam(), {tag, end});
            EXPECT_EQ(cut.read(), 4103U);
        }
    }
}

TEST_P(ParmLoop, RefusesEveryOtherElement)
{
    for (unsigned byte = 0; byte < 256; ++byte) {
        if ((byte & 0x3F) == 0x07) {
            continue;
        }
        SCOPED_TRACE(byte);
        AnyReading run(GetParam(), {static_cast<uint8_t>(byte), 0x01, 0x01});
        EXPECT_EQ(run.read(), 4101U);
        EXPECT_EQ(run.decoder.position(), 1U);
        EXPECT_EQ(run.fieldsSet(), records::Numbers{});
    }
}

TEST_P(ParmLoop, ReadsNothingWithoutARecord)
{
    decoding::Decoder decoder({0x87, 0x01, 0x01});
    EXPECT_EQ(GetParam().decode(decoder, nullptr), 2U);
    EXPECT_EQ(decoder.position(), 0U);
}

TEST_P(ParmLoop, FailsWithoutADecoder)
{
    AnyReading run(GetParam(), {});
    Traces traces;
    EXPECT_EQ(GetParam().decode(nullptr, run.record), 1U);
    EXPECT_EQ(traces.texts.back(),
              "[Error] [qvsClientProvWbxmlDecoderCheckElement] ptWbxmlDecoder NULL\n");
}

TEST_P(ParmLoop, FailsWhereTheDataEnds)
{
    for (const Bytes &cut : {Bytes{}, Bytes{0x87}, Bytes{0x87, 0x00}, Bytes{0x87, 0x00, 0x01}}) {
        AnyReading run(GetParam(), cut);
        EXPECT_EQ(run.read(), 4103U);
    }
}

TEST_P(ParmLoop, EndsBehindAPageSwitch)
{
    AnyReading run(GetParam(), {0x87, 0x00, 0x01, 0x01, 0x01});
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.left(), 1U);
    EXPECT_EQ(run.decoder->nCodePage, 1U);
}

TEST_P(ParmLoop, GoesOnBehindASwitchToAnUnknownPage)
{
    AnyReading run(GetParam(), {0x87, 0x00, 0x02, 0x01});
    run.decoder->nCodePage = 1;
    Traces traces;
    EXPECT_EQ(run.read(), 0U);
    EXPECT_EQ(run.left(), 0U);
    EXPECT_EQ(run.decoder->nCodePage, 1U) << "unchanged";
    EXPECT_TRUE(traces.has("ERROR::QVS_CODE_PAGE_UNKNOWN\n"));
}

// What becomes of a token behind a page switch, followed by VALUE and the text "v".
void expectBehindSwitch(const AnyParm &parm, uint8_t token)
{
    const uint8_t seen = parm.fresh ? token : token & 0x3F;
    AnyReading run(parm, join({{0xC7, 0x00, 0x01, token}, value("v"), {0x01}}));
    Traces traces;
    const qvsResult result = run.read();
    if (seen == 0x01) {
        EXPECT_EQ(result, 0U);
        EXPECT_EQ(run.decoder.position(), 4U);
        return;
    }
    if (seen == 0x00) {
        // A further switch, of which VALUE is the page; the inline string is refused.
        EXPECT_EQ(result, 4101U);
        EXPECT_EQ(run.decoder.position(), 5U);
        return;
    }
    for (const auto &row : parm.rows) {
        if (row.token == seen && (row.list || token == seen)) {
            EXPECT_EQ(result, 0U);
            EXPECT_EQ(run.shown(row), row.of({"v"}));
            return;
        }
        if (row.token == seen) {
            // The name is read once more, now as it stands.
            EXPECT_EQ(result, 4101U);
            EXPECT_EQ(run.decoder.position(), 4U);
            EXPECT_TRUE(traces.has(format("nId:%x, ", unsigned{seen}) +
                                   format("nTemp:%x\n", unsigned{token})));
            return;
        }
    }
    EXPECT_EQ(result, 4101U);
    EXPECT_EQ(run.decoder.position(), 3U) << "the token stays";
    for (const std::string &text : parm.refused(seen)) {
        EXPECT_TRUE(traces.has(text)) << text;
    }
}

TEST_P(ParmLoop, SeesTheTokenBehindAPageSwitch)
{
    for (unsigned byte = 0; byte < 256; ++byte) {
        const uint8_t token = static_cast<uint8_t>(byte);
        if (!GetParam().hasOtherMeaning(GetParam().fresh ? token : token & 0x3F)) {
            SCOPED_TRACE(byte);
            expectBehindSwitch(GetParam(), token);
        }
    }
}

// ---- Parameters whose name is a token

TEST_P(TokenParm, FillsTheFieldOfEachParmOnBothPages)
{
    for (const uint8_t page : {0, 1}) {
        for (const auto &row : GetParam().rows) {
            SCOPED_TRACE(row.name);
            AnyReading run(GetParam(), parm(row.token, "value"));
            run.decoder->nCodePage = page;
            EXPECT_EQ(run.read(), 0U);
            EXPECT_EQ(run.left(), 0U);
            EXPECT_EQ(run.fieldsSet(), records::Numbers{row.field});
            EXPECT_EQ(run.shown(row), row.of({"value"}));
            EXPECT_EQ(run.decoder->nCodePage, page);
        }
    }
}

TEST_P(TokenParm, FillsNothingWithoutAValue)
{
    for (const auto &row : GetParam().rows) {
        SCOPED_TRACE(row.name);
        for (const Bytes &attributes : {Bytes{row.token}, Bytes{row.token, 0x06}}) {
            AnyReading run(GetParam(), parm(attributes));
            EXPECT_EQ(run.read(), 0U);
            EXPECT_EQ(run.left(), 0U);
            EXPECT_EQ(run.shown(row), row.list ? "[]" : shown(GetParam().withoutValue(row.token)));
        }
    }
}

TEST_P(TokenParm, TakesAnEmptyValueAsAText)
{
    for (const auto &row : GetParam().rows) {
        SCOPED_TRACE(row.name);
        AnyReading run(GetParam(), parm(row.token, ""));
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.shown(row), row.of({""}));
    }
}

TEST_P(TokenParm, TakesAParmWhateverItsFlags)
{
    for (const auto &row : GetParam().rows) {
        for (const uint8_t flags : {0x00, 0x40, 0x80, 0xC0}) {
            AnyReading run(
                GetParam(),
                join({{static_cast<uint8_t>(0x07 | flags), row.token}, value("v"), {0x01}}));
            EXPECT_EQ(run.read(), 0U);
            EXPECT_EQ(run.shown(row), row.of({"v"}));
        }
    }
}

TEST_P(TokenParm, FailsWhereverTheDataEnds)
{
    for (const auto &row : GetParam().rows) {
        SCOPED_TRACE(row.name);
        const Bytes whole = parm(join({{row.token, 0x00, 0x01}, value("value")}));
        for (size_t count = 0; count < whole.size(); ++count) {
            SCOPED_TRACE(count);
            AnyReading run(GetParam(), prefix(whole, count));
            EXPECT_EQ(run.read(), 4103U);
            EXPECT_EQ(run.fieldsSet(), records::Numbers{});
        }
    }
}

TEST_P(TokenParm, FailsCleanlyWithoutMemory)
{
    for (const auto &row : GetParam().rows) {
        if (!GetParam().goesOn(row.token)) {
            SCOPED_TRACE(row.name);
            failEachAllocation(GetParam(), parm(row.token, "value"));
        }
    }
}

TEST_P(TokenParm, FollowsPageSwitchesOneBehindTheOther)
{
    for (const auto &row : GetParam().rows) {
        if (row.token >= 0x40) {
            continue; // another token when seen without its top bits
        }
        SCOPED_TRACE(row.name);
        AnyReading run(GetParam(), parm(join({{0x00, 0x01, 0x00, 0x00, 0x00, 0x01, row.token},
                                              {0x00, 0x00}, // between name and value too
                                              value("v")})));
        Traces traces;
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.left(), 0U);
        EXPECT_EQ(run.shown(row), row.of({"v"}));
        EXPECT_EQ(run.decoder->nCodePage, 0U);
        EXPECT_TRUE(traces.has("QVS_WBXML_TAG_SWITCH_PAGE0\n"));
        EXPECT_TRUE(traces.has("QVS_WBXML_TAG_SWITCH_PAGE1\n"));
    }
}

// ---- Of these, the texts

TEST_P(TextParm, KeepsTheLastOfRepeatedTextsAndLeavesTheOthersAllocated)
{
    for (const auto &row : GetParam().rows) {
        if (row.list) {
            continue;
        }
        SCOPED_TRACE(row.name);
        AnyReading run(GetParam(), join({parm(row.token, "first"), parm(row.token, "second"),
                                         parm({row.token})}));
        EXPECT_EQ(run.read(), 0U);
        char *first = run.text(row.field);
        EXPECT_EQ(run.read(), 0U);
        char *second = run.text(row.field);
        EXPECT_STREQ(second, "second");
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.shown(row), shown(GetParam().withoutValue(row.token)));
        EXPECT_STREQ(first, "first");
        EXPECT_STREQ(second, "second");
        records::release({first, second});
    }
}

TEST_P(TextParm, TakesSeveralParametersInOneElement)
{
    const auto rows = GetParam().rows;
    for (const auto &first : rows) {
        for (const auto &second : rows) {
            if (first.list || first.token == second.token) {
                continue; // a list takes whatever follows it
            }
            SCOPED_TRACE(std::string(first.name) + " " + second.name);
            AnyReading run(GetParam(),
                           parm(join({{first.token}, opaque("1"), {second.token}, opaque("2")})));
            EXPECT_EQ(run.read(), 0U);
            EXPECT_EQ(run.shown(first), first.of({"1"}));
            EXPECT_EQ(run.shown(second), second.of({"2"}));
        }
    }
}

TEST_P(TextParm, LeavesWhatItReadBeforeAFailure)
{
    for (const auto &row : GetParam().rows) {
        if (row.list) {
            continue;
        }
        SCOPED_TRACE(row.name);
        AnyReading run(GetParam(), parm(join({{row.token}, opaque("read"), {0x7F}})));
        EXPECT_EQ(run.read(), 4101U);
        EXPECT_EQ(run.left(), 2U) << "the refused token stays";
        EXPECT_EQ(run.shown(row), "read");
    }
}

TEST_P(TextParm, LeavesATextAloneThatCannotBeReadAgain)
{
    for (const auto &row : GetParam().rows) {
        if (row.list) {
            continue;
        }
        SCOPED_TRACE(row.name);
        AnyReading run(GetParam(),
                       join({parm(row.token, "old"), {0x87, row.token, 0x06, 0x03, 'n'}}));
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.read(), 4103U);
        EXPECT_EQ(run.shown(row), "old");
    }
}

// ---- And the lists

TEST_P(ListParm, CollectsRepeatedListsInOrder)
{
    for (const auto &row : GetParam().rows) {
        if (!row.list) {
            continue;
        }
        SCOPED_TRACE(row.name);
        AnyReading run(GetParam(),
                       join({parm(row.token, "b"), parm(row.token, "a"), parm({row.token}),
                             parm({row.token, 0x06}), parm(row.token, "b")}));
        while (run.left()) {
            ASSERT_EQ(run.read(), 0U);
        }
        EXPECT_EQ(run.shown(row), "[b, a, b]");
    }
}

TEST_P(ListParm, ContinuesTheTextOfAListInAFurtherPairOfTheSameElement)
{
    for (const auto &row : GetParam().rows) {
        if (!row.list) {
            continue;
        }
        SCOPED_TRACE(row.name);
        const auto expectItems = [&](const Bytes &attributes, const char *expected) {
            AnyReading run(GetParam(), parm(join({{row.token}, attributes})));
            EXPECT_EQ(run.read(), 0U);
            EXPECT_EQ(run.left(), 0U);
            EXPECT_EQ(run.shown(row), expected);
        };
        // Any attribute token is taken for the name of a further pair.
        expectItems({0x06, 0x85, 0x7F, 0x06, 0x86}, "[IPV4, IPV4IPV6]");
        expectItems({0x06, 0x9A, row.token, 0x06, 0x9B}, "[PAP, PAP,CHAP]");
        expectItems(join({opaque("a"), {0x3F}, opaque("b"), {0x3F}, value("c")}), "[a, ab, abc]");
        // A string ends at a VALUE too, which is then taken for a name.
        expectItems(join({value("a"), {0x06}, value("b")}), "[a, ab]");
        // Without a value it adds no item.
        expectItems({0x06, 0x85, row.token}, "[IPV4]");
        expectItems({0x06, 0x85, row.token, 0x06}, "[IPV4]");
        expectItems(join({value("a"), {0x06}}), "[a]");
    }
}

TEST_P(ListParm, DropsANewListThatFailsInAFurtherPair)
{
    for (const auto &row : GetParam().rows) {
        if (!row.list) {
            continue;
        }
        SCOPED_TRACE(row.name);
        const Bytes failing = parm({row.token, 0x06, 0x85, row.token, 0x77});
        AnyReading run(GetParam(), failing);
        EXPECT_EQ(run.read(), 4101U);
        EXPECT_EQ(run.shown(row), "(null)");

        AnyReading further(GetParam(), join({parm(row.token, "a"), failing}));
        EXPECT_EQ(further.read(), 0U);
        EXPECT_EQ(further.read(), 4101U);
        EXPECT_EQ(further.shown(row), "[a, IPV4]") << "a list that was there keeps it";
    }
}

} // namespace parms
