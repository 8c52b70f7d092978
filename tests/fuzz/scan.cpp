// One pass over the bytes of a body, with the elements that are open.
#include "scan.h"

#include "vocabulary.h"

#include <algorithm>

namespace fuzz {

namespace {

class Scan {
public:
    explicit Scan(const Bytes &bytes) : body(bytes) {}

    Layout all()
    {
        header();
        while (position < body.size()) {
            next();
        }
        for (size_t span : open) {
            layout.spans[span].end = body.size();
        }
        return std::move(layout);
    }

private:
    void header()
    {
        step(1);
        if (number() == 0) {
            (void)number();
        }
        (void)number();
        layout.tableLength = position;
        const uint64_t length = number();
        layout.table = position;
        step(length);
        layout.content = position;
    }

    void step(uint64_t bytes)
    {
        position += static_cast<size_t>(std::min<uint64_t>(bytes, body.size() - position));
    }

    uint64_t number()
    {
        uint64_t value = 0;
        for (int i = 0; i < 5 && position < body.size(); ++i) {
            const uint8_t byte = body[position++];
            value = (value << 7) | (byte & 0x7F);
            if (byte < 0x80) {
                break;
            }
        }
        return value;
    }

    void add(Part part, size_t begin) { layout.spans.push_back({part, begin, position}); }

    void next()
    {
        const size_t begin = position;
        const uint8_t byte = body[position++];
        if (byte == kSwitchPage) {
            step(1);
            add(Part::kPage, begin);
        } else if (byte == kEnd) {
            end(begin);
        } else if (byte == kStrI) {
            while (position < body.size() && body[position++] != 0) {
            }
            add(Part::kString, begin);
        } else if (byte == kStrT) {
            (void)number();
            add(Part::kTable, begin);
        } else if (byte == kOpaque) {
            step(number());
            add(Part::kOpaque, begin);
        } else if (!inAttributes && (byte & kTagBits) >= kDocument && (byte & kTagBits) <= kParm) {
            element(byte, begin);
        } else {
            add(Part::kToken, begin);
        }
    }

    void element(uint8_t byte, size_t begin)
    {
        const uint8_t tag = byte & kTagBits;
        const bool hasContent = byte & kContentBit;
        inAttributes = byte & kAttributesBit;
        if (tag != kDocument && (hasContent || inAttributes)) {
            add(tag == kParm ? Part::kParm : Part::kCharacteristic, begin);
            open.push_back(layout.spans.size() - 1);
            contents.push_back(hasContent);
        }
        add(Part::kTag, begin);
    }

    // Ends the attributes, or the innermost element.
    void end(size_t begin)
    {
        add(Part::kEnd, begin);
        if (inAttributes) {
            inAttributes = false;
            if (open.empty() || contents.back()) {
                return;
            }
        }
        if (!open.empty()) {
            layout.spans[open.back()].end = position;
            open.pop_back();
            contents.pop_back();
        }
    }

    const Bytes &body;
    size_t position = 0;
    bool inAttributes = false;
    std::vector<size_t> open;   // elements whose END has not come, innermost last
    std::vector<bool> contents; // whether they have content
    Layout layout;
};

} // namespace

Layout scan(const Bytes &body)
{
    return Scan(body).all();
}

} // namespace fuzz
