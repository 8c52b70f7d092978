// What the readers of parameters that are named by text have in common.
#ifndef NAMED_PARM_SUITE_H
#define NAMED_PARM_SUITE_H

#include "parms.h"

#include <cctype>

namespace parms {

// A reader of such a parameter, whatever it does with the name.
template <class D>
class NameReader : public blocks::BlockTest {
};
TYPED_TEST_SUITE_P(NameReader);

TYPED_TEST_P(NameReader, AnswersOneForANameThatIsEmptyOrWasNotRead)
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
        Reading<TypeParam> run(parm(join({{0x05}, name})));
        run.decoder->pStringTable = static_cast<char *>(records::blank(1));
        Traces traces;
        EXPECT_EQ(run.read(), 1U);
        EXPECT_EQ(run.left(), 1U) << "the END stays";
        EXPECT_EQ(fieldsSet(run.record.get()), records::Numbers{});
        EXPECT_TRUE(traces.has(std::string(TypeParam::kLabel) + " pszName NULL\n"));
    }
}

TYPED_TEST_P(NameReader, TracesAndDropsAPartOfANameThatCannotBeRead)
{
    Reading<TypeParam> run({0x87, 0x05, 0x03, 'A', 0x00, 0x60, 0x01});
    Traces traces;
    EXPECT_EQ(run.read(), 4103U);
    EXPECT_EQ(fieldsSet(run.record.get()), records::Numbers{});
    EXPECT_TRUE(traces.has(std::string(TypeParam::kLabel) + " pszName NULL\n"));
}

TYPED_TEST_P(NameReader, ReturnsTheFailureOfANameThatIsNotThere)
{
    Reading<TypeParam> run({0x87, 0x05});
    Traces traces;
    EXPECT_EQ(run.read(), 4103U);
    EXPECT_FALSE(traces.has(std::string(TypeParam::kLabel) + " pszName NULL\n"))
        << "traced for a name alone";
}

TYPED_TEST_P(NameReader, LeavesAnyOtherTokenToTheLoop)
{
    Reading<TypeParam> run(parm(join({{0x05, 0xC3, 0x01, 'N', 0x7F}})));
    EXPECT_EQ(run.read(), 4101U);
    EXPECT_EQ(run.left(), 2U);
    EXPECT_EQ(fieldsSet(run.record.get()), records::Numbers{});
}

TYPED_TEST_P(NameReader, ReadsBehindTheTokenThatItIsGiven)
{
    typename TypeParam::Record *record = nullptr;
    for (const uint8_t tag : {0x05, 0x33}) {
        Traces traces;
        decoding::Decoder decoder({tag, 0x03, 'N', 0x00, 0x01});
        EXPECT_EQ(TypeParam::readName(decoder, &record, tag), 0U);
        EXPECT_EQ(decoder.position(), 4U);
        EXPECT_EQ(traces.texts.front(),
                  TypeParam::kLabel + format(" nTagID [0x%x]\n", unsigned{tag}));

        decoding::Decoder other({0x06, 0x03, 'N', 0x00, 0x01});
        EXPECT_EQ(TypeParam::readName(other, &record, tag), 4101U);
        EXPECT_EQ(other.position(), 1U);
        decoding::Decoder none({});
        EXPECT_EQ(TypeParam::readName(none, &record, tag), 4103U);
    }
}

TYPED_TEST_P(NameReader, FailsWhereverTheDataEnds)
{
    for (const Bytes &whole : {named("NAME"), named("NAME", "value")}) {
        for (size_t count = 0; count < whole.size(); ++count) {
            SCOPED_TRACE(count);
            Reading<TypeParam> run(prefix(whole, count));
            EXPECT_EQ(run.read(), count > 8 && !TypeParam::kReadsAnyValue ? 4101U : 4103U);
            EXPECT_EQ(fieldsSet(run.record.get()), records::Numbers{});
        }
    }
}

TYPED_TEST_P(NameReader, NeedsNoMemoryForANameOfOnePieceOrAValueThatIsDropped)
{
    for (const Bytes &bytes : {named("NAME"), named("NAME", "value")}) {
        Reading<TypeParam> run(bytes);
        blocks::startCounting();
        EXPECT_EQ(run.read(), bytes.size() > 9 && !TypeParam::kReadsAnyValue ? 4101U : 0U);
        EXPECT_EQ(blocks::allocations(), 0U);
    }
}

TYPED_TEST_P(NameReader, FailsCleanlyWithoutMemoryForANameOfSeveralPieces)
{
    failEachAllocation<TypeParam>(parm({0x05, 0x03, 'N', 0x00, 0x03, 'A', 0x00}));
}

REGISTER_TYPED_TEST_SUITE_P(NameReader, AnswersOneForANameThatIsEmptyOrWasNotRead,
                            TracesAndDropsAPartOfANameThatCannotBeRead,
                            ReturnsTheFailureOfANameThatIsNotThere, LeavesAnyOtherTokenToTheLoop,
                            ReadsBehindTheTokenThatItIsGiven, FailsWhereverTheDataEnds,
                            NeedsNoMemoryForANameOfOnePieceOrAValueThatIsDropped,
                            FailsCleanlyWithoutMemoryForANameOfSeveralPieces);

// A reader that knows some names.
template <class D>
class NamedParm : public blocks::BlockTest {
};
TYPED_TEST_SUITE_P(NamedParm);

