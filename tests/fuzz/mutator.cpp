// One change of a body for each way that a body can be changed.
#include "mutator.h"

#include "generate.h"
#include "scan.h"

#include <algorithm>
#include <cstring>

extern "C" size_t LLVMFuzzerMutate(uint8_t *data, size_t size, size_t maxSize);

namespace fuzz {

namespace {

class BodyMutator {
public:
    BodyMutator(Bytes bytes, size_t most, Random *source)
        : body(std::move(bytes)), maxSize(most), random(source), generator(source),
          layout(scan(body))
    {
    }

    const Bytes &result() const { return body; }

    void mutate()
    {
        for (size_t changes = 1 + random->below(3); changes > 0; --changes) {
            change();
            body.resize(std::min(body.size(), maxSize));
            layout = scan(body);
        }
    }

    void cross(const Bytes &other)
    {
        const Layout theirs = scan(other);
        for (size_t elements = 1 + random->below(3); elements > 0; --elements) {
            if (const Span *span = choose(theirs, isElement)) {
                insert(elementPlace(), slice(other, *span));
                layout = scan(body);
            }
        }
        body.resize(std::min(body.size(), maxSize));
    }

private:
    using Filter = bool (*)(Part part);

    static bool isElement(Part part)
    {
        return part == Part::kCharacteristic || part == Part::kParm;
    }
    static bool isCharacteristic(Part part) { return part == Part::kCharacteristic; }
    static bool isTag(Part part) { return part == Part::kTag; }
    static bool isToken(Part part) { return part == Part::kToken || part == Part::kEnd; }
    static bool isNumbered(Part part) { return part == Part::kTable || part == Part::kOpaque; }
    static bool isInline(Part part) { return part == Part::kString; }
    static bool isValue(Part part) { return isNumbered(part) || isInline(part); }
    static bool isAny(Part) { return true; }

    const Span *choose(const Layout &from, Filter filter)
    {
        const auto all = std::count_if(from.spans.begin(), from.spans.end(),
                                       [&](const Span &span) { return filter(span.part); });
        if (all == 0) {
            return nullptr;
        }
        size_t chosen = random->below(static_cast<size_t>(all));
        return &*std::find_if(from.spans.begin(), from.spans.end(),
                              [&](const Span &span) { return filter(span.part) && chosen-- == 0; });
    }

    template <class Container>
    static auto at(Container &bytes, size_t position)
    {
        return bytes.begin() + static_cast<std::ptrdiff_t>(position);
    }

    static Bytes slice(const Bytes &bytes, const Span &span)
    {
        return Bytes(at(bytes, span.begin), at(bytes, span.end));
    }

    void insert(size_t position, const Bytes &more)
    {
        body.insert(at(body, std::min(position, body.size())), more.begin(), more.end());
    }

    void replace(const Span &span, const Bytes &by)
    {
        body.erase(at(body, span.begin), at(body, span.end));
        insert(span.begin, by);
    }

    // A place where an element may stand: in front of one, behind one, or in front of the last END
    // of a characteristic.
    size_t elementPlace()
    {
        const Span *span = choose(layout, isElement);
        if (!span) {
            return std::min(layout.content + 3, body.size());
        }
        switch (random->below(3)) {
        case 0:
            return span->begin;
        case 1:
            return span->end;
        default:
            return span->part == Part::kCharacteristic ? span->end - 1 : span->begin;
        }
    }

    // The kind of a characteristic, as far as its first token tells.
    const Kind &kindOf(const Span &characteristic)
    {
        for (size_t i = characteristic.begin; i < characteristic.end; ++i) {
            if (body[i] >= kTypeText && body[i] <= kLastType) {
                const bool switched = i > characteristic.begin + 1 && body[i - 1] == 1;
                for (const Kind &kind : kKinds) {
                    if (kind.token == body[i] && kind.pages[switched] && kind.token != kTypeText) {
                        return kind;
                    }
                }
                break;
            }
        }
        return kKinds[kRoaming + random->below(3)];
    }

