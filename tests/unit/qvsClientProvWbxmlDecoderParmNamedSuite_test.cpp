// What the readers of parameters that are named by text have in common.
#include "parms.h"

#include <cctype>

namespace parms {

// A reader of such a parameter, whatever it does with the name.
TEST_P(NameReader, AnswersOneForANameThatIsEmptyOrWasNotRead)
{
    const Bytes names[] = {
        {0x03, 0x00},            // an empty string
        {0x83, 0x00},            // an empty string of the table
        {0xC3, 0x00},            // no data
        {0xC3, 0x02, 0x00, 'x'}, // data that begins with its end
        {0x60},                  // skipped as an element
    };
    for (const Bytes &name : names) {
        SCOPED_TRACE(testing::PrintToString(name));
        AnyReading run(GetParam(), parm(join({{0x05}, name})));
        run.decoder->pStringTable = static_cast<char *>(records::blank(1));
        Traces traces;
        EXPECT_EQ(run.read(), 1U);
        EXPECT_EQ(run.left(), 1U) << "the END stays";
        EXPECT_EQ(run.fieldsSet(), records::Numbers{});
        EXPECT_TRUE(traces.has(std::string(GetParam().label) + " pszName NULL\n"));
    }
}

TEST_P(NameReader, TracesAndDropsAPartOfANameThatCannotBeRead)
{
    AnyReading run(GetParam(), {0x87, 0x05, 0x03, 'A', 0x00, 0x60, 0x01});
    Traces traces;
    EXPECT_EQ(run.read(), 4103U);
    EXPECT_EQ(run.fieldsSet(), records::Numbers{});
    EXPECT_TRUE(traces.has(std::string(GetParam().label) + " pszName NULL\n"));
}

TEST_P(NameReader, ReturnsTheFailureOfANameThatIsNotThere)
{
    AnyReading run(GetParam(), {0x87, 0x05});
    Traces traces;
    EXPECT_EQ(run.read(), 4103U);
    EXPECT_FALSE(traces.has(std::string(GetParam().label) + " pszName NULL\n"))
        << "traced for a name alone";
}

TEST_P(NameReader, LeavesAnyOtherTokenToTheLoop)
{
    AnyReading run(GetParam(), parm(join({{0x05, 0xC3, 0x01, 'N', 0x7F}})));
    EXPECT_EQ(run.read(), 4101U);
    EXPECT_EQ(run.left(), 2U);
    EXPECT_EQ(run.fieldsSet(), records::Numbers{});
}

TEST_P(NameReader, ReadsBehindTheTokenThatItIsGiven)
{
    for (const uint8_t tag : {0x05, 0x33}) {
        Traces traces;
        decoding::Decoder decoder({tag, 0x03, 'N', 0x00, 0x01});
        EXPECT_EQ(GetParam().readName(decoder, tag), 0U);
        EXPECT_EQ(decoder.position(), 4U);
        EXPECT_EQ(traces.texts.front(),
                  GetParam().label + format(" nTagID [0x%x]\n", unsigned{tag}));

        decoding::Decoder other({0x06, 0x03, 'N', 0x00, 0x01});
        EXPECT_EQ(GetParam().readName(other, tag), 4101U);
        EXPECT_EQ(other.position(), 1U);
        decoding::Decoder none({});
        EXPECT_EQ(GetParam().readName(none, tag), 4103U);
    }
}

TEST_P(NameReader, FailsWhereverTheDataEnds)
{
    for (const Bytes &whole : {named("NAME"), named("NAME", "value")}) {
        for (size_t count = 0; count < whole.size(); ++count) {
            SCOPED_TRACE(count);
            AnyReading run(GetParam(), prefix(whole, count));
            EXPECT_EQ(run.read(), count > 8 && !GetParam().readsAnyValue ? 4101U : 4103U);
            EXPECT_EQ(run.fieldsSet(), records::Numbers{});
        }
    }
}

TEST_P(NameReader, NeedsNoMemoryForANameOfOnePieceOrAValueThatIsDropped)
{
    for (const Bytes &bytes : {named("NAME"), named("NAME", "value")}) {
        AnyReading run(GetParam(), bytes);
        blocks::startCounting();
        EXPECT_EQ(run.read(), bytes.size() > 9 && !GetParam().readsAnyValue ? 4101U : 0U);
        EXPECT_EQ(blocks::allocations(), 0U);
    }
}

TEST_P(NameReader, FailsCleanlyWithoutMemoryForANameOfSeveralPieces)
{
    failEachAllocation(GetParam(), parm({0x05, 0x03, 'N', 0x00, 0x03, 'A', 0x00}));
}

// A reader that knows some names.
TEST_P(NamedParm, FillsTheFieldOfEachNameOnBothPages)
{
    for (const uint8_t page : {0, 1}) {
        for (const auto &row : GetParam().names) {
            SCOPED_TRACE(row.name);
            AnyReading run(GetParam(), named(row.name, "value"));
            run.decoder->nCodePage = page;
            EXPECT_EQ(run.read(), 0U);
            EXPECT_EQ(run.left(), 0U);
            EXPECT_EQ(run.fieldsSet(), records::Numbers{row.field});
            EXPECT_STREQ(run.text(row.field), "value");
        }
    }
}

TEST_P(NamedParm, TakesANameFromOpaqueDataAndThroughPageSwitches)
{
    for (const auto &row : GetParam().names) {
        SCOPED_TRACE(row.name);
        const Bytes name = message::opaque(Bytes(row.name, row.name + strlen(row.name))).bytes;
        AnyReading run(GetParam(),
                       parm(join({{0x00, 0x01, 0x05}, name, {0x06, 0x00, 0x00, 0x85}})));
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.left(), 0U);
        EXPECT_STREQ(run.text(row.field), "IPV4");
    }
}

