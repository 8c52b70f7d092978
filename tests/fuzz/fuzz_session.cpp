// A message through the natives, as a virtual machine calls them.
#include "check.h"
#include "context.h"
#include "queries.h"
#include "reading.h"
#include "support/fakevm.h"
#include "support/heap.h"
#include "target.h"

#include "qvsJniParser.h"

namespace {

using namespace fuzz;

constexpr jint kHeaderOnly = 1;

struct Expected {
    HeaderReading header;
    BodyReading body;
};

struct Message {
    const fakevm::Bytes &array; // that is handed in
    const fakevm::Bytes &bytes; // of it, those of the message
    const Expected &expected;
};

// The natives that read the header.
std::string askHeader(fakevm::Vm *vm, const HeaderReading &expected, const fakevm::Bytes &message)
{
    const bool there = expected.accepted;
    const auto number = [&](const char *name, size_t value) {
        const jint answer = vm->call(name).number;
        check(answer == (there ? static_cast<jint>(value) : -1), "a number of the header", name,
              ' ', answer);
    };
    const size_t start = there ? 3 + expected.headerLength : message.size();
    number("qvomacp_GetParserContentType", expected.contentType);
    number("qvomacp_GetParserHeaderLen", expected.headerLength);
    number("qvomacp_GetParserBodyLen", message.size() - start);
    number("qvomacp_GetParserMACLen", expected.mac.size());
    number("qvomacp_GetParserSEC", expected.security);
    const auto mac = vm->call("qvomacp_GetParserMAC").bytes;
    const auto body = vm->call("qvomacp_GetParserBody").bytes;
    check(mac.has_value() == there && body.has_value() == there,
          "MAC and body are there with the header");
    check(!there || std::equal(mac->begin(), mac->end(), expected.mac.begin(), expected.mac.end(),
                               [](uint8_t a, char b) { return a == static_cast<uint8_t>(b); }),
          "the MAC is that of the message");
    check(!there || std::equal(body->begin(), body->end(),
                               message.begin() + static_cast<std::ptrdiff_t>(start), message.end()),
          "the body is that of the message");
    return there ? "header" : "no header";
}

// Moves the start of the NAPDEF records to the n-th, asks again, and returns the blocks that are
// out of reach now.
size_t moveStart(fakevm::Vm *vm, jint n, std::string *log)
{
    const qvsCtxNapDef *before = ptCtx->ptNapDef;
    const jint count = vm->call("qvomacp_GetPxNapDefCount").number;
    const fakevm::Answer nth = vm->call("qvomacp_GetPxNapDefData", {n});
    (void)vm->call("qvomacp_SetPxNapDefIndex", {n});
    const jint left = vm->call("qvomacp_GetPxNapDefCount").number;
    check(left == (n >= 1 && n <= count ? count - n + 1 : 0), "as many are left as stand behind",
          left, " of ", count, " behind ", n);
    check(vm->call("qvomacp_GetPxNapDefData", {1}) == nth, "the n-th is the first");
    *log += askAll(vm);
    return blocksOf(before, ptCtx->ptNapDef);
}

// One session, from parse to delete, in which the start of the NAPDEF records is moved twice.
// Returns all answers.
std::string session(fakevm::Vm *vm, const Message &message, jlong length, jint n)
{
    const Expected &expected = message.expected;
    const bool accepted = vm->parse(&message.array, length, 0).number != 0;
    check(accepted == expected.body.context, "the message is accepted as the format says",
          accepted ? "accepted" : "refused");
    std::string log = askHeader(vm, accepted ? expected.header : HeaderReading{}, message.bytes);
    log += askAll(vm);
    size_t kept = expected.body.kept;
    if (accepted) {
        const ContextView whole = viewOf(ptCtx);
        const size_t blocks = 2 + whole.blocks + whole.abandoned + kept;
        check(blocks::live() == blocks, "header, body and context are all that a parse leaves",
              blocks::live(), " blocks instead of ", blocks);
        kept += moveStart(vm, n, &log);
        kept += moveStart(vm, 2, &log);
        kept += viewOf(ptCtx).kept;
    }
    (void)vm->call("qvomacp_parser_del");
    check(!ptCtx, "no context is left of a session");
    check(blocks::live() == kept, "a session leaves no block but the kept ones", blocks::live(),
          " blocks instead of ", kept);
    blocks::releaseAll();
    return log;
}

// A parse of the header alone.
void headerOnly(fakevm::Vm *vm, const fakevm::Bytes &message, const HeaderReading &expected)
{
    const bool accepted = vm->parse(message, kHeaderOnly).number != 0;
    check(accepted == expected.accepted, "the header is accepted as the format says");
    (void)askHeader(vm, expected, message);
    check(!ptCtx, "no context is made of a header");
    (void)vm->call("qvomacp_parser_del");
    (void)askHeader(vm, {}, message);
    check(blocks::live() == 0, "no block is left of a header", blocks::live());
}

// A length that the array does not have.
void tooLong(fakevm::Vm *vm, const fakevm::Bytes &message)
{
    for (const jlong more :
         {jlong{1}, jlong{INT32_MAX}, jlong{-1} - static_cast<jlong>(message.size())}) {
        const jlong length = static_cast<jlong>(message.size()) + more;
        check(vm->parse(&message, length, 0).number == 0, "no more is parsed than there is",
              length);
    }
    check(blocks::live() == 0, "nor is a block left", blocks::live());
}

fakevm::Vm *machine()
{
    static fakevm::Vm *const vm = [] {
        auto *made = new fakevm::Vm;
        (void)made->load();
        return made;
    }();
    return vm;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    // The first byte of a message means nothing to the library. Here it chooses the NAPDEF to begin
    // at, and bytes at the end of the array that are not said to belong to the message.
    const uint8_t choice = size ? data[0] : 0;
    const jint n = choice % 8 - 1;
    const size_t said = choice < 0xF0 ? size : size - std::min<size_t>(size, choice & 0x0F);
    const fakevm::Bytes array(data, data + size);
    const fakevm::Bytes message(data, data + said);
    Expected expected;
    expected.header = readHeader(data, said);
    if (expected.header.accepted) {
        const size_t start = 3 + expected.header.headerLength;
        expected.body = readBody(data + start, said - start);
    }
    fakevm::Vm *vm = machine();
    headerOnly(vm, message, expected.header);
    tooLong(vm, message);
    const jlong length = static_cast<jlong>(said);
    const std::string first = session(vm, {array, message, expected}, length, n);
    // Only the low half of a length counts.
    const std::string second = session(vm, {array, message, expected}, length | jlong{1} << 32, n);
    check(first == second, "what was accepted answers the same when parsed again", first, "\n\n",
          second);
    return 0;
}