TYPED_TEST_P(NamedParm, FillsTheFieldOfEachNameOnBothPages)
{
    for (const uint8_t page : {0, 1}) {
        for (const auto &row : TypeParam::names()) {
            SCOPED_TRACE(row.name);
            Reading<TypeParam> run(named(row.name, "value"));
            run.decoder->nCodePage = page;
            EXPECT_EQ(run.read(), 0U);
            EXPECT_EQ(run.left(), 0U);
            EXPECT_EQ(fieldsSet(run.record.get()),
                      records::Numbers{numberOf(run.record.get(), row.text)});
            EXPECT_STREQ(run.record.get()->*row.text, "value");
        }
    }
}

TYPED_TEST_P(NamedParm, TakesANameFromOpaqueDataAndThroughPageSwitches)
{
    for (const auto &row : TypeParam::names()) {
        SCOPED_TRACE(row.name);
        const Bytes name = message::opaque(Bytes(row.name, row.name + strlen(row.name))).bytes;
        Reading<TypeParam> run(parm(join({{0x00, 0x01, 0x05}, name, {0x06, 0x00, 0x00, 0x85}})));
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.left(), 0U);
        EXPECT_STREQ(run.record.get()->*row.text, "IPV4");
    }
}

TYPED_TEST_P(NamedParm, ComparesTheWholeNameByteForByte)
{
    for (const auto &row : TypeParam::names()) {
        std::vector<std::string> others = {std::string(row.name) + "x", std::string("x") + row.name,
                                           std::string(row.name, strlen(row.name) - 1)};
        for (size_t i = 0; row.name[i]; ++i) {
            if (isalpha(static_cast<unsigned char>(row.name[i]))) {
                others.emplace_back(row.name)[i] ^= 0x20;
            }
        }
        for (const std::string &other : others) {
            SCOPED_TRACE(other);
            Reading<TypeParam> run(named(other, "value"));
            EXPECT_EQ(run.read(), TypeParam::kReadsAnyValue ? 0U : 4101U);
            EXPECT_EQ(fieldsSet(run.record.get()), records::Numbers{});

            Reading<TypeParam> withoutValue(named(other));
            EXPECT_EQ(withoutValue.read(), 0U);
            EXPECT_EQ(withoutValue.left(), 0U);
        }
    }
}

TYPED_TEST_P(NamedParm, ChangesNothingWithoutAVALUE)
{
    for (const auto &row : TypeParam::names()) {
        SCOPED_TRACE(row.name);
        Reading<TypeParam> run(join({named(row.name), named(row.name, "old"), named(row.name)}));
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.record.get()->*row.text, nullptr);
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.left(), 0U);
        EXPECT_STREQ(run.record.get()->*row.text, "old");
    }
}

TYPED_TEST_P(NamedParm, KeepsTheLastOfRepeatedValuesAndLeavesTheOthersAllocated)
{
    for (const auto &row : TypeParam::names()) {
        SCOPED_TRACE(row.name);
        const Bytes name = message::Value(row.name).bytes;
        Reading<TypeParam> run(join({named(row.name, "first"), named(row.name, "second"),
                                     parm(join({{0x05}, name, {0x06}}))}));
        EXPECT_EQ(run.read(), 0U);
        char *first = run.record.get()->*row.text;
        EXPECT_EQ(run.read(), 0U);
        char *second = run.record.get()->*row.text;
        EXPECT_STREQ(second, "second");
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.record.get()->*row.text, nullptr) << "a VALUE that carries nothing";
        EXPECT_STREQ(first, "first");
        EXPECT_STREQ(second, "second");
        records::release({first, second});
    }
}

TYPED_TEST_P(NamedParm, LeavesTheFieldAloneWhenTheValueCannotBeRead)
{
    for (const auto &row : TypeParam::names()) {
        SCOPED_TRACE(row.name);
        const Bytes cut = named(row.name, "new");
        Reading<TypeParam> run(join({named(row.name, "old"), prefix(cut, cut.size() - 1)}));
        EXPECT_EQ(run.read(), 0U);
        EXPECT_EQ(run.read(), 4103U);
        EXPECT_STREQ(run.record.get()->*row.text, "old");
    }
}

TYPED_TEST_P(NamedParm, FailsWhereverTheDataEndsAndWithoutMemory)
{
    for (const auto &row : TypeParam::names()) {
        SCOPED_TRACE(row.name);
        const Bytes whole = named(row.name, "value");
        for (size_t count = 0; count < whole.size(); ++count) {
            SCOPED_TRACE(count);
            Reading<TypeParam> run(prefix(whole, count));
            EXPECT_EQ(run.read(), 4103U);
            EXPECT_EQ(fieldsSet(run.record.get()), records::Numbers{});
        }
        failEachAllocation<TypeParam>(whole);
    }
}

REGISTER_TYPED_TEST_SUITE_P(NamedParm, FillsTheFieldOfEachNameOnBothPages,
                            TakesANameFromOpaqueDataAndThroughPageSwitches,
                            ComparesTheWholeNameByteForByte, ChangesNothingWithoutAVALUE,
                            KeepsTheLastOfRepeatedValuesAndLeavesTheOthersAllocated,
                            LeavesTheFieldAloneWhenTheValueCannotBeRead,
                            FailsWhereverTheDataEndsAndWithoutMemory);

} // namespace parms

#endif