    void change()
    {
        switch (random->below(20)) {
        case 0:
            return insert(elementPlace(), generator.characteristic(2));
        case 1:
            return insertChild();
        case 2:
        case 3:
            return insertParm();
        case 4:
        case 5:
            return remove();
        case 6:
            return repeat();
        case 7:
            return exchange();
        case 8:
        case 9:
            return changeToken();
        case 10:
        case 11:
            return changeValue();
        case 12:
            return changeText();
        case 13:
            return insertPage();
        case 14:
            return wrap();
        case 15:
            return lie();
        case 16:
            return changeFlags();
        case 17:
            return changeTable();
        case 18:
            return changeBytes();
        default:
            return random->oneIn(4) ? regenerate() : truncate();
        }
    }

    void insertChild()
    {
        if (const Span *span = choose(layout, isCharacteristic)) {
            const Kind &kind = kindOf(*span);
            if (!kind.children.empty()) {
                const auto child = static_cast<uint8_t>(random->pick(kind.children));
                insert(span->end - 1, generator.characteristic(kKinds[child], 1));
            }
        }
    }

    void insertParm()
    {
        if (const Span *span = choose(layout, isCharacteristic)) {
            insert(span->end - 1, generator.parm(kindOf(*span)));
        }
    }

    void remove()
    {
        if (const Span *span = choose(layout, random->oneIn(3) ? isAny : isElement)) {
            replace(*span, {});
        }
    }

    void repeat()
    {
        if (const Span *span = choose(layout, random->oneIn(3) ? isAny : isElement)) {
            const Bytes copied = slice(body, *span);
            for (size_t copies = random->oneIn(4) ? 1 + random->below(12) : 1; copies > 0;
                 --copies) {
                insert(span->end, copied);
            }
        }
    }

    // Two elements change places.
    void exchange()
    {
        const Span *first = choose(layout, isElement);
        const Span *second = choose(layout, isElement);
        if (!first || first == second) {
            return;
        }
        if (first->begin > second->begin) {
            std::swap(first, second);
        }
        const Bytes front = slice(body, *first);
        const Bytes back = slice(body, *second);
        if (second->begin >= first->end) {
            replace(*second, front);
            replace(*first, back);
        } else {
            replace(*first, back);
        }
    }

    void changeToken()
    {
        if (const Span *span = choose(layout, random->oneIn(8) ? isTag : isToken)) {
            body[span->begin] = generator.token();
        }
    }

    void changeValue()
    {
        if (const Span *span = choose(layout, isValue)) {
            replace(*span, generator.value());
        }
    }

    // The text of an inline string, by any change of bytes.
    void changeText()
    {
        const Span *span = choose(layout, isInline);
        if (!span || span->end - span->begin < 2) {
            return;
        }
        Bytes text = slice(body, {span->part, span->begin + 1, span->end - 1});
        const size_t length = text.size();
        text.resize(length + 16);
        text.resize(LLVMFuzzerMutate(text.data(), length, text.size()));
        std::replace(text.begin(), text.end(), uint8_t{0}, uint8_t{'0'});
        text.insert(text.begin(), kStrI);
        text.push_back(0);
        replace(*span, text);
    }

    void insertPage()
    {
        if (const Span *span = choose(layout, isAny)) {
            insert(random->oneIn(2) ? span->begin : span->end, generator.page());
        }
    }

    // Puts an element into a new characteristic, or into many.
    void wrap()
    {
        const Span *span = choose(layout, isElement);
        if (!span) {
            return;
        }
        constexpr KindIndex kParents[] = {kPxLogical, kPxPhysical, kNapDef, kApplication, kAppAddr};
        const Kind &kind = kKinds[random->pick(kParents)];
        const Bytes start = {0xC6, kSwitchPage, static_cast<uint8_t>(kind.pages[0] ? 0 : 1),
                             kind.token, kEnd};
        const size_t levels = random->oneIn(4) ? 1 + random->below(30) : 1;
        const size_t begin = span->begin;
        insert(span->end, Bytes(levels, kEnd));
        for (size_t i = 0; i < levels; ++i) {
            insert(begin, start);
        }
    }

    // A length or an index that is not what it was.
    void lie()
    {
        if (const Span *span = choose(layout, isNumbered)) {
            const size_t begin = span->begin + 1;
            size_t end = begin;
            while (end < span->end && end - begin < 4 && body[end] >= 0x80) {
                ++end;
            }
            const size_t about = random->oneIn(2) ? body.size() - begin : span->end - begin;
            replace({span->part, begin, std::min(end + 1, body.size())}, generator.number(about));
        }
    }

