// A message through the parser of its push header.
#include "check.h"
#include "reading.h"
#include "support/heap.h"
#include "target.h"

#include "qvspushhandler.h"

#include <string_view>

namespace {

using namespace fuzz;

void checkRecord(const smlpushHdlrInfo &info, const HeaderReading &expected, const Input &input)
{
    check(info.nContentType == expected.contentType, "the content type is that of the message",
          info.nContentType);
    check(info.nHeaderLen == expected.headerLength, "so is the length of the header",
          info.nHeaderLen);
    check(info.nSec == expected.security, "so is SEC", info.nSec);
    check(info.nMacLen == expected.mac.size(), "so is the length of the MAC", info.nMacLen);
    check(std::string_view(info.szMac, sizeof info.szMac) ==
              expected.mac + std::string(sizeof info.szMac - expected.mac.size(), '\0'),
          "so is the MAC, and nothing stands behind it");
    const size_t start = 3 + size_t{expected.headerLength};
    check(info.nBodyLen == input.size() - start, "so is the length of the body", info.nBodyLen);
    check(std::equal(info.pBody, info.pBody + info.nBodyLen, input.data() + start) &&
              info.pBody[info.nBodyLen] == 0,
          "the body is copied, and a zero byte stands behind it");
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    const Input input(data, size);
    const HeaderReading expected = readHeader(data, size);
    for (int run = 0; run < 2; ++run) {
        Input copy = input;
        smlpushHdlrInfo *info = smlpushHdlrParsingWSPHeader(copy.data(), copy.size());
        copy.checkUnchanged(input);
        check((info != nullptr) == expected.accepted, "the header is accepted as the format says",
              info ? "accepted" : "refused");
        copy.overwrite();
        if (info) {
            checkRecord(*info, expected, input);
            check(blocks::live() == 2, "a header is a record and a body", blocks::live());
            qvs::releasePushHeader(info);
        }
        check(blocks::live() == 0, "no block is left of a header", blocks::live());
    }
    return 0;
}