TEST_P(NamedParm, ComparesTheWholeNameByteForByte)
{
    for (const auto &row : GetParam().names) {
        std::vector<std::string> others = {std::string(row.name) + "x", std::string("x") + row.name,
                                           std::string(row.name, strlen(row.name) - 1)};
        for (size_t i = 0; row.name[i]; ++i) {
            if (isalpha(static_cast<unsigned char>(row.name[i]))) {
                others.emplace_back(row.name)[i] ^= 0x20;
            }
        }
        for (const std::string &other : others) {
            SCOPED_TRACE(other);
            AnyReading run(GetParam(), named(other, "value"));
            EXPECT_EQ(run.read(), GetParam().readsAnyValue ? 0U : 4101U);
            EXPECT_EQ(run.fieldsSet(), records::Numbers{});

            AnyReading withoutValue(GetParam(), named(other));
            EXPECT_EQ(withoutValue.read(), 0U);
            EXPECT_EQ(withoutValue.left(), 0U);
        }
    }
}

TEST_P(NamedParm, ChangesNothingWithoutAVALUE)
{
    for (const auto &row : GetParam().names) {
        SCOPED_TRACE(row.name);
        AnyReading run(GetParam(),
                       join({named(row.name), named(row.name, "old"), named(row.name)}));
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.text(row.field), nullptr);
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.left(), 0U);
        EXPECT_STREQ(run.text(row.field), "old");
    }
}

TEST_P(NamedParm, KeepsTheLastOfRepeatedValuesAndLeavesTheOthersAllocated)
{
    for (const auto &row : GetParam().names) {
        SCOPED_TRACE(row.name);
        const Bytes name = message::Value(row.name).bytes;
        AnyReading run(GetParam(), join({named(row.name, "first"), named(row.name, "second"),
                                         parm(join({{0x05}, name, {0x06}}))}));
        EXPECT_EQ(run.read(), 0U);
        char *first = run.text(row.field);
        EXPECT_EQ(run.read(), 0U);
        char *second = run.text(row.field);
        EXPECT_STREQ(second, "second");
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.text(row.field), nullptr) << "a VALUE that carries nothing";
        EXPECT_STREQ(first, "first");
        EXPECT_STREQ(second, "second");
        records::release({first, second});
    }
}

TEST_P(NamedParm, LeavesTheFieldAloneWhenTheValueCannotBeRead)
{
    for (const auto &row : GetParam().names) {
        SCOPED_TRACE(row.name);
        const Bytes cut = named(row.name, "new");
        AnyReading run(GetParam(), join({named(row.name, "old"), prefix(cut, cut.size() - 1)}));
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.read(), 4103U);
        EXPECT_STREQ(run.text(row.field), "old");
    }
}

TEST_P(NamedParm, FailsWhereverTheDataEndsAndWithoutMemory)
{
    for (const auto &row : GetParam().names) {
        SCOPED_TRACE(row.name);
        const Bytes whole = named(row.name, "value");
        for (size_t count = 0; count < whole.size(); ++count) {
            SCOPED_TRACE(count);
            AnyReading run(GetParam(), prefix(whole, count));
            EXPECT_EQ(run.read(), 4103U);
            EXPECT_EQ(run.fieldsSet(), records::Numbers{});
        }
        failEachAllocation(GetParam(), whole);
    }
}

} // namespace parms