    void changeFlags()
    {
        if (const Span *span = choose(layout, isTag)) {
            body[span->begin] ^= random->oneIn(2) ? kContentBit : kAttributesBit;
        }
    }

    // The string table, or just what it says of its length.
    void changeTable()
    {
        const size_t length = layout.content - layout.table;
        if (random->oneIn(2)) {
            replace({Part::kToken, layout.tableLength, layout.table},
                    generator.number(random->oneIn(2) ? length : body.size() - layout.table));
            return;
        }
        Bytes text = generator.string();
        if (length + text.size() > 0x7F || layout.table != layout.tableLength + 1) {
            return;
        }
        insert(layout.content, text);
        body[layout.tableLength] = static_cast<uint8_t>(length + text.size());
    }

    void changeBytes()
    {
        const size_t size = body.size();
        body.resize(maxSize);
        body.resize(LLVMFuzzerMutate(body.data(), size, maxSize));
    }

    void truncate()
    {
        if (const Span *span = choose(layout, isAny)) {
            body.resize(random->oneIn(2) ? span->begin : span->end);
        }
    }

    void regenerate() { body = generator.document(); }

    Bytes body;
    size_t maxSize;
    Random *random;
    Generator generator;
    Layout layout;
};

size_t store(const Bytes &bytes, uint8_t *out, size_t maxSize)
{
    const size_t size = std::min(bytes.size(), maxSize);
    std::copy_n(bytes.begin(), size, out);
    return size;
}

// Where the body of a message begins.
size_t bodyStart(const Bytes &message)
{
    return message.size() < 3 ? message.size()
                              : std::min<size_t>(message.size(), 3 + size_t{message[2]});
}

// A message of the header of one and a body of at most the size that is left.
template <class MakeBody>
size_t withBody(const Bytes &message, uint8_t *out, size_t maxSize, MakeBody makeBody)
{
    const auto start = message.begin() + static_cast<std::ptrdiff_t>(bodyStart(message));
    Bytes whole(message.begin(), start);
    if (whole.size() < maxSize) {
        append(&whole, makeBody(Bytes(start, message.end()), maxSize - whole.size()));
    }
    return store(whole, out, maxSize);
}

} // namespace

size_t mutateBody(uint8_t *data, size_t size, size_t maxSize, unsigned seed)
{
    Random random(seed);
    if (random.oneIn(10)) {
        return LLVMFuzzerMutate(data, size, maxSize);
    }
    BodyMutator mutator(Bytes(data, data + size), maxSize, &random);
    mutator.mutate();
    return store(mutator.result(), data, maxSize);
}

size_t mutateMessage(uint8_t *data, size_t size, size_t maxSize, unsigned seed)
{
    Random random(seed);
    if (random.oneIn(10)) {
        return LLVMFuzzerMutate(data, size, maxSize);
    }
    const Bytes message(data, data + size);
    if (random.oneIn(5)) {
        Bytes whole = Generator(&random).pushHeader();
        whole.insert(whole.end(), message.begin() + static_cast<std::ptrdiff_t>(bodyStart(message)),
                     message.end());
        return store(whole, data, maxSize);
    }
    return withBody(message, data, maxSize, [&](Bytes body, size_t most) {
        BodyMutator mutator(std::move(body), most, &random);
        mutator.mutate();
        return mutator.result();
    });
}

size_t crossBodies(const uint8_t *first, size_t firstSize, const uint8_t *second, size_t secondSize,
                   uint8_t *out, size_t maxSize, unsigned seed)
{
    Random random(seed);
    BodyMutator mutator(Bytes(first, first + firstSize), maxSize, &random);
    mutator.cross(Bytes(second, second + secondSize));
    return store(mutator.result(), out, maxSize);
}

size_t crossMessages(const uint8_t *first, size_t firstSize, const uint8_t *second,
                     size_t secondSize, uint8_t *out, size_t maxSize, unsigned seed)
{
    Random random(seed);
    const Bytes other(second, second + secondSize);
    return withBody(Bytes(first, first + firstSize), out, maxSize, [&](Bytes body, size_t most) {
        BodyMutator mutator(std::move(body), most, &random);
        mutator.cross(
            Bytes(other.begin() + static_cast<std::ptrdiff_t>(bodyStart(other)), other.end()));
        return mutator.result();
    });
}

} // namespace fuzz
